// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlNames.h"

#include <gtest/gtest.h>

#include <string>

TEST(XmlNames, KnowsNames) {
    for (const char32_t* name : {U"a", U"_x", U"p:a", U"A-1.b", U"\u00E9t\u00E9", U"\U00010000"}) {
        EXPECT_TRUE(host::IsXmlName(name));
    }
    for (const char32_t* name : {U"", U"1a", U"-a", U".a", U"a b", U"a<", U"\u00D7", U"a\u00D7"}) {
        EXPECT_FALSE(host::IsXmlName(name));
    }
}

TEST(XmlNames, KnowsWhatMayStandInADocument) {
    EXPECT_TRUE(host::IsXmlContent(U""));
    EXPECT_TRUE(host::IsXmlContent(U"a\t\n\r<&>\u00E9\uFFFD\U0010FFFF"));
    EXPECT_FALSE(host::IsXmlContent(U"\x01"));
    EXPECT_FALSE(host::IsXmlContent(std::u32string(1, U'\0')));
    EXPECT_FALSE(host::IsXmlContent(std::u32string(1, 0xDCE9)));
    EXPECT_FALSE(host::IsXmlContent(U"\uFFFE"));
    EXPECT_FALSE(host::IsXmlContent(std::u32string(1, 0x110000)));
}
