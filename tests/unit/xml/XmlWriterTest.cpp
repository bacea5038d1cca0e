// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlWriter.h"

#include <iterator>

#include "reference_host/xml/XmlDocument.h"
#include "tests/unit/xml/XmlFixture.h"

using host::MakeRef;
using host::MakeString;
using host::Ref;

namespace {

constexpr char kDeclaration[] = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n";

class XmlWriterTest : public XmlTest {
protected:
    NCFRESULT Element(std::string_view name, std::string_view parent) {
        return writer_->Element(MakeString(name).get(), MakeString(parent).get());
    }
    NCFRESULT Root(std::string_view name) {
        return writer_->Element(MakeString(name).get(), nullptr);
    }
    NCFRESULT Attribute(std::string_view element, std::string_view name, std::string_view value) {
        return writer_->Attribute(MakeString(element).get(), MakeString(name).get(),
                                  MakeString(value).get());
    }
    NCFRESULT Text(std::string_view text, std::string_view parent) {
        return writer_->Text(MakeString(text).get(), MakeString(parent).get());
    }
    // The text without its declaration.
    std::string Written() {
        INCFString* text = nullptr;
        EXPECT_EQ(NCF_OK, writer_->GetText(&text));
        const std::string whole = Taken(text);
        EXPECT_EQ(0u, whole.find(kDeclaration));
        return whole.substr(sizeof(kDeclaration) - 1);
    }

    Ref<host::XmlWriter> writer_ = MakeRef<host::XmlWriter>();
};

}  // namespace

TEST_F(XmlWriterTest, WritesElementsAttributesAndTexts) {
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    EXPECT_EQ(NCF_OK, Root("list"));
    EXPECT_EQ(NCF_OK, Attribute("list", "n", "1"));
    EXPECT_EQ(NCF_OK, Element("entry", "list"));
    EXPECT_EQ(NCF_OK, Attribute("entry", "key", "a"));
    EXPECT_EQ(NCF_OK, Text("one", "entry"));
    EXPECT_EQ(NCF_OK, Element("entry", "list"));
    EXPECT_EQ(NCF_OK, Text("tail", "list"));
    EXPECT_EQ("<list n=\"1\"><entry key=\"a\">one</entry><entry/>tail</list>", Written());
}

TEST_F(XmlWriterTest, TheTextIsCompleteWithoutClose) {
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    Root("a");
    Element("b", "a");
    EXPECT_EQ("<a><b/></a>", Written());
    Element("c", "b");
    EXPECT_EQ("<a><b><c/></b></a>", Written()) << "and may be asked for again";
}

TEST_F(XmlWriterTest, ClosesDownToTheNearestElementOfTheParentsName) {
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    Root("a");
    Element("b", "a");
    Element("c", "b");
    EXPECT_EQ(NCF_OK, Element("d", "a"));
    EXPECT_EQ(NCF_E_INVALIDARG, Element("e", "c")) << "that one is closed";
    EXPECT_EQ(NCF_OK, Text("x", "d"));
    EXPECT_EQ("<a><b><c/></b><d>x</d></a>", Written());
}

TEST_F(XmlWriterTest, GroupsOfOneNameInAThirdNestWrongly) {
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    Root("group");
    Element("group", "group");
    Element("group", "group");  // meant beside the one before
    EXPECT_EQ("<group><group><group/></group></group>", Written());
}

TEST_F(XmlWriterTest, EscapesWhatStandsForMarks) {
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    Root("a");
    Attribute("a", "n", "<&>\"'");
    Text("<&>\"' ]]>", "a");
    EXPECT_EQ("<a n=\"&lt;&amp;>&quot;'\">&lt;&amp;&gt;\"' ]]&gt;</a>", Written());
}

TEST_F(XmlWriterTest, WhatItWroteIsReadAsItWas) {
    const std::string texts[] = {" lead and tail ",
                                 "line\nend\r\nand\ttab\r",
                                 "caf\xC3\xA9 \xF0\x9F\x8E\xAC",
                                 "<&>\"' ]]>",
                                 "\n",
                                 " "};
    for (const std::string& text : texts) {
        ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
        Root("a");
        Attribute("a", "n", text);
        Text(text, "a");
        INCFString* written = nullptr;
        ASSERT_EQ(NCF_OK, writer_->GetText(&written));
        const auto document = MakeRef<host::XmlDocument>();
        ASSERT_EQ(NCF_OK, document->LoadFromText(written));
        written->Release();
        Ref<INCFUnknown> root;
        Ref<IXmlNode> node;
        Ref<IXmlNode> child;
        Ref<IXmlAttributeList> list;
        Ref<IXmlNode> attribute;
        ASSERT_EQ(NCF_OK, document->GetRootNode(root.Out()));
        ASSERT_EQ(NCF_OK, host::Query(root.get(), node));
        ASSERT_EQ(NCF_OK, node->GetChild(0, child.Out()));
        ASSERT_EQ(NCF_OK, node->GetAttributes(list.Out()));
        ASSERT_EQ(NCF_OK, list->GetItem(0, attribute.Out()));
        INCFString* value = nullptr;
        child->GetValue(&value);
        EXPECT_EQ(text, Taken(value));
        attribute->GetValue(&value);
        EXPECT_EQ(text, Taken(value));
    }
}

TEST_F(XmlWriterTest, SavesAFileAtClose) {
    const auto path = host::ModulePath(folder_ / "out \xC3\xA9.xml");
    ASSERT_EQ(NCF_OK, writer_->Open(path.get()));
    Root("a");
    Text("\xE2\x82\xAC", "a");
    EXPECT_FALSE(std::filesystem::exists(folder_ / "out \xC3\xA9.xml"));
    EXPECT_EQ(NCF_OK, writer_->Close());
    std::ifstream stream(folder_ / "out \xC3\xA9.xml", std::ios::binary);
    const std::string content((std::istreambuf_iterator<char>(stream)),
                              std::istreambuf_iterator<char>());
    EXPECT_EQ(std::string(kDeclaration) + "<a>\xE2\x82\xAC</a>", content);
}

TEST_F(XmlWriterTest, TakesNoEventsBeforeOpenAndAfterClose) {
    EXPECT_EQ(NMA_E_NOTINITIALIZED, Root("a"));
    EXPECT_EQ(NMA_E_NOTINITIALIZED, Attribute("a", "n", "v"));
    EXPECT_EQ(NMA_E_NOTINITIALIZED, Text("x", "a"));
    EXPECT_EQ(NMA_E_NOTINITIALIZED, writer_->Close());
    INCFString* text = nullptr;
    EXPECT_EQ(NMA_E_NOTINITIALIZED, writer_->GetText(&text));
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    EXPECT_EQ(NCF_OK, Root("a"));
    EXPECT_EQ(NCF_OK, writer_->Close());
    EXPECT_EQ(NMA_E_NOTINITIALIZED, Text("x", "a"));
    EXPECT_EQ(NMA_E_NOTINITIALIZED, writer_->Close());
    EXPECT_EQ("<a/>", Written());
}

TEST_F(XmlWriterTest, ADocumentWithoutARootIsNotSaved) {
    ASSERT_EQ(NCF_OK, writer_->Open(host::ModulePath(folder_ / "none.xml").get()));
    EXPECT_EQ(NMA_E_NODATA, writer_->Close());
    EXPECT_FALSE(std::filesystem::exists(folder_ / "none.xml"));
}

TEST_F(XmlWriterTest, SaysWhenTheFileCannotBeWritten) {
    ASSERT_EQ(NCF_OK, writer_->Open(host::ModulePath("/no/such/folder/a.xml").get()));
    Root("a");
    EXPECT_EQ(NCF_E_HANDLE, writer_->Close());
    EXPECT_EQ(NCF_E_INVALIDARG, writer_->Open(MakeString("").get()));
}

TEST_F(XmlWriterTest, OpenStartsAfresh) {
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    Root("former");
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    EXPECT_EQ(NCF_OK, Root("latter"));
    EXPECT_EQ("<latter/>", Written());
}

TEST_F(XmlWriterTest, RefusesWhatMakesNoDocument) {
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    EXPECT_EQ(NCF_E_INVALIDARG, Root("1a"));
    EXPECT_EQ(NCF_E_INVALIDARG, Root(""));
    EXPECT_EQ(NCF_E_INVALIDARG, Root("a b"));
    EXPECT_EQ(NCF_OK, Root("a"));
    EXPECT_EQ(NMA_E_ROOTEXISTS, Root("b"));
    EXPECT_EQ(NCF_E_INVALIDARG, Element("b", "nowhere"));
    EXPECT_EQ(NCF_E_INVALIDARG, Text("x", "nowhere"));
    EXPECT_EQ(NCF_E_INVALIDARG, Attribute("nowhere", "n", "v"));
    EXPECT_EQ(NCF_E_INVALIDARG, Attribute("a", "n n", "v"));
    EXPECT_EQ(NCF_E_INVALIDARG, Attribute("a", "n", "\x01"));
    EXPECT_EQ(NCF_E_INVALIDARG, Text("\x01", "a"));
    EXPECT_EQ(NCF_E_INVALIDARG, Text("\xFF", "a"));
    EXPECT_EQ(NCF_E_INVALIDARG, writer_->Text(nullptr, MakeString("a").get()));
    EXPECT_EQ(NCF_E_POINTER, writer_->GetText(nullptr));
    EXPECT_EQ("<a/>", Written()) << "the document stays as it was";
}

TEST_F(XmlWriterTest, AttributesComeOnceAndBeforeContent) {
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    Root("a");
    EXPECT_EQ(NCF_OK, Attribute("a", "n", "1"));
    EXPECT_EQ(NMA_E_ALREADYSET, Attribute("a", "n", "2"));
    Text("x", "a");
    EXPECT_EQ(NCF_E_FAIL, Attribute("a", "m", "1"));
    EXPECT_EQ("<a n=\"1\">x</a>", Written());
}

TEST_F(XmlWriterTest, GoesAsDeepAsReadersDo) {
    ASSERT_EQ(NCF_OK, writer_->Open(nullptr));
    ASSERT_EQ(NCF_OK, Root("a"));
    for (int level = 1; level < 256; ++level) {
        ASSERT_EQ(NCF_OK, Element("a", "a")) << level;
    }
    EXPECT_EQ(NCF_E_NOTSUPPORTED, Element("a", "a"));
}
