// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/descriptor_data/FourCharDataContainerReader.h"

#include <gtest/gtest.h>

#include <cstring>
#include <memory>
#include <set>

#include "source/plugin/Rational.h"
#include "tests/unit/descriptor_data/DataHost.h"

namespace {

// A code or vendor as the reader takes it: text order in memory.
ncfUInt32 Word(const char* text) {
    ncfUInt32 word = 0;
    std::memcpy(&word, text, std::min<std::size_t>(std::strlen(text), 4));
    return word;
}

std::string Mapping(const std::string& attributes) {
    return "<FourCharMapping " + attributes + "/>\n";
}

class FourCharReaderTest : public DataHost {
protected:
    void Load(const std::string& entries) {
        const std::string path = Write("FourCharMapper.xml", "<Map>\n" + entries + "</Map>");
        reader_ =
            std::make_unique<FourCharDataContainerReader>(host.factory(), NMAString(path.c_str()));
    }
    // Looks a picture up; the id stays in id_.
    NCFRESULT Look(const char* code, const char* vendor, ncfUInt32 width, ncfUInt32 height,
                   ncfUInt8 layout = 0, Rational rate = {25, 1}) {
        id_ = 77;
        return reader_->GetVCID(Word(code), width, height, &rate, &layout, Word(vendor), &id_);
    }

    std::unique_ptr<FourCharDataContainerReader> reader_;
    ncfUInt32 id_ = 0;
};

const char kTwoVendors[] =
    "<FourCharMapping FourChar='apch' Vendor='abcd' vcid='1'/>"
    "<FourCharMapping FourChar='apch' Vendor='efgh' vcid='2'/>";

TEST_F(FourCharReaderTest, ACodeThatTheFileLacksIsUnsupportedWhateverTheTableSays) {
    Load(Mapping("FourChar='avc1' vcid='5'"));
    EXPECT_EQ(Look("apch", "appl", 1920, 1080), ncf_detail::Code(0x8000000D));
    EXPECT_EQ(id_, 77u);
}

TEST_F(FourCharReaderTest, AMissingOutputIsRefused) {
    Load("");
    const Rational rate{25, 1};
    const ncfUInt8 layout = 0;
    EXPECT_EQ(reader_->GetVCID(Word("apch"), 0, 0, &rate, &layout, 0, nullptr),
              ncf_detail::Code(0x80000003));
    EXPECT_EQ(reader_->GetVCIDByVendor({}, 0, nullptr), ncf_detail::Code(0x80000003));
    EXPECT_TRUE(log.once("CHK_INARG(vcid)FourCharDataContainerReader::GetVCIDByVendor"));
}

TEST_F(FourCharReaderTest, AMatchingVendorWins) {
    Load(kTwoVendors);
    EXPECT_EQ(Look("apch", "efgh", 1920, 1080), NCF_OK);
    EXPECT_EQ(id_, 2u);
}

TEST_F(FourCharReaderTest, TheFirstOfSeveralEqualVendorsWins) {
    Load(Mapping("FourChar='apch' Vendor='abcd' vcid='1'") +
         Mapping("FourChar='apch' Vendor='efgh' vcid='2'") +
         Mapping("FourChar='apch' Vendor='efghi' vcid='3'") +
         Mapping("FourChar='apch' Vendor='efgh' vcid='4'"));
    EXPECT_EQ(Look("apch", "efgh", 1920, 1080), NCF_OK);
    EXPECT_EQ(id_, 2u);
}

TEST_F(FourCharReaderTest, IdsAreDecimalAlsoWithLeadingZeros) {
    Load(Mapping("FourChar='v210' vcid='0010'") + Mapping("FourChar='2vuy' vcid='0x10'"));
    EXPECT_EQ(Look("v210", "", 0, 0), NCF_OK);
    EXPECT_EQ(id_, 10u);
    EXPECT_EQ(Look("2vuy", "", 0, 0), NCF_OK);
    EXPECT_EQ(id_, 0u);
}

TEST_F(FourCharReaderTest, ASingleEntryAnswersWhateverItsVendorAndTheTableSay) {
    Load(Mapping("FourChar='apch' Vendor='abcd' vcid='9'"));
    EXPECT_EQ(Look("apch", "zzzz", 1920, 1080), NCF_OK);
    EXPECT_EQ(id_, 9u);
}

TEST_F(FourCharReaderTest, ASingleEntryWithoutIdGivesZeroAndSuccess) {
    Load(Mapping("FourChar='apch'"));
    EXPECT_EQ(Look("apch", "appl", 1920, 1080), NCF_OK);
    EXPECT_EQ(id_, 0u);
}

TEST_F(FourCharReaderTest, SeveralEntriesWithoutMatchGoToTheTable) {
    Load(kTwoVendors);
    EXPECT_EQ(Look("apch", "none", 1920, 1080, 0), NCF_OK);
    EXPECT_EQ(id_, 3710u);
    EXPECT_EQ(Look("apch", "none", 1920, 540, 1), NCF_OK);
    EXPECT_EQ(id_, 3712u);
}

TEST_F(FourCharReaderTest, ARowThatDoesNotFitGivesZeroAndTheFileIsNotAskedAgain) {
    Load(Mapping("FourChar='apch'") + Mapping("FourChar='apch' vcid='8'"));
    EXPECT_EQ(Look("apch", "none", 1440, 1080), NCF_OK);
    EXPECT_EQ(id_, 0u);
    EXPECT_EQ(Look("apch", "none", 1920, 1080, 1), NCF_OK);
    EXPECT_EQ(id_, 0u);
}

TEST_F(FourCharReaderTest, WithoutRowsTheLastEntryWithoutVendorCounts) {
    Load(Mapping("FourChar='v210' Vendor='appl' vcid='1'") + Mapping("FourChar='v210' vcid='2'") +
         Mapping("FourChar='v210' vcid='3'") + Mapping("FourChar='v210'") +
         Mapping("FourChar='v210' Vendor='FFMP' vcid='4'"));
    EXPECT_EQ(Look("v210", "none", 1920, 1080), NCF_OK);
    EXPECT_EQ(id_, 3u);
    EXPECT_EQ(Look("v210", "FFMP", 1920, 1080), NCF_OK);
    EXPECT_EQ(id_, 4u);
}

TEST_F(FourCharReaderTest, WithoutRowsAndWithoutSuchEntryTheIdIsZero) {
    Load(Mapping("FourChar='v210' Vendor='appl' vcid='1'") + Mapping("FourChar='v210'"));
    EXPECT_EQ(Look("v210", "none", 1920, 1080), NCF_OK);
    EXPECT_EQ(id_, 0u);
}

TEST_F(FourCharReaderTest, AVendorWithoutIdGivesZero) {
    Load(Mapping("FourChar='v210' Vendor='appl'") + Mapping("FourChar='v210' vcid='3'"));
    EXPECT_EQ(Look("v210", "appl", 1920, 1080), NCF_OK);
    EXPECT_EQ(id_, 0u);
}

TEST_F(FourCharReaderTest, VendorsAreComparedByFourBytes) {
    Load(Mapping("FourChar='v210' Vendor='applesauce' vcid='1'") +
         Mapping("FourChar='v210' Vendor='ab' vcid='2'") +
         Mapping("FourChar='v210' Vendor='' vcid='3'"));
    EXPECT_EQ(Look("v210", "appl", 0, 0), NCF_OK);
    EXPECT_EQ(id_, 1u);
    EXPECT_EQ(Look("v210", "ab", 0, 0), NCF_OK);
    EXPECT_EQ(id_, 2u);
    EXPECT_EQ(Look("v210", "", 0, 0), NCF_OK) << "an empty vendor is the vendor 0";
    EXPECT_EQ(id_, 3u);
    EXPECT_EQ(Look("v210", "ab  ", 0, 0), NCF_OK);
    EXPECT_EQ(id_, 0u);
}

TEST_F(FourCharReaderTest, TheWholeCodeIsTheKey) {
    Load(
        "<FourCharMapping><FourChar>dvc </FourChar><vcid>1</vcid></FourCharMapping>"
        "<FourCharMapping><FourChar>dvcp</FourChar><vcid>2</vcid></FourCharMapping>");
    EXPECT_EQ(Look("dvc ", "", 0, 0), NCF_OK);
    EXPECT_EQ(id_, 1u);
    EXPECT_EQ(Look("dvcp", "", 0, 0), NCF_OK);
    EXPECT_EQ(id_, 2u);
    EXPECT_EQ(Look("dvc", "", 0, 0), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(Look("DVC ", "", 0, 0), NCF_E_NOTSUPPORTED);
}

TEST_F(FourCharReaderTest, OrderWithinAnEntryDoesNotMatter) {
    Load(
        "<FourCharMapping vcid='6' Vendor='appl' FourChar='v210'/>"
        "<FourCharMapping><vcid>7</vcid><FourChar>2vuy</FourChar></FourCharMapping>");
    EXPECT_EQ(Look("v210", "appl", 0, 0), NCF_OK);
    EXPECT_EQ(id_, 6u);
    EXPECT_EQ(Look("2vuy", "", 0, 0), NCF_OK);
    EXPECT_EQ(id_, 7u);
}

TEST_F(FourCharReaderTest, TwoIdsInAnEntryGiveTheFirst) {
    Load("<FourCharMapping FourChar='v210'><vcid>6</vcid><vcid>7</vcid></FourCharMapping>");
    EXPECT_EQ(Look("v210", "", 0, 0), NCF_OK);
    EXPECT_EQ(id_, 6u);
}

TEST_F(FourCharReaderTest, TheShortLookupAsksTheFileAlone) {
    Load(Mapping("FourChar='apch'") + Mapping("FourChar='v210' vcid='3'") +
         Mapping("FourChar='two '") + Mapping("FourChar='two ' vcid='4'"));
    ncfUInt32 id = 77;
    EXPECT_EQ(reader_->GetVCIDByFourChar(Word("none"), &id), ncf_detail::Code(0xA000006A));
    EXPECT_EQ(reader_->GetVCIDByFourChar(Word("apch"), &id), ncf_detail::Code(0xA000006A));
    EXPECT_EQ(reader_->GetVCIDByFourChar(Word("two "), &id), 0x200000C8);
    EXPECT_EQ(id, 77u);
    EXPECT_EQ(reader_->GetVCIDByFourChar(Word("v210"), &id), NCF_OK);
    EXPECT_EQ(id, 3u);
}

TEST_F(FourCharReaderTest, OnlyANegativeResultOfTheParseThrows) {
    UseScript();
    script.setErrorHandler = 1;
    EXPECT_NO_THROW(Load(Mapping("FourChar='apch' vcid='1'")));
    script.setErrorHandler = NCF_E_ABORT;
    EXPECT_THROW(Load(""), NCFRESULT);
}

TEST_F(FourCharReaderTest, AFileThatCannotBeReadMakesTheConstructorThrow) {
    const auto thrown = [this](const std::string& path) {
        try {
            FourCharDataContainerReader reader(host.factory(), NMAString(path.c_str()));
            return NCF_OK;
        } catch (NCFRESULT result) {
            return result;
        }
    };
    EXPECT_LT(thrown(Folder() + "absent.xml"), 0);
    EXPECT_LT(thrown(Write("broken.xml", "<Map><FourCharMapping>")), 0);
    EXPECT_LT(thrown(Write("early.xml", "<Map vcid='3'/>")), 0) << "a value before any entry";
    EXPECT_EQ(thrown(Write("none.xml", "<Map/>")), NCF_OK);
    const std::string good = Write("good.xml", "<Map/>");
    host.refuseCreation(kCLSID_GenericDocHandler, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(thrown(good), NCF_E_OUTOFMEMORY);
}

// --- the built-in table -------------------------------------------------------

class BuiltInTable : public FourCharReaderTest {
protected:
    // Every code that has rows, with two entries each.
    BuiltInTable() {
        std::string entries;
        for (const char* code : {"apco", "apcs", "apcn", "apch", "ap4h", "NVj2"}) {
            const std::string entry = Mapping(std::string("FourChar='") + code + "'");
            entries += entry + entry;
        }
        Load(entries);
    }
    ncfUInt32 Id(const char* code, ncfUInt32 width, ncfUInt32 height, ncfUInt8 layout,
                 Rational rate = {25, 1}) {
        EXPECT_EQ(Look(code, "none", width, height, layout, rate), NCF_OK);
        return id_;
    }
};

TEST_F(BuiltInTable, HoldsSixtyTwoRowsAndNoIdTwice) {
    std::set<ncfUInt32> ids;
    for (const auto& row : reader_->Formats()) {
        ids.insert(row.second.vcid);
    }
    EXPECT_EQ(reader_->Formats().size(), 62u);
    EXPECT_EQ(ids.size(), 62u);
}

TEST_F(BuiltInTable, FindsEveryProResRasterAtAnyRate) {
    struct Raster {
        ncfUInt32 width, height;
        ncfUInt8 layout;
    };
    const Raster rasters[] = {{720, 240, 1},  {720, 243, 1},  {720, 288, 1},
                              {720, 480, 0},  {720, 486, 0},  {720, 576, 0},
                              {1280, 720, 0}, {1920, 540, 1}, {1920, 1080, 0}};
    const std::pair<const char*, std::vector<ncfUInt32>> codes[] = {
        {"apco", {3800, 3802, 3804, 3801, 3803, 3805, 3807, 3811, 3809}},
        {"apcs", {3732, 3729, 3728, 3733, 3726, 3727, 3721, 3725, 3723}},
        {"apcn", {3744, 3743, 3745, 3741, 3740, 3746, 3748, 3752, 3750}},
        {"apch", {3701, 3700, 3702, 3708, 3709, 3703, 3705, 3712, 3710}},
        {"ap4h", {3783, 3782, 3785, 3780, 3784, 3786, 3788, 3792, 3790}}};
    for (const auto& [code, ids] : codes) {
        for (std::size_t i = 0; i < ids.size(); ++i) {
            const Raster& raster = rasters[i];
            EXPECT_EQ(Id(code, raster.width, raster.height, raster.layout), ids[i]) << code << i;
            EXPECT_EQ(Id(code, raster.width, raster.height, raster.layout, {0, 1}), ids[i]);
            EXPECT_EQ(Id(code, raster.width, raster.height, !raster.layout), 0u) << code << i;
            EXPECT_EQ(Id(code, raster.width + 1, raster.height, raster.layout), 0u);
            EXPECT_EQ(Id(code, raster.width, raster.height + 1, raster.layout), 0u);
        }
    }
}

TEST_F(BuiltInTable, SeparatesRowsOfOneRasterByRate) {
    struct Row {
        ncfUInt32 width, height;
        ncfUInt8 layout;
        Rational rate;
        ncfUInt32 id;
    };
    const Row rows[] = {{720, 496, 0, {24000, 1001}, 554},   {720, 496, 0, {24, 1}, 565},
                        {720, 592, 0, {25, 1}, 556},         {720, 592, 0, {24, 1}, 566},
                        {1280, 720, 0, {60000, 1001}, 552},  {1280, 720, 0, {50, 1}, 561},
                        {1280, 720, 0, {30000, 1001}, 562},  {1280, 720, 0, {25, 1}, 563},
                        {1280, 720, 0, {24000, 1001}, 564},  {1920, 540, 1, {30000, 1001}, 550},
                        {1920, 540, 1, {25, 1}, 557},        {1920, 1080, 0, {24000, 1001}, 551},
                        {1920, 1080, 0, {30000, 1001}, 558}, {1920, 1080, 0, {25, 1}, 559},
                        {1920, 1080, 0, {24, 1}, 560}};
    for (const Row& row : rows) {
        EXPECT_EQ(Id("NVj2", row.width, row.height, row.layout, row.rate), row.id);
    }
    EXPECT_EQ(Id("NVj2", 1920, 1080, 0, {50, 1}), 0u);
    EXPECT_EQ(Id("NVj2", 720, 496, 0, {25, 1}), 0u);
    EXPECT_EQ(Id("NVj2", 1920, 1080, 0, {50, 2}), 0u) << "rates are not reduced";
    EXPECT_EQ(Id("NVj2", 1280, 720, 0, {120000, 2002}), 0u);
    EXPECT_EQ(Id("NVj2", 1920, 1080, 0, {24000, 1000}), 0u) << "both words count";
}

TEST_F(BuiltInTable, TwoRowsWithFieldsTakeAnyRate) {
    EXPECT_EQ(Id("NVj2", 720, 248, 1, {17, 3}), 553u);
    EXPECT_EQ(Id("NVj2", 720, 296, 1, {0, 0}), 555u);
}

}  // namespace
