// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "tests/support/compound/CompoundTree.h"

namespace fuzz {

// The tree that an input stands for. Its first byte tells the sectors: 512 bytes when it is even.
// Each that follows is one step, by its lower two bits; the six above them are the length of a
// name, whose characters follow:
//
//   0  a storage with the name, which the next steps fill; a byte is the first of its class
//   1  the storage is done
//   2  a stream with the name; a byte is its size
//   3  the same, with a size of two bytes
struct InputTree {
    InputTree(const unsigned char* data, std::size_t size);

    compound::SectorSize sectorSize = compound::SectorSize::Bytes512;
    compound::Node root;
};

}  // namespace fuzz
