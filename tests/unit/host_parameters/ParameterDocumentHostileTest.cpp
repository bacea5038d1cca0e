// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Documents that are broken, wrong or meant to do harm: each is refused with a
// code and with words, and nothing of it is taken.

#include <gtest/gtest.h>

#include "reference_host/parameters/ParameterDocument.h"

namespace {

struct Outcome {
    NCFRESULT result;
    std::string problem;
};

Outcome OutcomeOf(const std::string& xml) {
    host::ParameterDocument document;
    document.components.resize(7);
    Outcome outcome;
    outcome.result = host::ReadParameterDocument(xml, document, outcome.problem);
    if (outcome.result < 0) {
        EXPECT_EQ(document.components.size(), 7u) << "a refused document leaves no trace";
        EXPECT_FALSE(outcome.problem.empty());
        EXPECT_EQ(outcome.problem.find('\n'), std::string::npos);
        EXPECT_LT(outcome.problem.size(), 400u);
    }
    return outcome;
}

void ExpectRefusal(const std::string& xml, NCFRESULT result, const std::string& words) {
    const Outcome outcome = OutcomeOf(xml);
    EXPECT_EQ(outcome.result, result) << xml.substr(0, 200);
    EXPECT_NE(outcome.problem.find(words), std::string::npos) << outcome.problem;
}

std::string Repeated(const std::string& text, int times) {
    std::string all;
    for (int i = 0; i < times; ++i) {
        all += text;
    }
    return all;
}

const std::string kWhole =
    "<ncfComponents><component id='0E74B673-0CA8-403B-A142-986D79508637'><track number='0'>"
    "<parameterInfos><version>1.0</version><parameterGroup "
    "id='A1CE72A4-FA19-40E3-9E83-266DAF8AF5BB'><parameter "
    "id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'><valueInfo><valueInfoDiscrete default='512'>"
    "<discrete value='256' name='P'>256</discrete></valueInfoDiscrete></valueInfo></parameter>"
    "</parameterGroup></parameterInfos>"
    "<activeSet>11111111-2222-3333-4444-555555555555</activeSet>"
    "<parameterSet id='11111111-2222-3333-4444-555555555555'><version>1.0</version>"
    "<name>Name</name><parameter id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'>"
    "<valueUInt32>512</valueUInt32></parameter></parameterSet></track></component>"
    "</ncfComponents>";

std::string With(const std::string& part, const std::string& other) {
    std::string xml = kWhole;
    const std::size_t at = xml.find(part);
    EXPECT_NE(at, std::string::npos) << part;
    return xml.replace(at, part.size(), other);
}

TEST(ParameterDocumentHostile, TheWholeOneIsFine) {
    EXPECT_EQ(OutcomeOf(kWhole).result, NCF_OK);
}

TEST(ParameterDocumentHostile, CutAnywhereItIsRefused) {
    for (std::size_t length = 0; length < kWhole.size(); ++length) {
        EXPECT_EQ(OutcomeOf(kWhole.substr(0, length)).result, NCF_E_FAIL) << length;
    }
}

TEST(ParameterDocumentHostile, WithAnyByteOverwrittenItIsTakenOrRefused) {
    for (std::size_t at = 0; at < kWhole.size(); ++at) {
        for (const char byte : {'\0', '<', '&', '\xFF', '\'', '0'}) {
            std::string xml = kWhole;
            xml[at] = byte;
            OutcomeOf(xml);
        }
    }
}

TEST(ParameterDocumentHostile, NothingThatIsNoXmlIsTaken) {
    for (const char* const xml : {"", " ", "hello", "<", "<a", "<a></b>", "<a/><b/>", "<a b=c/>",
                                  "<a>&unknown;</a>", "<a>&#0;</a>", "{\"a\": 1}"}) {
        EXPECT_EQ(OutcomeOf(xml).result, NCF_E_FAIL) << xml;
    }
    ExpectRefusal("<ncfComponents>\n<component", NCF_E_FAIL, "2:");
}

TEST(ParameterDocumentHostile, AnotherOutermostElementIsRefused) {
    ExpectRefusal("<html/>", NCF_E_INVALIDARG, "html: the outermost element");
    ExpectRefusal("<x:ncfComponents xmlns:x='y'/>", NCF_E_INVALIDARG, "outermost");
}

TEST(ParameterDocumentHostile, EntityBombsAreRefusedAtTheirDeclaration) {
    std::string bomb = "<!DOCTYPE ncfComponents [<!ENTITY a0 'ha'>";
    for (int i = 1; i < 40; ++i) {
        const std::string before = "&a" + std::to_string(i - 1) + ";";
        bomb += "<!ENTITY a" + std::to_string(i) + " '" + before + before + "'>";
    }
    ExpectRefusal(bomb + "]><ncfComponents>&a39;</ncfComponents>", NCF_E_NOTSUPPORTED,
                  "document type declaration");
    ExpectRefusal("<!DOCTYPE ncfComponents SYSTEM 'file:///etc/passwd'><ncfComponents/>",
                  NCF_E_NOTSUPPORTED, "document type declaration");
}

TEST(ParameterDocumentHostile, DeepNestingIsRefused) {
    for (const char* const name : {"parameterGroup", "component", "x"}) {
        const std::string open = std::string("<") + name + ">";
        const std::string close = std::string("</") + name + ">";
        ExpectRefusal(
            "<ncfComponents>" + Repeated(open, 20000) + Repeated(close, 20000) + "</ncfComponents>",
            NCF_E_NOTSUPPORTED, "levels");
    }
    const std::string group = "<parameterGroup id='A1CE72A4-FA19-40E3-9E83-266DAF8AF5BB'>";
    EXPECT_EQ(OutcomeOf(With("<version>1.0</version><parameterGroup",
                             Repeated(group, 240) + Repeated("</parameterGroup>", 240) +
                                 "<parameterGroup"))
                  .result,
              NCF_OK)
        << "but what is allowed is walked";
}

TEST(ParameterDocumentHostile, MoreThanAMegabyteIsRefusedUnread) {
    const std::string filler(host::ParameterLimits::kLargestDocument, ' ');
    ExpectRefusal(filler + kWhole, NCF_E_NOTSUPPORTED, "more than 1 MiB");
    const std::string fits(host::ParameterLimits::kLargestDocument - kWhole.size(), ' ');
    EXPECT_EQ(OutcomeOf(kWhole + fits).result, NCF_OK) << "one of exactly that size is taken";
}

TEST(ParameterDocumentHostile, TextsBeyondTheLimitAreRefused) {
    const std::string limit(host::ParameterLimits::kLongestText, 'n');
    EXPECT_EQ(OutcomeOf(With("<name>Name", "<name>" + limit)).result, NCF_OK);
    ExpectRefusal(With("<name>Name", "<name>n" + limit), NCF_E_NOTSUPPORTED, "too long");
    ExpectRefusal(With("<name>Name", "<name>n<!-- -->" + limit), NCF_E_NOTSUPPORTED, "too long");
    ExpectRefusal(With("name='P'", "name='n" + limit + "'"), NCF_E_NOTSUPPORTED, "too long");
    ExpectRefusal(With("512</valueUInt32>", std::string(5000, '0') + "</valueUInt32>"),
                  NCF_E_NOTSUPPORTED, "too long");
}

TEST(ParameterDocumentHostile, IdsThatAreNoneAreRefused) {
    for (const char* const part :
         {"id='0E74B673-0CA8-403B-A142-986D79508637'", "id='A1CE72A4-FA19-40E3-9E83-266DAF8AF5BB'",
          "id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'",
          "id='11111111-2222-3333-4444-555555555555'"}) {
        ExpectRefusal(With(part, ""), NCF_E_INVALIDARG, "has no id");
        ExpectRefusal(With(part, "id=''"), NCF_E_INVALIDARG, "\"\", which is no identifier");
        ExpectRefusal(With(part, "id='{0E74B673-0CA8-403B-A142-986D79508637}'"), NCF_E_INVALIDARG,
                      "no identifier");
        ExpectRefusal(With(part, "id='" + std::string(100000, 'A') + "'"), NCF_E_INVALIDARG,
                      "AAA...\"");
    }
    ExpectRefusal(With("<activeSet>11111111-2222-3333-4444-555555555555", "<activeSet>mine"),
                  NCF_E_INVALIDARG, "\"mine\"");
    ExpectRefusal(With("id='0E74B673-0CA8-403B-A142-986D79508637'", "id='a&#10;b&#27;'"),
                  NCF_E_FAIL, "");
    ExpectRefusal(With("id='0E74B673-0CA8-403B-A142-986D79508637'", "id='a&#10;b'"),
                  NCF_E_INVALIDARG, "\"a b\"");
}

TEST(ParameterDocumentHostile, CommandsToATerminalAreNotRepeated) {
    const std::string id = "id='0E74B673-0CA8-403B-A142-986D79508637'";
    ExpectRefusal(With(id,
                       "id='a\xC2\x9B"
                       "31m\x7F"
                       "b'"),
                  NCF_E_INVALIDARG, "\"a 31m b\"");
    ExpectRefusal(With(id, "id='&#x9B;2J&#9;\xC2\xA0'"), NCF_E_INVALIDARG, "\" 2J \xC2\xA0\"");
    // Long ones end between characters.
    const std::string euro = "\xE2\x82\xAC";
    ExpectRefusal(With(id, "id='" + Repeated(euro, 60) + "'"), NCF_E_INVALIDARG,
                  "\"" + Repeated(euro, 60) + "\"");
    ExpectRefusal(With(id, "id='" + Repeated(euro, 61) + "'"), NCF_E_INVALIDARG,
                  "\"" + Repeated(euro, 60) + "...\"");
    ExpectRefusal(With(id, "id='" + Repeated("\xF0\x9F\x8E\x9E", 1000) + "'"), NCF_E_INVALIDARG,
                  Repeated("\xF0\x9F\x8E\x9E", 60) + "...\"");
}

TEST(ParameterDocumentHostile, NothingMayFollowTheEndNotEvenAZero) {
    ExpectRefusal(kWhole + std::string(1, '\0'), NCF_E_FAIL, "");
    ExpectRefusal(kWhole + std::string("\0<junk", 6), NCF_E_FAIL, "");
    ExpectRefusal(kWhole + kWhole, NCF_E_FAIL, "");
}

TEST(ParameterDocumentHostile, NumbersThatAreNoneAreRefused) {
    for (const char* const number : {"", " ", "-1", "+1", "0x10", "1.0", "4294967296", "1 2", "one",
                                     "99999999999999999999999999", "1e3", "\xD9\xA1"}) {
        SCOPED_TRACE(number);
        const std::string text = number;
        ExpectRefusal(With("<valueUInt32>512", "<valueUInt32>" + text), NCF_E_INVALIDARG,
                      "parameter/valueUInt32: holds");
        ExpectRefusal(With("value='256'", "value='" + text + "'"), NCF_E_INVALIDARG, "holds");
        ExpectRefusal(With("default='512'", "default='" + text + "'"), NCF_E_INVALIDARG, "holds");
        ExpectRefusal(With("number='0'", "number='" + text + "'"), NCF_E_INVALIDARG, "holds");
    }
    ExpectRefusal(With("number='0'", ""), NCF_E_INVALIDARG, "track");
}

TEST(ParameterDocumentHostile, VersionsThatAreNoneAreRefused) {
    for (const char* const number : {"", "one", "1,5", "inf", "nan", "1e999", "1.0 x"}) {
        ExpectRefusal(With("<version>1.0</version><name>",
                           std::string("<version>") + number + "</version><name>"),
                      NCF_E_INVALIDARG, "no version");
    }
    EXPECT_EQ(OutcomeOf(With("</version><name>", "</version><version>x</version><name>")).result,
              NCF_OK)
        << "the first one counts";
}

TEST(ParameterDocumentHostile, BytesThatAreNoUtf8AreRefused) {
    ExpectRefusal(With("<name>Name", "<name>N\xE4me"), NCF_E_FAIL, "");
    ExpectRefusal(With("<name>Name", "<name>\xED\xA0\x80"), NCF_E_FAIL, "");
    ExpectRefusal(With("<name>Name", "<name>\xC0\x80"), NCF_E_FAIL, "");
    const std::string wide("\xFF\xFE<\0n\0/\0>\0", 10);
    EXPECT_EQ(OutcomeOf(wide).result, NCF_E_FAIL) << "UTF-16 bytes";
    EXPECT_EQ(OutcomeOf("<?xml version='1.0' encoding='UTF-16'?>" + kWhole).result, NCF_OK)
        << "the text is what it is, whatever it claims";
}

}  // namespace
