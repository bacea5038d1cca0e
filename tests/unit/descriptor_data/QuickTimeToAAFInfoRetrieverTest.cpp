// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The retriever's life, and what it asks of a clip.

#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"

#include <gtest/gtest.h>

#include <set>
#include <thread>

#include "tests/unit/descriptor_data/RetrieverFixture.h"

namespace {

// --- life ---------------------------------------------------------------------

TEST_F(RetrieverTest, IsMadeOnceFromTheModulesFolder) {
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), nullptr);
    EXPECT_EQ(Init(Entry("1", "CDCI", Join(CDCIValues()))), NCF_OK);
    QuickTimeToAAFInfoRetriever* const made = QuickTimeToAAFInfoRetriever::GetInstance();
    ASSERT_NE(made, nullptr);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "none", "none"),
              NCF_OK);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), made);
    EXPECT_TRUE(host.console().lines().empty());
}

TEST_F(RetrieverTest, ReadsTheMapperBeforeTheDescriptors) {
    UseScript();
    SetModulesFolder("D:\\plugins\\");
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "a.xml", "b.xml"),
              NCF_OK);
    EXPECT_EQ(journal.startingWith("parser Parse"),
              (std::vector<std::string>{"parser Parse 0 D:\\plugins\\a.xml",
                                        "parser Parse 0 D:\\plugins\\b.xml"}));
}

TEST_F(RetrieverTest, AddsNoSeparatorToTheFolder) {
    UseScript();
    SetModulesFolder("folder");
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "a.xml", "b.xml"),
              NCF_OK);
    EXPECT_EQ(journal.count("parser Parse 0 foldera.xml"), 1);
}

TEST_F(RetrieverTest, AMissingMapperLeavesNothingAndTheNextClipTriesAgain) {
    MakeItTheModulesFolder();
    Write("info.xml", Document(""));
    const auto init = [this] {
        return QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "map.xml",
                                                 "info.xml");
    };
    EXPECT_EQ(init(), ncf_detail::Code(0x8000FFFF));
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), nullptr);
    EXPECT_EQ(init(), NCF_E_UNEXPECTED);
    EXPECT_EQ(host.console().count(1, "Unable to init QuickTimeToAAFInfoRetriever.\n"), 2);
    EXPECT_TRUE(log.contains("ParseHelperFunctions::ParseXMLfilePath: "));
    Write("map.xml", "<Map/>");
    EXPECT_EQ(init(), NCF_OK);
}

TEST_F(RetrieverTest, AMissingOrBrokenDescriptorFileIsTheSameFailure) {
    MakeItTheModulesFolder();
    Write("map.xml", "<Map/>");
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "map.xml", "none"),
              NCF_E_UNEXPECTED);
    Write("broken.xml", "<Infos>");
    EXPECT_EQ(
        QuickTimeToAAFInfoRetriever::Init(&host.console(), host.factory(), "map.xml", "broken.xml"),
        NCF_E_UNEXPECTED);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), nullptr);
    EXPECT_EQ(host.console().count(1, "Unable to init QuickTimeToAAFInfoRetriever.\n"), 2);
}

TEST_F(RetrieverTest, WithoutFolderOrConsoleInitFailsCleanly) {
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(nullptr, host.factory(), "map.xml", "info.xml"),
              NCF_E_UNEXPECTED);
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(nullptr, nullptr, "map.xml", "info.xml"),
              NCF_E_UNEXPECTED);
}

TEST_F(RetrieverTest, ShutDownIsHarmlessBeforeInitAndTwice) {
    ShutDownInfoRetriever();
    EXPECT_EQ(Init(""), NCF_OK);
    ShutDownInfoRetriever();
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance(), nullptr);
    ShutDownInfoRetriever();
    EXPECT_EQ(Init(""), NCF_OK);
}

TEST_F(RetrieverTest, ManyThreadsMakeOneObject) {
    MakeItTheModulesFolder();
    Write("map.xml", "<Map/>");
    Write("info.xml", Document(""));
    std::vector<QuickTimeToAAFInfoRetriever*> seen(4);
    std::vector<std::thread> threads;
    // The fakes' journal belongs to one thread, so the object is made first.
    EXPECT_EQ(Init(""), NCF_OK);
    for (auto& place : seen) {
        threads.emplace_back([&place] {
            EXPECT_EQ(QuickTimeToAAFInfoRetriever::Init(nullptr, nullptr, "", ""), NCF_OK);
            place = QuickTimeToAAFInfoRetriever::GetInstance();
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    EXPECT_EQ(std::set<QuickTimeToAAFInfoRetriever*>(seen.begin(), seen.end()).size(), 1u);
    EXPECT_NE(seen[0], nullptr);
}

// --- what is asked of the clip ----------------------------------------------------

TEST_F(RetrieverTest, AsksTheClipInOrder) {
    EXPECT_EQ(InitAndGetInfo("CDCI", CDCIValues()), NCF_OK);
    EXPECT_EQ(clip_.asked,
              (std::vector<std::string>{"GetDataFormat", "GetVendor", "GetEncodedWidthAndHeight",
                                        "GetNMAFrameLayout", "GetEditRate"}));
    EXPECT_EQ(id_, 1u);
}

TEST_F(RetrieverTest, EachFailureOfTheClipIsLoggedAndReturned) {
    EXPECT_EQ(Init(Entry("1", "CDCI", Join(CDCIValues()))), NCF_OK);
    const std::pair<NCFRESULT FakePicture::*, const char*> steps[] = {
        {&FakePicture::codeResult, "media->GetDataFormat(&fourCC)"},
        {&FakePicture::vendorResult, "media->GetVendor(&vendor)"},
        {&FakePicture::sizeResult,
         "const_cast<BaseClip*>(media)->GetEncodedWidthAndHeight(&width, &height)"},
        {&FakePicture::rateResult, "media->GetEditRate(&movieEditRate)"}};
    for (const auto& [result, expression] : steps) {
        clip_.*result = NCF_E_NOTFOUND;
        log.clear();
        EXPECT_EQ(GetInfo(), NCF_E_NOTFOUND);
        ASSERT_EQ(log.records().size(), 1u) << expression;
        const std::string line =
            std::string("NCF_RETURN(0x8000000c): ") + expression + " : " + kGetInfo;
        EXPECT_EQ(log.records()[0].text, line);
        EXPECT_EQ(GetInfoWithoutRecord(), NCF_E_NOTFOUND);
        EXPECT_EQ(log.count(line), 2);
        clip_.*result = NCF_OK;
    }
}

TEST_F(RetrieverTest, AFailedFrameLayoutIsReturnedInSilence) {
    EXPECT_EQ(Init(Entry("1", "CDCI", Join(CDCIValues()))), NCF_OK);
    clip_.layoutResult = NCF_E_NOTFOUND;
    EXPECT_EQ(GetInfo(), NCF_E_NOTFOUND);
    clip_.layoutResult = 1;
    EXPECT_EQ(GetInfo(), 1);
    EXPECT_TRUE(log.records().empty());
}

TEST_F(RetrieverTest, FieldsHalveTheHeight) {
    const std::string two = Entry("1", "CDCI", Join(CDCIValues()));
    EXPECT_EQ(
        Init(two + two, "<FourCharMapping FourChar='apch'/><FourCharMapping FourChar='apch'/>"),
        NCF_OK);
    clip_.code = Code("apch");
    clip_.width = 1920;
    clip_.height = 1080;
    EXPECT_EQ(GetInfo(), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(id_, 3712u) << "540 lines, separate fields";
    clip_.layout = 0;
    EXPECT_EQ(GetInfo(), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(id_, 3710u);
}

TEST_F(RetrieverTest, TheTableIsAskedWithTheClipsRate) {
    EXPECT_EQ(Init(Entry("1", "CDCI", Join(CDCIValues())),
                   "<FourCharMapping FourChar='NVj2'/><FourCharMapping FourChar='NVj2'/>"),
              NCF_OK);
    clip_.code = Code("NVj2");
    clip_.width = 1920;
    clip_.height = 1080;
    clip_.layout = 0;
    const std::pair<Rational, ncfUInt32> kIds[] = {
        {{24000, 1001}, 551}, {{30000, 1001}, 558}, {{25, 1}, 559}, {{24, 1}, 560}};
    for (const auto& [rate, id] : kIds) {
        clip_.rate = rate;
        EXPECT_EQ(GetInfo(), NCF_E_NOTSUPPORTED) << "no record of it here";
        EXPECT_EQ(id_, id) << rate.numerator;
    }
}

// Of the two entries the first matches 1080 lines alone, the second 540.
TEST_F(RetrieverTest, TheFileIsAskedForTheHeightOfAField) {
    const auto entry = [](const char* height) {
        Values values = CDCIValues();
        for (const char* const width : {"StoredWidth", "SampledWidth", "DisplayWidth"}) {
            values[width] = "1920";
        }
        values["StoredHeight"] = values["DisplayHeight"] = height;
        return Entry("3712", "CDCI", Join(values));
    };
    EXPECT_EQ(Init(entry("2160") + entry("540"),
                   "<FourCharMapping FourChar='apch'/><FourCharMapping FourChar='apch'/>"),
              NCF_OK);
    clip_.code = Code("apch");
    clip_.width = 1920;
    clip_.height = 1080;
    EXPECT_EQ(GetInfo(), NCF_OK);
    EXPECT_EQ(id_, 3712u);
    EXPECT_EQ(info_.storedHeight, 540u);
    EXPECT_EQ(info_.displayHeight, 540u);
}

TEST_F(RetrieverTest, AClipThatDoesNotTellItsLayoutIsAFullFrame) {
    const std::string two = Entry("1", "CDCI", Join(CDCIValues()));
    EXPECT_EQ(
        Init(two + two, "<FourCharMapping FourChar='apch'/><FourCharMapping FourChar='apch'/>"),
        NCF_OK);
    clip_.code = Code("apch");
    clip_.width = 1920;
    clip_.height = 1080;
    clip_.layoutResult = NCF_E_PARAMETERNOTAVAILABLE;
    EXPECT_EQ(GetInfo(), NCF_E_NOTSUPPORTED);
    EXPECT_EQ(id_, 3710u);
    EXPECT_EQ(info_.frameLayout, 0u);
}

TEST_F(RetrieverTest, AnUnknownCodeIsToldToLogAndConsole) {
    EXPECT_EQ(Init(""), NCF_OK);
    clip_.code = Code(
        "%s\x01"
        "z");
    info_.storedWidth = 5;
    EXPECT_EQ(GetInfo(), ncf_detail::Code(0x8000000D));
    EXPECT_EQ(id_, 0u);
    EXPECT_EQ(info_.storedWidth, 5u);
    ASSERT_EQ(log.records().size(), 1u);
    EXPECT_EQ(log.records()[0].kind, 1u);
    EXPECT_EQ(log.records()[0].text,
              std::string(kGetInfo) + "The FOURCC video code of %s?z is not natively supported.");
    EXPECT_EQ(host.console().count(2, "The FOURCC video code of %s?z is not natively supported.\n"),
              1);
}

TEST_F(RetrieverTest, TheVendorIsComparedInTheOrderOfItsText) {
    EXPECT_EQ(Init(Entry("5", "CDCI", Join(CDCIValues())),
                   "<FourCharMapping FourChar='code' Vendor='lppa' vcid='4'/>"
                   "<FourCharMapping FourChar='code' Vendor='appl' vcid='5'/>"
                   "<FourCharMapping FourChar='code' vcid='6'/>"),
              NCF_OK);
    EXPECT_EQ(GetInfo(), NCF_OK);
    EXPECT_EQ(id_, 5u);
}

TEST_F(RetrieverTest, WithoutIdTheMovieItselfIsAsked) {
    EXPECT_EQ(Init(Entry("9", "CDCI", Join(CDCIValues())), "<FourCharMapping FourChar='code'/>"),
              NCF_OK);
    EXPECT_EQ(GetInfo(), NCF_E_PARAMETERNOTAVAILABLE);
    EXPECT_TRUE(log.once(std::string("NCF_RETURN(0xa000006a): media->GetNivoResolution(&vcid) : ") +
                         kGetInfo));
    clip_.resolutionResult = NCF_OK;
    clip_.resolution = 9;
    EXPECT_EQ(GetInfo(), NCF_OK);
    EXPECT_EQ(id_, 9u);
    clip_.resolution = 0;
    EXPECT_EQ(GetInfo(), NCF_E_NOTSUPPORTED);
}

TEST_F(RetrieverTest, AnIdThatTheFileLacksIsNotSupported) {
    EXPECT_EQ(Init(Entry("2", "CDCI", Join(CDCIValues()))), NCF_OK);
    EXPECT_EQ(GetInfo(), ncf_detail::Code(0x8000000D));
    EXPECT_TRUE(log.once(std::string("NCF_RETURN(0x8000000d): "
                                     "m_aafInfoReader.IsDescriptorRGBA(&isRGBADescr) : ") +
                         kGetInfo));
    EXPECT_FALSE(log.contains("failed, Error of")) << "no getter is to blame";
    EXPECT_TRUE(host.console().lines().empty());
}

TEST_F(RetrieverTest, TheRecordMayBeLeftOut) {
    EXPECT_EQ(Init(Entry("1", "MPEG2Video", Join(MPEG2Values()))), NCF_OK);
    EXPECT_EQ(GetInfoWithoutRecord(), NCF_OK);
    EXPECT_EQ(id_, 1u);
    EXPECT_TRUE(IsMPEG());
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance()->GetInfoFromImageDescription(
                  &clip_, nullptr, nullptr),
              NCF_E_INVALIDARG);
}

TEST_F(RetrieverTest, WithoutAPictureNothingIsAnswered) {
    EXPECT_EQ(Init(Entry("1", "MPEG2Video", Join(MPEG2Values()))), NCF_OK);
    id_ = 7;
    EXPECT_EQ(QuickTimeToAAFInfoRetriever::GetInstance()->GetInfoFromImageDescription(
                  nullptr, nullptr, &id_),
              NCF_E_INVALIDARG);
    EXPECT_EQ(id_, 7u);
}

}  // namespace
