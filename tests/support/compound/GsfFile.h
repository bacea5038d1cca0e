// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "tests/support/compound/CompoundTree.h"

// Compound files by libgsf, beside the library's own reader and writer. A failure is a
// std::runtime_error with libgsf's reason.

namespace gsf {

compound::Node Read(const compound::Bytes& file);
compound::Bytes Written(const compound::Node& root, compound::SectorSize sectorSize);

// A tree with its names as libgsf takes them. It refers to the nodes.
struct Named {
    explicit Named(const compound::Node& wanted);

    const compound::Node& node;
    std::string name;
    std::vector<Named> nodes;
};
// Writes into memory; gives the size of the file.
std::size_t SizeWritten(const Named& root, compound::SectorSize sectorSize);

}  // namespace gsf
