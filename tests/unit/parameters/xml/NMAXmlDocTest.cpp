// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/xml/NMAXmlDoc.h"

#include <filesystem>
#include <fstream>

#include "tests/support/TestFolder.h"
#include "tests/unit/parameters/xml/XmlTest.h"

namespace {

using NMA::XMLUtils::NMAXmlNode;

class XmlDocument : public XmlTest {};

TEST_F(XmlDocument, HasNoRootBeforeLoading) {
    Doc doc(host.factory());
    EXPECT_EQ(doc.GetRoot(), nullptr);
}

TEST_F(XmlDocument, LoadsATextAndMirrorsItsRoot) {
    Doc doc(host.factory());
    doc.LoadFromString(S("<a><b/></a>"));
    ASSERT_NE(doc.GetRoot(), nullptr);
    EXPECT_EQ(TagOf(doc.GetRoot()), "a");
    EXPECT_EQ(doc.GetRoot()->GetState(), NMAXmlNode::kUnread) << "children wait to be asked for";
}

TEST_F(XmlDocument, ThrowsNotInitializedWithoutFactory) {
    Doc doc(nullptr);
    EXPECT_EQ(Thrown([&] { doc.LoadFromString(S("<a/>")); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { doc.LoadFromFile(S("x.xml")); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { doc.SaveToFile(S("x.xml")); }), NMA_E_NOTINITIALIZED);
    NMAString text;
    EXPECT_EQ(Thrown([&] { doc.SaveToString(text); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(doc.CreateRoot(S("a")), NMA_E_NOTINITIALIZED);
}

TEST_F(XmlDocument, ThrowsForATextThatIsNotWellFormed) {
    for (const char* const text : {"", "<a>", "<a></b>", "a", "<a><b></a></b>", "<a/><b/>"}) {
        Doc doc(host.factory());
        EXPECT_LT(Thrown([&] { doc.LoadFromString(S(text)); }), 0) << text;
        EXPECT_EQ(doc.GetRoot(), nullptr);
    }
}

TEST_F(XmlDocument, ThrowsTheRefusalOfItsReader) {
    host.refuseCreation(kCLSID_XmlDocument, NCF_E_OUTOFMEMORY);
    Doc doc(host.factory());
    EXPECT_EQ(Thrown([&] { doc.LoadFromString(S("<a/>")); }), NCF_E_OUTOFMEMORY);
}

TEST_F(XmlDocument, CreatesARootOnce) {
    Doc doc(host.factory());
    EXPECT_EQ(doc.CreateRoot(S("")), NCF_E_INVALIDARG);
    EXPECT_EQ(doc.GetRoot(), nullptr);
    EXPECT_EQ(doc.CreateRoot(S("root")), NCF_OK);
    EXPECT_EQ(TagOf(doc.GetRoot()), "root");
    EXPECT_EQ(doc.CreateRoot(S("other")), NMA_E_ROOTEXISTS);
    EXPECT_EQ(TagOf(doc.GetRoot()), "root");
}

TEST_F(XmlDocument, ComesOutAsItWentInButForCdata) {
    Doc doc(host.factory());
    doc.LoadFromString(
        S("<a x=\"1\" y=\"&lt;&quot;\"><b>text &amp; more</b><c><d/>tail</c>"
          "<e><![CDATA[lost]]></e></a>"));
    const std::string saved = Saved(doc);
    EXPECT_EQ(saved.find("lost"), std::string::npos);
    Doc again(host.factory());
    again.LoadFromString(S(saved.c_str()));
    Element* const root = again.GetRoot();
    EXPECT_EQ(AttributeOf(root, "x"), "1");
    EXPECT_EQ(AttributeOf(root, "y"), "<\"");
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 0)), "text & more");
    EXPECT_NE(root->FindChild(S("c"), 0)->FindChild(S("d"), 0), nullptr);
    EXPECT_EQ(TextOf(root->FindChild(S("c"), 0)), "tail");
    EXPECT_NE(root->FindChild(S("e"), 0), nullptr);
}

TEST_F(XmlDocument, GoesThroughAFile) {
    const TestFolder folder;
    const std::string path = (folder / "doc.xml").u8string();
    Doc doc(host.factory());
    doc.CreateRoot(S("root"));
    doc.GetRoot()->AddChildElementWithText(S("Name"), S("\xC3\xBC \xF0\x9F\x8E\xAC"));
    doc.SaveToFile(S(path.c_str()));
    Doc again(host.factory());
    again.LoadFromFile(S(path.c_str()));
    EXPECT_EQ(TextOf(again.GetRoot()->FindChild(S("Name"), 0)), "\xC3\xBC \xF0\x9F\x8E\xAC");
    std::filesystem::remove(std::filesystem::u8path(path));
    Doc absent(host.factory());
    EXPECT_LT(Thrown([&] { absent.LoadFromFile(S(path.c_str())); }), 0);
}

TEST_F(XmlDocument, SavesNothingWithoutARoot) {
    Doc doc(host.factory());
    NMAString text;
    EXPECT_EQ(Thrown([&] { doc.SaveToString(text); }), NMA_E_NOTINITIALIZED);
}

TEST_F(XmlDocument, ThrowsTheRefusalOfItsWriter) {
    Doc doc(host.factory());
    doc.CreateRoot(S("root"));
    host.refuseCreation(kCLSID_XmlWriter, NCF_E_ACCESSDENIED);
    NMAString text;
    EXPECT_EQ(Thrown([&] { doc.SaveToString(text); }), NCF_E_ACCESSDENIED);
}

}  // namespace
