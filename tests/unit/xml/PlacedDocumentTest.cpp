// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/PlacedDocument.h"

#include <gtest/gtest.h>

#include "tests/support/TestFolder.h"

namespace {

using host::DocumentProblem;
using host::PlacedElement;

class PlacedDocuments : public testing::Test {
protected:
    PlacedElement Read(const std::string& text, std::size_t mostBytes = 1u << 20) {
        return host::ReadPlacedDocument(folder_.Write("a.xml", text), mostBytes, problem_);
    }
    static std::string At(host::XmlPlace place) {
        return std::to_string(place.line) + ":" + std::to_string(place.column);
    }
    const TestFolder folder_;
    DocumentProblem problem_;
};

TEST_F(PlacedDocuments, KnowWhereElementsAndAttributesStand) {
    const PlacedElement root = Read(
        "<?xml version='1.0'?>\n"
        "<a>\n"
        "  <b one='1'\n"
        "     two = \"&lt;2 '\" three='>'/>\n"
        "  <c>text</c>\n"
        "</a>\n");
    EXPECT_EQ(problem_.text, "");
    EXPECT_EQ(At(root.place), "2:1");
    ASSERT_EQ(root.elements.size(), 2u);
    const PlacedElement& b = root.elements[0];
    EXPECT_EQ(At(b.place), "3:3");
    ASSERT_EQ(b.attributes.size(), 3u);
    EXPECT_EQ(At(b.attributes[0].place), "3:6");
    EXPECT_EQ(At(b.attributes[1].place), "4:6");
    EXPECT_EQ(b.attributes[1].value, "<2 '");
    EXPECT_EQ(At(b.attributes[2].place), "4:22");
    EXPECT_EQ(At(root.elements[1].place), "5:3");
    EXPECT_EQ(root.elements[1].text, "text");
}

TEST_F(PlacedDocuments, CountCharactersAndEveryEndOfALine) {
    const PlacedElement root =
        Read("<a>\r\n<b \xC3\xA9='\xC3\xA9' c='1'\r\n d='2'/>\r<c e='3'/></a>");
    ASSERT_EQ(root.elements.size(), 2u) << problem_.text;
    EXPECT_EQ(At(root.elements[0].attributes[1].place), "2:10");
    EXPECT_EQ(At(root.elements[0].attributes[2].place), "3:2");
    EXPECT_EQ(At(root.elements[1].attributes[0].place), "4:4");
}

TEST_F(PlacedDocuments, KeepTheFirstRunOfAText) {
    EXPECT_EQ(Read("<a>1<!-- -->2</a>").text, "1");
    EXPECT_EQ(Read("<a><![CDATA[1]]>2</a>").text, "12");
    EXPECT_EQ(Read("<a/>").text, "");
}

TEST_F(PlacedDocuments, GiveAttributesThePlaceOfTheirElementInAnOtherEncoding) {
    std::string wide = "\xFF\xFE";
    for (const char c : std::string("<a>\n <b c='1'/></a>")) {
        wide += c;
        wide += '\0';
    }
    const PlacedElement root = Read(wide);
    ASSERT_EQ(root.elements.size(), 1u) << problem_.text;
    EXPECT_EQ(At(root.elements[0].attributes[0].place), "2:2");
}

TEST_F(PlacedDocuments, TellWhereADocumentIsBroken) {
    Read("<a>\n  <b>\n</a>");
    EXPECT_FALSE(problem_.isOfFile);
    EXPECT_EQ(problem_.text, "mismatched tag");
    EXPECT_EQ(problem_.place.line, 3u);
    Read("<!DOCTYPE a [<!ENTITY e 'x'>]><a>&e;</a>");
    EXPECT_NE(problem_.text.find("document type declaration"), std::string::npos);
    Read("");
    EXPECT_NE(problem_.text, "");
}

TEST_F(PlacedDocuments, TellWhatCanNotBeRead) {
    host::ReadPlacedDocument(folder_ / "none.xml", 100, problem_);
    EXPECT_TRUE(problem_.isOfFile);
    EXPECT_EQ(problem_.text, "there is no such file");
    host::ReadPlacedDocument(folder_.path(), 100, problem_);
    EXPECT_TRUE(problem_.isOfFile);
    Read("<a>12345</a>", 11);
    EXPECT_TRUE(problem_.isOfFile);
    EXPECT_EQ(problem_.text, "the document has more than 11 bytes");
    Read("<a>12345</a>", 12);
    EXPECT_EQ(problem_.text, "");
}

TEST_F(PlacedDocuments, AreRefusedWhereElementsLieTooDeep) {
    std::string deep;
    for (int i = 0; i < 100'000; ++i) {
        deep += "<a>";
    }
    Read(deep);
    EXPECT_NE(problem_.text.find("levels of elements"), std::string::npos);
}

}  // namespace
