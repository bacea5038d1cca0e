// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Any tree of storages and streams is written and comes back the same, or is refused for one of its
// names. Storages whose class is odd are laid out before and put in as they are, unless they hold
// a long stream.

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <set>
#include <string>

#include "aaf_library/stored/CompoundFileWriter.h"
#include "aaf_library/stored/StoredError.h"
#include "aaf_library/stored/UpperCase.h"
#include "fuzz/compound_writer/InputTree.h"
#include "fuzz/support/RunLimits.h"

using aaf::stored::CompoundFileWriter;
using aaf::stored::CompoundPart;
using compound::Node;

namespace {

void Demand(bool isSo, const std::string& what) {
    if (!isSo) {
        std::fprintf(stderr, "%s\n", what.c_str());
        std::abort();
    }
}

bool HasGoodNames(const Node& storage) {
    std::set<std::u16string> capitals;
    return std::all_of(storage.nodes.begin(), storage.nodes.end(), [&](const Node& node) {
        std::u16string name = node.name;
        std::transform(name.begin(), name.end(), name.begin(), aaf::stored::UpperCase);
        return !name.empty() && name.size() <= 31 &&
               name.find_first_of(std::u16string_view(u"/\\:!\0", 5)) == std::u16string::npos &&
               capitals.insert(name).second && HasGoodNames(node);
    });
}

bool IsShort(const Node& node) {
    return node.content.size() < aaf::stored::kSmallStreamLimit &&
           std::all_of(node.nodes.begin(), node.nodes.end(), IsShort);
}

void Fill(CompoundFileWriter& writer, CompoundFileWriter::Storage storage, const Node& node,
          compound::SectorSize sectorSize) {
    writer.SetClass(storage, node.classId);
    for (const Node& contained : node.nodes) {
        if (!contained.isStorage) {
            writer.AddStream(storage, contained.name, contained.content);
            continue;
        }
        if (contained.classId[0] % 2 != 0 && IsShort(contained)) {
            CompoundFileWriter before(sectorSize);
            Fill(before, CompoundFileWriter::kRoot, contained, sectorSize);
            const std::optional<CompoundPart> part = before.FinishPart();
            Demand(part.has_value(), "a storage of short streams is no part");
            writer.AddPart(storage, contained.name, *part);
            continue;
        }
        Fill(writer, writer.AddStorage(storage, contained.name), contained, sectorSize);
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const fuzz::TimeLimit limit;
    const fuzz::InputTree input(data, size);
    const bool hasGoodNames = HasGoodNames(input.root);
    compound::Bytes file;
    try {
        CompoundFileWriter writer(input.sectorSize);
        Fill(writer, CompoundFileWriter::kRoot, input.root, input.sectorSize);
        file = writer.Finish();
    } catch (const aaf::stored::StoredError& problem) {
        Demand(!hasGoodNames, std::string("refused: ") + problem.what());
        return 0;
    }
    Demand(hasGoodNames, "a name was not refused");
    const std::string difference = compound::Difference(compound::Read(file), input.root);
    Demand(difference.empty(), difference);
    return 0;
}
