// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Documents as text: what is written, and what of it is read.

#include "reference_host/parameters/ParameterDocument.h"

#include <gtest/gtest.h>

namespace {

using host::ParameterDocument;

constexpr GUID kComponent = ncfGuid("0E74B673-0CA8-403B-A142-986D79508637");
constexpr GUID kFirst = ncfGuid("11111111-2222-3333-4444-555555555555");
constexpr GUID kSecond = ncfGuid("AAAAAAAA-2222-3333-4444-555555555555");

// A document with all that can stand in one.
ParameterDocument Whole() {
    host::ParameterInfo order;
    order.id = kParamFieldOrdering;
    order.name = "Order";
    order.label = "Order <of> \"fields\" & more";
    order.choices = {{256, "Progressive"}, {512, "Odd, \"upper\""}};
    order.defaultValue = 512;
    host::ParameterInfo layout;
    layout.id = kParamFieldLayout;
    layout.name = "Layout";
    layout.label = "Layout";
    layout.choices = {{2, "Merged"}};
    layout.rules = {{kParamFieldOrdering, 512, true}, {kParamFieldOrdering, 256, false}};
    host::ParameterTrack track;
    track.number = 3;
    track.descriptionVersion = 1.5f;
    track.parameters = {layout};
    track.groups = {{kParamGroup, "Fields", false, {order}}, {kFirst, "", true, {}}};
    track.activeSet = kSecond;
    track.sets = {{kParamSetDefault,
                   "Default Settings",
                   1.0f,
                   true,
                   false,
                   {{kParamFieldOrdering, 512}, {kParamFieldLayout, std::nullopt}}},
                  {kSecond, "Mine & yours", 2.25f, false, true, {}}};
    return {{{kComponent, {track}}, {kFirst, {}}}};
}

std::string Written(const ParameterDocument& document) {
    std::string xml = "unchanged";
    EXPECT_EQ(host::WriteParameterDocument(document, xml), NCF_OK);
    return xml;
}

TEST(ParameterDocument, IsWrittenInTheOrderOfItsParts) {
    EXPECT_EQ(
        Written(Whole()),
        "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
        "<ncfComponents><component id=\"0E74B673-0CA8-403B-A142-986D79508637\">"
        "<track number=\"3\"><parameterInfos><version>1.5</version>"
        "<parameter id=\"76320B7E-5BF9-4E30-BF04-2BE7D48D4C69\"><shortName>Layout</shortName>"
        "<description>Layout</description>"
        "<valueInfo><valueInfoDiscrete default=\"4294967295\">"
        "<discrete value=\"2\" name=\"Merged\">2</discrete></valueInfoDiscrete></valueInfo>"
        "<displayRuleSet><displayRule><ifCondition id=\"6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A\">"
        "<ifValue>512</ifValue></ifCondition><operation>enable</operation></displayRule>"
        "<displayRule><ifCondition id=\"6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A\">"
        "<ifValue>256</ifValue></ifCondition><operation>disable</operation></displayRule>"
        "</displayRuleSet></parameter>"
        "<parameterGroup id=\"A1CE72A4-FA19-40E3-9E83-266DAF8AF5BB\" displayState=\"hide\">"
        "<shortName>Fields</shortName><description/>"
        "<parameter id=\"6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A\"><shortName>Order</shortName>"
        "<description>Order &lt;of&gt; \"fields\" &amp; more</description>"
        "<valueInfo><valueInfoDiscrete default=\"512\">"
        "<discrete value=\"256\" name=\"Progressive\">256</discrete>"
        "<discrete value=\"512\" name=\"Odd, &quot;upper&quot;\">512</discrete>"
        "</valueInfoDiscrete></valueInfo></parameter></parameterGroup>"
        "<parameterGroup id=\"11111111-2222-3333-4444-555555555555\" displayState=\"show\">"
        "<shortName/><description/></parameterGroup></parameterInfos>"
        "<activeSet>AAAAAAAA-2222-3333-4444-555555555555</activeSet>"
        "<parameterSet id=\"9F9FC555-4014-11C5-8FDE-5ED45EED7C03\" readOnly=\"false\" "
        "default=\"true\"><version>1.0</version><name>Default Settings</name>"
        "<parameter id=\"6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A\" silent=\"false\">"
        "<valueUInt32>512</valueUInt32></parameter>"
        "<parameter id=\"76320B7E-5BF9-4E30-BF04-2BE7D48D4C69\" silent=\"false\"/></parameterSet>"
        "<parameterSet id=\"AAAAAAAA-2222-3333-4444-555555555555\" readOnly=\"true\">"
        "<version>2.25</version><name>Mine &amp; yours</name></parameterSet></track></component>"
        "<component id=\"11111111-2222-3333-4444-555555555555\"/></ncfComponents>");
}

ParameterDocument Read(const std::string& xml) {
    ParameterDocument document;
    std::string problem;
    EXPECT_EQ(host::ReadParameterDocument(xml, document, problem), NCF_OK) << problem;
    EXPECT_EQ(problem, "");
    return document;
}

TEST(ParameterDocument, IsReadAsItWasWritten) {
    const ParameterDocument document = Read(Written(Whole()));
    ASSERT_EQ(document.components.size(), 2u);
    EXPECT_EQ(document.components[0].id, kComponent);
    EXPECT_TRUE(document.components[1].tracks.empty());
    ASSERT_EQ(document.components[0].tracks.size(), 1u);
    const host::ParameterTrack& track = document.components[0].tracks[0];
    EXPECT_EQ(track.number, 3u);
    EXPECT_EQ(track.descriptionVersion, 1.5f);
    ASSERT_EQ(track.parameters.size(), 1u);
    EXPECT_EQ(track.parameters[0].id, kParamFieldLayout);
    EXPECT_FALSE(track.parameters[0].defaultValue) << "no choice is the default";
    ASSERT_EQ(track.groups.size(), 2u);
    EXPECT_EQ(track.groups[0].id, kParamGroup);
    EXPECT_EQ(track.groups[0].name, "Fields");
    EXPECT_FALSE(track.groups[0].isShown);
    EXPECT_TRUE(track.groups[1].isShown);
    ASSERT_EQ(track.groups[0].parameters.size(), 1u);
    const host::ParameterInfo& order = track.groups[0].parameters[0];
    EXPECT_EQ(order.name, "Order");
    EXPECT_EQ(order.label, "Order <of> \"fields\" & more");
    EXPECT_EQ(order.defaultValue, 512u);
    ASSERT_EQ(order.choices.size(), 2u);
    EXPECT_EQ(order.choices[1].value, 512u);
    EXPECT_EQ(order.choices[1].text, "Odd, \"upper\"");
    ASSERT_EQ(track.sets.size(), 2u);
    EXPECT_EQ(track.sets[0].id, kParamSetDefault);
    EXPECT_TRUE(track.sets[0].isDefault);
    EXPECT_FALSE(track.sets[0].isReadOnly);
    ASSERT_EQ(track.sets[0].settings.size(), 2u);
    EXPECT_EQ(track.sets[0].settings[0].value, 512u);
    EXPECT_FALSE(track.sets[0].settings[1].value);
    EXPECT_EQ(track.sets[1].name, "Mine & yours");
    EXPECT_EQ(track.sets[1].version, 2.25f);
    EXPECT_TRUE(track.sets[1].isReadOnly);
    EXPECT_EQ(track.SetInUse(), &track.sets[1]);
}

const host::ParameterTrack ReadTrack(const std::string& content) {
    const ParameterDocument document = Read(
        "<ncfComponents><component id='0e74b673-0ca8-403b-a142-986d79508637'>"
        "<track number='0'>" +
        content + "</track></component></ncfComponents>");
    return document.components.at(0).tracks.at(0);
}

const std::string kOneSet = "<parameterSet id='11111111-2222-3333-4444-555555555555'/>";
const std::string kOtherSet = "<parameterSet id='AAAAAAAA-2222-3333-4444-555555555555'/>";

TEST(ParameterDocument, UsesTheOnlySetWhenNoneIsNamed) {
    const host::ParameterTrack track = ReadTrack(kOneSet);
    EXPECT_EQ(track.SetInUse(), &track.sets[0]);
    EXPECT_EQ(track.sets[0].version, 1.0f);
    EXPECT_EQ(track.sets[0].name, "");
}

TEST(ParameterDocument, UsesNoneOfSeveralSetsWhenNoneIsNamed) {
    EXPECT_EQ(ReadTrack(kOneSet + kOtherSet).SetInUse(), nullptr);
    EXPECT_EQ(ReadTrack("").SetInUse(), nullptr);
}

TEST(ParameterDocument, UsesTheSetThatIsNamedAndNoOther) {
    const std::string active = "<activeSet>aaaaaaaa-2222-3333-4444-555555555555</activeSet>";
    const host::ParameterTrack track = ReadTrack(kOneSet + active + kOtherSet);
    EXPECT_EQ(track.SetInUse(), &track.sets[1]);
    EXPECT_EQ(ReadTrack(active + kOneSet).SetInUse(), nullptr) << "the named one is not there";
}

TEST(ParameterDocument, ReadsNumbersOfBothKinds) {
    const auto read = [](const std::string& value) {
        return ReadTrack(
                   "<parameterSet id='11111111-2222-3333-4444-555555555555'>"
                   "<parameter id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'>" +
                   value + "</parameter></parameterSet>")
            .sets.at(0)
            .settings.at(0)
            .value;
    };
    EXPECT_EQ(read("<valueUInt32>512</valueUInt32>"), 512u);
    EXPECT_EQ(read("<valueUInt32>\n  4294967295\t</valueUInt32>"), 4294967295u);
    EXPECT_EQ(read("<valueDiscrete>7</valueDiscrete>"), 7u);
    EXPECT_EQ(read("<valueDiscrete>7</valueDiscrete><valueUInt32>8</valueUInt32>"), 8u)
        << "the plain number comes first";
    EXPECT_EQ(read("<valueUInt32>1<!-- and -->2<![CDATA[3]]></valueUInt32>"), 123u);
    EXPECT_EQ(read("<valueDouble>1.5</valueDouble>"), std::nullopt) << "not carried";
    EXPECT_EQ(read("<valueString>text</valueString>"), std::nullopt);
    EXPECT_EQ(read(""), std::nullopt);
}

TEST(ParameterDocument, PassesOverWhatItDoesNotKnow) {
    const host::ParameterTrack track = ReadTrack(
        "<modifiedDateTime>now</modifiedDateTime><parameterInfos><external>"
        "<fileNameExtension>xyz</fileNameExtension></external>"
        "<parameter id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'><valueInfo>"
        "<valueInfoDouble max='1' min='0' default='?'/></valueInfo></parameter>"
        "</parameterInfos><?instruction?>" +
        kOneSet);
    EXPECT_EQ(track.descriptionVersion, 1.0f);
    ASSERT_EQ(track.parameters.size(), 1u);
    EXPECT_TRUE(track.parameters[0].choices.empty());
    EXPECT_EQ(track.sets.size(), 1u);
}

TEST(ParameterDocument, ListsGroupsOfGroupsOneAfterTheOther) {
    const host::ParameterTrack track = ReadTrack(
        "<parameterInfos><parameterGroup id='11111111-2222-3333-4444-555555555555'>"
        "<parameterGroup id='A1CE72A4-FA19-40E3-9E83-266DAF8AF5BB'>"
        "<parameter id='6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A'/></parameterGroup>"
        "</parameterGroup></parameterInfos>");
    ASSERT_EQ(track.groups.size(), 2u);
    EXPECT_TRUE(track.groups[0].parameters.empty());
    EXPECT_EQ(track.groups[1].parameters.size(), 1u);
}

TEST(ParameterDocument, IsNotWrittenWithATextThatXmlHasNoPlaceFor) {
    ParameterDocument document = Whole();
    document.components[0].tracks[0].sets[0].name = "a\x01z";
    std::string xml = "unchanged";
    EXPECT_EQ(host::WriteParameterDocument(document, xml), NCF_E_INVALIDARG);
    EXPECT_EQ(xml, "unchanged");
}

}  // namespace
