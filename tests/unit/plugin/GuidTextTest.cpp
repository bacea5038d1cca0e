// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/GuidText.h"

#include <gtest/gtest.h>

#include "host_interfaces/util/NMAUtil.h"
#include "tests/support/fakes/FakeHost.h"

namespace {

class GuidText : public ::testing::Test {
protected:
    GuidText() { EXPECT_GE(NMAInitialize(host.factory()), 0); }
    ~GuidText() override { NMATerminate(); }

    FakeHost host;
};

TEST_F(GuidText, IsReadInEitherCase) {
    GUID id{};
    EXPECT_TRUE(StringToGUID(NMAString("0E170000-0001-0101-060E-2B340401010C"), &id));
    EXPECT_TRUE(id == ncfGuid("0E170000-0001-0101-060E-2B340401010C"));
    EXPECT_TRUE(StringToGUID(NMAString("abcdef01-2345-6789-abcd-ef0123456789"), &id));
    EXPECT_TRUE(id == ncfGuid("ABCDEF01-2345-6789-ABCD-EF0123456789"));
    EXPECT_FALSE(StringToGUID(NMAString("0E170000-0001-0101-060E"), &id));
    EXPECT_FALSE(StringToGUID(NMAString("0E170000-0001-0101-060E-2B3404010"), &id))
        << "ten numbers";
    EXPECT_TRUE(id == ncfGuid("ABCDEF01-2345-6789-ABCD-EF0123456789"));
    EXPECT_FALSE(StringToGUID(NMAString(""), &id));
}

TEST_F(GuidText, NumbersMayBeginAsScannedNumbersDo) {
    struct {
        const char* text;
        GUID label;
    } const kLabels[] = {
        {" \n0E170000-0001-0101-060E-2B340401010C",
         ncfGuid("0E170000-0001-0101-060E-2B340401010C")},
        {"0x170000-0001-0101-060E-2B340401010C", ncfGuid("00170000-0001-0101-060E-2B340401010C")},
        {"+E170000- 1-0X1-060E-2B340401010C", ncfGuid("0E170000-0001-0001-060E-2B340401010C")},
        {"0E170000--1-0101-060E-2B340401010C", ncfGuid("0E170000-FFFF-0101-060E-2B340401010C")},
        {"E17-1-101-060E-2B340401010Cxyz", ncfGuid("00000E17-0001-0101-060E-2B340401010C")},
    };
    for (const auto& [text, label] : kLabels) {
        GUID id{};
        EXPECT_FALSE(StringToGUID(NMAString("0E170000-0001"), &id));
        EXPECT_TRUE(StringToGUID(NMAString(text), &id)) << text;
        EXPECT_TRUE(id == label) << text;
    }
}

TEST_F(GuidText, IsWrittenInCapitals) {
    EXPECT_STREQ(GUIDToString(ncfGuid("abcdef01-2345-6789-abcd-ef0123456789")).GetUTF8String(),
                 "ABCDEF01-2345-6789-ABCD-EF0123456789");
}

}  // namespace
