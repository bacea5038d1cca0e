// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/StoredTree.h"

namespace aaf::stored {

// Makes the tree of a compound file's bytes. Hostile files are refused: every
// storage and stream is taken once, every count is held against the bytes
// that are there. Storages and streams that no property names are passed over.
// A weak reference, stream or second value of a property that makes no sense
// is kept with its problem; an object that cannot be read is not.
// Throws StoredError with the place and the defect.
StoredObject ReadTree(const Bytes& file);

}  // namespace aaf::stored
