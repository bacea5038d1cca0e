// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/MetaRecords.h"

namespace aaf::stored::sample {

// The whole built-in model as the records of one file; local numbers are
// given out as a file would do it.
MetaRecords BuiltInRecords();

}  // namespace aaf::stored::sample
