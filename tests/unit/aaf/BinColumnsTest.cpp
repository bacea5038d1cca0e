// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/BinColumns.h"

#include "source/aaf/BinColumnMapping.h"
#include "tests/unit/aaf/support/AAFTest.h"
#include "tests/unit/aaf/support/StubbornString.h"

namespace NMA::Impl {
namespace {

class BinColumnsTest : public AAFTest {
protected:
    NCFRESULT AddVideo() { return AddVideoBinColumnEntry(Media(), mob, Console()); }
    // The cell of column "Video" for a codec's name.
    std::string VideoCell(const std::string& name) {
        aaf.clearJournal();
        clip->codecName = name;
        EXPECT_EQ(AddVideo(), NCF_OK);
        EXPECT_EQ(aaf.journal().lines().size(), 1u);
        const std::string start = "MasterMob1.AppendComment 'Video' ";
        return aaf.journal().lines().at(0).substr(start.size());
    }
    IAAFSmartPointer<IAAFMob> mob = Make<IAAFMob>("MasterMob");
};

TEST_F(BinColumnsTest, AnEntryIsACommentOnTheMasterMob) {
    EXPECT_EQ(AddBinColumnEntry(mob, Console(), L"Column", L"Cell"), NCF_OK);
    EXPECT_EQ(aaf.journal().lines(),
              std::vector<std::string>{"MasterMob1.AppendComment 'Column' 'Cell'"});
}

TEST_F(BinColumnsTest, AnEntryChecksItsArguments) {
    EXPECT_EQ(AddBinColumnEntry(nullptr, Console(), L"a", L"b"), NCF_E_INVALIDARG);
    EXPECT_EQ(AddBinColumnEntry(mob, Console(), nullptr, L"b"), NCF_E_INVALIDARG);
    EXPECT_EQ(AddBinColumnEntry(mob, Console(), L"a", nullptr), NCF_E_INVALIDARG);
    const std::string function = "NMA::Impl::AddBinColumnEntry";
    EXPECT_TRUE(log.once("CHK_INARG(pMobMasterMob)" + function));
    EXPECT_TRUE(log.once("CHK_INARG(pBinColumnEntry)" + function));
    EXPECT_TRUE(log.once("CHK_INARG(pBinColumnValue)" + function));
}

TEST_F(BinColumnsTest, ARefusedEntryIsToldAndFails) {
    for (const HRESULT answer : {AAFRESULT_SMALLBUF, HRESULT(1)}) {
        host.console().clear();
        aaf.refuse("MasterMob1.AppendComment", answer);
        EXPECT_EQ(AddBinColumnEntry(mob, Console(), L"Column", L"100 %s \u00e9"), NCF_E_FAIL);
        EXPECT_EQ(host.console().count(
                      2, "AppendComment failed for Column with value 100 %s \xC3\xA9.\n"),
                  1);
    }
}

TEST_F(BinColumnsTest, AspectRatioIsTwoNumbersAndAColon) {
    AAFInfo info;
    aafRational_t ratio{};
    AddAspectRatioBinColumnEntry(mob, Console(), info, 16, 9, ratio);
    EXPECT_TRUE(aaf.has("MasterMob1.AppendComment 'Image Aspect Ratio' '16:9'"));
    EXPECT_EQ(ratio.numerator, 16);
    EXPECT_EQ(ratio.denominator, 9);
    EXPECT_EQ(info.aspectNumerator, 16u);
    EXPECT_EQ(info.aspectDenominator, 9u);
}

TEST_F(BinColumnsTest, AspectRatioIsSwappedInColumnAndDescriptorAlike) {
    AAFInfo info;
    info.swapAspectRatio = true;
    aafRational_t ratio{};
    AddAspectRatioBinColumnEntry(mob, Console(), info, 16, 9, ratio);
    EXPECT_TRUE(aaf.has("MasterMob1.AppendComment 'Image Aspect Ratio' '9:16'"));
    EXPECT_EQ(ratio.numerator, 9);
    EXPECT_EQ(ratio.denominator, 16);
}

TEST_F(BinColumnsTest, ARefusedAspectRatioIsLoggedAndPassedOver) {
    AAFInfo info;
    aafRational_t ratio{};
    aaf.refuse("MasterMob1.AppendComment");
    AddAspectRatioBinColumnEntry(mob, Console(), info, 4, 3, ratio);
    EXPECT_EQ(ratio.numerator, 4);
    EXPECT_TRUE(
        log.once("NCF_SKIP(0x80000008): AddBinColumnEntry(pMobMasterMob, pConsole, &iar[0], "
                 "(aafCharacter *) arStr.GetWCHARString()) : "
                 "NMA::Impl::AddAspectRatioBinColumnEntry"));
}

TEST_F(BinColumnsTest, TheMakersNameIsCutFromACodecsName) {
    EXPECT_EQ(VideoCell("Apple ProRes 422"), "'ProRes 422'");
    EXPECT_EQ(VideoCell("H.264"), "'H.264'");
    EXPECT_EQ(VideoCell("The Apple ProRes"), "'ProRes'");
}

TEST_F(BinColumnsTest, ANameThatEndsAtTheMakersNameLeavesAnEmptyCell) {
    EXPECT_EQ(VideoCell("Apple"), "''");
    EXPECT_EQ(VideoCell("An Apple"), "''");
    EXPECT_EQ(VideoCell("Apple "), "''");
    EXPECT_EQ(VideoCell("Apple X"), "'X'");
}

TEST_F(BinColumnsTest, ACodecWithoutANameHasTenCharactersMadeOfPairsOfLetters) {
    EXPECT_EQ(VideoCell(""), "'<6E55><6E6B><776F><206E><6F43><706D><6572><7373><6F69>n'");
}

TEST_F(BinColumnsTest, ACodecThatCannotBeNamedStopsTheClip) {
    clip->failures["GetCodecName"] = NCF_E_NOTFOUND;
    EXPECT_EQ(AddVideo(), NCF_E_FAIL);
    EXPECT_EQ(host.console().count(1, "Appropriate QuickTime decompressor wasn't found!\n"), 1);
    EXPECT_TRUE(log.contains("Appropriate QuickTime decompressor wasn't found!"));
    EXPECT_EQ(aaf.callCount(), 0);
}

TEST_F(BinColumnsTest, ANameThatRefusesToBeReadStopsTheClip) {
    const std::pair<const char*, const char*> statements[] = {
        {"ConvertTo", "codecName->ConvertTo(kNCFWCHAR)"},
        {"GetRawWCHAR", "codecName->GetRawWCHAR(&p_buffer)"},
        {"FindWCHAR", "codecName->FindWCHAR(badSeed,5,0,&findIndex)"},
    };
    for (const auto& [operation, statement] : statements) {
        NCFSmartPtr<INCFString> name;
        name.attach(new StubbornString("Apple ProRes", operation, NCF_E_NOTFOUND));
        clip->codecString = name.inArg();
        EXPECT_EQ(AddVideo(), NCF_E_NOTFOUND) << operation;
        EXPECT_TRUE(log.returned(NCF_E_NOTFOUND, statement, "NMA::Impl::AddVideoBinColumnEntry"));
        clip->codecString = nullptr;
    }
    EXPECT_EQ(aaf.callCount(), 0);
}

TEST_F(BinColumnsTest, ACodecsCodeIsNeeded) {
    clip->failures["GetDataFormat"] = NCF_E_NOTFOUND;
    EXPECT_EQ(AddVideo(), NCF_E_NOTFOUND);
    EXPECT_TRUE(log.returned(NCF_E_NOTFOUND, "media->GetDataFormat(&codecType)",
                             "NMA::Impl::AddVideoBinColumnEntry"));
}

TEST_F(BinColumnsTest, ARefusedVideoCellIsLoggedByItsKindAndPassedOver) {
    const std::pair<const char*, const char*> kinds[] = {
        {"", "AddBinColumnEntry(pMobMasterMob, pConsole, &vff[0],(aafCharacter *)unknown_name)"},
        {"Apple ProRes",
         "AddBinColumnEntry(pMobMasterMob, pConsole, &vff[0],(aafCharacter "
         "*)(&p_buffer[6+findIndex]))"},
        {"H.264", "AddBinColumnEntry(pMobMasterMob, pConsole, &vff[0],(aafCharacter *) p_buffer)"},
    };
    for (const auto& [name, statement] : kinds) {
        aaf.refuse("MasterMob1.AppendComment");
        clip->codecName = name;
        EXPECT_EQ(AddVideo(), NCF_OK);
        EXPECT_TRUE(log.once(std::string("NCF_SKIP(0x80000008): ") + statement +
                             " : NMA::Impl::AddVideoBinColumnEntry"))
            << name;
    }
}

TEST_F(BinColumnsTest, SoundIsNamedByItsCode) {
    const std::pair<ncfUInt32, const char*> kinds[] = {{0x61616320, "'AAC'"},
                                                       {0x6C70636D, "'LPCM'"},
                                                       {0, "'QT-NMA Audio'"},
                                                       {0x736F7774, "'QT-NMA Audio'"}};
    for (const auto& [code, name] : kinds) {
        aaf.clearJournal();
        AddAudioFormatBinColumnEntry(mob, Console(), code);
        EXPECT_TRUE(aaf.has(std::string("MasterMob1.AppendComment 'Audio Format' ") + name));
    }
}

TEST_F(BinColumnsTest, ARefusedSoundCellIsLoggedAndPassedOver) {
    aaf.refuse("MasterMob1.AppendComment");
    AddAudioFormatBinColumnEntry(mob, Console(), 0);
    EXPECT_TRUE(
        log.once("NCF_SKIP(0x80000008): AddBinColumnEntry(pMobMasterMob, pConsole, &aff[0], "
                 "(aafCharacter *) arStr.GetWCHARString()) : "
                 "NMA::Impl::AddAudioFormatBinColumnEntry"));
}

TEST_F(BinColumnsTest, TheMappingTiesParametersToColumns) {
    ASSERT_EQ(AddBinColMappingToMob(mob), NCF_OK);
    EXPECT_EQ(aaf.journal().lines(),
              (std::vector<std::string>{
                  "MasterMob1.AppendComment 'Field Ordering' 'Default'",
                  "MasterMob1.AppendComment 'GFX-Video Level' 'Do not modify levels'",
                  "MasterMob1.AppendComment '_ncfparametersxml.nma.bin.0' "
                  "'6caede802de04e2f9f5d904b7a2c2f4a:Field Ordering:"
                  "322655d50a5646ca9260d006f719b8a4:GFX-Video Level:'"}));
}

TEST_F(BinColumnsTest, AnyAnswerButZeroRefusesTheMapping) {
    for (int nth = 1; nth <= 3; ++nth) {
        aaf.clearJournal();
        aaf.refuse("MasterMob1.AppendComment", 1, nth);
        EXPECT_EQ(AddBinColMappingToMob(mob), NMA_E_AAF_ADD);
        EXPECT_EQ(aaf.journal().lines().size(), static_cast<std::size_t>(nth));
    }
    EXPECT_TRUE(lines.contains(
        "Unable to add bin column mapping comment, AAFResult = 0x1, QuickTimeToAAF("));
}

TEST_F(BinColumnsTest, ARefusedMappingEndsAtOnceWithItsOwnCode) {
    for (int nth = 1; nth <= 3; ++nth) {
        aaf.clearJournal();
        aaf.refuse("MasterMob1.AppendComment", AAFRESULT_SMALLBUF, nth);
        EXPECT_EQ(AddBinColMappingToMob(mob), NMA_E_AAF_ADD);
        EXPECT_EQ(aaf.journal().lines().size(), static_cast<std::size_t>(nth));
    }
    ASSERT_EQ(lines.lines().size(), 3u);
    EXPECT_EQ(lines.lines()[0].level, 1u);
    const std::string start =
        "Unable to add bin column mapping comment, AAFResult = 0x8012006f, QuickTimeToAAF(";
    EXPECT_EQ(lines.lines()[0].text.substr(0, start.size()), start);
}

}  // namespace
}  // namespace NMA::Impl
