// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The search for an entry, and the shape of the file.

#include <gtest/gtest.h>

#include "tests/unit/descriptor_data/AAFInfoFile.h"

namespace {

class AAFInfoReaderTest : public AAFInfoFile {
protected:
    // The result of a search, and the mark of the entry found.
    NCFRESULT Search(ncfUInt32 width, ncfUInt32 height, ncfUInt32 vcid = 1) {
        Reader reader(*this, width, height, vcid);
        mark_ = 0;
        return reader.GetOneProperty("rp210:MaxGOP", &mark_) == NCF_E_NOTSUPPORTED
                   ? reader.GetMediaDescriptorSignature(vcid, width, height)
                   : NCF_OK;
    }
    // An MPEG-2 entry can carry a mark of its own.
    static std::string Marked(int mark, const std::string& values) {
        return Entry("1", "MPEG2Video", values + Value("MaxGOP", std::to_string(mark)));
    }
    ncfUInt32 mark_ = 0;
};

TEST_F(AAFInfoReaderTest, AnUnknownIdIsNotSupported) {
    Load(Entry("1", "CDCI", Size(720, 480)));
    EXPECT_EQ(Search(720, 480, 2), ncf_detail::Code(0x8000000D));
}

TEST_F(AAFInfoReaderTest, TheKeyIsComparedAsText) {
    Load(Entry("01", "CDCI", Size(720, 480)));
    EXPECT_EQ(Search(720, 480), NCF_E_NOTSUPPORTED);
}

TEST_F(AAFInfoReaderTest, AnIdWithTheTopBitIsWrittenAsANegativeNumber) {
    Load(Entry("-2", "CDCI", Size(720, 480)));
    EXPECT_EQ(Search(720, 480, 0xFFFFFFFEu), NCF_OK);
}

TEST_F(AAFInfoReaderTest, ASingleEntryTakesAnyHeight) {
    Load(Entry("1", "CDCI", Size(720, 480)));
    EXPECT_EQ(Search(720, 17), NCF_OK);
    EXPECT_EQ(Search(704, 480), NCF_E_NOTSUPPORTED);
}

TEST_F(AAFInfoReaderTest, TheFirstOfSeveralWhoseHeightFitsWins) {
    Load(Marked(1, Size(720, 576)) + Marked(2, Size(720, 486)) + Marked(3, Size(720, 480)));
    EXPECT_EQ(Search(720, 576), NCF_OK);
    EXPECT_EQ(mark_, 1u);
    EXPECT_EQ(Search(720, 486), NCF_OK);
    EXPECT_EQ(mark_, 2u);
    EXPECT_EQ(Search(720, 480), NCF_OK);
    EXPECT_EQ(mark_, 3u);
    EXPECT_EQ(Search(720, 500), NCF_E_NOTSUPPORTED);
}

TEST_F(AAFInfoReaderTest, EachValueIsOfItsOwnEntryWhateverWasSearchedForBefore) {
    Load(Marked(1, Size(720, 576)) + Marked(2, Size(720, 486)));
    Reader reader(*this, 720, 576, 1);
    const auto mark = [&] {
        ncfUInt32 found = 0;
        EXPECT_EQ(reader.GetOneProperty("rp210:MaxGOP", &found), NCF_OK);
        return found;
    };
    EXPECT_EQ(mark(), 1u);
    EXPECT_EQ(mark(), 1u);
    EXPECT_EQ(reader.GetMediaDescriptorSignature(1, 720, 486), NCF_OK);
    EXPECT_EQ(mark(), 1u);
    EXPECT_EQ(reader.GetMediaDescriptorSignature(1, 720, 500), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(mark(), 1u);
}

TEST_F(AAFInfoReaderTest, FieldsMatchFramesAndFramesFields) {
    Load(Marked(1, Size(1920, 540)) + Marked(2, Size(1440, 1080)));
    EXPECT_EQ(Search(1920, 1080), NCF_OK);  // half
    EXPECT_EQ(mark_, 1u);
    EXPECT_EQ(Search(1920, 1081), NCF_OK);  // half, cut
    EXPECT_EQ(mark_, 1u);
    EXPECT_EQ(Search(1440, 540), NCF_OK);  // double
    EXPECT_EQ(mark_, 2u);
    EXPECT_EQ(Search(1440, 541), NCF_E_NOTSUPPORTED);
}

TEST_F(AAFInfoReaderTest, ThreeOrSixLinesMoreThanTheEntryStillFit) {
    Load(Marked(1, Size(720, 240)) + Marked(2, Size(720, 480)));
    EXPECT_EQ(Search(720, 243), NCF_OK);
    EXPECT_EQ(mark_, 1u);
    EXPECT_EQ(Search(720, 246), NCF_OK);
    EXPECT_EQ(mark_, 1u);
    EXPECT_EQ(Search(720, 486), NCF_OK);
    EXPECT_EQ(mark_, 2u);
    EXPECT_EQ(Search(720, 482), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(Search(720, 477), NCF_E_NOTSUPPORTED);
}

TEST_F(AAFInfoReaderTest, TheOrderOfTheFileDecidesBetweenTwoThatFit) {
    Load(Marked(1, Size(720, 480)) + Marked(2, Size(720, 486)));
    EXPECT_EQ(Search(720, 486), NCF_OK);
    EXPECT_EQ(mark_, 1u);
}

TEST_F(AAFInfoReaderTest, TheDisplayHeightHasPrecedence) {
    Load(Marked(1, Size(1920, 544) + Value("DisplayHeight", "540")) + Marked(2, Size(1920, 1088)));
    EXPECT_EQ(Search(1920, 540), NCF_OK);
    EXPECT_EQ(mark_, 1u);
    EXPECT_EQ(Search(1920, 544), NCF_OK);
    EXPECT_EQ(mark_, 2u);
}

TEST_F(AAFInfoReaderTest, TheSampledWidthFitsToo) {
    Load(Entry("1", "CDCI", Size(1296, 720) + Value("SampledWidth", "1280")));
    EXPECT_EQ(Search(1280, 720), NCF_OK);
    EXPECT_EQ(Search(1296, 720), NCF_OK);
    EXPECT_EQ(Search(1290, 720), NCF_E_NOTSUPPORTED);
}

TEST_F(AAFInfoReaderTest, EntriesWithoutHeightOrWidthAreSkipped) {
    Load(Entry("1", "CDCI", Value("StoredWidth", "720")));
    EXPECT_EQ(Search(720, 480), ncf_detail::Code(0x8000000D));
    Load(Entry("1", "CDCI", Value("StoredWidth", "720")) +
         Entry("1", "CDCI", Value("StoredHeight", "480")) + Marked(3, Size(720, 480)));
    EXPECT_EQ(Search(720, 480), NCF_OK);
    EXPECT_EQ(mark_, 3u);
}

TEST_F(AAFInfoReaderTest, AnEntryWithoutDescriptorEndsTheSearch) {
    Load("<MediaDescriptorSignature><NivoInfo ResolutionID=\"1\"/></MediaDescriptorSignature>" +
         Marked(2, Size(720, 480)));
    EXPECT_EQ(Search(720, 480), NCF_E_NOTSUPPORTED);
    ASSERT_FALSE(log.records().empty());
    EXPECT_EQ(log.records()[0].kind, 1u);
    EXPECT_EQ(log.records()[0].text,
              "AAFInfoDataContainerReader2::GetMediaDescriptorSignature"
              "unknown video description!");
}

TEST_F(AAFInfoReaderTest, KindsArePreferredInTheirOrder) {
    const std::string cdci =
        "<groups:CDCIDescriptor>" + Size(720, 480) + "</groups:CDCIDescriptor>";
    const std::string mpeg =
        "<groups:MPEG2VideoDescriptor>" + Size(720, 480) + "</groups:MPEG2VideoDescriptor>";
    const std::string rgba =
        "<groups:RGBADescriptor>" + Size(720, 480) + "</groups:RGBADescriptor>";
    const auto entry = [](const char* id, const std::string& descriptors) {
        return std::string("<MediaDescriptorSignature><NivoInfo><ResolutionID>") + id +
               "</ResolutionID></NivoInfo>" + descriptors + "</MediaDescriptorSignature>";
    };
    Load(entry("1", rgba + mpeg + cdci) + entry("2", rgba + mpeg) + entry("3", rgba));
    const auto kind = [this](ncfUInt32 vcid) {
        Reader reader(*this, 720, 480, vcid);
        bool isMPEG2 = false;
        bool isRGBA = false;
        EXPECT_EQ(reader.IsDescriptorMPEG2(&isMPEG2), NCF_OK);
        EXPECT_EQ(reader.IsDescriptorRGBA(&isRGBA), NCF_OK);
        return std::pair(isMPEG2, isRGBA);
    };
    EXPECT_EQ(kind(1), std::pair(false, false));
    EXPECT_EQ(kind(2), std::pair(true, false));
    EXPECT_EQ(kind(3), std::pair(false, true));
}

TEST_F(AAFInfoReaderTest, TheKindIsThatOfTheEntryFoundAndNotOfOnePassedOver) {
    Load(Entry("1", "MPEG2Video", Size(1920, 1080)) + Entry("1", "RGBA", Size(1280, 720)) +
         Entry("1", "CDCI", Size(720, 480)));
    Reader reader(*this, 720, 480);
    bool isMPEG2 = true;
    bool isRGBA = true;
    EXPECT_EQ(reader.IsDescriptorMPEG2(&isMPEG2), NCF_OK);
    EXPECT_EQ(reader.IsDescriptorRGBA(&isRGBA), NCF_OK);
    EXPECT_FALSE(isMPEG2);
    EXPECT_FALSE(isRGBA);
}

TEST_F(AAFInfoReaderTest, EveryQuestionLogsAFailedSearch) {
    Load(Entry("1", "CDCI", Size(720, 480)));
    Reader reader(*this, 720, 480, 9);
    aafUID_t uid{};
    NMAString text;
    ncfUInt32 number = 0;
    bool flag = false;
    std::vector<ncfSInt32> lines;
    std::vector<aafRGBAComponent_t> layout;
    EXPECT_EQ(reader.GetUID("x", &uid), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(reader.GetOneProperty("x", &text), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(reader.GetTwoProperties("x", "y", "z", &number, &number), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(reader.IsDescriptorMPEG2(&flag), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(reader.IsDescriptorRGBA(&flag), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(reader.GetVideoLineMapFromVCID(&lines), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(reader.GetPixelLayoutFromVCID(&layout), NCF_E_NOTSUPPORTED);
    const std::string text1 =
        "NCF_RETURN(0x8000000d): GetMediaDescriptorSignature(m_curVCID, m_curWidth, m_curHeight) "
        ": AAFInfoDataContainerReader2::";
    for (const char* name :
         {"GetUID", "GetOneProperty", "GetTwoProperties", "IsDescriptorMPEG2", "IsDescriptorRGBA",
          "GetVideoLineMapFromVCID", "GetPixelLayoutFromVCID"}) {
        EXPECT_TRUE(log.once(text1 + name)) << name;
    }
}

TEST_F(AAFInfoReaderTest, MissingOutputsAreRefusedUnderTheirNames) {
    Load(Entry("1", "CDCI", Size(720, 480)));
    Reader reader(*this, 720, 480);
    EXPECT_EQ(reader.IsDescriptorMPEG2(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(reader.IsDescriptorRGBA(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(reader.GetProfileAndLevelFromVCID(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(reader.GetPixelLayoutFromVCID(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(reader.GetFrameLayoutFromVCID(nullptr), ncf_detail::Code(0x80000005));
    EXPECT_EQ(reader.GetPictureEssenceCodingFromVCID(nullptr), NCF_E_INVALIDARG);
    for (const char* text :
         {"CHK_INARG(isMPEG2)AAFInfoDataContainerReader2::IsDescriptorMPEG2",
          "CHK_INARG(isRGBA)AAFInfoDataContainerReader2::IsDescriptorRGBA",
          "CHK_INARG(outProfileAndLevel)AAFInfoDataContainerReader2::GetProfileAndLevelFromVCID",
          "CHK_INARG(outPixelLayoutVect)AAFInfoDataContainerReader2::GetPixelLayoutFromVCID",
          "CHK_PTR(elementValue)AAFInfoDataContainerReader2::GetOneProperty",
          "CHK_INARG(outUID)GetUIDImpl"}) {
        EXPECT_TRUE(log.once(text)) << text;
    }
}

TEST_F(AAFInfoReaderTest, TheImplsRefuseAMissingDescriptorUnderTheirNames) {
    aafUID_t uid{};
    NMAString text;
    ncfUInt32 number = 0;
    EXPECT_EQ(GetUIDImpl(nullptr, "x", &uid), NCF_E_INVALIDARG);
    EXPECT_EQ(GetOnePropertyImpl(nullptr, "x", &text), NCF_E_INVALIDARG);
    EXPECT_EQ(GetTwoPropertiesImpl(nullptr, "x", "y", "z", nullptr, &number), NCF_E_INVALIDARG);
    EXPECT_EQ(GetTwoPropertiesImpl(nullptr, "x", "y", "z", &number, nullptr), NCF_E_INVALIDARG);
    for (const char* record : {"CHK_INARG(pMediaDescriptorNode)GetUIDImpl",
                               "CHK_INARG(pMediaDescriptorNode)GetOnePropertyImpl",
                               "CHK_INARG(elementValue1)GetTwoPropertiesImpl",
                               "CHK_INARG(elementValue2)GetTwoPropertiesImpl"}) {
        EXPECT_TRUE(log.once(record)) << record;
    }
}

TEST_F(AAFInfoReaderTest, ItemsMayBeAttributes) {
    Load(
        "<MediaDescriptorSignature><NivoInfo ResolutionID='1'/>"
        "<groups:CDCIDescriptor rp210:StoredWidth='720' rp210:StoredHeight='480'>"
        "<rp210:AspectRatio types:Numerator='4' types:Denominator='3'/>"
        "</groups:CDCIDescriptor></MediaDescriptorSignature>");
    Reader reader(*this, 720, 480);
    ncfUInt32 numerator = 0;
    ncfUInt32 denominator = 0;
    EXPECT_EQ(reader.GetAspectRatioFromVCID(&numerator, &denominator), NCF_OK);
    EXPECT_EQ(numerator, 4u);
    EXPECT_EQ(denominator, 3u);
}

TEST_F(AAFInfoReaderTest, ElementsOfAnotherKindAreNotSeen) {
    Load(Entry("1", "RGBA",
               Size(720, 480) + Value("ComponentDepth", "10") + Value("ColorRange", "225")));
    Reader reader(*this, 720, 480);
    ncfUInt32 value = 77;
    EXPECT_EQ(reader.GetComponentDepthFromVCID(&value), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(reader.GetColorRangeFromVCID(&value), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_EQ(value, 77u);
}

TEST_F(AAFInfoReaderTest, EveryFailureOfLoadingIsThrownAsOneResult) {
    const auto thrown = [this](const std::string& path) {
        GenericXMLDataContainer container;
        try {
            ParseAAFInfoXML(host.factory(), &container, NMAString(path.c_str()));
            return NCF_OK;
        } catch (NCFRESULT result) {
            return result;
        }
    };
    const std::string good = Write("good.xml", Document(""));
    EXPECT_EQ(thrown(good), NCF_OK);
    EXPECT_EQ(thrown(Folder() + "absent.xml"), NCF_E_FAIL);
    EXPECT_EQ(thrown(Write("broken.xml", "<Infos><x></Infos>")), NCF_E_FAIL);
    EXPECT_EQ(thrown(Write("empty.xml", "")), NCF_E_FAIL);
    host.refuseCreation(kCLSID_GenericDocHandler, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(thrown(good), NCF_E_FAIL);
    host.clearRefusals();
    host.refuseCreation(kCLSID_SaxParser, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(thrown(good), NCF_E_FAIL);
    host.clearRefusals();
    UseScript();
    script.setErrorHandler = 1;
    EXPECT_EQ(thrown(good), NCF_E_FAIL) << "any result but 0";
}

TEST_F(AAFInfoReaderTest, ADescriptorBeforeTheFirstEntryIsAFailure) {
    EXPECT_THROW(Load("<NivoInfo ResolutionID='1'/>"), NCFRESULT);
}

TEST_F(AAFInfoReaderTest, DeclaringNeedsItsNode) {
    EXPECT_EQ(AddCDCIProperties(&container_, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(AddMPEG2Properties(&container_, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(AddRGBAProperties(&container_, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log.contains(": AddCDCIProperties"));
}

}  // namespace
