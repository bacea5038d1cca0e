// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/XMLParserHelpers.h"

#include <gtest/gtest.h>

#include <stdexcept>

#include "source/descriptor_data/GenericXMLDataContainer.h"
#include "tests/unit/descriptor_data/DataHost.h"

namespace {

using ParseHelperFunctions::MakeDocHandler;
using ParseHelperFunctions::ParseXML;

class XMLParserHelpersTest : public DataHost {
protected:
    XMLParserHelpersTest() {
        UseScript();
        EXPECT_EQ(MakeDocHandler(host.factory(), &container_, handler_), NCF_OK);
        journal.clear();
    }
    NCFRESULT Parse() {
        return ParseXML(NMAString("C:\\data\\file.xml"), handler_.inArg(), host.factory());
    }
    // What the parser was asked, without the strings that were made for it.
    std::vector<std::string> ParserCalls() const { return journal.startingWith("parser "); }

    GenericXMLDataContainer container_;
    NCFSmartPtr<UTIL::INCFSaxDocumentHandler> handler_;
};

TEST_F(XMLParserHelpersTest, SetsBothHandlersThenParses) {
    EXPECT_EQ(Parse(), NCF_OK);
    EXPECT_EQ(journal.count("create parser"), 1);
    EXPECT_EQ(ParserCalls(),
              (std::vector<std::string>{"parser SetDocumentHandler", "parser SetErrorHandler",
                                        "parser Parse 0 C:\\data\\file.xml"}));
    EXPECT_TRUE(log.records().empty());
}

TEST_F(XMLParserHelpersTest, TheDocumentHandlerTakesMessagesToo) {
    UTIL::INCFSaxErrorHandler* seen = nullptr;
    script.parse = [&](UTIL::INCFSaxDocumentHandler*, UTIL::INCFSaxErrorHandler* errors) {
        seen = errors;
        return errors->Warning(MakeHostString("message"));
    };
    EXPECT_EQ(Parse(), NCF_OK);
    EXPECT_NE(seen, nullptr);
    EXPECT_TRUE(log.once("NMA::Impl::GenericDocHandler::Warningmessage"));
}

TEST_F(XMLParserHelpersTest, WithoutParserTheCreationIsLogged) {
    host.refuseCreation(kCLSID_SaxParser, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(Parse(), NCF_E_OUTOFMEMORY);
    ASSERT_EQ(log.records().size(), 1u);
    EXPECT_EQ(log.records()[0].kind, 2u);
    EXPECT_EQ(log.records()[0].where, "ParseHelperFunctions::GetSaxParser");
    EXPECT_EQ(log.records()[0].text,
              "ParseHelperFunctions::GetSaxParser"
              "Unable to create XML Sax parser component, result=0x80000002, XMLParserHelpers:53");
}

TEST_F(XMLParserHelpersTest, ARefusedDocumentHandlerIsLogged) {
    script.setDocumentHandler = NCF_E_ACCESSDENIED;
    EXPECT_EQ(Parse(), NCF_E_ACCESSDENIED);
    EXPECT_EQ(log.records()[0].text,
              "ParseHelperFunctions::GetSaxParser"
              "Unable to set document handler, result=0x80000009, XMLParserHelpers:61");
}

TEST_F(XMLParserHelpersTest, ARefusedErrorHandlerIsLogged) {
    script.setErrorHandler = NCF_E_ABORT;
    EXPECT_EQ(Parse(), NCF_E_ABORT);
    EXPECT_EQ(log.records()[0].text,
              "ParseHelperFunctions::GetSaxParser"
              "Unable to set error handler, result=0x80000007, XMLParserHelpers:68");
}

TEST_F(XMLParserHelpersTest, APositiveAnswerToASetterIsAFailureToo) {
    script.setErrorHandler = 1;
    EXPECT_EQ(Parse(), 1);
    EXPECT_TRUE(log.contains("Unable to set error handler, result=0x1,"));
}

TEST_F(XMLParserHelpersTest, AFailedParseIsLoggedWithItsMessage) {
    script.parse = [](auto*, auto*) { return NCF_E_NOTFOUND; };
    script.lastMessage = "no such file: 100%s";
    EXPECT_EQ(Parse(), NCF_E_NOTFOUND);
    ASSERT_EQ(log.records().size(), 1u);
    EXPECT_EQ(log.records()[0].kind, 2u);
    EXPECT_EQ(log.records()[0].text,
              "ParseHelperFunctions::ParseXML"
              "filePath: C:\\data\\file.xml; error: no such file: 100%s");
    EXPECT_EQ(ParserCalls().back(), "parser GetLastMessage");
}

TEST_F(XMLParserHelpersTest, AFailureWithoutMessageIsNotLogged) {
    script.parse = [](auto*, auto*) { return NCF_E_NOTFOUND; };
    EXPECT_EQ(Parse(), NCF_E_NOTFOUND);
    EXPECT_TRUE(log.records().empty());
    script.lastMessage = "unread";
    for (const NCFRESULT result : {NCF_E_FAIL, 1}) {
        script.lastMessageResult = result;
        EXPECT_EQ(Parse(), NCF_E_NOTFOUND);
        EXPECT_TRUE(log.records().empty());
    }
}

TEST_F(XMLParserHelpersTest, APositiveAnswerToParseIsSuccess) {
    script.parse = [](auto*, auto*) { return 1; };
    EXPECT_EQ(Parse(), NCF_OK);
}

TEST_F(XMLParserHelpersTest, AThrownResultIsTheResult) {
    script.parse = [](auto*, auto*) -> NCFRESULT { throw NCF_E_HANDLE; };
    EXPECT_EQ(Parse(), NCF_E_HANDLE);
}

TEST_F(XMLParserHelpersTest, AnythingElseThrownIsUnexpectedAndSilent) {
    script.parse = [](auto*, auto*) -> NCFRESULT { throw std::runtime_error("x"); };
    script.lastMessage = "unread";
    EXPECT_EQ(Parse(), NCF_E_UNEXPECTED);
    EXPECT_TRUE(log.records().empty());
}

TEST_F(XMLParserHelpersTest, AHandlerThatTakesNoMessagesStopsBeforeTheParserIsMade) {
    struct DocumentOnly : FakeObject<UTIL::INCFSaxDocumentHandler> {
        NCFRESULT Start() override { return NCF_OK; }
        NCFRESULT End() override { return NCF_OK; }
        NCFRESULT Element(INCFString*) override { return NCF_OK; }
        NCFRESULT Attribute(INCFString*, INCFString*) override { return NCF_OK; }
        NCFRESULT Text(INCFString*) override { return NCF_OK; }
    };
    auto* const plain = new DocumentOnly;
    EXPECT_EQ(ParseXML(NMAString("file"), plain, host.factory()), NCF_E_NOINTERFACE);
    EXPECT_EQ(journal.count("create parser"), 0);
    plain->Release();
}

TEST_F(XMLParserHelpersTest, MakingAHandlerGivesTheFailureOfItsStep) {
    NCFSmartPtr<UTIL::INCFSaxDocumentHandler> handler;
    EXPECT_EQ(MakeDocHandler(host.factory(), nullptr, handler), NCF_E_INVALIDARG);
    host.refuseCreation(kCLSID_GenericDocHandler, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(MakeDocHandler(host.factory(), &container_, handler), NCF_E_OUTOFMEMORY);
    EXPECT_TRUE(handler.isNull());
}

}  // namespace
