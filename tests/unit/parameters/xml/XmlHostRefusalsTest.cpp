// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What the mirror asks of the host's two components, in which order, and what
// becomes of their refusals.

#include "tests/unit/parameters/xml/FakeXmlHost.h"
#include "tests/unit/parameters/xml/XmlTest.h"

namespace {

using NMA::XMLUtils::NMAXmlAttribute;
using NMA::XMLUtils::NMAXmlNode;
using NMA::XMLUtils::NMAXmlText;

// <root x="1"><child y="2">text</child></root>
class XmlHostRefusals : public XmlTest {
protected:
    XmlHostRefusals() {
        host.maker(kCLSID_XmlDocument, [this](const GUID& iid, void** out) {
            return reader->QueryInterface(iid, out);
        });
        host.maker(kCLSID_XmlWriter, [this](const GUID& iid, void** out) {
            return writer->QueryInterface(iid, out);
        });
    }
    ~XmlHostRefusals() override {
        doc.reset();
        EXPECT_EQ(root.references, 0);
        EXPECT_EQ(child.references, 0);
        EXPECT_EQ(reader->Release(), 0u);
        EXPECT_EQ(writer->Release(), 0u);
    }
    Element* Load() {
        doc->LoadFromString(S("text"));
        return doc->GetRoot();
    }

    FakeXmlNode root{kXmlElement, "root"};
    FakeXmlNode& x = root.AddAttribute("x", "1");
    FakeXmlNode& child = root.AddElement("child");
    FakeXmlNode& y = child.AddAttribute("y", "2");
    FakeXmlNode& text = child.AddText("text");
    FakeXmlDocument* reader = new FakeXmlDocument(&root);
    FakeXmlWriter* writer = new FakeXmlWriter;
    std::unique_ptr<Doc> doc = std::make_unique<Doc>(host.factory());
};

// Going through all children by their indexes asks each for its tag twice at
// most: once when it is stepped to, once when it is stepped from.
TEST_F(XmlHostRefusals, StepsFromChildToChild) {
    constexpr int kCount = 200;
    std::vector<FakeXmlNode*> children;
    for (int i = 0; i < kCount; ++i) {
        children.push_back(&root.AddElement(i % 2 == 0 ? "even" : "odd"));
    }
    Element* const element = Load();
    ncfUInt32 found = 0;
    while (element->FindChild(S("even"), found)) {
        ++found;
    }
    EXPECT_EQ(found, kCount / 2u);
    int questions = 0;
    for (const FakeXmlNode* one : children) {
        questions += one->tagQuestions;
    }
    EXPECT_LE(questions, 2 * kCount);
}

// What is added behind the attributes doesn't bring up their names again.
TEST_F(XmlHostRefusals, AsksEachAttributeForItsNameOnceHoweverMuchIsAdded) {
    constexpr int kCount = 50;
    std::vector<FakeXmlNode*> attributes{&x};
    for (int i = 1; i < kCount; ++i) {
        attributes.push_back(&root.AddAttribute("x" + std::to_string(i), "1"));
    }
    Element* const element = Load();
    for (int i = 0; i < kCount; ++i) {
        const std::string number = std::to_string(i);
        element->AddChildElement(S("new"), nullptr);
        element->AddText(S("text"));
        element->SetAttribute(S(("y" + number).c_str()), S("2"));
        element->AddChild(new NMAXmlAttribute(S(("z" + number).c_str()), S("3")));
    }
    EXPECT_EQ(AttributeOf(element, "x49"), "1");
    EXPECT_EQ(AttributeOf(element, "y49"), "2");
    EXPECT_EQ(AttributeOf(element, "z49"), "3");
    for (const FakeXmlNode* const attribute : attributes) {
        EXPECT_EQ(attribute->nameQuestions, 1);
    }
}

// --- loading ----------------------------------------------------------------------

TEST_F(XmlHostRefusals, EveryRefusedStepOfLoadingIsThrown) {
    struct {
        Refusals* refuser;
        const char* operation;
    } const kSteps[] = {{reader, "LoadFromText"}, {reader, "GetRootNode"}, {&root, "query node"}};
    for (const auto& step : kSteps) {
        step.refuser->results[step.operation] = NCF_E_ABORT;
        EXPECT_EQ(Thrown([&] { Load(); }), NCF_E_ABORT) << step.operation;
        EXPECT_EQ(doc->GetRoot(), nullptr);
        step.refuser->results.clear();
    }
    reader->results["Load"] = NCF_E_ACCESSDENIED;
    EXPECT_EQ(Thrown([&] { doc->LoadFromFile(S("path")); }), NCF_E_ACCESSDENIED);
}

TEST_F(XmlHostRefusals, ARootThatIsNoElementFails) {
    for (const XmlNodeType type : {kXmlAttribute, kXmlText, kXmlCDATA, kXmlOther}) {
        FakeXmlNode other(type, "other");
        auto* const odd = new FakeXmlDocument(&other);
        host.maker(kCLSID_XmlDocument,
                   [odd](const GUID& iid, void** out) { return odd->QueryInterface(iid, out); });
        Doc document(host.factory());
        EXPECT_EQ(Thrown([&] { document.LoadFromString(S("text")); }), NCF_E_FAIL);
        EXPECT_EQ(document.GetRoot(), nullptr);
        EXPECT_EQ(other.references, 0);
        odd->Release();
    }
}

TEST_F(XmlHostRefusals, ALoadThatFailsKeepsTheRootThatWasThere) {
    Element* const before = Load();
    reader->results["LoadFromText"] = NCF_E_FAIL;
    EXPECT_EQ(Thrown([&] { Load(); }), NCF_E_FAIL);
    EXPECT_EQ(doc->GetRoot(), before);
}

// --- reading ----------------------------------------------------------------------

TEST_F(XmlHostRefusals, NothingIsReadBelowTheLevelsThatAreLookedAt) {
    Element* const element = Load();
    EXPECT_EQ(root.childQuestions, 0);
    EXPECT_NE(element->FindChild(S("child"), 0), nullptr);
    EXPECT_EQ(element->CountChildren(S("")), 1u);
    EXPECT_EQ(root.childQuestions, 1) << "once";
    EXPECT_EQ(child.childQuestions, 0);
    EXPECT_EQ(TextOf(element->FindChild(S("child"), 0)), "text");
    EXPECT_EQ(child.childQuestions, 1);
}

TEST_F(XmlHostRefusals, ARefusedReadingIsThrownAndMayBeTriedAgain) {
    struct {
        FakeXmlNode* refuser;
        const char* operation;
    } const kSteps[] = {{&root, "GetAttributes"}, {&root, "GetItem"}, {&root, "GetChild"}};
    for (const auto& step : kSteps) {
        Element* const element = Load();
        step.refuser->results[step.operation] = NCF_E_ABORT;
        EXPECT_EQ(Thrown([&] { element->CountChildren(S("")); }), NCF_E_ABORT) << step.operation;
        step.refuser->results.clear();
        EXPECT_EQ(element->CountChildren(S("")), 1u) << step.operation;
        EXPECT_EQ(element->Children().size(), 2u) << "nothing twice";
        EXPECT_EQ(AttributeOf(element, "x"), "1");
    }
}

TEST_F(XmlHostRefusals, RefusedNamesAndValuesAreThrown) {
    Element* const element = Load();
    NMAString out;
    x.results["GetValue"] = NCF_E_ABORT;
    EXPECT_EQ(Thrown([&] { element->GetAttribute(S("x"), out); }), NCF_E_ABORT);
    child.results["GetTagName"] = NCF_E_FAIL;
    EXPECT_EQ(Thrown([&] { element->FindChild(S("child"), 0); }), NCF_E_FAIL);
    child.results = {{"query element", NCF_E_NOINTERFACE}};
    EXPECT_EQ(Thrown([&] { element->FindChild(S("child"), 0); }), NCF_E_NOINTERFACE);
    child.results.clear();
    Element* const found = element->FindChild(S("child"), 0);
    text.results["GetValue"] = NCF_E_OUTOFMEMORY;
    EXPECT_EQ(Thrown([&] { found->GetText(out); }), NCF_E_OUTOFMEMORY);
    root.results["GetName"] = NCF_E_FAIL;
    EXPECT_EQ(Thrown([&] { element->GetNodeName(out); }), NCF_E_FAIL);
}

// --- changing ---------------------------------------------------------------------

TEST_F(XmlHostRefusals, AChildThatCouldNotBeAddedStaysWithTheCaller) {
    Element* const element = Load();
    element->LoadChildren();
    FakeXmlNode foreign(kXmlAttribute, "foreign", "3");
    foreign.results["GetName"] = NCF_E_ABORT;  // it can't be indexed
    const std::unique_ptr<NMAXmlNode> added(NMAXmlNode::Wrap(&foreign));
    EXPECT_EQ(Thrown([&] { element->AddChild(added.get()); }), NCF_E_ABORT);
    EXPECT_EQ(added->Parent(), nullptr);
    EXPECT_EQ(Thrown([&] { element->GetOrAddChildForHostNode(&foreign); }), NCF_E_ABORT);
    EXPECT_EQ(element->Children().size(), 2u) << "what was there";
    EXPECT_EQ(foreign.references, 1) << "by the caller's node";
    foreign.results.clear();
    element->SetAttribute(S("z"), S("4"));
    EXPECT_EQ(AttributeOf(element, "z"), "4") << "where the refused one stood";
    element->AddChild(added.get());
    EXPECT_EQ(AttributeOf(element, "foreign"), "3");
    element->RemoveChild(added.get());
    EXPECT_FALSE(element->HasAttribute(S("foreign")));
    EXPECT_EQ(AttributeOf(element, "x"), "1");
}

// A deletion anywhere makes all names be asked for again.
TEST_F(XmlHostRefusals, NothingIsAddedWhileTheNamesCannotBeAsked) {
    Element* const element = Load();
    element->FindChild(S("child"), 0)->MarkDeleted();
    x.results["GetName"] = NCF_E_ABORT;
    Element added;
    EXPECT_EQ(Thrown([&] { element->AddChild(&added); }), NCF_E_ABORT);
    EXPECT_EQ(added.Parent(), nullptr);
    EXPECT_EQ(Thrown([&] { element->AddChildElement(S("new"), nullptr); }), NCF_E_ABORT);
    EXPECT_EQ(Thrown([&] { element->AddChildElementWithText(S("new"), S("t")); }), NCF_E_ABORT);
    EXPECT_EQ(Thrown([&] { element->AddText(S("new")); }), NCF_E_ABORT);
    EXPECT_EQ(element->Children().size(), 2u) << "what was there";
    x.results.clear();
    element->SetAttribute(S("z"), S("4"));
    EXPECT_EQ(AttributeOf(element, "x"), "1");
    EXPECT_EQ(AttributeOf(element, "z"), "4");
}

TEST_F(XmlHostRefusals, ARefusedIdentityIsThrown) {
    Element* const element = Load();
    const std::unique_ptr<NMAXmlNode> twin(NMAXmlNode::Wrap(&child));
    x.results["query identity"] = NCF_E_ABORT;
    EXPECT_EQ(Thrown([&] { element->AddChild(twin.get()); }), NCF_E_ABORT) << "of one on the way";
    x.results.clear();
    child.results["query identity"] = NCF_E_ABORT;
    EXPECT_EQ(Thrown([&] { element->AddChild(twin.get()); }), NCF_E_ABORT);
    EXPECT_EQ(Thrown([&] { element->RemoveChildForHostNode(&child); }), NCF_E_ABORT);
    EXPECT_EQ(element->Children().size(), 2u);
}

// Otherwise a long list of them takes a time that grows with its square.
TEST_F(XmlHostRefusals, AnAddedHostNodeIsNotComparedWithEveryChild) {
    Element* const element = Load();
    std::vector<std::unique_ptr<FakeXmlNode>> nodes;
    for (int i = 0; i < 500; ++i) {
        nodes.push_back(std::make_unique<FakeXmlNode>(kXmlText, "", std::to_string(i)));
        element->GetOrAddChildForHostNode(nodes.back().get());
    }
    EXPECT_EQ(element->Children().size(), 502u);
    EXPECT_EQ(element->GetOrAddChildForHostNode(nodes[250].get()), element->Children()[252]);
    EXPECT_LT(nodes[0]->identityQuestions, 10);
    element->RemoveChildForHostNode(nodes[250].get());
    EXPECT_EQ(element->GetOrAddChildForHostNode(nodes[251].get()), element->Children()[252])
        << "the next one has moved up";
    element->Reset();  // the nodes go before the document
}

TEST_F(XmlHostRefusals, AChildRemovedByItsHostNodeLetsThatGo) {
    Element* const element = Load();
    EXPECT_NE(element->FindChild(S("child"), 0), nullptr);
    EXPECT_EQ(child.references, 1);
    element->RemoveChildForHostNode(&child);
    EXPECT_EQ(child.references, 0);
}

TEST_F(XmlHostRefusals, AHostNodeOfAnotherTypeMakesNoChild) {
    Element* const element = Load();
    FakeXmlNode comment(kXmlOther, "comment");
    EXPECT_EQ(element->GetOrAddChildForHostNode(&comment), nullptr);
    EXPECT_EQ(element->Children().size(), 2u);
}

// --- writing ----------------------------------------------------------------------

TEST_F(XmlHostRefusals, WritesAttributesBeforeOtherChildrenEachUnderItsParentsName) {
    Element* const element = Load();
    element->AddText(S("tail"));
    element->SetAttribute(S("z"), S("3"));
    doc->SaveToFile(S("path"));
    EXPECT_EQ(writer->lines, (std::vector<std::string>{
                                 "Open path", "Element root -", "Attribute root x 1",
                                 "Attribute root z 3", "Element child root", "Attribute child y 2",
                                 "Text text child", "Text tail root", "Close"}));
}

TEST_F(XmlHostRefusals, SavingToATextOpensWithoutPathAndDoesNotClose) {
    doc->CreateRoot(S("a"));
    NMAString saved;
    doc->SaveToString(saved);
    EXPECT_STREQ(saved.GetUTF8String(), "the text");
    EXPECT_EQ(writer->lines, (std::vector<std::string>{"Open -", "Element a -", "GetText"}));
}

TEST_F(XmlHostRefusals, DeletedNodesAreNotWritten) {
    Element* const element = Load();
    element->RemoveAttribute(S("x"));
    Element* const found = element->FindChild(S("child"), 0);
    found->LoadChildren();
    for (NMAXmlNode* const node : found->Children()) {
        node->MarkDeleted();
    }
    doc->SaveToFile(S("path"));
    EXPECT_EQ(writer->lines, (std::vector<std::string>{"Open path", "Element root -",
                                                       "Element child root", "Close"}));
}

TEST_F(XmlHostRefusals, EveryRefusalOfTheWriterIsThrown) {
    Load();
    for (const char* const operation : {"Open", "Element", "Attribute", "Text", "Close"}) {
        writer->results[operation] = NCF_E_ABORT;
        EXPECT_EQ(Thrown([&] { doc->SaveToFile(S("path")); }), NCF_E_ABORT) << operation;
        writer->results.clear();
    }
    writer->results["GetText"] = NCF_E_ABORT;
    NMAString saved(S("before"));
    EXPECT_EQ(Thrown([&] { doc->SaveToString(saved); }), NCF_E_ABORT);
    EXPECT_STREQ(saved.GetUTF8String(), "before");
}

}  // namespace
