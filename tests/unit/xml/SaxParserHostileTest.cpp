// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlLimits.h"
#include "tests/support/TestFiles.h"
#include "tests/unit/xml/SaxFixture.h"

TEST_F(SaxParserTest, RefusesWhatIsNotWellFormed) {
    ExpectRefused("", NCF_E_FAIL, "no element found");
    ExpectRefused("<a><b></a>", NCF_E_FAIL, ":1:9: mismatched tag");
    ExpectRefused("<a/><b/>", NCF_E_FAIL, "junk after document element");
    ExpectRefused("<a n='1' n='2'/>", NCF_E_FAIL, "duplicate attribute");
    ExpectRefused("<a>&unknown;</a>", NCF_E_FAIL, "undefined entity");
    ExpectRefused("<a>&#0;</a>", NCF_E_FAIL, "reference to invalid character number");
    ExpectRefused("text", NCF_E_FAIL, "");
    ExpectRefused(std::string("<a>\0</a>", 8), NCF_E_FAIL, "not well-formed");
    ExpectRefused("<a>\x01</a>", NCF_E_FAIL, "not well-formed");
}

TEST_F(SaxParserTest, RefusesADocumentCutAtEveryByte) {
    const std::string whole =
        "<?xml version='1.0'?><l><e k='v'>t&amp;<![CDATA[c]]></e><!-- --></l>";
    ASSERT_EQ(NCF_OK, Parse(whole));
    for (std::size_t length = 0; length < whole.size(); ++length) {
        handler_->events.clear();
        EXPECT_LT(Parse(whole.substr(0, length)), 0) << length;
        EXPECT_NE("", LastMessage());
        for (const std::string& event : handler_->events) {
            EXPECT_NE("end", event);
        }
    }
}

TEST_F(SaxParserTest, RefusesBytesThatAreNotOfTheDeclaredEncoding) {
    ExpectRefused("<a>\xE9</a>", NCF_E_FAIL, "not well-formed");
    ExpectRefused("<?xml version='1.0' encoding='UTF-16'?><a/>", NCF_E_FAIL, "encoding");
    ExpectRefused("<?xml version='1.0' encoding='no-such'?><a/>", NCF_E_FAIL, "unknown encoding");
    ExpectRefused("<?xml version='1.0' encoding='US-ASCII'?><a>\xC3\xA9</a>", NCF_E_FAIL, "");
}

TEST_F(SaxParserTest, RefusesEveryDocumentTypeDeclaration) {
    ExpectRefused("<!DOCTYPE a><a/>", NCF_E_NOTSUPPORTED, "document type declaration");
    ExpectRefused("<!DOCTYPE a SYSTEM 'file:///etc/passwd'><a/>", NCF_E_NOTSUPPORTED,
                  "document type declaration");
}

// Each entity is ten of the one before: a few lines that would be gigabytes.
TEST_F(SaxParserTest, RefusesAnEntityBombBeforeItGoesOff) {
    std::string bomb = "<!DOCTYPE a [<!ENTITY e0 'xxxxxxxxxx'>";
    for (int i = 1; i < 10; ++i) {
        bomb += "<!ENTITY e" + std::to_string(i) + " '";
        for (int turn = 0; turn < 10; ++turn) {
            bomb += "&e" + std::to_string(i - 1) + ";";
        }
        bomb += "'>";
    }
    ExpectRefused(bomb + "]><a>&e9;</a>", NCF_E_NOTSUPPORTED, "document type declaration");
    EXPECT_EQ(Events{"start"}, handler_->events);
}

TEST_F(SaxParserTest, TakesTwoHundredAndFiftySixLevelsAndNoMore) {
    EXPECT_EQ(NCF_OK, Parse(Nested(256)));
    ExpectRefused(Nested(257), NCF_E_NOTSUPPORTED, "more than 256 levels");
    ExpectRefused(Nested(100000), NCF_E_NOTSUPPORTED, "more than 256 levels");
    std::string wide = "<a>";
    for (int i = 0; i < 1000; ++i) {
        wide += "<b/>";
    }
    EXPECT_EQ(NCF_OK, Parse(wide + "</a>")) << "only depth is bounded";
}

TEST_F(SaxParserTest, TakesTenMegabytesOfText) {
    const std::string text(10u << 20, 'x');
    EXPECT_EQ(NCF_OK, Parse("<a>" + text + "</a>"));
    EXPECT_EQ(text.size() + 2, handler_->events[2].size());
}

TEST_F(SaxParserTest, RefusesATextBeyondTheLimit) {
    const std::string piece(1u << 20, 'x');
    std::string content = "<a>";
    for (std::size_t size = 0; size <= host::XmlLimits::kLongestText; size += piece.size()) {
        content += piece;
    }
    ExpectRefused(content + "</a>", NCF_E_NOTSUPPORTED, "a text that is too long");
}

TEST_F(SaxParserTest, DoesNotWaitForAPipe) {
    const auto pipe = folder_ / "pipe.xml";
    ASSERT_TRUE(MakePipe(pipe));
    EXPECT_EQ(NCF_E_HANDLE, parser_->Parse(0, host::ModulePath(pipe).get()));
}
