// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

#include "host_interfaces/util/NMAUtil.h"
#include "reference_host/framework/Host.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/framework/String.h"
#include "reference_host/util/text/HostText.h"
#include "tests/support/TestFolder.h"

// A host that the utility library is started with, and a look at the end
// whether any of its objects was kept.
class UtilTest : public testing::Test {
protected:
    void SetUp() override {
        ASSERT_EQ(NCF_OK, NMAInitialize(&host_.factory()));
        before_ = host_.LiveObjects();
    }

    void TearDown() override {
        NMATerminate();
        EXPECT_EQ(before_, host_.LiveObjects()) << "host objects were kept";
    }

    // The text of a string that the caller was given, which is released.
    static std::string Taken(INCFString* string) {
        if (string == nullptr) {
            return "(null)";
        }
        const std::string text = host::text::ReadUtf8(string);
        string->Release();
        return text;
    }

    host::Host host_;
    std::int64_t before_ = 0;
};
