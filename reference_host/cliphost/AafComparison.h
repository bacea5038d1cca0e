// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <string>
#include <unordered_map>

#include "host_interfaces/aaf/AAFFile.h"
#include "reference_host/cliphost/TreeDifferences.h"

namespace cliphost {

// An object of a file that is compared by itself: a mob, the media in it, or the header.
struct ComparedObject {
    std::string kind;        // its class, such as "MasterMob"
    std::string id;          // empty for the header
    std::string name;        // as people named it
    std::string descriptor;  // of a source mob the class of its description
};
std::string InWords(const ComparedObject& object);

struct ComparisonCounts {
    std::size_t alike = 0;  // objects
    std::size_t changed = 0;
    std::size_t gone = 0;
    std::size_t added = 0;
    std::size_t unknown = 0;      // of which nothing is known now
    std::size_t differences = 0;  // of all of them
    std::size_t unread = 0;       // values of both files that nothing can be said of

    bool AreEqual() const { return differences == 0; }
};

// Takes one difference after the other; those of one object come together.
using TakeDifference = std::function<void(const ComparedObject&, const TreeDifference&)>;

// Mobs of the first file of which it is not known what the second one would have, by their ids, and
// why.
using UnknownMobs = std::unordered_map<std::string, std::string>;

// Compares two files, whoever made them, mob by mob. Mobs are those with the same id; of the rest
// those that are the only ones of their class and name, or of their class alone where the files
// share no mob. Who wrote a file and when is left out, and so are definitions, which are compared
// where they are used. Holds no more than two mobs at once.
ComparisonCounts CompareFiles(IAAFFile* before, IAAFFile* after, const TakeDifference& take,
                              const UnknownMobs& unknown = {});

}  // namespace cliphost
