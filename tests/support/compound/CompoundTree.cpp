// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/support/compound/CompoundTree.h"

#include <algorithm>

#include "aaf_library/stored/CompoundFileReader.h"
#include "aaf_library/stored/CompoundFileWriter.h"
#include "aaf_library/stored/StoredNames.h"

namespace compound {

using aaf::stored::CompoundFileReader;
using aaf::stored::CompoundFileWriter;

namespace {

void Add(CompoundFileWriter& writer, CompoundFileWriter::Storage storage, const Node& node) {
    writer.SetClass(storage, node.classId);
    for (const Node& contained : node.nodes) {
        if (contained.isStorage) {
            Add(writer, writer.AddStorage(storage, contained.name), contained);
        } else {
            writer.AddStream(storage, contained.name, contained.content);
        }
    }
}

Node NodeOf(CompoundFileReader& reader, std::uint32_t index) {
    const CompoundFileReader::Entry& entry = reader.entry(index);
    if (entry.kind == CompoundFileReader::Kind::Stream) {
        return Stream(entry.name, reader.Read(index));
    }
    Node node = Storage(entry.name);
    node.classId = entry.classId;
    for (const auto& contained : entry.contained) {
        node.nodes.push_back(NodeOf(reader, contained.second));
    }
    return node;
}

std::vector<const Node*> ByName(const Node& node) {
    std::vector<const Node*> sorted;
    for (const Node& contained : node.nodes) {
        sorted.push_back(&contained);
    }
    std::sort(sorted.begin(), sorted.end(),
              [](const Node* left, const Node* right) { return left->name < right->name; });
    return sorted;
}

std::string DifferenceAt(const std::string& place, const Node& left, const Node& right) {
    if (left.isStorage != right.isStorage) {
        return place + " is a storage in one file and a stream in the other";
    }
    if (left.classId != right.classId) {
        return place + " has another class";
    }
    if (left.content != right.content) {
        return place + " has other content, " + std::to_string(left.content.size()) + " and " +
               std::to_string(right.content.size()) + " bytes";
    }
    if (left.nodes.size() != right.nodes.size()) {
        return place + " holds " + std::to_string(left.nodes.size()) + " and " +
               std::to_string(right.nodes.size()) + " storages and streams";
    }
    const std::vector<const Node*> lefts = ByName(left);
    const std::vector<const Node*> rights = ByName(right);
    for (std::size_t i = 0; i < lefts.size(); ++i) {
        const std::string name = place + "/" + aaf::stored::ToUtf8(lefts[i]->name);
        if (lefts[i]->name != rights[i]->name) {
            return name + " is not in the other file";
        }
        if (std::string found = DifferenceAt(name, *lefts[i], *rights[i]); !found.empty()) {
            return found;
        }
    }
    return "";
}

}  // namespace

Node Storage(const std::u16string& name, std::vector<Node> nodes) {
    Node node;
    node.name = name;
    node.nodes = std::move(nodes);
    return node;
}

Node Stream(const std::u16string& name, Bytes content) {
    Node node;
    node.name = name;
    node.isStorage = false;
    node.content = std::move(content);
    return node;
}

Bytes Content(std::size_t size) {
    Bytes content(size);
    for (std::size_t i = 0; i < size; ++i) {
        content[i] = static_cast<std::uint8_t>(i * 7 + i / 256 + size);
    }
    return content;
}

Bytes Written(const Node& root, SectorSize sectorSize) {
    CompoundFileWriter writer(sectorSize);
    Add(writer, CompoundFileWriter::kRoot, root);
    return writer.Finish();
}

std::vector<aaf::stored::Piece> WrittenInPieces(const Node& root, SectorSize sectorSize) {
    CompoundFileWriter writer(sectorSize);
    Add(writer, CompoundFileWriter::kRoot, root);
    return writer.FinishPieces();
}

Node Read(const Bytes& file) {
    CompoundFileReader reader(file);
    return NodeOf(reader, CompoundFileReader::kRootIndex);
}

std::string Difference(const Node& left, const Node& right) {
    return DifferenceAt("", left, right);
}

}  // namespace compound
