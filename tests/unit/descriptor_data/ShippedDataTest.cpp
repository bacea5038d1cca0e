// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The shipped data files: what they say of every movie that is known.

#include <gtest/gtest.h>

#include <cstring>
#include <set>

#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "tests/unit/descriptor_data/DataHost.h"
#include "tests/unit/descriptor_data/FakePicture.h"
#include "tests/unit/descriptor_data/KnownRecords.h"

namespace {

ncfUInt32 Number(const char* code) {
    ncfUInt32 number = 0;
    const std::size_t length = std::strlen(code);
    for (std::size_t i = 0; i < 4; ++i) {
        number = number << 8 | (i < length ? static_cast<unsigned char>(code[i]) : 0);
    }
    return number;
}

aafUID_t Identifier(const char (&text)[37]) {
    return ncfGuid(text);
}

class ShippedData : public DataHost {
protected:
    ShippedData() {
        SetModulesFolder(SHIPPED_DATA_FOLDER "/");
        EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(),
                                                    "FourCharMapper.xml", "AAFInfo.xml"),
                  NCF_OK);
    }
    ~ShippedData() override { ShutDownInfoRetriever(); }

    struct Answer {
        NCFRESULT result;
        ncfUInt32 id = 0;
        AAFInfo info;
        bool isMPEG;
        bool isRGBA;
    };
    static Answer Ask(FakePicture& clip) {
        Answer answer;
        QuickTimeToAAFInfoRetriever* const retriever = QuickTimeToAAFInfoRetriever::GetInstance();
        answer.result = retriever->GetInfoFromImageDescription(&clip, &answer.info, &answer.id);
        answer.isMPEG = retriever->IsMPEGDescriptor();
        answer.isRGBA = retriever->IsRGBADescriptor();
        return answer;
    }
    static Answer Ask(const KnownRecord& record) {
        FakePicture clip;
        clip.code = Number(record.code);
        clip.vendor = Number(record.vendor);
        clip.width = record.width;
        clip.height = record.height;
        clip.layout = record.fields == 2 ? 1 : 0;
        clip.layoutResult = record.fields == 0 ? NCF_E_PARAMETERNOTAVAILABLE : NCF_OK;
        return Ask(clip);
    }
    static std::string Name(const KnownRecord& record) {
        return std::string(record.code) + " of '" + record.vendor + "' " +
               std::to_string(record.width) + "x" + std::to_string(record.height) + ", fields " +
               std::to_string(record.fields);
    }
};

TEST_F(ShippedData, EveryKnownMovieFindsItsRecord) {
    for (const KnownRecord& record : KnownRecords()) {
        SCOPED_TRACE(Name(record));
        const Answer answer = Ask(record);
        ASSERT_EQ(answer.result, NCF_OK);
        EXPECT_EQ(answer.id, record.id);
        EXPECT_EQ(answer.isMPEG, record.kind == KnownKind::kMPEG2);
        EXPECT_FALSE(answer.isRGBA);
        const AAFInfo& info = answer.info;
        EXPECT_EQ(info.frameLayout, record.frameLayout);
        EXPECT_EQ(info.storedWidth, record.storedWidth);
        EXPECT_EQ(info.storedHeight, record.storedHeight);
        EXPECT_EQ(info.sampledWidth, record.width);
        EXPECT_EQ(info.displayWidth, record.width);
        EXPECT_EQ(info.displayHeight, record.displayHeight);
        EXPECT_EQ(info.videoLineMapVect,
                  (std::vector<ncfSInt32>{record.firstLines[0], record.firstLines[1]}));
        EXPECT_EQ(info.aspectNumerator, record.aspect[0]);
        EXPECT_EQ(info.aspectDenominator, record.aspect[1]);
    }
}

TEST_F(ShippedData, EveryKnownCodeHasItsLabelsAndSampling) {
    for (const KnownRecord& record : KnownRecords()) {
        SCOPED_TRACE(Name(record));
        const Answer answer = Ask(record);
        const KnownCode* known = nullptr;
        for (const KnownCode& code : KnownCodes()) {
            known = std::strcmp(code.code, record.code) == 0 ? &code : known;
        }
        ASSERT_NE(known, nullptr);
        EXPECT_EQ(answer.info.pictureEssenceCoding, Identifier(known->coding));
        EXPECT_EQ(answer.info.essenceContainerLabel, Identifier(known->container));
        EXPECT_EQ(answer.info.componentDepth, known->depth);
        EXPECT_EQ(answer.info.horizontalSubsampling, known->horizontalSubsampling);
        EXPECT_EQ(answer.info.verticalSubsampling, known->verticalSubsampling);
        EXPECT_EQ(answer.info.colorSiting, known->siting);
        // Video range of the depth.
        const ncfUInt32 shift = known->depth - 8;
        EXPECT_EQ(answer.info.blackRefLevel, 16u << shift);
        EXPECT_EQ(answer.info.whiteRefLevel, 235u << shift);
        EXPECT_EQ(answer.info.colorRange, (224u << shift) + 1);
    }
}

TEST_F(ShippedData, MPEGRecordsHaveProfileRateAndGroup) {
    for (const KnownRecord& record : KnownRecords()) {
        if (record.kind != KnownKind::kMPEG2) {
            continue;
        }
        SCOPED_TRACE(Name(record));
        const Answer answer = Ask(record);
        EXPECT_EQ(answer.info.maxGOP, record.height == 720 ? 12u : 15u);
        const std::string family(record.code, 3);
        const bool isHD422 = family == "xd5";
        const bool isHDV = family == "hdv";
        const bool isHL = !isHDV || std::strchr("9a", record.code[3]);
        EXPECT_EQ(answer.info.levelAndProfile, isHD422 ? 0x82 : isHL ? 0x44 : 0x46);
        const ncfUInt32 rateOfHDV = record.height == 720 ? 19700000u : 25000000u;
        EXPECT_EQ(answer.info.bitRate, isHD422 ? 50000000u : isHDV ? rateOfHDV : 35000000u);
    }
}

TEST_F(ShippedData, OnlyAVCIntraCountsSlices) {
    for (const KnownRecord& record : KnownRecords()) {
        const bool isAVCIntra = std::string(record.code, 2) == "ai";
        EXPECT_EQ(Ask(record).info.sliceCounter, isAVCIntra ? 10u : 0u) << Name(record);
    }
}

TEST_F(ShippedData, OnlyIMXHidesItsTopLines) {
    for (const KnownRecord& record : KnownRecords()) {
        const bool isIMX = std::string(record.code, 2) == "mx";
        const ncfUInt32 hidden = record.displayHeight == 288 ? 16u : 13u;
        EXPECT_EQ(Ask(record).info.displayYOffset, isIMX ? hidden : 0u) << Name(record);
    }
}

TEST_F(ShippedData, TheVendorChangesNothing) {
    for (KnownRecord record : KnownRecords()) {
        const ncfUInt32 id = Ask(record).id;
        for (const char* vendor : {"", "appl", "FFMP", "zzzz"}) {
            std::strcpy(record.vendor, vendor);
            EXPECT_EQ(Ask(record).id, id) << Name(record);
        }
    }
}

TEST_F(ShippedData, CodesThatAreNotNativeGoToTheProvider) {
    for (const char* code : {"avc1", "hvc1", "hev1", "mp2v", "m2v1", "jpeg", "mp4v", "vp09", "av01",
                             "raw ", "rle ", "png ", "b48r", "r210", "NVj2"}) {
        KnownRecord record{};
        std::strcpy(record.code, code);
        record.width = 1920;
        record.height = 1080;
        EXPECT_EQ(Ask(record).result, NCF_E_NOTSUPPORTED) << code;
    }
}

TEST_F(ShippedData, ProResOfAnotherRasterIsAskedOfTheMovie) {
    FakePicture clip;
    clip.code = Number("apcn");
    clip.width = 2048;
    clip.height = 1080;
    EXPECT_EQ(Ask(clip).result, NCF_E_PARAMETERNOTAVAILABLE);
    clip.resolutionResult = NCF_OK;
    clip.resolution = 10950;
    const Answer answer = Ask(clip);
    EXPECT_EQ(answer.result, NCF_OK);
    EXPECT_EQ(answer.info.storedWidth, 2048u);
    EXPECT_EQ(answer.info.storedHeight, 1080u);
    EXPECT_EQ(answer.info.aspectNumerator * 135, answer.info.aspectDenominator * 256);
    clip.height = 858;
    EXPECT_EQ(Ask(clip).result, NCF_E_NOTSUPPORTED) << "another height is another picture";
}

TEST_F(ShippedData, CodesOfManyRastersRefuseARasterThatTheyLack) {
    for (const char* code : {"ap4x", "2vuy", "v210", "2Vuy", "ai56"}) {
        FakePicture clip;
        clip.code = Number(code);
        clip.width = 720;
        clip.height = 500;
        EXPECT_EQ(Ask(clip).result, NCF_E_NOTSUPPORTED) << code;
        clip.width = 640;
        clip.height = 480;
        EXPECT_EQ(Ask(clip).result, NCF_E_NOTSUPPORTED) << code;
    }
}

TEST_F(ShippedData, WovenFieldsOfUncompressedPicturesAreWholeFrames) {
    for (const KnownRecord& record : KnownRecords()) {
        if (record.fields == 2 && std::strcmp(record.code, "v210") == 0) {
            EXPECT_EQ(Ask(record).info.frameLayout, 0u) << Name(record);
        }
    }
}

TEST_F(ShippedData, TheKnownMoviesCoverEveryCode) {
    std::set<std::string> withRecords;
    for (const KnownRecord& record : KnownRecords()) {
        withRecords.insert(record.code);
    }
    for (const KnownCode& code : KnownCodes()) {
        EXPECT_EQ(withRecords.count(code.code), 1u) << code.code;
    }
    EXPECT_EQ(withRecords.size(), KnownCodes().size());
}

}  // namespace
