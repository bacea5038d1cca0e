// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "reference_host/cliphost/AafValue.h"
#include "reference_host/cliphost/TreeNode.h"

namespace cliphost {

// Everything that the mobs of a file hold, read through the published
// interfaces, so that any build of the AAF library may stand behind them:
// slots, segments, descriptors, locators, comments, tagged values and
// extension properties. Mobs come master, file, source.
TreeNode ReadTree(IAAFFile* file);

// The mobs in that order.
std::vector<host::Ref<IAAFMob>> MobsOf(IAAFFile* file);

// What ReadTree reads, of one object after the other, for whoever needs not hold a whole file.
class ObjectReader {
public:
    explicit ObjectReader(LongValues longValues = LongValues::Cut);
    ~ObjectReader();
    ObjectReader(const ObjectReader&) = delete;
    ObjectReader& operator=(const ObjectReader&) = delete;

    TreeNode Read(IAAFObject* object);
    // Without the objects that it holds.
    TreeNode ReadAlone(IAAFObject* object);

private:
    class TreeReader;
    std::unique_ptr<TreeReader> reader_;
};

// A whole tree for people: mobs get numbers, which stand for their ids where other
// mobs refer to them.
std::string ToReadableText(TreeNode tree, int indent = 0);

}  // namespace cliphost
