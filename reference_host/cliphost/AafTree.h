// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFFile.h"
#include "reference_host/cliphost/TreeNode.h"

namespace cliphost {

// Everything that the mobs of a file hold, read through the published
// interfaces, so that any build of the AAF library may stand behind them:
// slots, segments, descriptors, locators, comments, tagged values and
// extension properties. Mobs come master, file, source.
TreeNode ReadTree(IAAFFile* file);

// The same for people: mobs get numbers, which stand for their ids where other
// mobs refer to them.
std::string ToReadableText(TreeNode tree, int indent = 0);

}  // namespace cliphost
