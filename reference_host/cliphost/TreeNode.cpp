// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/TreeNode.h"

#include "reference_host/cliphost/JsonText.h"
#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

constexpr std::size_t kUsualJson = 16384;

std::string Margin(int level) {
    return std::string(static_cast<std::size_t>(level) * 2, ' ');
}

// A new line for a member of a JSON object that has others before it, and its name.
void AppendJsonName(const std::string& newLine, const std::string& name, std::string& out) {
    out += ',';
    out += newLine;
    AppendJsonText(name, out);
    out += ": ";
}

// The new line is the one of the object's members: its margin goes before them.
void AppendJson(const TreeNode& node, std::string& newLine, std::string& out) {
    out += '{';
    out += newLine;
    out += "\"class\": ";
    AppendJsonText(node.title, out);
    for (const TreeNode::Fact& fact : node.facts) {
        AppendJsonName(newLine, fact.name, out);
        AppendJsonText(fact.value, out);
    }
    for (const TreeNode::Branch& branch : node.branches) {
        AppendJsonName(newLine, branch.name, out);
        out += '[';
        const char* before = "";
        for (const TreeNode& child : branch.nodes) {
            out += before;
            out += newLine;
            out += "  ";
            newLine += "    ";
            AppendJson(child, newLine, out);
            newLine.resize(newLine.size() - 4);
            before = ",";
        }
        if (!branch.nodes.empty()) {
            out += newLine;
        }
        out += ']';
    }
    out.append(newLine, 0, newLine.size() - 2);
    out += '}';
}

// A line for the title and one for each fact, however long. So trees of one shape
// have their facts on the same lines, and when one fact changes only its line does.
// A single part follows the name of its property.
void AppendLines(const TreeNode& node, int indent, const std::string& property, std::string& out) {
    const std::string margin = Margin(indent);
    out += margin;
    out += property;
    out += node.title;
    out += '\n';
    for (const TreeNode::Fact& fact : node.facts) {
        out += margin;
        out += "  ";
        out += fact.name;
        out += " = ";
        out += host::text::Printable(fact.value);
        out += '\n';
    }
    for (const TreeNode::Branch& branch : node.branches) {
        if (branch.nodes.size() == 1) {
            AppendLines(branch.nodes[0], indent + 1, branch.name + ": ", out);
            continue;
        }
        out += margin;
        out += "  ";
        out += branch.name;
        out += ":\n";
        for (const TreeNode& child : branch.nodes) {
            AppendLines(child, indent + 2, "", out);
        }
    }
}

}  // namespace

const std::string& FactOf(const TreeNode& node, std::string_view name) {
    static const std::string nothing;
    for (const TreeNode::Fact& fact : node.facts) {
        if (fact.name == name) {
            return fact.value;
        }
    }
    return nothing;
}

void AppendText(const TreeNode& node, int indent, std::string& out) {
    AppendLines(node, indent, "", out);
}

std::string ToText(const TreeNode& node, int indent) {
    std::string out;
    AppendText(node, indent, out);
    return out;
}

std::string ToJson(const TreeNode& node, int level) {
    std::string out;
    out.reserve(kUsualJson);
    std::string newLine = '\n' + Margin(level + 1);
    AppendJson(node, newLine, out);
    return out;
}

}  // namespace cliphost
