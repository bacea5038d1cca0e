// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlDocument.h"

#include "tests/unit/xml/XmlFixture.h"

using host::MakeRef;
using host::MakeString;
using host::Ref;

namespace {

class XmlDocumentTest : public XmlTest {
protected:
    Ref<IXmlNode> Root(const std::string& text) {
        EXPECT_EQ(NCF_OK, document_->LoadFromText(MakeString(text).get()));
        return RootNode();
    }
    Ref<IXmlNode> RootNode() {
        Ref<INCFUnknown> root;
        EXPECT_EQ(NCF_OK, document_->GetRootNode(root.Out()));
        Ref<IXmlNode> node;
        EXPECT_EQ(NCF_OK, host::Query(root.get(), node));
        return node;
    }
    static Ref<IXmlNode> Child(const Ref<IXmlNode>& node, ncfUInt32 index) {
        Ref<IXmlNode> child;
        EXPECT_EQ(NCF_OK, node->GetChild(index, child.Out()));
        return child;
    }
    static Ref<IXmlNode> Attribute(const Ref<IXmlNode>& node, ncfUInt32 index) {
        Ref<IXmlAttributeList> list;
        EXPECT_EQ(NCF_OK, node->GetAttributes(list.Out()));
        Ref<IXmlNode> item;
        EXPECT_EQ(NCF_OK, list->GetItem(index, item.Out()));
        return item;
    }
    static std::string Name(const Ref<IXmlNode>& node) {
        INCFString* name = nullptr;
        EXPECT_EQ(NCF_OK, node->GetName(&name));
        return Taken(name);
    }
    static std::string Value(const Ref<IXmlNode>& node) {
        INCFString* value = nullptr;
        EXPECT_EQ(NCF_OK, node->GetValue(&value));
        return Taken(value);
    }

    Ref<host::XmlDocument> document_ = MakeRef<host::XmlDocument>();
};

}  // namespace

TEST_F(XmlDocumentTest, HasNoRootBeforeLoading) {
    INCFUnknown* root = document_.get();
    EXPECT_EQ(NMA_E_NOTINITIALIZED, document_->GetRootNode(&root));
    EXPECT_EQ(nullptr, root);
    EXPECT_EQ(NCF_E_POINTER, document_->GetRootNode(nullptr));
}

TEST_F(XmlDocumentTest, ShowsAnElementWithItsNameAndAttributes) {
    const auto root = Root("<Root one='1' two='2 &lt;'>text</Root>");
    EXPECT_EQ(static_cast<ncfUInt32>(kXmlElement), root->GetType());
    EXPECT_EQ("Root", Name(root));
    EXPECT_EQ("", Value(root));
    EXPECT_NE(0, root->HasAttributes());
    Ref<IXmlElement> element;
    ASSERT_EQ(NCF_OK, host::Query(root.get(), element));
    INCFString* tag = nullptr;
    EXPECT_EQ(NCF_OK, element->GetTagName(&tag));
    EXPECT_EQ("Root", Taken(tag));
    Ref<IXmlAttributeList> list;
    ASSERT_EQ(NCF_OK, root->GetAttributes(list.Out()));
    EXPECT_EQ(2u, list->GetCount());
    const auto two = Attribute(root, 1);
    EXPECT_EQ(static_cast<ncfUInt32>(kXmlAttribute), two->GetType());
    EXPECT_EQ("two", Name(two));
    EXPECT_EQ("2 <", Value(two));
    IXmlNode* none = root.get();
    EXPECT_EQ(NCF_E_INVALIDARG, list->GetItem(2, &none));
    EXPECT_EQ(nullptr, none);
    EXPECT_EQ("one", Name(Attribute(root, 0))) << "asked for out of order";
}

TEST_F(XmlDocumentTest, AnAttributeAnswersItsTwoInterfaces) {
    const auto attribute = Attribute(Root("<a n='v'/>"), 0);
    Ref<IXmlAttribute> same;
    ASSERT_EQ(NCF_OK, host::Query(attribute.get(), same));
    INCFString* text = nullptr;
    EXPECT_EQ(NCF_OK, same->GetName(&text));
    EXPECT_EQ("n", Taken(text));
    EXPECT_EQ(NCF_OK, same->GetValue(&text));
    EXPECT_EQ("v", Taken(text));
    Ref<IXmlElement> element;
    EXPECT_EQ(NCF_E_NOINTERFACE, host::Query(attribute.get(), element));
    EXPECT_EQ(0u, attribute->GetChildCount());
    EXPECT_EQ(0, attribute->HasAttributes());
    IXmlNode* child = attribute.get();
    EXPECT_EQ(NCF_E_INVALIDARG, attribute->GetChild(0, &child));
    EXPECT_EQ(nullptr, child);
    Ref<IXmlAttributeList> list;
    EXPECT_EQ(NMA_E_NODATA, attribute->GetAttributes(list.Out()));
}

TEST_F(XmlDocumentTest, ShowsChildrenOfEveryKindInOrder) {
    const auto root = Root("<a>one &amp; two<b/><![CDATA[<three>]]><!--c--><?p i?> </a>");
    ASSERT_EQ(6u, root->GetChildCount());
    const auto text = Child(root, 0);
    EXPECT_EQ(static_cast<ncfUInt32>(kXmlText), text->GetType());
    EXPECT_EQ("one & two", Value(text));
    EXPECT_EQ("#text", Name(text));
    EXPECT_EQ(static_cast<ncfUInt32>(kXmlElement), Child(root, 1)->GetType());
    EXPECT_EQ(static_cast<ncfUInt32>(kXmlCDATA), Child(root, 2)->GetType());
    EXPECT_EQ("<three>", Value(Child(root, 2)));
    EXPECT_EQ(static_cast<ncfUInt32>(kXmlOther), Child(root, 3)->GetType());
    EXPECT_EQ(static_cast<ncfUInt32>(kXmlOther), Child(root, 4)->GetType());
    EXPECT_EQ(" ", Value(Child(root, 5))) << "white space is text";
    EXPECT_EQ("one & two", Value(Child(root, 0))) << "asked for out of order";
    IXmlNode* none = root.get();
    EXPECT_EQ(NCF_E_INVALIDARG, root->GetChild(6, &none));
    EXPECT_EQ(nullptr, none);
    Ref<IXmlAttributeList> list;
    EXPECT_EQ(NMA_E_NODATA, text->GetAttributes(list.Out()));
    Ref<IXmlElement> element;
    EXPECT_EQ(NCF_E_NOINTERFACE, host::Query(text.get(), element));
}

TEST_F(XmlDocumentTest, AnElementWithoutAttributesHasAnEmptyList) {
    const auto root = Root("<a/>");
    EXPECT_EQ(0, root->HasAttributes());
    Ref<IXmlAttributeList> list;
    ASSERT_EQ(NCF_OK, root->GetAttributes(list.Out()));
    EXPECT_EQ(0u, list->GetCount());
}

TEST_F(XmlDocumentTest, OneObjectStandsForANodeWhileItLives) {
    const auto root = Root("<a n='1'><b/></a>");
    const auto child = Child(root, 0);
    EXPECT_EQ(child.get(), Child(root, 0).get());
    EXPECT_EQ(root.get(), RootNode().get());
    EXPECT_NE(root.get(), child.get());
    const auto attribute = Attribute(root, 0);
    EXPECT_EQ(attribute.get(), Attribute(root, 0).get());
    Ref<INCFUnknown> one;
    Ref<INCFUnknown> other;
    Ref<IXmlElement> element;
    ASSERT_EQ(NCF_OK, host::Query(child.get(), element));
    ASSERT_EQ(NCF_OK, host::Query(child.get(), one));
    ASSERT_EQ(NCF_OK, host::Query(element.get(), other));
    EXPECT_EQ(one.get(), other.get());
}

TEST_F(XmlDocumentTest, ANodeIsMadeAgainAfterItsEnd) {
    const std::int64_t before = host::LiveObjectCount();
    const auto root = Root("<a><b/></a>");
    for (int turn = 0; turn < 3; ++turn) {
        EXPECT_EQ("b", Name(Child(root, 0)));
        EXPECT_EQ(before + 1, host::LiveObjectCount());
    }
}

TEST_F(XmlDocumentTest, NodesKeepTheirDocumentAlive) {
    auto root = Root("<a><b n='v'/></a>");
    document_.Reset();
    const auto child = Child(root, 0);
    root.Reset();
    EXPECT_EQ("b", Name(child));
    EXPECT_EQ("v", Value(Attribute(child, 0)));
}

TEST_F(XmlDocumentTest, ASecondLoadLeavesFormerNodesAlone) {
    const auto former = Root("<former/>");
    const auto latter = Root("<latter/>");
    EXPECT_EQ("former", Name(former));
    EXPECT_EQ("latter", Name(latter));
}

TEST_F(XmlDocumentTest, LoadsAFileAsItDeclaresItself) {
    const auto path = File("<?xml version='1.0' encoding='ISO-8859-1'?><a>\xE9</a>");
    ASSERT_EQ(NCF_OK, document_->Load(path.get()));
    EXPECT_EQ("\xC3\xA9", Value(Child(RootNode(), 0)));
    const char16_t wide[] = u"\uFEFF<a>\u20AC</a>";
    const auto other =
        File(std::string(reinterpret_cast<const char*>(wide), sizeof(wide) - 2), "wide.xml");
    ASSERT_EQ(NCF_OK, document_->Load(other.get()));
    EXPECT_EQ("\xE2\x82\xAC", Value(Child(RootNode(), 0)));
}

TEST_F(XmlDocumentTest, TextIsReadAsItIsWhateverItDeclares) {
    for (const char* encoding : {"UTF-16", "ISO-8859-1", "US-ASCII", "no-such"}) {
        const auto root =
            Root(std::string("<?xml version='1.0' encoding='") + encoding + "'?><a>\xC3\xA9</a>");
        EXPECT_EQ("\xC3\xA9", Value(Child(root, 0))) << encoding;
    }
    const auto wide = MakeString(U"<a>\u20AC</a>", kNCFWCHAR);
    EXPECT_EQ(NCF_OK, document_->LoadFromText(wide.get()));
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFWCHAR), wide->GetEncoding()) << "the text stays";
}

TEST_F(XmlDocumentTest, ManyChildrenAreWalkedInLittleTime) {
    std::string text = "<a>";
    for (int i = 0; i < 100000; ++i) {
        text += "<b/>";
    }
    const auto root = Root(text + "</a>");
    for (ncfUInt32 i = 0; i < root->GetChildCount(); ++i) {
        ASSERT_EQ(static_cast<ncfUInt32>(kXmlElement), Child(root, i)->GetType());
    }
}
