// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Colour and bounds that a movie tells in XML texts of its description, read
// with the host's own XML component.

#include "host_interfaces/xml/XmlDocument.h"
#include "reference_host/util/Ref.h"
#include "reference_host/xml/XmlDocument.h"
#include "tests/unit/clips/ClipFixture.h"

namespace {

class QuickTimeClipAttributeTexts : public ClipTest {
protected:
    QuickTimeClipAttributeTexts() {
        parser->AddVideoTrack(1);
        host->name(kCLSID_XmlDocument, "xml document");
        host->maker(kCLSID_XmlDocument, [](const GUID& iid, void** out) {
            const auto document = host::MakeRef<host::XmlDocument>();
            return document->QueryInterface(iid, out);
        });
    }
    ColorDetails Color(const std::string& text) {
        Picture().SetColorText(text);
        Load();
        EXPECT_TRUE(clip->IsLoaded());
        ColorDetails details;
        clip->GetColorDetails(&details);
        return details;
    }
    GeometryDetails Geometry(const std::string& text) {
        Picture().SetRasterText(text);
        Load();
        EXPECT_TRUE(clip->IsLoaded());
        GeometryDetails details;
        clip->GetGeometryDetails(&details);
        return details;
    }
    static std::string Descriptor(const std::string& inside) {
        return "<ColorSpaceDescriptor>" + inside + "</ColorSpaceDescriptor>";
    }
    static std::string Box(const std::string& name, int x) {
        const auto value = [](const char* tag, int number) {
            return std::string("<") + tag + "><Numerator>" + std::to_string(number) +
                   "</Numerator><Denominator>2</Denominator></" + tag + ">";
        };
        return "<" + name + ">" + value("PositionX", x) + value("PositionY", x + 1) +
               value("Height", x + 2) + value("Width", x + 3) + "</" + name + ">";
    }
    static bool IsEmpty(const BoundsBox& box) {
        return box.positionX == Rational() && box.positionY == Rational() &&
               box.width == Rational() && box.height == Rational();
    }
    static void ExpectBox(const BoundsBox& box, int x) {
        EXPECT_EQ(box.positionX, (Rational{x, 2}));
        EXPECT_EQ(box.positionY, (Rational{x + 1, 2}));
        EXPECT_EQ(box.height, (Rational{x + 2, 2}));
        EXPECT_EQ(box.width, (Rational{x + 3, 2}));
    }
    void ExpectDefaultGeometry(const GeometryDetails& details) {
        for (const BoundsBox* box :
             {&details.framing, &details.valid, &details.essence, &details.source}) {
            EXPECT_EQ(box->width, (Rational{1600, 1}));
            EXPECT_EQ(box->height, (Rational{900, 1}));
        }
    }
};

const char kLabel[] =
    "<TransferCharacteristicUID>0e170000-0001-0101-060E-2B340401010C"
    "</TransferCharacteristicUID>";

}  // namespace

// --- colour -------------------------------------------------------------------------------

TEST_F(QuickTimeClipAttributeTexts, TakesColourFromTheText) {
    Picture().SetColor(1, 1, 1);
    const ColorDetails details =
        Color("<?xml version='1.0'?><Other/>" +
              Descriptor("<Name>Film</Name><BitDepth>10</BitDepth><MinReference>64</MinReference>"
                         "<MaxReference>940</MaxReference><TransferCharacteristicName>Log"
                         "</TransferCharacteristicName>" +
                         std::string(kLabel)));
    EXPECT_TRUE(details.hasVendorMetadata);
    EXPECT_EQ(details.refBlack, 64);
    EXPECT_EQ(details.refWhite, 940);
    EXPECT_EQ(TextOf(details.name.inArg()), "Film");
    EXPECT_EQ(TextOf(details.transferCharacteristicName.inArg()), "Log");
    EXPECT_TRUE(details.transferCharacteristicUID ==
                ncfGuid("0E170000-0001-0101-060E-2B340401010C"));
    ncfUInt32 colorSpace = 0;
    clip->GetColorSpace(&colorSpace);
    EXPECT_EQ(colorSpace, ncfUInt32{CS_RGB});
    EXPECT_EQ(journal.count("video description.GetVideoColorSpaceDetails"), 0);
}

TEST_F(QuickTimeClipAttributeTexts, TakesColourFromTheTextBeforeTheParsersMarks) {
    parser->color = new FakeParserColor(&journal);
    parser->color->flagA = parser->color->flagB = 0;
    const ColorDetails details =
        Color(Descriptor("<MinReference>64</MinReference><MaxReference>940</MaxReference>"
                         "<TransferCharacteristicUID>01020304-0506-0708-090A-0B0C0D0E0F10"
                         "</TransferCharacteristicUID>"));
    EXPECT_TRUE(details.hasVendorMetadata);
    EXPECT_EQ(details.refBlack, 64);
    EXPECT_EQ(details.refWhite, 940);
    EXPECT_TRUE(details.transferCharacteristicUID ==
                ncfGuid("01020304-0506-0708-090A-0B0C0D0E0F10"));
    EXPECT_TRUE(journal.startingWith("parser color").empty());
}

TEST_F(QuickTimeClipAttributeTexts, CannotTellABlackOfZero) {
    const ColorDetails details = Color(Descriptor(
        "<MinReference>0</MinReference><MaxReference>255</MaxReference>" + std::string(kLabel)));
    EXPECT_EQ(details.refBlack, -1);
    EXPECT_EQ(details.refWhite, 255);
    EXPECT_EQ(TextOf(details.name.inArg()), "Empty");
}

TEST_F(QuickTimeClipAttributeTexts, FallsBackWithoutTheTag) {
    Picture().SetColor(1, 1, 1);
    const ColorDetails details = Color("<Something>else</Something>");
    EXPECT_FALSE(details.hasVendorMetadata);
    EXPECT_EQ(details.matrix, 1u);
    EXPECT_EQ(journal.count("create xml document"), 0);
    // Nothing of its own is recorded: most movies have no such text.
    EXPECT_FALSE(log->contains("op_res"));
}

TEST_F(QuickTimeClipAttributeTexts, FallsBackWhenTheTextIsBroken) {
    Picture().SetColor(6, 1, 6);
    const struct {
        const char* what;
        std::string text;
    } kTexts[] = {
        {"not closed", "<ColorSpaceDescriptor><Name>"},
        {"wrapper's end behind", "<Wrapper>" + Descriptor(kLabel) + "</Wrapper>"},
        {"label missing", Descriptor("<Name>Film</Name>")},
        {"label empty", Descriptor("<TransferCharacteristicUID/>")},
        {"only the tag", "<ColorSpaceDescriptor>"},
    };
    for (const auto& entry : kTexts) {
        const ColorDetails details = Color(entry.text);
        EXPECT_FALSE(details.hasVendorMetadata) << entry.what;
        ncfUInt32 colorSpace = 0;
        clip->GetColorSpace(&colorSpace);
        EXPECT_EQ(colorSpace, ncfUInt32{CS_YCbCr_601}) << entry.what;
    }
}

TEST_F(QuickTimeClipAttributeTexts, LogsATextThatIsNotWellFormed) {
    Color("<ColorSpaceDescriptor><Name>");
    EXPECT_TRUE(log->contains(": op_res : QuickTimeClip::SetColorSpaceImplFromSpecificMedia"));
}

TEST_F(QuickTimeClipAttributeTexts, FallsBackWithoutXmlComponent) {
    host->refuseCreation(kCLSID_XmlDocument, NCF_E_OUTOFMEMORY);
    EXPECT_FALSE(Color(Descriptor(kLabel)).hasVendorMetadata);
    EXPECT_TRUE(
        log->returned("80000002", "op_res", "QuickTimeClip::SetColorSpaceImplFromSpecificMedia"));
}

TEST_F(QuickTimeClipAttributeTexts, FallsBackOnATextThatIsNotThere) {
    Picture().nullTexts = true;
    Picture().SetRasterText("");
    EXPECT_FALSE(Color("").hasVendorMetadata);
    EXPECT_TRUE(
        log->once("CHK_PTR(pCMString.inArg())QuickTimeClip::SetColorSpaceImplFromSpecificMedia"));
    EXPECT_TRUE(
        log->once("CHK_PTR(pRIString.inArg())QuickTimeClip::SetGeometryImplFromSpecificMedia"));
}

TEST_F(QuickTimeClipAttributeTexts, FallsBackWhenTheTextsThrow) {
    struct Throwing : FakeVideoDescription {
        using FakeVideoDescription::FakeVideoDescription;
        NCFRESULT GetCMAttributes(INCFString**) override { throw std::bad_alloc(); }
        NCFRESULT GetRIAttributes(INCFString**) override { throw std::bad_alloc(); }
    };
    Video().description->Release();
    Video().description = new Throwing(&journal);
    Load();
    EXPECT_TRUE(clip->IsLoaded());
    GeometryDetails details;
    clip->GetGeometryDetails(&details);
    ExpectDefaultGeometry(details);
}

TEST_F(QuickTimeClipAttributeTexts, SurvivesEveryCutOfTheTexts) {
    const std::string color = Descriptor("<Name>F</Name>" + std::string(kLabel));
    for (std::size_t length = 0; length < color.size(); ++length) {
        EXPECT_FALSE(Color(color.substr(0, length)).hasVendorMetadata) << length;
    }
    const std::string bounds = "<Bounds>" + Box("Source", 10) + "</Bounds>";
    for (std::size_t length = 0; length < bounds.size(); ++length) {
        ExpectDefaultGeometry(Geometry(bounds.substr(0, length)));
    }
}

// --- bounds ---------------------------------------------------------------------------------

TEST_F(QuickTimeClipAttributeTexts, TakesTheFourBoxesFromTheText) {
    const GeometryDetails details =
        Geometry("<!-- before --><Bounds>" + Box("Valid", 20) + Box("Source", 40) +
                 Box("Framing", 10) + Box("Essence", 30) + "</Bounds>");
    ExpectBox(details.framing, 10);
    ExpectBox(details.valid, 20);
    ExpectBox(details.essence, 30);
    ExpectBox(details.source, 40);
}

TEST_F(QuickTimeClipAttributeTexts, LeavesBoxesEmptyThatTheTextLacks) {
    const GeometryDetails details = Geometry("<Bounds>" + Box("Valid", 20) + "</Bounds>");
    ExpectBox(details.valid, 20);
    EXPECT_TRUE(IsEmpty(details.framing));
    EXPECT_TRUE(IsEmpty(details.essence));
    EXPECT_TRUE(IsEmpty(details.source));
}

TEST_F(QuickTimeClipAttributeTexts, ComputesTheBoundsWhenABoxIsBroken) {
    ExpectDefaultGeometry(
        Geometry("<Bounds>" + Box("Framing", 10) + "<Essence><PositionX/></Essence></Bounds>"));
    ExpectDefaultGeometry(Geometry("<Bounds>not closed"));
    ExpectDefaultGeometry(Geometry("no tag at all"));
}

TEST_F(QuickTimeClipAttributeTexts, HandsFailuresToReachTheTextOver) {
    Picture().results["GetRIAttributes"] = NCF_E_FAIL;
    Picture().results["GetCMAttributes"] = NCF_E_FAIL;
    Load();
    EXPECT_TRUE(clip->IsLoaded());
    EXPECT_TRUE(log->returned("80000008", "pSD->GetRIAttributes(pRIString.outArg())",
                              "QuickTimeClip::SetGeometryImplFromSpecificMedia"));
    EXPECT_TRUE(log->returned("80000008", "vdscr->GetCMAttributes(pCMString.outArg())",
                              "QuickTimeClip::SetColorSpaceImplFromSpecificMedia"));
}
