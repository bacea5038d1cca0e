// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/StoredTree.h"

namespace aaf::stored {

// Lays the tree out as a compound file. Properties without content (an empty
// value, an empty stream, a weak collection without targets) are left out,
// since readers take an entry without bytes amiss; sets are written in the
// order of their keys. The same tree gives the same bytes. Throws StoredError.
Bytes WriteTree(const StoredObject& root, SectorSize sectorSize);

}  // namespace aaf::stored
