// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/QTAttributesXMLParser.h"

#include <gtest/gtest.h>

#include "host_interfaces/util/NMAUtil.h"
#include "tests/support/fakes/HostXml.h"
#include "tests/support/fakes/RecordingLogger.h"

namespace {

using ParseHelperFunctions::QTAttributesXMLParser;

constexpr char kColour[] =
    "<ColorSpaceDescriptor><Name>Log C</Name><BitDepth>12</BitDepth>"
    "<MinReference>64</MinReference><MaxReference>940</MaxReference>"
    "<TransferCharacteristicName>Log</TransferCharacteristicName>"
    "<TransferCharacteristicUID>0e170000-0001-0101-060e-2b340401010c</TransferCharacteristicUID>"
    "</ColorSpaceDescriptor>";

std::string Number(const char* tag, const char* numerator, const char* denominator) {
    return std::string("<") + tag + "><Numerator>" + numerator + "</Numerator><Denominator>" +
           denominator + "</Denominator></" + tag + ">";
}

std::string Box(const char* tag) {
    return std::string("<") + tag + ">" + Number("PositionX", "-8", "1") +
           Number("PositionY", "-9", "2") + Number("Height", "18", "3") +
           Number("Width", "16", "4") + "</" + tag + ">";
}

class AttributeTexts : public ::testing::Test {
protected:
    AttributeTexts() {
        UseHostXml(host);
        NMAInitialize(host.factory());
    }
    ~AttributeTexts() override { NMATerminate(); }

    QTAttributesXMLParser parse(const std::string& text) {
        return QTAttributesXMLParser(NCFSmartPtr<INCFComponentFactory>(host.factory()),
                                     NMAString(text.c_str()), result);
    }
    NCFRESULT colourOf(const std::string& text, ColorSpaceDescriptor& out) {
        QTAttributesXMLParser parser = parse(text);
        EXPECT_EQ(result, NCF_OK);
        try {
            return parser.GetColorSpaceDescriptor(&out);
        } catch (NCFRESULT thrown) {
            thrown_ = true;
            return thrown;
        }
    }
    // The colour text with one element replaced.
    static std::string with(const std::string& element, const std::string& replacement) {
        std::string text = kColour;
        const std::size_t start = text.find("<" + element + ">");
        const std::string end = "</" + element + ">";
        const std::size_t stop = text.find(end) + end.size();
        return text.replace(start, stop - start, replacement);
    }

    FakeHost host;
    NCFRESULT result = 1;
    bool thrown_ = false;
};

TEST_F(AttributeTexts, ReadTheColour) {
    ColorSpaceDescriptor colour;
    ASSERT_EQ(colourOf(kColour, colour), NCF_OK);
    EXPECT_EQ(TextOf(colour.name.inArg()), "Log C");
    EXPECT_EQ(colour.bitDepth, 12);
    EXPECT_EQ(colour.minReference, 64);
    EXPECT_EQ(colour.maxReference, 940);
    EXPECT_EQ(TextOf(colour.transferCharacteristicName.inArg()), "Log");
    EXPECT_TRUE(colour.transferCharacteristicUID ==
                ncfGuid("0E170000-0001-0101-060E-2B340401010C"));
}

TEST_F(AttributeTexts, DoNotCheckTheRootsName) {
    std::string text = kColour;
    for (std::size_t at = 0; (at = text.find("ColorSpaceDescriptor", at)) != std::string::npos;) {
        text.replace(at, 20, "Other");
    }
    ColorSpaceDescriptor colour;
    EXPECT_EQ(colourOf(text, colour), NCF_OK);
}

TEST_F(AttributeTexts, ReferenceOfZeroReadsAsNotGiven) {
    ColorSpaceDescriptor colour;
    ASSERT_EQ(colourOf(with("MinReference", "<MinReference>0</MinReference>"), colour), NCF_OK);
    EXPECT_EQ(colour.minReference, -1);
    EXPECT_EQ(colour.maxReference, 940);
    ASSERT_EQ(colourOf(with("MaxReference", "<MaxReference>255</MaxReference>"), colour), NCF_OK);
    EXPECT_EQ(colour.maxReference, 255);
}

TEST_F(AttributeTexts, MissingElementReadsEmptyWithOneLine) {
    RecordingLog log(host);
    ColorSpaceDescriptor colour;
    ASSERT_EQ(colourOf(with("MinReference", ""), colour), NCF_OK);
    EXPECT_EQ(colour.minReference, -1);
    ASSERT_EQ(log.records().size(), 1u);
    EXPECT_NE(log.records()[0].text.find("Element with tag <MinReference> is missing!"),
              std::string::npos);
    EXPECT_EQ(log.records()[0].where, "ParseHelperFunctions::QTAttributesXMLParser::_ReadElement");
    EXPECT_EQ(log.records()[0].kind, 1u);
}

TEST_F(AttributeTexts, ElementsAreReadInTheirOrderAndARequiredOneThrowsWithoutALine) {
    RecordingLog log(host);
    ColorSpaceDescriptor colour;
    EXPECT_EQ(colourOf("<Other/>", colour), NCF_E_UNEXPECTED);
    std::vector<std::string> missing;
    for (const LoggedRecord& record : log.records()) {
        const std::size_t start = record.text.find('<') + 1;
        missing.push_back(record.text.substr(start, record.text.find('>') - start));
    }
    EXPECT_EQ(missing, (std::vector<std::string>{"Name", "BitDepth", "MinReference", "MaxReference",
                                                 "TransferCharacteristicName"}));
    EXPECT_EQ(TextOf(colour.transferCharacteristicName.inArg()), "Empty");
}

TEST_F(AttributeTexts, EmptyElementReadsEmptyWithOneLine) {
    RecordingLog log(host);
    ColorSpaceDescriptor colour;
    ASSERT_EQ(colourOf(with("Name", "<Name/>"), colour), NCF_OK);
    EXPECT_EQ(TextOf(colour.name.inArg()), "Empty");
    EXPECT_TRUE(log.contains("Element with tag <Name> is empty!"));
    ASSERT_EQ(colourOf(with("BitDepth", ""), colour), NCF_OK);
    EXPECT_EQ(colour.bitDepth, 0);
}

TEST_F(AttributeTexts, MissingTransferLabelThrowsUnexpected) {
    ColorSpaceDescriptor colour;
    EXPECT_EQ(colourOf(with("TransferCharacteristicUID", ""), colour), NCF_E_UNEXPECTED);
    EXPECT_TRUE(thrown_);
    thrown_ = false;
    EXPECT_EQ(colourOf(with("TransferCharacteristicUID", "<TransferCharacteristicUID/>"), colour),
              NCF_E_UNEXPECTED);
    EXPECT_TRUE(thrown_);
}

TEST_F(AttributeTexts, MalformedTransferLabelLeavesTheFieldAsItWas) {
    ColorSpaceDescriptor colour;
    colour.transferCharacteristicUID = ncfGuid("11111111-2222-3333-4444-555555555555");
    const GUID before = colour.transferCharacteristicUID;
    ASSERT_EQ(colourOf(with("TransferCharacteristicUID",
                            "<TransferCharacteristicUID>nonsense</TransferCharacteristicUID>"),
                       colour),
              NCF_OK);
    EXPECT_TRUE(colour.transferCharacteristicUID == before);
}

TEST_F(AttributeTexts, MalformedTextFailsToLoad) {
    for (const std::string& text :
         {std::string(), std::string("<Bounds>"), std::string(kColour) + "</Wrapper>",
          std::string("<Bounds></Other>")}) {
        QTAttributesXMLParser parser = parse(text);
        EXPECT_LT(result, 0) << text;
        BoundsBox box;
        EXPECT_EQ(parser.GetBox(kBoxValid, &box), NMA_E_NOTINITIALIZED);
        ColorSpaceDescriptor colour;
        EXPECT_EQ(parser.GetColorSpaceDescriptor(&colour), NMA_E_NOTINITIALIZED);
    }
}

TEST_F(AttributeTexts, GiveTheRefusalOfTheDocumentComponent) {
    host.refuseCreation(kCLSID_XmlDocument, NCF_E_OUTOFMEMORY);
    parse(kColour);
    EXPECT_EQ(result, NCF_E_OUTOFMEMORY);
}

TEST_F(AttributeTexts, LoadNothingWithoutAFactory) {
    QTAttributesXMLParser parser(nullptr, NMAString(kColour), result);
    EXPECT_EQ(result, NMA_E_NOTINITIALIZED);
}

TEST_F(AttributeTexts, AnyOtherExceptionIsUnexpected) {
    host.maker(kCLSID_XmlDocument, [](const GUID&, void**) -> NCFRESULT { throw 1.0; });
    parse(kColour);
    EXPECT_EQ(result, NCF_E_UNEXPECTED);
}

// --- boxes ----------------------------------------------------------------------

TEST_F(AttributeTexts, ReadEachBoxByItsKind) {
    const std::pair<QTBoxKind, const char*> kinds[] = {{kBoxFraming, "Framing"},
                                                       {kBoxValid, "Valid"},
                                                       {kBoxEssence, "Essence"},
                                                       {kBoxSource, "Source"}};
    for (const auto& [kind, tag] : kinds) {
        QTAttributesXMLParser parser = parse("<Bounds>" + Box(tag) + "</Bounds>");
        ASSERT_EQ(result, NCF_OK);
        for (const auto& [asked, name] : kinds) {
            BoundsBox box;
            EXPECT_EQ(parser.GetBox(asked, &box), asked == kind ? NCF_OK : NMA_E_NODATA) << name;
        }
        BoundsBox box;
        parser.GetBox(kind, &box);
        EXPECT_EQ(box.positionX.numerator, -8);
        EXPECT_EQ(box.positionX.denominator, 1);
        EXPECT_EQ(box.positionY.numerator, -9);
        EXPECT_EQ(box.positionY.denominator, 2);
        EXPECT_EQ(box.height.numerator, 18);
        EXPECT_EQ(box.height.denominator, 3);
        EXPECT_EQ(box.width.numerator, 16);
        EXPECT_EQ(box.width.denominator, 4);
    }
}

TEST_F(AttributeTexts, AbsentBoxIsNoDataWithoutALine) {
    RecordingLog log(host);
    QTAttributesXMLParser parser = parse("<Bounds/>");
    BoundsBox box;
    EXPECT_EQ(parser.GetBox(kBoxFraming, &box), NMA_E_NODATA);
    EXPECT_TRUE(log.records().empty());
}

struct BrokenBox {
    const char* removed;  // the child that is taken out
    const char* logged;
    bool horizontalStored;
    bool verticalStored;
    bool heightStored;
};

TEST_F(AttributeTexts, BoxWithoutAPartFailsAndKeepsWhatWasRead) {
    const BrokenBox cases[] = {
        {"PositionX", "positionXNode", false, false, false},
        {"PositionY", "positionYNode", true, false, false},
        {"Height", "heightNode", true, true, false},
        {"Width", "widthNode", true, true, true},
    };
    for (const BrokenBox& broken : cases) {
        std::string text = "<Bounds>" + Box("Framing") + "</Bounds>";
        const std::string end = std::string("</") + broken.removed + ">";
        const std::size_t start = text.find(std::string("<") + broken.removed + ">");
        text.erase(start, text.find(end) + end.size() - start);
        QTAttributesXMLParser parser = parse(text);
        RecordingLog log(host);
        BoundsBox box;
        EXPECT_EQ(parser.GetBox(kBoxFraming, &box), NCF_E_FAIL) << broken.removed;
        EXPECT_TRUE(log.once(std::string("NCFASSERT( ") + broken.logged +
                             " )ParseHelperFunctions::QTAttributesXMLParser::GetBox"));
        EXPECT_EQ(box.positionX.numerator == -8, broken.horizontalStored);
        EXPECT_EQ(box.positionY.numerator == -9, broken.verticalStored);
        EXPECT_EQ(box.height.numerator == 18, broken.heightStored);
        EXPECT_EQ(box.width.numerator, 0);
    }
}

TEST_F(AttributeTexts, MissingNumeratorAndDenominatorAreLoggedUnderOneText) {
    RecordingLog log(host);
    BoundsBox box;
    QTAttributesXMLParser first = parse(
        "<Bounds><Valid><PositionX><Denominator>1</Denominator></PositionX></Valid></Bounds>");
    EXPECT_EQ(first.GetBox(kBoxValid, &box), NCF_E_FAIL);
    EXPECT_TRUE(
        log.once("NCFASSERT( numeratorElement )"
                 "ParseHelperFunctions::QTAttributesXMLParser::_GetNumerator"));
    EXPECT_TRUE(
        log.once("NCF_RETURN(0x80000008): "
                 "_GetNumerator(positionXNode,&op_box->positionX.numerator) : "
                 "ParseHelperFunctions::QTAttributesXMLParser::GetBox"));
    QTAttributesXMLParser second =
        parse("<Bounds><Valid><PositionX><Numerator>5</Numerator></PositionX></Valid></Bounds>");
    EXPECT_EQ(second.GetBox(kBoxValid, &box), NCF_E_FAIL);
    EXPECT_EQ(box.positionX.numerator, 5);
    EXPECT_TRUE(
        log.once("NCFASSERT( numeratorElement )"
                 "ParseHelperFunctions::QTAttributesXMLParser::_GetDenominator"));
}

TEST_F(AttributeTexts, NumberWithoutTextIsUnexpected) {
    BoundsBox box;
    QTAttributesXMLParser parser =
        parse("<Bounds><Valid>" + Number("PositionX", "1", "") + "</Valid></Bounds>");
    EXPECT_EQ(parser.GetBox(kBoxValid, &box), NCF_E_UNEXPECTED);
    QTAttributesXMLParser other =
        parse("<Bounds><Valid>" + Number("PositionX", "", "1") + "</Valid></Bounds>");
    EXPECT_EQ(other.GetBox(kBoxValid, &box), NCF_E_UNEXPECTED);
}

TEST_F(AttributeTexts, EveryNumberIsLoggedUnderItsOwnExpression) {
    const struct {
        const char* part;
        const char* number;
        const char* expression;
    } rows[] = {
        {"PositionX", "Denominator",
         "_GetDenominator(positionXNode,&op_box->positionX.denominator)"},
        {"PositionY", "Denominator",
         "_GetDenominator(positionYNode,&op_box->positionY.denominator)"},
        {"Height", "Denominator", "_GetDenominator(heightNode, &op_box->height.denominator)"},
        {"Width", "Denominator", "_GetDenominator(widthNode, &op_box->width.denominator)"},
        {"PositionY", "Numerator", "_GetNumerator(positionYNode,&op_box->positionY.numerator)"},
        {"Height", "Numerator", "_GetNumerator(heightNode,&op_box->height.numerator)"},
        {"Width", "Numerator", "_GetNumerator(widthNode, &op_box->width.numerator)"},
    };
    for (const auto& row : rows) {
        std::string text = "<Bounds>" + Box("Source") + "</Bounds>";
        const std::string begin = std::string("<") + row.number + ">";
        const std::size_t part = text.find(std::string("<") + row.part + ">");
        const std::size_t start = text.find(begin, part) + begin.size();
        text.erase(start, text.find("</", start) - start);
        QTAttributesXMLParser parser = parse(text);
        RecordingLog log(host);
        BoundsBox box;
        EXPECT_EQ(parser.GetBox(kBoxSource, &box), NCF_E_UNEXPECTED);
        EXPECT_TRUE(log.contains(row.expression)) << row.part << ' ' << row.number;
    }
}

TEST_F(AttributeTexts, HugeNumbersDoNotOverflow) {
    BoundsBox box;
    QTAttributesXMLParser parser =
        parse("<Bounds><Valid>" + Number("PositionX", "99999999999999999999999", "1") +
              Number("PositionY", "1", "1") + Number("Height", "1", "1") +
              Number("Width", "1", "1") + "</Valid></Bounds>");
    EXPECT_EQ(parser.GetBox(kBoxValid, &box), NCF_OK);
}

TEST_F(AttributeTexts, NeedTheirOutputs) {
    QTAttributesXMLParser parser = parse(kColour);
    EXPECT_EQ(parser.GetColorSpaceDescriptor(nullptr), NCF_E_POINTER);
    EXPECT_EQ(parser.GetBox(kBoxValid, nullptr), NCF_E_POINTER);
}

}  // namespace
