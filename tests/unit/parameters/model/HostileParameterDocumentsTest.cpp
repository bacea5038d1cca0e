// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Parameter documents that come from elsewhere and mean no good: they are
// refused as a whole by the reader, or what is wrong in them is reported where
// it is met, and the rest stays usable.

#include "source/parameters/model/NMAParametersVisitor.h"
#include "tests/unit/parameters/model/FakeParametersXML.h"
#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using namespace NMA::XMLUtils;

std::string Repeated(const std::string& text, int times) {
    std::string all;
    all.reserve(text.size() * static_cast<std::size_t>(times));
    for (int i = 0; i < times; ++i) {
        all += text;
    }
    return all;
}

class HostileParameterDocuments : public ParamTest {
protected:
    NCFRESULT loading(const std::string& text) {
        return Thrown([&] { suite.LoadFromString(S(text.c_str())); });
    }
};

TEST_F(HostileParameterDocuments, TextsThatAreNoDocumentAreRefused) {
    for (const char* const text :
         {"", " ", "text", "<a", "<a>", "<a></b>", "<a/><b/>", "<a b='1' b='2'/>", "<a b=1/>",
          "<a>&unknown;</a>", "<a>&#0;</a>", "<1/>", "<!-- only -->", "<a b=\"<\"/>"}) {
        EXPECT_LT(loading(text), 0) << text;
        EXPECT_EQ(suite.GetRoot(), nullptr) << text;
        EXPECT_EQ(Thrown([&] { suite.GetComponentCount(); }), NMA_E_NOTINITIALIZED);
    }
}

TEST_F(HostileParameterDocuments, EntityBombsAreRefused) {
    EXPECT_LT(loading("<!DOCTYPE a [<!ENTITY x \"xxxxxxxxxx\"><!ENTITY y \"&x;&x;&x;&x;&x;\">"
                      "<!ENTITY z \"&y;&y;&y;&y;&y;\">]><a>&z;&z;&z;</a>"),
              0);
    EXPECT_LT(loading("<!DOCTYPE a SYSTEM \"file:///etc/passwd\"><a/>"), 0);
    EXPECT_EQ(suite.GetRoot(), nullptr);
}

TEST_F(HostileParameterDocuments, DeepNestingIsRefusedAndTheDeepestAllowedIsWalked) {
    const std::string open = "<parameterGroup id=\"" ID_A "\">";
    const auto nested = [&](int levels) {
        return Repeated(open, levels) + Repeated("</parameterGroup>", levels);
    };
    EXPECT_LT(loading(nested(257)), 0);
    EXPECT_LT(loading(nested(100000)), 0);
    NMAParamInfoGroup group = rootOf<NMAParamInfoGroup>(nested(256));
    int levels = 1;
    while (group.GetGroupCount() == 1) {
        NMAParamInfoGroup inner;
        group.GetGroup(kIdA, inner);
        group = inner;
        ++levels;
    }
    EXPECT_EQ(levels, 256);
    const std::string before = saved();
    suite.LoadFromString(S(before.c_str()));
    EXPECT_EQ(saved(), before) << "and written whole";
}

TEST_F(HostileParameterDocuments, GroupsAddedTooDeepAreRefusedWhenSaved) {
    NMAParamInfoGroup group = rootOf<NMAParamInfoGroup>("<parameterGroup/>");
    for (int i = 0; i < 300; ++i) {
        NMAParamInfoGroup inner;
        group.AddGroup(kIdA, inner);
        group = inner;
    }
    EXPECT_EQ(Thrown([&] { Saved(suite); }), NCF_E_NOTSUPPORTED);
}

TEST_F(HostileParameterDocuments, HugeTextsAreReadAndMakeNoNumbers) {
    const std::string digits(1 << 20, '9');
    const std::string letters(1 << 20, 'x');
    NMAParameter parameter = rootOf<NMAParameter>(
        "<p><valueUInt32>" + digits + "</valueUInt32><valueSInt32>" + letters +
        "</valueSInt32><valueRational>" + digits + "/" + digits + "</valueRational><valueDouble>" +
        digits + "</valueDouble><valueString>" + letters + "</valueString></p>");
    ncfUInt32 u32 = 0;
    ncfSInt32 s32 = 0;
    double real = 0;
    NMAParamRational ratio;
    NMAString text;
    EXPECT_EQ(parameter.GetUInt32(u32), NCF_OK);
    EXPECT_EQ(u32, 0xFFFFFFFFu);
    EXPECT_EQ(Thrown([&] { parameter.GetSInt32(s32); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(parameter.GetRational(ratio), NCF_OK);
    EXPECT_EQ(parameter.GetDouble(real), NCF_OK);
    EXPECT_LT(real, 1e-300);
    EXPECT_EQ(parameter.GetString(text), NCF_OK);
    EXPECT_EQ(text, S(letters.c_str()));
}

TEST_F(HostileParameterDocuments, HugeIdsAndNumbersMatchNothing) {
    const std::string id = ID_A + std::string(1 << 20, 'A');
    suite.LoadFromString(S(("<a><component id=\"" + id + "\"/></a>").c_str()));
    NMAParamComponent component;
    EXPECT_EQ(Thrown([&] { suite.GetComponent(kIdA, component); }), NMA_E_NODATA);
    ASSERT_EQ(suite.GetComponentAt(0, component), NCF_OK);
    GUID read{};
    EXPECT_EQ(component.GetID(read), NCF_OK) << "what stands behind an id is passed over";
}

TEST_F(HostileParameterDocuments, ManyItemsAreCountedAndTheLastIsFound) {
    const int kMany = 20000;
    NMAParamSet set = rootOf<NMAParamSet>(
        "<parameterSet>" + Repeated("<parameter id=\"" ID_A "\"/>", kMany) +
        "<parameter id=\"" ID_B "\"><valueBoolean>true</valueBoolean></parameter></parameterSet>");
    NMAParameter parameter;
    EXPECT_EQ(set.CountParameters(kIdA), static_cast<ncfUInt32>(kMany));
    ASSERT_EQ(set.GetParameter(kIdB, parameter), NCF_OK);
    bool flag = false;
    EXPECT_EQ(parameter.GetBoolean(flag), NCF_OK);
    EXPECT_TRUE(flag);
}

TEST_F(HostileParameterDocuments, ManyDiscreteValuesAreReadWhole) {
    const ncfUInt32 kMany = 20000;
    NMAParamValueInfo info = rootOf<NMAParamValueInfo>(
        "<v><valueInfoDiscrete default=\"0\">" +
        Repeated("<discrete value=\"7\"/>", static_cast<int>(kMany)) + "</valueInfoDiscrete></v>");
    ncfUInt32* values = nullptr;
    ncfUInt32 count = 0;
    ncfUInt32 def = 1;
    ASSERT_EQ(info.GetDiscreteInfo(&values, &count, &def), NCF_OK);
    const std::unique_ptr<ncfUInt32[]> owned(values);
    EXPECT_EQ(count, kMany);
    EXPECT_EQ(values[kMany - 1], 7u);
}

TEST_F(HostileParameterDocuments, TheDeclaredEncodingIsNotBelieved) {
    for (const char* const encoding : {"UTF-16", "ISO-8859-1", "nonsense"}) {
        NMAParamSet set = rootOf<NMAParamSet>(
            std::string("<?xml version=\"1.0\" encoding=\"") + encoding +
            "\"?><parameterSet><name>\xC3\xA4\xE2\x82\xAC</name></parameterSet>");
        EXPECT_EQ(textOf([&](NMAString& out) { return set.GetName(out); }), "\xC3\xA4\xE2\x82\xAC")
            << encoding;
    }
}

TEST_F(HostileParameterDocuments, MarksThatAreNoElementsAreIgnored) {
    NMAParamSet set = rootOf<NMAParamSet>(
        "<parameterSet><!-- <parameter/> --><?parameter x?>text<![CDATA[<parameter/>]]>"
        "<x:parameter xmlns:x=\"u\"/><PARAMETER/><parameter id=\"" ID_A "\"/></parameterSet>");
    EXPECT_EQ(set.GetParameterCount(), 1u);
}

TEST_F(HostileParameterDocuments, ItemsWithoutKeyAreCountedButNotFound) {
    NMAParamTrack track = rootOf<NMAParamTrack>(
        "<track><parameterSet/><parameterSet id=\"\"/><parameterSet Id=\"" ID_A
        "\"/><parameterSet id=\"{" ID_A "}\"/><parameterSet id=\" " ID_A
        "\"/><parameterSet id=\"" ID_A "\" readOnly=\"true\"/></track>");
    NMAParamSet set;
    EXPECT_EQ(track.GetParameterSetCount(), 6u);
    ASSERT_EQ(track.GetParameterSet(kIdA, set), NCF_OK);
    EXPECT_TRUE(set.IsReadOnly()) << "the last one";
    GUID id{};
    for (const ncfUInt32 index : {0u, 2u}) {
        track.GetParameterSetAt(index, set);
        EXPECT_EQ(Thrown([&] { set.GetID(id); }), NMA_E_NODATA) << index;
    }
    for (const ncfUInt32 index : {1u, 3u}) {
        track.GetParameterSetAt(index, set);
        EXPECT_EQ(Thrown([&] { set.GetID(id); }), NCF_E_UNEXPECTED) << index;
    }
}

TEST_F(HostileParameterDocuments, ALargestIndexIsNoData) {
    NMAParamTrack track = rootOf<NMAParamTrack>("<track><parameterSet/></track>");
    NMAParamSet set;
    EXPECT_EQ(Thrown([&] { track.GetParameterSetAt(0xFFFFFFFFu, set); }), NMA_E_NODATA);
}

TEST_F(HostileParameterDocuments, TextsThatXmlHasNoPlaceForAreRefusedWhenSaved) {
    NMAParamSet set = rootOf<NMAParamSet>("<parameterSet/>");
    set.SetName(S("a\x01z"));
    EXPECT_EQ(Thrown([&] { Saved(suite); }), NCF_E_INVALIDARG);
    set.SetName(S("]]> & <name> \"quoted\""));
    const std::string text = saved();
    EXPECT_EQ(rootOf<NMAParamSet>(text).SetVersion(S("1")), NCF_OK);
    NMAParamSet again = rootOf<NMAParamSet>(text);
    EXPECT_EQ(textOf([&](NMAString& out) { return again.GetName(out); }),
              "]]> & <name> \"quoted\"");
}

TEST_F(HostileParameterDocuments, AVisitorThrowsWhatItsObjectGives) {
    Journal journal;
    auto* const object = new FakeParametersXML(journal);
    object->description = "<a/>";
    {
        NMAParametersVisitor visitor(host.factory(), object);
        ncfUInt32 value = 5;
        const auto reading = [&](const std::string& text) {
            object->values = text;
            return Thrown([&] { visitor.GetUInt32(kIdA, 0, kIdB, kIdC, value); });
        };
        EXPECT_LT(reading(""), 0);
        EXPECT_LT(reading("<!DOCTYPE a><a/>"), 0);
        EXPECT_LT(reading(Repeated("<a>", 100000)), 0);
        EXPECT_EQ(reading("<component id=\"" ID_A "\"/>"), NMA_E_NODATA)
            << "a root is no component";
        EXPECT_EQ(value, 5u);
    }
    EXPECT_EQ(object->Release(), 0u);
}

}  // namespace
