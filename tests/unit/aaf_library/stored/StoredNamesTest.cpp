// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/StoredNames.h"

#include <gtest/gtest.h>

using namespace aaf::stored;

TEST(StoredNames, ShortNamesKeepAllTheirLetters) {
    EXPECT_EQ(SingleName(u"Header", 0x0002), u"Header-2");
    EXPECT_EQ(SingleName(u"Content", 0x3B03), u"Content-3b03");
    EXPECT_EQ(CollectionName(u"Mobs", 0x1901), u"Mobs-1901");
    EXPECT_EQ(CollectionName(u"ClassDefinitions", 0x0003), u"ClassDefinitions-3");
    EXPECT_EQ(CollectionName(u"Track", 0xFFFE), u"Track-fffe");
}

TEST(StoredNames, CollectionNamesThatJustFitAreNotSqueezed) {
    EXPECT_EQ(CollectionName(u"DataDefinitions", 0x2605), u"DataDefinitions-2605");
    EXPECT_EQ(CollectionName(u"CodecDefinitions", 0x2607), u"CodecDefinitions-2607");
}

TEST(StoredNames, LongNamesLoseTheirMiddle) {
    EXPECT_EQ(CollectionName(u"IdentificationList", 0x3B06), u"Identifi-ionList-3b06");
    EXPECT_EQ(CollectionName(u"ContainerDefinitions", 0x2608), u"Containe-nitions-2608");
    EXPECT_EQ(CollectionName(u"OperationDefinitions", 0x2603), u"Operatio-nitions-2603");
    EXPECT_EQ(CollectionName(u"KLVDataDefinitions", 0x260A), u"KLVDataD-nitions-260a");
    EXPECT_EQ(CollectionName(u"TaggedValueDefinitions", 0x260B), u"TaggedVa-nitions-260b");
}

TEST(StoredNames, NoNameIsLongerThanThirtyOneCharacters) {
    const std::u16string longName(200, u'x');
    EXPECT_EQ(SingleName(longName, 0xFFFF).size(), 31u);
    EXPECT_EQ(SingleName(longName, 0x0001).size(), 31u);
    EXPECT_LE(IndexName(CollectionName(longName, 0xFFFF)).size(), 31u);
    EXPECT_LE(ElementName(CollectionName(longName, 0xFFFF), 0xFFFFFFFF).size(), 31u);
}

TEST(StoredNames, ElementsAreNumberedInLowerCaseHexadecimal) {
    EXPECT_EQ(ElementName(u"Mobs-1901", 0), u"Mobs-1901{0}");
    EXPECT_EQ(ElementName(u"Mobs-1901", 31), u"Mobs-1901{1f}");
    EXPECT_EQ(IndexName(u"Mobs-1901"), u"Mobs-1901 index");
}

TEST(StoredNames, ThePropertyPartIsWhatStandsBeforeThePid) {
    EXPECT_EQ(PropertyPart(u"Slots-4403", 0x4403), u"Slots");
    EXPECT_EQ(PropertyPart(u"Identifi-ionList-3b06", 0x3B06), u"Identifi-ionList");
    EXPECT_EQ(PropertyPart(u"Slots-4404", 0x4403), u"Slots-4404");
    EXPECT_EQ(PropertyPart(u"-4403", 0x4403), u"-4403");
}

TEST(StoredNames, ASqueezedNameComesOutTheSameFromItsPropertyPart) {
    const std::u16string stored = CollectionName(u"IdentificationList", 0x3B06);
    EXPECT_EQ(CollectionName(PropertyPart(stored, 0x3B06), 0x3B06), stored);
}

TEST(StoredNames, Utf8HoldsEveryCharacterAndShowsLoneHalvesAsQuestionMarks) {
    EXPECT_EQ(ToUtf8(u"a\u00e4\u20ac\U0001F3AC"), "a\xC3\xA4\xE2\x82\xAC\xF0\x9F\x8E\xAC");
    EXPECT_EQ(ToUtf8(std::u16string{u'a', 0xD83C}), "a?");
    EXPECT_EQ(ToUtf8(std::u16string{0xDFAC, u'b'}), "?b");
    EXPECT_EQ(PropertyText(0x9), "property 0009");
}
