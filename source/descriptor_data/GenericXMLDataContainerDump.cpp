// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Dump: the entries of a container, written for a person to read.

#include <iomanip>

#include "source/descriptor_data/GenericXMLDataContainer.h"

namespace {

constexpr int kLabelColumns = 25;

void PrintIndent(std::ostream& stream, int indent) {
    for (int level = 0; level < indent; ++level) {
        stream << "      ";
    }
}

void PrintLine(std::ostream& stream, int indent, const char* label, std::string_view text) {
    PrintIndent(stream, indent);
    stream << std::left << std::setw(kLabelColumns) << label << text << "\n";
}

void PrintNode(std::ostream& stream, const XMLDataPropertyValue& node, int indent) {
    const XMLDataPropertyDescription* description = nullptr;
    node.GetDesc(&description);
    PrintLine(stream, indent, "Description Property: ", description->NameText());
    PrintLine(stream, indent, "Data Entry: ", node.ValueText());
    stream << "\n";
}

// As deep as the declared tree.
void PrintTree(std::ostream& stream, const XMLDataPropertyValue& node, int indent) {
    PrintNode(stream, node, indent);
    for (const XMLDataPropertyValue* child : node.Children()) {
        PrintTree(stream, *child, indent + 1);
    }
}

}  // namespace

void GenericXMLDataContainer::Dump(std::ostream& stream) const {
    for (const auto& [key, entry] : entries_) {
        stream << "\n\nData Item\n---------------------------------------------\n";
        PrintNode(stream, *key, 0);
        stream << "\n";
        PrintTree(stream, *entry, 0);
    }
}
