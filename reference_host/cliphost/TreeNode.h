// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace cliphost {

// A piece of a description for people and programs: a title, named facts and
// what it contains.
struct TreeNode {
    struct Fact {
        std::string name;
        std::string value;
    };

    std::string title;
    std::vector<Fact> facts;
    // Named lists of parts; the name is the property that holds them.
    struct Branch {
        std::string name;
        std::vector<TreeNode> nodes;
        bool isSet = false;  // their order means nothing
    };
    std::vector<Branch> branches;
    bool isCut = false;  // it lies too deep: what it holds was not read
};

// The value of a fact, empty where the node has none of that name.
const std::string& FactOf(const TreeNode& node, std::string_view name);

// Indented lines, one for each fact whatever it holds.
std::string ToText(const TreeNode& node, int indent = 0);
void AppendText(const TreeNode& node, int indent, std::string& out);
// The same as JSON text, which may stand so many levels inside other JSON.
std::string ToJson(const TreeNode& node, int level = 0);

}  // namespace cliphost
