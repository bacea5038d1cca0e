// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/MetaRecords.h"

// The local keys of definitions: the numbers in the names of their storages.
//
// A program on the published library that opens a file and saves it writes the definitions that
// are built into that library again, each under the key that tells in which place that library
// makes it. It does not look at what lies there. So these have that key in our files, and the keys
// of those that a file leaves out stay free; all others come behind, in the order of their ids.

namespace aaf::stored {

void NumberClasses(StoredProperty& classes);
void NumberTypes(StoredProperty& types);
// The properties of a class, in the order of the record.
void NumberProperties(StoredProperty& properties, const MetaClass& record);

}  // namespace aaf::stored
