// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/ParametersReader.h"

#include <gtest/gtest.h>

#include <functional>

#include "reference_host/framework/Console.h"
#include "reference_host/framework/String.h"
#include "reference_host/parameters/GuidText.h"
#include "reference_host/util/text/HostText.h"

namespace {

using host::MakeRef;
using Lines = std::vector<std::string>;

// Writes down what it hears; may refuse one of the events.
class Listener final : public host::Component<NMA::IParametersHandler> {
public:
    Lines lines;
    std::string refused;

    NCFRESULT BeginDocument() override { return Heard("document"); }
    NCFRESULT BeginComponent(const GUID& id) override { return Heard("component " + Short(id)); }
    NCFRESULT EndComponent(ncfUInt32 flag) override {
        return Heard("end component " + std::to_string(flag));
    }
    NCFRESULT BeginParamSet(const GUID& id, INCFString* name, float version,
                            ncfUInt32 state) override {
        return Heard("set " + Short(id) + " '" + host::text::ReadUtf8(name) + "' " +
                     std::to_string(version).substr(0, 4) + " " + std::to_string(state));
    }
    NCFRESULT ParamValue(const GUID& id, IParameterValue* value) override {
        ncfUInt32 number = 0;
        const bool held = value->GetData(&number, sizeof number) >= 0;
        return Heard("value " + Short(id) + " " + (held ? std::to_string(number) : "none"));
    }
    NCFRESULT EndDocument() override { return Heard("end"); }

private:
    static std::string Short(const GUID& id) { return host::GuidText(id).substr(0, 8); }
    NCFRESULT Heard(const std::string& line) {
        lines.push_back(line);
        return line == refused ? NCF_E_ABORT : NCF_OK;
    }
};

class ParametersReader : public testing::Test {
protected:
    ParametersReader() {
        console->SetSink([this](ncfUInt32 level, const std::string& text) {
            told.push_back(std::to_string(level) + " " + text);
        });
        reader->SetHandler(listener.get());
    }
    NCFRESULT Parse(const std::string& xml) {
        listener->lines.clear();
        return reader->Parse(host::MakeString(xml).get());
    }

    Lines told;
    host::Ref<host::Console> console = MakeRef<host::Console>();
    host::Ref<Listener> listener = MakeRef<Listener>();
    host::Ref<host::ParametersReader> reader =
        MakeRef<host::ParametersReader>(host::Ref<INCFConsole>(console));
};

const std::string kXml =
    "<ncfComponents>"
    "<component id='0E74B673-0CA8-403B-A142-986D79508637'>"
    "<track number='0'><activeSet>22222222-2222-3333-4444-555555555555</activeSet>"
    "<parameterSet id='11111111-2222-3333-4444-555555555555'><name>A</name>"
    "<parameter id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'><valueUInt32>1</valueUInt32></parameter>"
    "</parameterSet>"
    "<parameterSet id='22222222-2222-3333-4444-555555555555'><version>2.5</version>"
    "<parameter id='76320B7E-5BF9-4E30-BF04-2BE7D48D4C69'><valueDiscrete>3</valueDiscrete>"
    "</parameter><parameter id='A1CE72A4-FA19-40E3-9E83-266DAF8AF5BB'><valueDouble>1</valueDouble>"
    "</parameter></parameterSet></track>"
    "<track number='1'><parameterSet id='33333333-2222-3333-4444-555555555555' readOnly='true'/>"
    "</track></component>"
    "<component id='FFFFFFFF-0CA8-403B-A142-986D79508637'/></ncfComponents>";

const Lines kEvents = {
    "document",
    "component 0E74B673",
    "set 11111111 'A' 1.00 0",
    "value 6CAEDE80 1",
    "set 22222222 '' 2.50 1",
    "value 76320B7E 3",
    "value A1CE72A4 none",
    "set 33333333 '' 1.00 2",
    "end component 1",
    "component FFFFFFFF",
    "end component 1",
    "end",
};

TEST_F(ParametersReader, TellsOfComponentsSetsAndValuesInTheirOrder) {
    EXPECT_EQ(Parse(kXml), NCF_OK);
    EXPECT_EQ(listener->lines, kEvents);
    EXPECT_EQ(Parse("<ncfComponents/>"), NCF_OK);
    EXPECT_EQ(listener->lines, (Lines{"document", "end"}));
    EXPECT_TRUE(told.empty());
}

TEST_F(ParametersReader, ReadsTheTextInAnyEncodingAndLeavesItAlone) {
    for (const ncfUInt32 encoding : {kNCFASCII, kNCFUTF8, kNCFUTF16, kNCFUTF32, kNCFWCHAR}) {
        const auto text =
            host::MakeString("<?xml version='1.0' encoding='ISO-8859-1'?>" + kXml, encoding);
        listener->lines.clear();
        EXPECT_EQ(reader->Parse(text.get()), NCF_OK);
        EXPECT_EQ(listener->lines, kEvents);
        EXPECT_EQ(text->GetEncoding(), encoding);
    }
}

TEST_F(ParametersReader, StopsAtTheEventThatItsHandlerRefuses) {
    for (std::size_t i = 0; i < kEvents.size(); ++i) {
        // Of two events with the same words the first one ends the reading.
        listener->refused = kEvents[i];
        const auto first = std::find(kEvents.begin(), kEvents.end(), kEvents[i]);
        EXPECT_EQ(Parse(kXml), NCF_E_ABORT);
        EXPECT_EQ(listener->lines, Lines(kEvents.begin(), first + 1)) << kEvents[i];
    }
    EXPECT_TRUE(told.empty()) << "the handler knows its own reasons";
}

TEST_F(ParametersReader, TellsTheUserWhatIsWrongAndTheHandlerNothing) {
    EXPECT_EQ(Parse("<ncfComponents>\n<component></ncfComponents>"), NCF_E_FAIL);
    EXPECT_TRUE(listener->lines.empty());
    ASSERT_EQ(told.size(), 1u);
    EXPECT_EQ(told[0], "1 Parameter document refused: 2:14: mismatched tag");
    // The mistake comes last, and nothing before it counts.
    std::string late = kXml;
    late.replace(late.find("FFFFFFFF"), 8, "ABCDEFGH");
    EXPECT_EQ(Parse(late), NCF_E_INVALIDARG);
    EXPECT_TRUE(listener->lines.empty());
    ASSERT_EQ(told.size(), 2u);
    EXPECT_NE(told[1].find("ncfComponents/component: the id is \"ABCDEFGH-0CA8"),
              std::string::npos);
}

TEST_F(ParametersReader, PassesNoPercentSignsToTheConsole) {
    EXPECT_EQ(Parse("<ncfComponents><component id='%s%s%n'/></ncfComponents>"), NCF_E_INVALIDARG);
    ASSERT_EQ(told.size(), 1u);
    EXPECT_NE(told[0].find("%s%s%n"), std::string::npos);
}

TEST_F(ParametersReader, RefusesTextsThatAreTooLargeOrHaveNoPlace) {
    EXPECT_EQ(Parse(std::string((std::size_t{1} << 20) + 1, 'x')), NCF_E_NOTSUPPORTED);
    const auto lone = MakeRef<host::String>();
    const ncfUTF16 surrogate[] = {'<', 0xD800, '/', '>', 0};
    ASSERT_EQ(lone->AssignUTF16(kNCFUTF16, surrogate, kNCFZeroTerminated), NCF_OK);
    EXPECT_EQ(reader->Parse(lone.get()), NCF_E_FAIL);
    EXPECT_EQ(told, (Lines{"1 Parameter document refused: it is too large",
                           "1 Parameter document refused: a character that has no place in it"}));
}

// A text does not end at a zero in it, so nothing hides behind one.
TEST_F(ParametersReader, ReadsTheWholeTextPastAZero) {
    for (const ncfUInt32 encoding : {kNCFUTF8, kNCFUTF16, kNCFUTF32, kNCFWCHAR}) {
        listener->lines.clear();
        const auto text = host::MakeString(kXml + std::string(1, '\0') + "<hidden/>", encoding);
        EXPECT_EQ(reader->Parse(text.get()), NCF_E_FAIL);
        EXPECT_TRUE(listener->lines.empty());
    }
    EXPECT_EQ(told.size(), 4u);
}

TEST_F(ParametersReader, NeedsATextAndAHandler) {
    EXPECT_EQ(reader->Parse(nullptr), NCF_E_POINTER);
    EXPECT_EQ(reader->SetHandler(nullptr), NCF_OK);
    EXPECT_EQ(Parse(kXml), NMA_E_NOTINITIALIZED);
}

TEST_F(ParametersReader, WorksWithoutAConsole) {
    const auto silent = MakeRef<host::ParametersReader>(host::Ref<INCFConsole>());
    silent->SetHandler(listener.get());
    EXPECT_EQ(silent->Parse(host::MakeString("no").get()), NCF_E_FAIL);
}

TEST_F(ParametersReader, HoldsOneReferenceToItsHandler) {
    EXPECT_EQ(listener->AddRef(), 3u);
    EXPECT_EQ(listener->Release(), 2u);
    reader->SetHandler(listener.get());
    EXPECT_EQ(listener->AddRef(), 3u);
    EXPECT_EQ(listener->Release(), 2u);
    reader.Reset();
    EXPECT_EQ(listener->AddRef(), 2u);
    EXPECT_EQ(listener->Release(), 1u);
}

}  // namespace
