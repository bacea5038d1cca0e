// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

#include "reference_host/cliphost/TreeNode.h"

namespace cliphost {

// One thing in which two trees of an AAF object differ.
struct TreeDifference {
    enum class Kind {
        Changed,    // a value, or the class of what a property holds
        Gone,       // an object
        New,        // an object
        Reordered,  // objects of a list that is no set
        Unknown,    // an object that could not be looked at; no difference
    };
    Kind kind = Kind::Changed;
    // For people, from the outside in: {"picture slot 1", "second component (SourceClip)"}.
    std::vector<std::string> place;
    std::string property;               // as the file names it, where a property changed
    std::optional<std::string> before;  // values as a tree has them, or what was there in words
    std::optional<std::string> after;
    std::string reason;  // why nothing is known
};
const char* NameOf(TreeDifference::Kind kind);
// "picture slot 1: length 250 -> 251", "second timecode slot (2) gone". Long values are cut to
// where they begin to differ.
std::string InWords(const TreeDifference& difference);

// A name or value for people, cut where it is long.
std::string Shown(const std::string& value);

// "EditRate" -> "edit rate"
std::string PropertyWords(const std::string& property);

// Compares trees of objects, property by property. Objects in a list are those with the same key,
// such as a slot's id or a name; the rest go by their content, and then by their order. What says
// when or by whom something was written is left out.
class TreeComparison {
public:
    using Take = std::function<void(const TreeDifference&)>;
    explicit TreeComparison(Take take) : take_(std::move(take)) {}

    // What `after` calls this is what `before` calls that: such ids are alike.
    void AddSame(const std::string& before, const std::string& after) { same_[after] = before; }
    void Compare(const TreeNode& before, const TreeNode& after);
    // Values and objects of both that nothing can be said of.
    std::size_t unread() const { return unread_; }

private:
    void CompareFacts(const TreeNode& before, const TreeNode& after);
    void CompareFact(const std::string& name, const std::string* before, const std::string* after);
    void CompareBranches(const TreeNode& before, const TreeNode& after);
    void CompareLists(const TreeNode::Branch& before, const TreeNode::Branch& after);
    void CompareAt(std::string place, const TreeNode& before, const TreeNode& after);
    void TellObject(TreeDifference::Kind kind, std::string place, const TreeNode& node);
    void Tell(TreeDifference difference);
    const std::string& InTermsOfBefore(const std::string& value) const;

    Take take_;
    std::unordered_map<std::string, std::string> same_;
    std::vector<std::string> place_;
    std::size_t unread_ = 0;
};

}  // namespace cliphost
