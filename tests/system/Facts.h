// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "reference_host/cliphost/TreeNode.h"

// Short readings of a description's tree, so that a test's table can hold what
// it expects of a movie in a line.

enum MobPlace : std::size_t { kMasterMob = 0, kFileMob = 1, kSourceMob = 2 };

// Fact of a node; "-" when it has none of that name.
std::string Fact(const cliphost::TreeNode& node, const std::string& name);
// Parts of a node by the name of the property that holds them.
const std::vector<cliphost::TreeNode>& Parts(const cliphost::TreeNode& node,
                                             const std::string& branch);
const cliphost::TreeNode& Mob(const cliphost::TreeNode& tree, MobPlace place);

std::vector<cliphost::TreeNode> Pictures(const cliphost::TreeNode& tree);
std::vector<cliphost::TreeNode> Sounds(const cliphost::TreeNode& tree);
// Values of the master mob's comments of a name, in their order.
std::vector<std::string> Column(const cliphost::TreeNode& tree, const std::string& name);
// URL of the one locator of a file or source mob's descriptor.
std::string Url(const cliphost::TreeNode& tree, MobPlace place);

// "25/1 x 10": edit rate and length of the essence slots, which all share.
std::string RateAndLength(const cliphost::TreeNode& tree);
// "1 TC1, 2 AuxTC1, 3 picture, 4 sound": slots of a mob.
std::string SlotList(const cliphost::TreeNode& tree, MobPlace place);
// "native {coding} stored 1920x540 shows 1920x540 SeparateFields 16/9"; a
// picture without a coding of its own is "provider NAME ...".
std::string PictureLine(const cliphost::TreeNode& tree, std::size_t index = 0);
// "little-endian 2 x 48000 Hz 16 bit, 19200 samples, 1536000 a second, block 4"
std::string SoundLine(const cliphost::TreeNode& tree, std::size_t index = 0);
// "25 fps, clip enters at 900000": the first timecode slot, and where the file
// mob's clips enter the source mob.
std::string TimecodeLine(const cliphost::TreeNode& tree);
// "-800/1 -450/1 1600/1 900/1", the same for all four boxes, else all.
std::string BoxesLine(const cliphost::TreeNode& tree);
