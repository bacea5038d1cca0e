// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include "reference_host/quicktime/CodecNames.h"

namespace {

constexpr ncfUInt32 Number(const char (&text)[5]) {
    return static_cast<ncfUInt32>(static_cast<unsigned char>(text[0])) << 24 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[1])) << 16 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[2])) << 8 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[3]));
}

TEST(CodecNames, KnowsCodesFamiliesAndTheLibrarysOwn) {
    std::string name;
    EXPECT_EQ(host::CodecName(Number("apch"), name), NCF_OK);
    EXPECT_EQ(name, "Apple ProRes 422 HQ");
    EXPECT_EQ(host::CodecName(Number("xdvc"), name), NCF_OK);
    EXPECT_EQ(name, "XDCAM EX");
    EXPECT_EQ(host::CodecName(Number("ai15"), name), NCF_OK);
    EXPECT_EQ(name, "AVC-Intra 100");
    EXPECT_EQ(host::CodecName(Number("MAC6"), name), NCF_OK);
    EXPECT_FALSE(name.empty());
}

TEST(CodecNames, LeavesAnUnknownCodeEmpty) {
    std::string name = "before";
    EXPECT_EQ(host::CodecName(Number("q?z!"), name), NCF_OK);
    EXPECT_TRUE(name.empty());
}

TEST(CodecNames, RefusesCodesThatAreNoText) {
    std::string name = "before";
    EXPECT_EQ(host::CodecName(0, name), NCF_E_INVALIDARG);
    EXPECT_EQ(host::CodecName(0x61620063, name), NCF_E_INVALIDARG);
    EXPECT_EQ(host::CodecName(0x6162637F, name), NCF_E_INVALIDARG);
    EXPECT_EQ(name, "before");
}

}  // namespace
