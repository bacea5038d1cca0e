// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Model.h"
#include "aaf_library/stored/MetaRecords.h"
#include "aaf_library/stored/StoredTree.h"

namespace aaf::stored::sample {

// The whole built-in model as the records of one file; local numbers are
// given out as a file would do it.
MetaRecords BuiltInRecords();

// A file of nothing but the definitions that a model has for all that is built in.
Bytes FileOfDefinitions(Model& model, StoredObject (*dictionaryOf)(const MetaRecords&));

}  // namespace aaf::stored::sample
