// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace cliphost {

// What is known of an element of a list, to find it again in another list.
struct ListElement {
    // What it is called; the n-th of a key is the n-th of that key there. Empty: it has none.
    std::string key;
    std::size_t content = 0;  // equal where the contents are, but perhaps for the key
    std::string kind;         // only elements of one kind can be one
    // Whether one whose key is not there may be the one of the same content, and one of as many of
    // its kind with other keys the one in the same place among them.
    bool mayChangeKey = false;
};

// For each element of `before` its place in `after`: by keys, then by content, and elements without
// a key at last by their kinds, in their order between those that were found. In a list in which
// the order counts, elements that were found by content alone keep theirs.
std::vector<std::optional<std::size_t>> MatchLists(const std::vector<ListElement>& before,
                                                   const std::vector<ListElement>& after,
                                                   bool isSet);

}  // namespace cliphost
