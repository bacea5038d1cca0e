// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlDocument.h"
#include "tests/unit/xml/XmlFixture.h"

using host::MakeRef;
using host::MakeString;

namespace {

class XmlDocumentHostileTest : public XmlTest {
protected:
    // Both roads into the document refuse it, and it is empty afterwards.
    void ExpectRefused(const std::string& content, NCFRESULT code) {
        const auto document = MakeRef<host::XmlDocument>();
        INCFUnknown* root = nullptr;
        ASSERT_EQ(NCF_OK, document->LoadFromText(MakeString("<former/>").get()));
        EXPECT_EQ(code, document->LoadFromText(MakeString(content).get())) << content;
        EXPECT_EQ(NMA_E_NOTINITIALIZED, document->GetRootNode(&root));
        EXPECT_EQ(code, document->Load(File(content).get())) << content;
        EXPECT_EQ(NMA_E_NOTINITIALIZED, document->GetRootNode(&root));
    }
};

}  // namespace

TEST_F(XmlDocumentHostileTest, RefusesWhatIsNotWellFormed) {
    for (const char* text :
         {"", " ", "text", "<a>", "<a></b>", "<a/><b/>", "<a/>text", "<a n=1/>", "<a n='1' n='2'/>",
          "<a>&unknown;</a>", "<a>&#0;</a>", "<a>]]></a>", "<a b='<'/>", "< a/>", "<1/>",
          "<a><!-- -- --></a>", "<a>\x01</a>", "<a"}) {
        ExpectRefused(text, NCF_E_FAIL);
    }
    ExpectRefused(std::string("<a>\0</a>", 8), NCF_E_FAIL);
    ExpectRefused("<a>\xFF</a>", NCF_E_FAIL);
}

TEST_F(XmlDocumentHostileTest, RefusesDocumentTypeDeclarations) {
    ExpectRefused("<!DOCTYPE a><a/>", NCF_E_NOTSUPPORTED);
    ExpectRefused("<!DOCTYPE a [<!ENTITY e 'x'>]><a>&e;</a>", NCF_E_NOTSUPPORTED);
}

TEST_F(XmlDocumentHostileTest, TakesTwoHundredAndFiftySixLevelsAndNoMore) {
    const auto document = MakeRef<host::XmlDocument>();
    EXPECT_EQ(NCF_OK, document->LoadFromText(MakeString(Nested(256)).get()));
    ExpectRefused(Nested(257), NCF_E_NOTSUPPORTED);
    ExpectRefused(Nested(100000), NCF_E_NOTSUPPORTED);
}

TEST_F(XmlDocumentHostileTest, RefusesAFileInAnotherEncodingThanItDeclares) {
    const auto document = MakeRef<host::XmlDocument>();
    EXPECT_EQ(NCF_E_FAIL,
              document->Load(File("<?xml version='1.0' encoding='UTF-16'?><a/>").get()));
    EXPECT_EQ(NCF_E_FAIL,
              document->Load(File("<?xml version='1.0' encoding='no-such'?><a/>").get()));
}

TEST_F(XmlDocumentHostileTest, RefusesTextThatIsNoText) {
    const auto document = MakeRef<host::XmlDocument>();
    const char16_t lone[] = {u'<', u'a', u'>', 0xD800, u'<', u'/', u'a', u'>'};
    const auto text = MakeRef<host::String>();
    ASSERT_EQ(NCF_OK, text->AssignUTF16(kNCFUTF16, lone, 8));
    EXPECT_EQ(NCF_E_FAIL, document->LoadFromText(text.get()));
}

TEST_F(XmlDocumentHostileTest, RefusesFilesThatAreNotThere) {
    const auto document = MakeRef<host::XmlDocument>();
    EXPECT_EQ(NCF_E_NOTFOUND, document->Load(host::ModulePath("/no/such.xml").get()));
    EXPECT_EQ(NCF_E_HANDLE, document->Load(host::ModulePath(folder_.path()).get()));
    EXPECT_EQ(NCF_E_POINTER, document->Load(nullptr));
    EXPECT_EQ(NCF_E_POINTER, document->LoadFromText(nullptr));
}

TEST_F(XmlDocumentHostileTest, TakesTenMegabytesOfText) {
    const auto document = MakeRef<host::XmlDocument>();
    const std::string text = "<a>" + std::string(10u << 20, 'x') + "</a>";
    EXPECT_EQ(NCF_OK, document->LoadFromText(MakeString(text).get()));
}
