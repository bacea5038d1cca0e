// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/TreeNode.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

nlohmann::ordered_json JsonOf(const TreeNode& node) {
    nlohmann::ordered_json json;
    json["class"] = node.title;
    for (const TreeNode::Fact& fact : node.facts) {
        json[fact.name] = fact.value;
    }
    for (const TreeNode::Branch& branch : node.branches) {
        nlohmann::ordered_json list = nlohmann::ordered_json::array();
        for (const TreeNode& child : branch.nodes) {
            list.push_back(JsonOf(child));
        }
        json[branch.name] = std::move(list);
    }
    return json;
}

// A line for the title and one for each fact, however long. So trees of one shape
// have their facts on the same lines, and when one fact changes only its line does.
// A single part follows the name of its property.
void Write(const TreeNode& node, int indent, const std::string& property, std::string& out) {
    const std::string margin(static_cast<std::size_t>(indent) * 2, ' ');
    out += fmt::format("{}{}{}\n", margin, property, node.title);
    for (const TreeNode::Fact& fact : node.facts) {
        out += fmt::format("{}  {} = {}\n", margin, fact.name, host::text::Printable(fact.value));
    }
    for (const TreeNode::Branch& branch : node.branches) {
        if (branch.nodes.size() == 1) {
            Write(branch.nodes[0], indent + 1, branch.name + ": ", out);
            continue;
        }
        out += fmt::format("{}  {}:\n", margin, branch.name);
        for (const TreeNode& child : branch.nodes) {
            Write(child, indent + 2, "", out);
        }
    }
}

}  // namespace

std::string ToText(const TreeNode& node, int indent) {
    std::string out;
    Write(node, indent, "", out);
    return out;
}

std::string ToJson(const TreeNode& node, int indent) {
    return JsonOf(node).dump(indent, ' ', false, nlohmann::json::error_handler_t::replace);
}

}  // namespace cliphost
