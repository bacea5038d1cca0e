// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/xml/NMAXmlElement.h"

#include <memory>

#include "tests/unit/parameters/xml/XmlTest.h"

namespace {

using NMA::XMLUtils::NMAXmlAttribute;
using NMA::XMLUtils::NMAXmlNode;
using NMA::XMLUtils::NMAXmlPair;

class XmlElement : public XmlTest {
protected:
    Element* load(const char* text) {
        doc.LoadFromString(S(text));
        return doc.GetRoot();
    }
    Doc doc{host.factory()};
};

// --- finding children ----------------------------------------------------------

TEST_F(XmlElement, FindsChildrenByNameInOrder) {
    Element* const root = load("<a><b>1</b>text<c/><b>2</b><B/></a>");
    EXPECT_EQ(root->CountChildren(S("b")), 2u);
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 1)), "2");
    EXPECT_EQ(root->FindChild(S("b"), 2), nullptr);
    EXPECT_EQ(root->FindChild(S("x"), 0), nullptr);
    std::vector<Element*> found;
    root->CollectChildren(S("b"), found);
    EXPECT_EQ(found.size(), 2u);
}

TEST_F(XmlElement, FindsChildrenByIndexesInAnyOrderAndAfterChanges) {
    doc.CreateRoot(S("a"));
    Element* const root = doc.GetRoot();
    for (const char* const text : {"0", "1", "2", "3"}) {
        root->AddChildElementWithText(S("b"), S(text));
        root->AddChildElementWithText(S("c"), S("c"));
    }
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 2)), "2");
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 3)), "3");
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 0)), "0");
    EXPECT_EQ(TextOf(root->FindChild(S(""), 2)), "1") << "another name counts anew";
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 2)), "2");
    // In front of the one found last a match goes, then one comes.
    Element* const first = root->FindChild(S("b"), 0);
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 2)), "2");
    root->RemoveChild(first);
    delete first;
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 2)), "3");
    Element* const other = root->FindChild(S("c"), 0);
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 2)), "3");
    other->SetTagName(S("b"));  // in front of it, one more
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 2)), "2");
    other->SetTagName(S("c"));
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 2)), "3");
    root->RemoveChild(other);  // in front of it, one that doesn't match
    delete other;
    EXPECT_EQ(TextOf(root->FindChild(S("b"), 2)), "3");
}

// The document may be gone by then.
TEST_F(XmlElement, RenamesAnElementThatWasTakenOutOfItsDocument) {
    auto gone = std::make_unique<Doc>(host.factory());
    gone->CreateRoot(S("a"));
    Element* child = nullptr;
    gone->GetRoot()->AddChildElement(S("b"), &child);
    gone->GetRoot()->RemoveChild(child);
    const std::unique_ptr<Element> removed(child);
    Element copy;
    removed->CopyTo(copy);
    gone.reset();
    removed->SetTagName(S("c"));
    copy.SetTagName(S("d"));
    EXPECT_EQ(TagOf(removed.get()), "c");
    EXPECT_EQ(TagOf(&copy), "d");
}

// Through the attribute itself; the element learns of it with its next change.
TEST_F(XmlElement, LearnsWhatBecameOfItsAttributesWithItsNextChange) {
    Element* const root = load("<a x=\"1\" y=\"2\"/>");
    NMAXmlAttribute* const first = root->FindAttribute(S("x"));
    first->MarkDeleted();
    root->AddText(S("t"));
    EXPECT_FALSE(root->HasAttribute(S("x")));
    first->DiscardNewChildren();  // brings it back
    root->AddText(S("t"));
    EXPECT_EQ(AttributeOf(root, "x"), "1");
    NMAXmlAttribute(S("z"), S("3")).CopyTo(*first);
    root->AddText(S("t"));
    EXPECT_EQ(AttributeOf(root, "z"), "3");
    EXPECT_FALSE(root->HasAttribute(S("x")));
    EXPECT_EQ(AttributeOf(root, "y"), "2");
}

// Attributes may stand behind other children, which come and go.
TEST_F(XmlElement, KnowsItsAttributesWhereverTheyStand) {
    doc.CreateRoot(S("a"));
    Element* const root = doc.GetRoot();
    root->AddText(S("text"));
    root->SetAttribute(S("x"), S("1"));
    root->AddChildElement(S("b"), nullptr);
    root->SetAttribute(S("y"), S("2"));
    EXPECT_EQ(AttributeOf(root, "y"), "2");
    root->SetText(S("other"));  // the first child goes, all others move
    EXPECT_EQ(AttributeOf(root, "x"), "1");
    EXPECT_EQ(AttributeOf(root, "y"), "2");
    root->RemoveChildren(S("b"));
    root->SetAttribute(S("y"), S("3"));
    EXPECT_EQ(AttributeOf(root, "y"), "3");
    root->RemoveAttribute(S("x"));
    EXPECT_FALSE(root->HasAttribute(S("x")));
    std::vector<NMAXmlNode*> attributes;
    root->GetAttributes(attributes);
    EXPECT_EQ(attributes.size(), 2u) << "deleted ones stay in the list";
}

TEST_F(XmlElement, EmptyNameFindsElementsOnly) {
    Element* const root = load("<a x=\"1\">text<b/>more<c/></a>");
    EXPECT_EQ(root->CountChildren(S("")), 2u);
    EXPECT_EQ(TagOf(root->FindChild(S(""), 1)), "c");
}

TEST_F(XmlElement, CountsADeletedChildButDoesNotWriteIt) {
    Element* const root = load("<a><b/><c/></a>");
    root->FindChild(S("b"), 0)->MarkDeleted();
    EXPECT_EQ(root->CountChildren(S("b")), 1u);
    const std::string saved = Saved(doc);
    EXPECT_EQ(saved.find("<b"), std::string::npos);
    EXPECT_NE(saved.find("<c"), std::string::npos);
}

TEST_F(XmlElement, SelectsByAllAttributesWithFoldedCase) {
    Element* const root = load("<a><b x=\"One\" y=\"2\"/><b x=\"one\" y=\"3\"/><b x=\"one\"/></a>");
    const NMAXmlPair pairs[] = {{L"x", L"ONE"}, {L"y", L"3"}};
    EXPECT_EQ(root->CountChildrenWithAttributes(S("b"), pairs, 2), 1u);
    EXPECT_EQ(AttributeOf(root->FindChildWithAttributes(S("b"), pairs, 2, 0), "y"), "3");
    EXPECT_EQ(root->FindChildWithAttributes(S("b"), pairs, 2, 1), nullptr);
    EXPECT_EQ(root->CountChildrenWithAttributes(S("b"), pairs, 1), 3u);
    std::vector<Element*> found;
    root->CollectChildrenWithAttributes(S(""), pairs, 1, found);
    EXPECT_EQ(found.size(), 3u);
}

TEST_F(XmlElement, MatchesAttributesWithRegardToCaseWhenAsked) {
    Element* const root = load("<a x=\"One\"/>");
    const NMAXmlPair same[] = {{L"x", L"One"}};
    const NMAXmlPair folded[] = {{L"x", L"one"}};
    const NMAXmlPair absent[] = {{L"y", L"one"}};
    EXPECT_TRUE(root->MatchesAttributes(same, 1, 1));
    EXPECT_FALSE(root->MatchesAttributes(folded, 1, 1));
    EXPECT_TRUE(root->MatchesAttributes(folded, 1, 0));
    EXPECT_FALSE(root->MatchesAttributes(absent, 1, 0));
    EXPECT_TRUE(root->MatchesAttributes(nullptr, 1, 0));
    EXPECT_TRUE(root->MatchesAttributes(absent, 0, 0));
}

TEST_F(XmlElement, MatchesChildrenByAnyText) {
    Element* const root = load("<a><b><id>1</id><name>x</name></b><b><id>2</id></b></a>");
    const NMAXmlPair pairs[] = {{L"id", L"9"}, {L"name", L"X"}};
    EXPECT_EQ(root->CountChildrenWithChildren(S("b"), pairs, 2), 1u);
    const NMAXmlPair second[] = {{L"id", L"2"}};
    EXPECT_EQ(root->FindChildWithChildren(S("b"), second, 1, 0), root->FindChild(S("b"), 1));
    EXPECT_FALSE(root->FindChild(S("b"), 0)->MatchesChildren(pairs, 2, 1));
    std::vector<Element*> found;
    root->CollectChildrenWithChildren(S("b"), second, 1, found);
    EXPECT_EQ(found.size(), 1u);
}

TEST_F(XmlElement, MatchesAnyOfSeveralChildrenOfOneName) {
    Element* const root = load("<a><b><id>1</id><id>2</id><id>3</id></b><b><id>4</id></b></a>");
    Element* const first = root->FindChild(S("b"), 0);
    for (const wchar_t* const id : {L"1", L"2", L"3"}) {
        const NMAXmlPair pair[] = {{L"id", id}};
        EXPECT_TRUE(first->MatchesChildren(pair, 1, 1));
        EXPECT_EQ(root->CountChildrenWithChildren(S("b"), pair, 1), 1u);
    }
    const NMAXmlPair neither[] = {{L"id", L"4"}};
    EXPECT_FALSE(first->MatchesChildren(neither, 1, 1));
}

// --- attributes -----------------------------------------------------------------

TEST_F(XmlElement, ReadsAttributesAndThrowsNoDataForAbsentOnes) {
    Element* const root = load("<a x=\"1\"/>");
    EXPECT_TRUE(root->HasAttribute(S("x")));
    EXPECT_FALSE(root->HasAttribute(S("y")));
    NMAString value;
    EXPECT_EQ(Thrown([&] { root->GetAttribute(S("y"), value); }), NMA_E_NODATA);
}

TEST_F(XmlElement, GivesTheNewValueOfAnAttributeThatCameFromTheHost) {
    Element* const root = load("<a x=\"1\" y=\"2\"><b/></a>");
    root->SetAttribute(S("x"), S("new"));
    EXPECT_EQ(AttributeOf(root, "x"), "new");
    EXPECT_EQ(AttributeOf(root, "y"), "2");
    EXPECT_EQ(root->GetState(), NMAXmlNode::kChanged);
    EXPECT_NE(Saved(doc).find("x=\"new\""), std::string::npos);
}

TEST_F(XmlElement, MakesAnAttributeThatIsAbsentAndKeepsTheChildren) {
    Element* const root = load("<a><b/></a>");
    root->SetAttribute(S("x"), S("1"));
    EXPECT_EQ(AttributeOf(root, "x"), "1");
    EXPECT_EQ(root->CountChildren(S("b")), 1u);
    EXPECT_NE(Saved(doc).find("<a x=\"1\">"), std::string::npos);
}

TEST_F(XmlElement, RemovesAnAttributeOnce) {
    Element* const root = load("<a x=\"1\" y=\"2\"><b/></a>");
    root->RemoveAttribute(S("x"));
    EXPECT_FALSE(root->HasAttribute(S("x")));
    EXPECT_TRUE(root->HasAttribute(S("y")));
    EXPECT_EQ(Thrown([&] { root->RemoveAttribute(S("x")); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { root->RemoveAttribute(S("z")); }), NMA_E_NODATA);
    const std::string saved = Saved(doc);
    EXPECT_EQ(saved.find("x="), std::string::npos);
    EXPECT_NE(saved.find("<b"), std::string::npos);
}

TEST_F(XmlElement, RemovesAllAttributesOfAName) {
    Element* const root = load("<a x=\"1\" y=\"2\"/>");
    root->AddChild(new NMAXmlAttribute(S("x"), S("3")));
    root->AddChild(new NMAXmlAttribute(S("x"), S("4")));
    root->RemoveAttribute(S("x"));
    EXPECT_FALSE(root->HasAttribute(S("x")));
    std::vector<NMAXmlNode*> attributes;
    root->GetAttributes(attributes);
    ASSERT_EQ(attributes.size(), 4u) << "marked, not taken out";
    EXPECT_EQ(attributes[0]->GetState(), NMAXmlNode::kDeleted);
    EXPECT_NE(attributes[1]->GetState(), NMAXmlNode::kDeleted);
    EXPECT_EQ(attributes[2]->GetState(), NMAXmlNode::kDeleted);
    EXPECT_EQ(attributes[3]->GetState(), NMAXmlNode::kDeleted);
    EXPECT_NE(Saved(doc).find("<a y=\"2\""), std::string::npos);
}

TEST_F(XmlElement, SetsAnAttributeAgainAfterItWasRemoved) {
    Element* const root = load("<a x=\"1\"/>");
    root->RemoveAttribute(S("x"));
    root->SetAttribute(S("x"), S("2"));
    EXPECT_EQ(AttributeOf(root, "x"), "2");
}

TEST_F(XmlElement, ReadingADeletedAttributeThrowsNoData) {
    Element* const root = load("<a x=\"1\"/>");
    std::vector<NMAXmlNode*> attributes;
    root->GetAttributes(attributes);
    ASSERT_EQ(attributes.size(), 1u);
    attributes[0]->MarkDeleted();
    NMAString text;
    EXPECT_EQ(Thrown([&] { attributes[0]->GetNodeName(text); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { attributes[0]->GetNodeValue(text); }), NMA_E_NODATA);
}

TEST_F(XmlElement, SeparatesAttributesFromOtherChildren) {
    Element* const root = load("<a x=\"1\" y=\"2\">text<b/></a>");
    std::vector<NMAXmlNode*> attributes;
    std::vector<NMAXmlNode*> others;
    root->GetAttributes(attributes);
    root->GetNonAttributes(others);
    EXPECT_EQ(attributes.size(), 2u);
    EXPECT_EQ(others.size(), 2u);
}

// --- text -------------------------------------------------------------------------

TEST_F(XmlElement, JoinsTextsAndLeavesCdataOut) {
    Element* const root = load("<a>one<b/>two<![CDATA[three]]></a>");
    EXPECT_EQ(TextOf(root), "onetwo");
}

TEST_F(XmlElement, GivesEmptyTextForACdataValue) {
    Element* const root = load("<a><Name><![CDATA[value]]></Name><Other/></a>");
    EXPECT_EQ(TextOf(root->FindChild(S("Name"), 0)), "");
    EXPECT_EQ(TextOf(root->FindChild(S("Other"), 0)), "");
}

TEST_F(XmlElement, ReplacesAllTextsByOne) {
    Element* const root = load("<a>one<b/>two</a>");
    root->AddText(S("three"));
    root->SetText(S("new"));
    EXPECT_EQ(TextOf(root), "new");
    EXPECT_EQ(root->CountChildren(S("b")), 1u);
    root->SetText(S("again"));
    EXPECT_EQ(TextOf(root), "again");
    const std::string saved = Saved(doc);
    EXPECT_EQ(saved.find("one"), std::string::npos);
    EXPECT_NE(saved.find("again"), std::string::npos);
}

// --- changing ---------------------------------------------------------------------

TEST_F(XmlElement, TagOfAHostElementCanNotBeChanged) {
    Element* const root = load("<a/>");
    EXPECT_EQ(Thrown([&] { root->SetTagName(S("b")); }), NCF_E_UNEXPECTED);
}

TEST_F(XmlElement, RemovesChildrenByName) {
    Element* const root = load("<a><b/><c/><b/></a>");
    Element* added = nullptr;
    root->AddChildElement(S("b"), &added);
    ASSERT_NE(added, nullptr);
    EXPECT_EQ(root->CountChildren(S("b")), 3u);
    root->RemoveChildren(S("b"));
    EXPECT_EQ(root->CountChildren(S("b")), 2u) << "those of the host are marked, not taken out";
    EXPECT_EQ(Saved(doc).find("<b"), std::string::npos);
    root->RemoveChildren(S(""));
    EXPECT_EQ(Saved(doc).find("<c"), std::string::npos);
}

TEST_F(XmlElement, RemovingChildrenIsAChangeOnlyWhenThereAreSome) {
    Element* const root = load("<a x=\"1\"><b/></a>");
    root->RemoveChildren(S("c"));
    EXPECT_EQ(root->GetState(), NMAXmlNode::kInStep);
    root->RemoveChildren(S("b"));
    EXPECT_EQ(root->GetState(), NMAXmlNode::kChanged);
}

TEST_F(XmlElement, RemovesChildrenBySelection) {
    Element* const root = load("<a><b x=\"1\"/><b x=\"2\"><id>7</id></b></a>");
    const NMAXmlPair first[] = {{L"x", L"1"}};
    root->RemoveChildrenWithAttributes(S("b"), first, 1);
    EXPECT_EQ(root->FindChild(S("b"), 0)->GetState(), NMAXmlNode::kDeleted);
    const NMAXmlPair seven[] = {{L"id", L"7"}};
    root->RemoveChildrenWithChildren(S("b"), seven, 1);
    EXPECT_EQ(root->FindChild(S("b"), 1)->GetState(), NMAXmlNode::kDeleted);
}

TEST_F(XmlElement, WritesChildrenUnderTheirParents) {
    doc.CreateRoot(S("root"));
    Element* group = nullptr;
    doc.GetRoot()->AddChildElement(S("group"), &group);
    group->SetAttribute(S("id"), S("1"));
    group->AddChildElementWithText(S("value"), S("a<b"));
    doc.GetRoot()->AddChildElementWithText(S("tail"), S("t"));
    Doc again(host.factory());
    again.LoadFromString(S(Saved(doc).c_str()));
    Element* const found = again.GetRoot()->FindChild(S("group"), 0);
    ASSERT_NE(found, nullptr);
    EXPECT_EQ(AttributeOf(found, "id"), "1");
    EXPECT_EQ(TextOf(found->FindChild(S("value"), 0)), "a<b");
    EXPECT_NE(again.GetRoot()->FindChild(S("tail"), 0), nullptr);
}

}  // namespace
