// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <string>

#include "reference_host/cliphost/TreeNode.h"
#include "tests/unit/descriptor_data/KnownRecords.h"

// Compares the first picture of a description with what public registers say of
// its kind; fails the test for each difference.
void ExpectKnownPicture(const cliphost::TreeNode& tree, const KnownRecord& record,
                        const std::string& what);
// The record of a code and raster; fails the test and gives null without one.
const KnownRecord* FindRecord(const std::string& code, ncfUInt32 width, ncfUInt32 height,
                              ncfUInt32 fields);
