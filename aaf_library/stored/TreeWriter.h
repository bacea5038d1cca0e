// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/CompoundFileWriter.h"
#include "aaf_library/stored/StoredTree.h"

namespace aaf::stored {

// Lays the tree out as a compound file. Properties without content (an empty
// value, an empty stream, a weak collection without targets) are left out,
// since readers take an entry without bytes amiss; sets are written in the
// order of their keys. The same tree gives the same bytes. Throws StoredError.
Bytes WriteTree(const StoredObject& root, SectorSize sectorSize);
// The same in pieces, which follow each other.
std::vector<Piece> WriteTreeInPieces(const StoredObject& root, SectorSize sectorSize);

using TargetPath = std::vector<std::uint16_t>;

// An object with all that it contains as it stands in a file whose table of
// targets begins with these paths.
struct LaidOut {
    CompoundPart part;
    std::vector<TargetPath> paths;
};

// For objects that many files hold; in that place of a file their bytes are not even copied. Null
// when it can't be shared: one of its streams is too long for that, or all of it too large. Throws
// StoredError.
std::shared_ptr<const LaidOut> LayOut(const StoredObject& object,
                                      const std::vector<TargetPath>& paths,
                                      CompoundPlace place = {});

}  // namespace aaf::stored
