// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/xml/NMAXmlNode.h"

#include <memory>

#include "source/parameters/xml/NMAXmlElement.h"
#include "tests/unit/parameters/xml/XmlTest.h"

namespace {

using NMA::XMLUtils::NMAXmlAttribute;
using NMA::XMLUtils::NMAXmlCDATA;
using NMA::XMLUtils::NMAXmlNode;
using NMA::XMLUtils::NMAXmlText;

class XmlNode : public XmlTest {
protected:
    Element* load(const char* text) {
        doc.LoadFromString(S(text));
        return doc.GetRoot();
    }
    // The host node behind a child of the root, with a reference.
    NCFSmartPtr<IXmlNode> hostChild(Element* root, ncfUInt32 index) {
        NCFSmartPtr<IXmlNode> child;
        EXPECT_EQ(root->HostNode()->GetChild(index, child.outArg()), NCF_OK);
        return child;
    }
    Doc doc{host.factory()};
};

TEST_F(XmlNode, ReadsItsChildrenWhenTheyAreFirstAskedFor) {
    Element* const root = load("<a x=\"1\"><b/>t</a>");
    EXPECT_TRUE(root->Children().empty());
    root->LoadChildren();
    EXPECT_EQ(root->GetState(), NMAXmlNode::kInStep);
    ASSERT_EQ(root->Children().size(), 3u);
    EXPECT_NE(dynamic_cast<NMAXmlAttribute*>(root->Children()[0]), nullptr) << "attributes first";
    EXPECT_EQ(root->Children()[1]->Parent(), root);
}

TEST_F(XmlNode, LeavesOutCommentsAndInstructions) {
    Element* const root = load("<a><!-- c --><b/><?p i?></a>");
    root->LoadChildren();
    EXPECT_EQ(root->Children().size(), 1u);
}

TEST_F(XmlNode, WrapsEveryKindInItsClass) {
    Element* const root = load("<a x=\"1\">t<![CDATA[c]]><b/></a>");
    root->LoadChildren();
    ASSERT_EQ(root->Children().size(), 4u);
    EXPECT_NE(dynamic_cast<NMAXmlAttribute*>(root->Children()[0]), nullptr);
    EXPECT_NE(dynamic_cast<NMAXmlText*>(root->Children()[1]), nullptr);
    EXPECT_NE(dynamic_cast<NMAXmlCDATA*>(root->Children()[2]), nullptr);
    EXPECT_NE(dynamic_cast<Element*>(root->Children()[3]), nullptr);
    EXPECT_EQ(Thrown([] { NMAXmlNode::Wrap(nullptr); }), NCF_E_INVALIDARG);
}

TEST_F(XmlNode, WithoutHostNodeIsNotInitialized) {
    Element element;
    element.Reset();
    NMAString text;
    EXPECT_EQ(Thrown([&] { element.LoadChildren(); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { element.GetNodeName(text); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { element.GetNodeValue(text); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { element.Refresh(); }), NMA_E_NOTINITIALIZED);
}

TEST_F(XmlNode, GivesNameAndValueOfItsHostNode) {
    Element* const root = load("<a/>");
    NMAString name;
    root->GetNodeName(name);
    EXPECT_STREQ(name.GetUTF8String(), "a");
}

TEST_F(XmlNode, AddsAChildOnceAndLoadsFirst) {
    Element* const root = load("<a><b/></a>");
    auto child = std::make_unique<Element>();
    child->SetTagName(S("c"));
    root->AddChild(child.get());
    Element* const added = child.release();
    EXPECT_EQ(root->GetState(), NMAXmlNode::kChanged);
    EXPECT_EQ(added->Parent(), root);
    EXPECT_EQ(root->CountChildren(S("")), 2u) << "the host's child is still there";
    EXPECT_EQ(Thrown([&] { root->AddChild(nullptr); }), NCF_E_INVALIDARG);

    const std::unique_ptr<NMAXmlNode> twin(NMAXmlNode::Wrap(hostChild(root, 0).inArg()));
    EXPECT_EQ(Thrown([&] { root->AddChild(twin.get()); }), NCF_E_UNEXPECTED);
}

TEST_F(XmlNode, FindsTheChildOfAHostNodeOrMakesIt) {
    Element* const root = load("<a><b/></a>");
    const auto node = hostChild(root, 0);
    EXPECT_EQ(root->GetOrAddChildForHostNode(node.inArg()), root->FindChild(S("b"), 0));
    EXPECT_EQ(root->CountChildren(S("")), 1u);

    Doc other(host.factory());
    other.LoadFromString(S("<x><y/></x>"));
    NCFSmartPtr<IXmlNode> foreign;
    other.GetRoot()->HostNode()->GetChild(0, foreign.outArg());
    NMAXmlNode* const made = root->GetOrAddChildForHostNode(foreign.inArg());
    ASSERT_NE(made, nullptr);
    EXPECT_EQ(root->CountChildren(S("")), 2u);
    EXPECT_EQ(Thrown([&] { root->GetOrAddChildForHostNode(nullptr); }), NCF_E_INVALIDARG);
}

TEST_F(XmlNode, RemovesAChildWithoutDeletingIt) {
    Element* const root = load("<a><b/></a>");
    const std::unique_ptr<NMAXmlNode> child(root->FindChild(S("b"), 0));
    root->RemoveChild(child.get());
    EXPECT_EQ(root->CountChildren(S("")), 0u);
    EXPECT_EQ(root->GetState(), NMAXmlNode::kChanged);
    EXPECT_EQ(Thrown([&] { root->RemoveChild(child.get()); }), NCF_OK) << "no child: no failure";
    EXPECT_EQ(Thrown([&] { root->RemoveChild(nullptr); }), NCF_E_INVALIDARG);
}

TEST_F(XmlNode, RemovesAChildByItsHostNode) {
    Element* const root = load("<a><b/></a>");
    const auto node = hostChild(root, 0);
    root->RemoveChildForHostNode(node.inArg());
    EXPECT_EQ(root->CountChildren(S("")), 0u);
    EXPECT_EQ(Thrown([&] { root->RemoveChildForHostNode(node.inArg()); }), NMA_E_NODATA);
    EXPECT_EQ(Thrown([&] { root->RemoveChildForHostNode(nullptr); }), NCF_E_INVALIDARG);
}

TEST_F(XmlNode, RefreshReadsTheHostAgainUnlessInStep) {
    Element* const root = load("<a><b/></a>");
    root->LoadChildren();
    NMAXmlNode* const before = root->Children()[0];
    root->Refresh();
    EXPECT_EQ(root->Children()[0], before) << "in step: nothing is read";
    root->AddChildElement(S("c"), nullptr);
    root->Refresh();
    EXPECT_EQ(root->CountChildren(S("")), 1u);
    EXPECT_EQ(root->GetState(), NMAXmlNode::kInStep);
}

TEST_F(XmlNode, DiscardsWhatWasMadeInMemoryHereAndBelow) {
    Element* const root = load("<a x=\"1\"><b/></a>");
    root->AddChildElement(S("c"), nullptr);
    root->FindChild(S("b"), 0)->AddChildElement(S("d"), nullptr);
    root->SetAttribute(S("y"), S("2"));
    root->DiscardNewChildren();
    EXPECT_EQ(root->CountChildren(S("")), 1u);
    EXPECT_EQ(root->FindChild(S("b"), 0)->CountChildren(S("")), 0u);
    EXPECT_EQ(root->GetState(), NMAXmlNode::kInStep);
}

TEST_F(XmlNode, DiscardingBringsTheAttributesOfTheHostBack) {
    Element* const root = load("<a x=\"1\" y=\"2\"><b/></a>");
    root->SetAttribute(S("x"), S("changed"));
    root->RemoveAttribute(S("y"));
    root->SetAttribute(S("z"), S("new"));
    root->DiscardNewChildren();
    EXPECT_EQ(AttributeOf(root, "x"), "1");
    EXPECT_EQ(AttributeOf(root, "y"), "2");
    EXPECT_FALSE(root->HasAttribute(S("z")));
    root->SetAttribute(S("z"), S("again"));
    EXPECT_EQ(AttributeOf(root, "z"), "again");
}

TEST_F(XmlNode, CopiesItselfWithItsChildrenUnderTheTarget) {
    Element* const root = load("<a x=\"1\"><b>t</b></a>");
    root->SetAttribute(S("x"), S("2"));
    root->FindChild(S("b"), 0)->AddText(S("u"));
    Element copy;
    root->CopyTo(copy);
    EXPECT_EQ(copy.Origin(), root->Origin());
    EXPECT_EQ(copy.GetState(), root->GetState());
    EXPECT_EQ(TagOf(&copy), "a");
    EXPECT_EQ(AttributeOf(&copy, "x"), "2");
    Element* const child = copy.FindChild(S("b"), 0);
    EXPECT_EQ(TextOf(child), "tu");
    EXPECT_EQ(child->Parent(), &copy);
    Element childCopy;
    child->CopyTo(childCopy);
    EXPECT_EQ(childCopy.Parent(), &copy) << "the target itself gets the parent of its model";
    EXPECT_NE(child, root->FindChild(S("b"), 0));
}

TEST_F(XmlNode, CopiesWhatWasMadeInMemory) {
    doc.CreateRoot(S("made"));
    Element* const root = doc.GetRoot();
    root->SetAttribute(S("x"), S("1"));
    root->AddChildElementWithText(S("b"), S("t"));
    Element copy;
    root->CopyTo(copy);
    EXPECT_EQ(copy.Origin(), NMAXmlNode::kOriginMemory);
    EXPECT_EQ(TagOf(&copy), "made");
    EXPECT_EQ(AttributeOf(&copy, "x"), "1");
    EXPECT_EQ(TextOf(copy.FindChild(S("b"), 0)), "t");
}

TEST_F(XmlNode, CopyReplacesWhatTheTargetHeld) {
    Element* const root = load("<a><b/></a>");
    root->LoadChildren();
    Element copy;
    copy.SetTagName(S("old"));
    copy.AddChildElement(S("gone"), nullptr);
    root->CopyTo(copy);
    EXPECT_EQ(copy.CountChildren(S("gone")), 0u);
    EXPECT_EQ(copy.CountChildren(S("b")), 1u);
}

TEST_F(XmlNode, ADeletedTextIsEmpty) {
    Element* const root = load("<a>t</a>");
    root->LoadChildren();
    auto* const text = dynamic_cast<NMAXmlText*>(root->Children()[0]);
    ASSERT_NE(text, nullptr);
    text->MarkDeleted();
    EXPECT_TRUE(text->GetText().IsEmpty());
}

// --- writing ------------------------------------------------------------------------

TEST_F(XmlNode, WritingWithoutAWriterFails) {
    Element element;
    element.SetTagName(S("a"));
    NMAXmlAttribute attribute(S("x"), S("1"));
    NMAXmlText text(S("t"));
    NMAXmlCDATA section;
    EXPECT_EQ(Thrown([&] { element.WriteTo(nullptr); }), NCF_E_INVALIDARG);
    EXPECT_EQ(attribute.WriteTo(nullptr), NCF_E_INVALIDARG) << "told, not thrown";
    EXPECT_EQ(Thrown([&] { text.WriteTo(nullptr); }), NCF_E_INVALIDARG);
    EXPECT_EQ(Thrown([&] { section.WriteTo(nullptr); }), NCF_E_INVALIDARG);
}

TEST_F(XmlNode, LeavesWithoutAnElementAroundThemCanNotBeWritten) {
    NCFSmartPtr<IXmlWriter> writer;
    ASSERT_EQ(ncfCreate(host.factory(), kCLSID_XmlWriter, kIID_XmlWriter, writer), NCF_OK);
    writer->Open(nullptr);
    NMAXmlAttribute attribute(S("x"), S("1"));
    NMAXmlText text(S("t"));
    EXPECT_EQ(Thrown([&] { attribute.WriteTo(writer.inArg()); }), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Thrown([&] { text.WriteTo(writer.inArg()); }), NMA_E_NOTINITIALIZED);
}

// The destructor takes two places.
TEST_F(XmlNode, KeepsTheOrderOfItsVirtualOperations) {
    Element* const root = load("<a><b/></a>");
    NMAXmlNode* const node = root;
    void** const table = *reinterpret_cast<void***>(node);
    reinterpret_cast<void (*)(NMAXmlNode*)>(table[2])(node);
    EXPECT_EQ(node->GetState(), NMAXmlNode::kInStep) << "LoadChildren";
    reinterpret_cast<void (*)(NMAXmlNode*)>(table[3])(node);
    EXPECT_EQ(node->GetState(), NMAXmlNode::kChanged) << "SetChanged";
    Element copy;
    reinterpret_cast<void (*)(NMAXmlNode*, NMAXmlNode*)>(table[4])(node, &copy);
    EXPECT_EQ(copy.GetState(), NMAXmlNode::kChanged) << "CopyTo";
    reinterpret_cast<void (*)(NMAXmlNode*)>(table[11])(node);
    EXPECT_EQ(node->GetState(), NMAXmlNode::kInStep) << "Refresh";
    reinterpret_cast<void (*)(NMAXmlNode*)>(table[6])(node);
    EXPECT_EQ(node->GetState(), NMAXmlNode::kDeleted) << "MarkDeleted";
    reinterpret_cast<void (*)(NMAXmlNode*)>(table[5])(node);
    EXPECT_EQ(node->GetState(), NMAXmlNode::kUnread) << "Reset";
    EXPECT_EQ(node->HostNode(), nullptr);
}

TEST_F(XmlNode, KeepsTheOrderOfItsOperationsOnChildren) {
    Element* const root = load("<a><b/></a>");
    NMAXmlNode* const node = root;
    void** const table = *reinterpret_cast<void***>(node);
    const auto hostNode = hostChild(root, 0);
    auto* const added = new Element;
    reinterpret_cast<void (*)(NMAXmlNode*, NMAXmlNode*)>(table[7])(node, added);
    EXPECT_EQ(node->Children().size(), 2u) << "AddChild";
    using FindByHost = NMAXmlNode* (*)(NMAXmlNode*, IXmlNode*);
    EXPECT_EQ(reinterpret_cast<FindByHost>(table[8])(node, hostNode.inArg()), node->Children()[0])
        << "GetOrAddChildForHostNode";
    reinterpret_cast<void (*)(NMAXmlNode*, NMAXmlNode*)>(table[9])(node, added);
    EXPECT_EQ(node->Children().size(), 1u) << "RemoveChild";
    delete added;
    reinterpret_cast<void (*)(NMAXmlNode*, IXmlNode*)>(table[10])(node, hostNode.inArg());
    EXPECT_EQ(node->Children().size(), 0u) << "RemoveChildForHostNode";
    node->AddChild(new Element);
    reinterpret_cast<void (*)(NMAXmlNode*)>(table[12])(node);
    EXPECT_EQ(node->Children().size(), 0u) << "DiscardNewChildren";
    using Write = NCFRESULT (*)(NMAXmlNode*, IXmlWriter*);
    EXPECT_EQ(Thrown([&] { reinterpret_cast<Write>(table[13])(node, nullptr); }), NCF_E_INVALIDARG)
        << "WriteTo";
    NMAXmlAttribute attribute(S("name"), S("value"));
    void** const itsTable = *reinterpret_cast<void***>(static_cast<NMAXmlNode*>(&attribute));
    using Read = void (*)(NMAXmlNode*, NMAString*);
    NMAString text;
    reinterpret_cast<Read>(itsTable[14])(&attribute, &text);
    EXPECT_STREQ(text.GetUTF8String(), "name");
    reinterpret_cast<Read>(itsTable[15])(&attribute, &text);
    EXPECT_STREQ(text.GetUTF8String(), "value");
}

}  // namespace
