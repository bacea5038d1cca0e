// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/Pieces.h"
#include "aaf_library/stored/StoredTree.h"

#include <string>
#include <vector>

// A compound file as the tree that it holds.

namespace compound {

using aaf::stored::Bytes;
using aaf::stored::SectorSize;
using aaf::stored::StoredAuid;

// A storage or a stream. Of the root the name does not count.
struct Node {
    std::u16string name;
    bool isStorage = true;
    StoredAuid classId{};     // of a storage
    Bytes content;            // of a stream
    std::vector<Node> nodes;  // of a storage
};

Node Storage(const std::u16string& name, std::vector<Node> nodes = {});
Node Stream(const std::u16string& name, Bytes content);
// So many bytes that differ from one another and from those of other sizes.
Bytes Content(std::size_t size);

// By the library's own writer and reader. They throw StoredError.
Bytes Written(const Node& root, SectorSize sectorSize);
std::vector<aaf::stored::Piece> WrittenInPieces(const Node& root, SectorSize sectorSize);
Node Read(const Bytes& file);

// Where two trees differ, as a sentence; empty when they are equal. The order of nodes does not
// count.
std::string Difference(const Node& left, const Node& right);

}  // namespace compound
