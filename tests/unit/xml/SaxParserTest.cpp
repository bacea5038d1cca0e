// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <stdexcept>

#include "tests/unit/xml/SaxFixture.h"

TEST_F(SaxParserTest, TellsEverythingInTheOrderOfTheDocument) {
    EXPECT_EQ(NCF_OK, Parse("<?xml version='1.0'?><list><entry key='a' n='1'>x</entry>"
                            "<entry/>tail</list>"));
    EXPECT_EQ(
        (Events{"start", "<list", "<entry", "@key=a", "@n=1", "'x'", "<entry", "'tail'", "end"}),
        handler_->events);
    EXPECT_EQ("", LastMessage());
    EXPECT_TRUE(handler_->messages.empty());
}

TEST_F(SaxParserTest, ARunOfTextIsOneEvent) {
    EXPECT_EQ(NCF_OK, Parse("<a>one &amp; two&#33;\n<![CDATA[<three>]]> four</a>"));
    EXPECT_EQ((Events{"start", "<a", "'one & two!\n<three> four'", "end"}), handler_->events);
}

TEST_F(SaxParserTest, ARunIsOneEventAcrossBuffers) {
    // Longer than any buffer, so that it is read in several pieces.
    const std::string text(3u << 20, 'x');
    EXPECT_EQ(NCF_OK, Parse("<a>" + text + "</a>"));
    ASSERT_EQ(4u, handler_->events.size());
    EXPECT_EQ("'" + text + "'", handler_->events[2]);
}

TEST_F(SaxParserTest, NeverTrimsText) {
    EXPECT_EQ(NCF_OK, Parse("<l>\n <key>dvc </key>\n</l>"));
    EXPECT_EQ((Events{"start", "<l", "'\n '", "<key", "'dvc '", "'\n'", "end"}), handler_->events);
}

TEST_F(SaxParserTest, CommentsAndInstructionsSplitRunsAndAreNotTold) {
    EXPECT_EQ(NCF_OK, Parse("<a>x<!-- c -->y<?p i?>z</a>"));
    EXPECT_EQ((Events{"start", "<a", "'x'", "'y'", "'z'", "end"}), handler_->events);
}

TEST_F(SaxParserTest, KeepsPrefixesAsWritten) {
    EXPECT_EQ(NCF_OK, Parse("<p:a xmlns:p='urn:x' p:n='1'/>"));
    EXPECT_EQ((Events{"start", "<p:a", "@xmlns:p=urn:x", "@p:n=1", "end"}), handler_->events);
}

TEST_F(SaxParserTest, ReadsTheEncodingsThatADocumentMayDeclare) {
    EXPECT_EQ(NCF_OK, Parse("<?xml version='1.0' encoding='ISO-8859-1'?><a>\xE9</a>"));
    EXPECT_EQ("'\xC3\xA9'", handler_->events[2]);
    handler_->events.clear();
    EXPECT_EQ(NCF_OK, Parse("\xEF\xBB\xBF<a>\xC3\xA9</a>"));
    EXPECT_EQ("'\xC3\xA9'", handler_->events[2]);
    handler_->events.clear();
    const char16_t wide[] = u"\uFEFF<a>\u00E9</a>";
    EXPECT_EQ(NCF_OK, Parse(std::string(reinterpret_cast<const char*>(wide), sizeof(wide) - 2)));
    EXPECT_EQ("'\xC3\xA9'", handler_->events[2]);
}

TEST_F(SaxParserTest, ANegativeAnswerEndsTheParseAndIsItsResult) {
    const Events all = {"start", "<a", "@n=1", "'x'", "<b", "end"};
    for (std::size_t refused = 0; refused < all.size(); ++refused) {
        handler_->events.clear();
        handler_->answer = [&](const std::string& event) {
            return event == all[refused] ? NCF_E_NOTFOUND : NCF_OK;
        };
        EXPECT_EQ(NCF_E_NOTFOUND, Parse("<a n='1'>x<b/></a>")) << all[refused];
        EXPECT_EQ(Events(all.begin(), all.begin() + static_cast<long>(refused) + 1),
                  handler_->events);
        EXPECT_TRUE(handler_->messages.empty()) << "the handler knows already";
    }
}

TEST_F(SaxParserTest, TheMessageTellsWhereTheHandlerStopped) {
    handler_->answer = [](const std::string& event) {
        return event == "<b" ? NCF_E_NOTFOUND : NCF_OK;
    };
    Parse("<a>\n  <b/></a>");
    EXPECT_EQ((folder_ / "file.xml").u8string() +
                  ":2:3: the reader of the document stopped with 0x8000000C",
              LastMessage());
}

TEST_F(SaxParserTest, WhatAHandlerThrowsIsTheResult) {
    handler_->answer = [](const std::string& event) -> NCFRESULT {
        if (event == "@n=1") {
            throw NCF_E_HANDLE;
        }
        return NCF_OK;
    };
    EXPECT_EQ(NCF_E_HANDLE, Parse("<a n='1'/>"));
    handler_->answer = [](const std::string& event) -> NCFRESULT {
        if (event == "'x'") {
            throw std::runtime_error("text");
        }
        return NCF_OK;
    };
    EXPECT_EQ(NCF_E_UNEXPECTED, Parse("<a>x</a>"));
    EXPECT_NE("", LastMessage());
    handler_->answer = [](const std::string& event) -> NCFRESULT {
        if (event == "start" || event == "end") {
            throw NCF_E_ABORT;
        }
        return NCF_OK;
    };
    EXPECT_EQ(NCF_E_ABORT, Parse("<a/>"));
}

TEST_F(SaxParserTest, ParsesWithoutHandlers) {
    parser_->SetDocumentHandler(nullptr);
    parser_->SetErrorHandler(nullptr);
    EXPECT_EQ(NCF_OK, Parse("<a>x</a>"));
    EXPECT_EQ(NCF_E_FAIL, Parse("<a>"));
    EXPECT_NE("", LastMessage());
}

TEST_F(SaxParserTest, HoldsItsHandlersUntilTheNextSetting) {
    handler_->AddRef();
    EXPECT_EQ(3u, handler_->Release()) << "this test's and two of the parser";
    parser_->SetErrorHandler(nullptr);
    handler_->AddRef();
    EXPECT_EQ(2u, handler_->Release());
}

TEST_F(SaxParserTest, AMessageLastsUntilTheNextParse) {
    EXPECT_EQ(NCF_E_FAIL, Parse("<a>"));
    EXPECT_NE("", LastMessage());
    EXPECT_EQ(NCF_OK, Parse("<a/>"));
    EXPECT_EQ("", LastMessage());
    EXPECT_EQ(NCF_E_POINTER, parser_->GetLastMessage(nullptr));
}

TEST_F(SaxParserTest, SaysWhatIsWrongWithTheFile) {
    const auto absent = std::filesystem::path("/no/such.xml").make_preferred();
    EXPECT_EQ(NCF_E_NOTFOUND, parser_->Parse(0, host::ModulePath(absent).get()));
    EXPECT_EQ(absent.u8string() + ": there is no such file", LastMessage());
    EXPECT_TRUE(handler_->events.empty()) << "nothing starts without a file";
    EXPECT_EQ(1u, handler_->messages.size());
    EXPECT_EQ(NCF_E_HANDLE, parser_->Parse(0, host::ModulePath(folder_.path()).get()));
    EXPECT_NE(std::string::npos, LastMessage().find(": this is a folder"));
}

TEST_F(SaxParserTest, RefusesArgumentsThatMakeNoSense) {
    EXPECT_EQ(NCF_E_POINTER, parser_->Parse(0, nullptr));
    EXPECT_EQ(NCF_E_INVALIDARG, parser_->Parse(1, File("<a/>").get()));
    EXPECT_EQ(NCF_E_INVALIDARG, parser_->Parse(0, host::MakeString("").get()));
}

namespace {

// Keeps every string that it is lent, and spoils those that it does not keep.
class KeepingHandler final : public host::Component<UTIL::INCFSaxDocumentHandler> {
public:
    NCFRESULT Start() override { return NCF_OK; }
    NCFRESULT End() override { return NCF_OK; }
    NCFRESULT Element(INCFString* tag) override { return Keep(tag); }
    NCFRESULT Attribute(INCFString* name, INCFString* value) override {
        name->AssignUTF16(kNCFUTF16, u"spoilt", kNCFZeroTerminated);
        return Keep(value);
    }
    NCFRESULT Text(INCFString* text) override { return Keep(text); }

    std::vector<host::Ref<INCFString>> kept;

private:
    NCFRESULT Keep(INCFString* string) {
        EXPECT_EQ(static_cast<ncfUInt32>(kNCFUTF8), string->GetEncoding());
        kept.emplace_back(string);
        return NCF_OK;
    }
};

}  // namespace

TEST_F(SaxParserTest, AStringThatAHandlerKeepsStaysAsItWas) {
    const auto keeper = host::MakeRef<KeepingHandler>();
    parser_->SetDocumentHandler(keeper.get());
    ASSERT_EQ(NCF_OK, Parse("<a one='1' two='22'>text<b>more</b></a>"));
    std::vector<std::string> texts;
    for (const host::Ref<INCFString>& string : keeper->kept) {
        texts.push_back(host::text::ReadUtf8(string.get()));
    }
    EXPECT_EQ((std::vector<std::string>{"a", "1", "22", "text", "b", "more"}), texts);
}
