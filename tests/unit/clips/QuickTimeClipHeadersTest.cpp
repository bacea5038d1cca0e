// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Loading: from the first bytes to a loaded clip.

#include "tests/unit/clips/ClipFixture.h"

namespace {

using Lines = std::vector<std::string>;

class QuickTimeClipLoading : public ClipTest {};

// A movie shorter than the first read.
class QuickTimeClipOfShortFile : public ClipTest {
protected:
    QuickTimeClipOfShortFile() : ClipTest(CountingBytes(100)) {}
};

class QuickTimeClipOfEmptyFile : public ClipTest {
protected:
    QuickTimeClipOfEmptyFile() : ClipTest(std::vector<ncfUInt8>()) {}
};

// A movie that a large read has room in.
class QuickTimeClipOfLargeFile : public ClipTest {
protected:
    QuickTimeClipOfLargeFile() : ClipTest(CountingBytes(1200000)) {}
};

}  // namespace

TEST_F(QuickTimeClipLoading, TakesEverythingFromTheParserInOrder) {
    parser->AddVideoTrack(1);
    parser->AddAudioTrack(2);
    GiveSettings(NCF_OK, 0);
    Load();
    EXPECT_TRUE(clip->IsLoaded());
    const Lines expected = {
        "create parser",
        "parser.ParseHeaders",
        "parser.GetVideoTrackCount",
        "parser.GetAudioTrackCount",
        "parser.GetTimeCodeTrackCount",
        "parser.GetOtherTrackCount",
        "parser.GetVideoTrackInfo",
        "video 1.GetTrackId",
        "parser.GetAudioTrackInfo",
        "audio 2.GetTrackId",
        "parser.GetVideoTrackCount",  // is there a picture
        "parser.GetVideoTrackCount",  // the first picture track
        "parser.GetVideoTrackInfo",
        "video 1.GetVideoSampleDescription",
        "video description.HasAlpha",
        "video description.GetDataFormat",
        "video 1.GetTrackMatrix",
        "video 1.GetVideoSampleDescription",  // size
        "video description.GetEncodedWidthAndHeight",
        "video 1.GetVideoSampleDescription",  // ratio
        "video description.GetImageAspectRatio",
        "video 1.GetVideoSampleDescription",  // colour
        "video 1.GetVideoSampleDescription",
        "video description.GetCMAttributes",
        "video description.GetVideoColorSpaceDetails",
        "parser.GetVideoTrackInfo",  // geometry
        "video 1.GetVideoSampleDescription",
        "video description.GetRIAttributes",
        "video 1.GetVideoSampleDescription",  // fields
        "video description.GetFieldInfo",
        "video description.GetEncodedWidthAndHeight",
        "video 1.GetVideoSampleDescription",  // data format
        "video description.GetDataFormat",
        "create settings",
        "settings ignore alpha 64",
    };
    Lines seen;
    for (const std::string& line : journal.lines()) {
        if (line.compare(0, 8, "console ") != 0) {
            seen.push_back(line);
        }
    }
    EXPECT_EQ(seen, expected);
}

TEST_F(QuickTimeClipLoading, RecordsTheCountsAsTheyAreRead) {
    parser->AddVideoTrack(1);
    parser->AddTimecodeTrack(3);
    parser->AddTimecodeTrack(4);
    parser->AddOtherTrack(9);
    Load();
    EXPECT_TRUE(log->once("QuickTimeClip::CollectMediaInfo videoTrackCount: 1"));
    EXPECT_TRUE(log->once("QuickTimeClip::CollectMediaInfo audioTrackCount: 0"));
    EXPECT_TRUE(log->once("QuickTimeClip::CollectMediaInfo tcTrackCount: 2"));
    EXPECT_TRUE(log->once("QuickTimeClip::CollectMediaInfo otherTrackCount: 1"));
}

TEST_F(QuickTimeClipLoading, FeedsTheParserUntilItIsContent) {
    parser->script = {{QT_E_MOREDATA, 8000, 500}, {QT_E_MOREDATA, 4096, 16}, {NCF_OK, 0, 0}};
    LoadVideo();
    EXPECT_TRUE(clip->IsLoaded());
    const auto file9000 = CountingBytes(9000);
    ASSERT_EQ(parser->fed.size(), 3u);
    EXPECT_EQ(parser->fed[0].position, 0u);
    EXPECT_EQ(parser->fed[0].bytes,
              std::vector<ncfUInt8>(file9000.begin(), file9000.begin() + 4096));
    EXPECT_EQ(parser->fed[1].position, 8000u);
    EXPECT_EQ(parser->fed[1].bytes,
              std::vector<ncfUInt8>(file9000.begin() + 8000, file9000.begin() + 8500));
    EXPECT_EQ(parser->fed[2].position, 4096u);
    EXPECT_EQ(parser->fed[2].bytes,
              std::vector<ncfUInt8>(file9000.begin() + 4096, file9000.begin() + 4112));
}

TEST_F(QuickTimeClipOfShortFile, ShowsTheParserZerosBehindTheEnd) {
    LoadVideo();
    EXPECT_TRUE(clip->IsLoaded());
    auto expected = CountingBytes(100);
    expected.resize(4096);
    ASSERT_EQ(parser->fed.size(), 1u);
    EXPECT_EQ(parser->fed[0].bytes, expected);
}

TEST_F(QuickTimeClipLoading, ShowsZerosBehindTheEndAlsoInAUsedBuffer) {
    parser->script = {{QT_E_MOREDATA, 8900, 4096}, {NCF_OK, 0, 0}};
    LoadVideo();
    const auto whole = CountingBytes(9000);
    std::vector<ncfUInt8> expected(whole.begin() + 8900, whole.end());
    expected.resize(4096);
    ASSERT_EQ(parser->fed.size(), 2u);
    EXPECT_EQ(parser->fed[1].bytes, expected);
}

TEST_F(QuickTimeClipOfLargeFile, GrowsTheBufferAndKeepsItForReadsThatItHolds) {
    parser->script = {{QT_E_MOREDATA, 5, 1000000},
                      {QT_E_MOREDATA, 9, 1000000},
                      {QT_E_MOREDATA, 1000001, 100},
                      {QT_E_MOREDATA, 7, 500000},
                      {NCF_OK, 0, 0}};
    LoadVideo();
    EXPECT_TRUE(clip->IsLoaded());
    const auto whole = CountingBytes(1200000);
    ASSERT_EQ(parser->fed.size(), 5u);
    EXPECT_EQ(parser->fed[2].place, parser->fed[1].place) << "one of the same size";
    EXPECT_EQ(parser->fed[3].place, parser->fed[1].place) << "a smaller read";
    EXPECT_EQ(parser->fed[4].place, parser->fed[1].place) << "a larger one that has room still";
    EXPECT_EQ(parser->fed[1].bytes,
              std::vector<ncfUInt8>(whole.begin() + 5, whole.begin() + 1000005));
    EXPECT_EQ(parser->fed[3].bytes,
              std::vector<ncfUInt8>(whole.begin() + 1000001, whole.begin() + 1000101));
}

TEST_F(QuickTimeClipLoading, EndsWhenTheParserAsksForNothing) {
    parser->script = {{QT_E_MOREDATA, 100, 0}};
    LoadVideo();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(log->returned("a000006f", "ParseMediaHeaders()", "QuickTimeClip::LoadClipImpl"));
}

TEST_F(QuickTimeClipLoading, EndsWhenTheParserGivesUp) {
    parser->script = {{NCF_E_NOTSUPPORTED, 0, 0}};
    LoadVideo();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_EQ(parser->fed.size(), 1u);
    EXPECT_TRUE(log->returned("8000000d", "ParseMediaHeaders()", "QuickTimeClip::LoadClipImpl"));
}

TEST_F(QuickTimeClipLoading, EndsWhenTheNextPositionIsRefused) {
    parser->script = {{QT_E_MOREDATA, 100, 10}};
    parser->results["GetRecomendedReadPosition"] = NCF_E_FAIL;
    LoadVideo();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(log->returned("80000008", "qtParser_->GetRecomendedReadPosition(&pos, &readSize)",
                              "QuickTimeClip::ParseMediaHeaders"));
}

TEST_F(QuickTimeClipLoading, EndsWhenTheParserAsksBehindTheEnd) {
    parser->script = {{QT_E_MOREDATA, 90000, 10}};
    RecordingNMALog lines(1);
    LoadVideo();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(log->returned("a000006f",
                              "file_reader.Read(pos, outputBuffer.get(), readSize, &bytesRead)",
                              "QuickTimeClip::ParseMediaHeaders"));
}

TEST_F(QuickTimeClipOfEmptyFile, EndsWithNoData) {
    RecordingNMALog lines(1);
    LoadVideo();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(parser->fed.empty());
    EXPECT_TRUE(log->returned("a000006f", "ParseMediaHeaders()", "QuickTimeClip::LoadClipImpl"));
}

TEST_F(QuickTimeClipLoading, ThrowsWhenTheFileCannotBeOpened) {
    RecordingNMALog lines(1);
    NCFSmartPtr<INCFConsole> console(&host->console());
    NCFSmartPtr<INCFComponentFactory> factory(host->factory());
    try {
        QuickTimeClip missing(HostText(NoSuchMovie()), console, factory);
        FAIL() << "nothing was thrown";
    } catch (NCFRESULT result) {
        EXPECT_EQ(result, NCF_E_HANDLE);
    }
}

TEST_F(QuickTimeClipLoading, StaysEmptyWithoutParser) {
    host->refuseCreation(NCFCompID_QTParser, NCF_E_OUTOFMEMORY);
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(log->returned("80000002",
                              "componentFactory_->CreateComponent(NCFCompID_QTParser, "
                              "NULL, IID_IQTParser, (void **)&qtParser_)",
                              "QuickTimeClip::LoadClipImpl"));
}

TEST_F(QuickTimeClipLoading, ChecksItsThreeArgumentsInOrder) {
    NCFSmartPtr<INCFConsole> console(&host->console());
    NCFSmartPtr<INCFComponentFactory> factory(host->factory());
    QuickTimeClip nothing(nullptr, nullptr, nullptr);
    QuickTimeClip noFactory(nullptr, console, nullptr);
    QuickTimeClip noName(nullptr, console, factory);
    EXPECT_FALSE(nothing.IsLoaded());
    EXPECT_TRUE(log->once("CHK_PTR(console_)QuickTimeClip::LoadClipImpl"));
    EXPECT_TRUE(log->once("CHK_PTR(componentFactory_)QuickTimeClip::LoadClipImpl"));
    EXPECT_TRUE(log->once("CHK_PTR(fileName_.inArg())QuickTimeClip::LoadClipImpl"));
    EXPECT_EQ(nothing.LoadClipImpl(), NCF_E_POINTER);
    EXPECT_EQ(nothing.SetFieldLayoutDetails(), NCF_E_POINTER);
    EXPECT_TRUE(log->once("CHK_PTR(console_)QuickTimeClip::SetFieldLayoutDetails"));
    EXPECT_EQ(noName.SetFieldLayoutDetails(), NCF_E_POINTER);
    EXPECT_TRUE(log->once("CHK_PTR(qtParser_)QuickTimeClip::SetFieldLayoutDetails"));
}

TEST_F(QuickTimeClipLoading, DoesNothingWhenLoadedAlready) {
    LoadVideo();
    journal.clear();
    EXPECT_EQ(clip->LoadClipImpl(), NCF_OK);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(QuickTimeClipLoading, LoadsASoundOnlyMovieWithoutLookingForAPicture) {
    parser->AddAudioTrack(1);
    Load();
    EXPECT_TRUE(clip->IsLoaded());
    ncfUInt32 colorSpace = 77;
    EXPECT_EQ(clip->GetColorSpace(&colorSpace), NMA_E_NOTSET);
    EXPECT_EQ(colorSpace, 77u);
    EXPECT_EQ(clip->GetTemporalFieldOrder(&colorSpace), NMA_E_NOTSET);
    EXPECT_EQ(clip->GetFrameBufferLayout(&colorSpace), NMA_E_NOTSET);
    EXPECT_EQ(host->creations(NMA::Impl::CompID_HostSettings), 0);
}

TEST_F(QuickTimeClipLoading, TellsTheUserOfAMovieWithoutPictureAndSound) {
    parser->AddTimecodeTrack(1);
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_EQ(Console(1, "Movie doesn't contain any video/audio tracks!\n"), 1);
    EXPECT_TRUE(
        log->once("QuickTimeClip::LoadClipImplInitialization failed: No one audio/video tracks"));
    EXPECT_EQ(log->records().back().kind, slog::kWarning);
    EXPECT_EQ(clip->LoadClipImpl(), NMA_E_NODATA);
}

TEST_F(QuickTimeClipLoading, RefusesAMovieWithoutTracks) {
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(host->console().lines().empty());
    EXPECT_EQ(clip->LoadClipImpl(), NCF_E_FAIL);
}

TEST_F(QuickTimeClipLoading, LosesASecondTrackWithAUsedId) {
    parser->AddVideoTrack(7);
    parser->AddAudioTrack(7);
    Load();
    ncfUInt32 count = 0;
    EXPECT_EQ(clip->GetTrackCount(&count), NCF_OK);
    EXPECT_EQ(count, 1u);
    ncfUInt32 type = 99;
    EXPECT_EQ(clip->GetTrackType(7, &type), NCF_OK);
    EXPECT_EQ(type, ncfUInt32{kTrackVideo});
}

TEST_F(QuickTimeClipLoading, TakesATrackWhoseIdCannotBeRead) {
    parser->AddVideoTrack(7);
    Video().results["GetTrackId"] = NCF_E_FAIL;
    Load();
    EXPECT_TRUE(clip->IsLoaded());
    ncfUInt32 type = 99;
    EXPECT_EQ(clip->GetTrackType(0, &type), NCF_OK) << "it stands under the id 0";
    EXPECT_EQ(type, ncfUInt32{kTrackVideo});
}

TEST_F(QuickTimeClipLoading, StopsAtEveryFailingStep) {
    struct {
        const char* operation;
        const char* expression;
        const char* function;
    } const kSteps[] = {
        {"GetVideoTrackCount", "qtParser_->GetVideoTrackCount(&videoTrackCount)",
         "QuickTimeClip::CollectMediaInfo"},
        {"GetAudioTrackCount", "qtParser_->GetAudioTrackCount(&audioTrackCount)",
         "QuickTimeClip::CollectMediaInfo"},
        {"GetTimeCodeTrackCount", "qtParser_->GetTimeCodeTrackCount(&tcTrackCount)",
         "QuickTimeClip::CollectMediaInfo"},
        {"GetOtherTrackCount", "qtParser_->GetOtherTrackCount(&otherTrackCount)",
         "QuickTimeClip::CollectMediaInfo"},
        {"GetVideoTrackInfo", "qtParser_->GetVideoTrackInfo(i, trackInfo.inOutArg())",
         "QuickTimeClip::CollectMediaInfo"},
        {"GetAudioTrackInfo", "qtParser_->GetAudioTrackInfo(i, trackInfo.inOutArg())",
         "QuickTimeClip::CollectMediaInfo"},
        {"GetTimeCodeTrackInfo", "qtParser_->GetTimeCodeTrackInfo(i, trackInfo.inOutArg())",
         "QuickTimeClip::CollectMediaInfo"},
        {"GetOtherTrackInfo", "qtParser_->GetOtherTrackInfo(i, trackInfo.inOutArg())",
         "QuickTimeClip::CollectMediaInfo"},
    };
    parser->AddVideoTrack(1);
    parser->AddAudioTrack(2);
    parser->AddTimecodeTrack(3);
    parser->AddOtherTrack(4);
    for (const auto& step : kSteps) {
        parser->results = {{step.operation, NCF_E_ACCESSDENIED}};
        log->clear();
        Load();
        EXPECT_FALSE(clip->IsLoaded()) << step.operation;
        EXPECT_TRUE(log->returned("80000009", step.expression, step.function)) << step.operation;
    }
}

TEST_F(QuickTimeClipLoading, StopsWhenWhatWorkedOnceFailsLater) {
    parser->AddVideoTrack(1);
    parser->passes["GetVideoTrackCount"] = 1;
    parser->results["GetVideoTrackCount"] = NCF_E_ABORT;
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(log->returned("80000007", "GetVideoTrackCount(&videoTrackCount)",
                              "QuickTimeClip::LoadClipImpl"));
    parser->results.clear();
    Picture().passes["GetDataFormat"] = 1;
    Picture().results["GetDataFormat"] = NCF_E_ABORT;
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(log->returned("80000007", "GetDataFormat(&fourCC)", "BaseClip::LoadClipBase"));
}

TEST_F(QuickTimeClipLoading, StopsWhenTheSoundCannotBeCountedAgain) {
    parser->AddAudioTrack(1);
    parser->passes["GetAudioTrackCount"] = 1;
    parser->results["GetAudioTrackCount"] = NCF_E_ABORT;
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(host->console().lines().empty());
    EXPECT_TRUE(log->returned("80000007", "GetAudioTrackCount(&audioTrackCount)",
                              "QuickTimeClip::LoadClipImpl"));
}

TEST_F(QuickTimeClipLoading, StopsWhenThePictureCannotBeRead) {
    struct {
        const char* operation;
        const char* record;
    } const kSteps[] = {
        {"HasAlpha", "vdscr->HasAlpha(&hasAlpha_) : QuickTimeClip::LoadClipImpl"},
        {"GetDataFormat", "vdscr->GetDataFormat(&dataFormatOut) : QuickTimeClip::LoadClipImpl"},
        {"GetEncodedWidthAndHeight",
         "vdscr->GetEncodedWidthAndHeight((ncfUInt16*)&width_, (ncfUInt16*)&height_) : "
         "QuickTimeClip::GetEncodedWidthAndHeightImpl"},
        {"GetImageAspectRatio",
         "vdscr->GetImageAspectRatio(&imageAspectRatioNumerator_, &imageAspectRatioDenominator_) "
         ": QuickTimeClip::GetImageAspectRatioImpl"},
        {"GetFieldInfo", "SetFieldLayoutDetails() : BaseClip::LoadClipBase"},
    };
    parser->AddVideoTrack(1);
    for (const auto& step : kSteps) {
        const auto results = Picture().results;
        Picture().results[step.operation] = NCF_E_UNEXPECTED;
        log->clear();
        Load();
        EXPECT_FALSE(clip->IsLoaded()) << step.operation;
        EXPECT_TRUE(log->once(std::string("NCF_RETURN(0x8000ffff): ") + step.record))
            << step.operation;
        const bool inBase = std::string(step.record).find("LoadClipImpl") == std::string::npos;
        EXPECT_EQ(log->count(ReturnRecord("8000ffff", "BaseClip::LoadClipBase()",
                                          "QuickTimeClip::LoadClipImpl")),
                  inBase ? 1 : 0)
            << step.operation;
        Picture().results = results;
    }
}

TEST_F(QuickTimeClipLoading, StopsWithoutSampleDescription) {
    parser->AddVideoTrack(1);
    Video().results["GetVideoSampleDescription"] = NCF_E_NOTFOUND;
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(log->returned("8000000c", "vti->GetVideoSampleDescription(0, vdscr.outArg())",
                              "QuickTimeClip::LoadClipImpl"));
}

// --- alpha ---------------------------------------------------------------------------

TEST_F(QuickTimeClipLoading, RecordsAlpha) {
    parser->AddVideoTrack(1);
    Picture().hasAlpha = 1;
    Load();
    EXPECT_TRUE(log->once("QuickTimeClip::LoadClipImplMovie has alpha!"));
    EXPECT_FALSE(clip->ShowsAlpha()) << "the host ignores alpha until it says otherwise";
}

TEST_F(QuickTimeClipLoading, ShowsAlphaWhenTheHostWantsIt) {
    parser->AddVideoTrack(1);
    Picture().hasAlpha = 1;
    GiveSettings(NCF_OK, 0);
    Load();
    EXPECT_TRUE(clip->ShowsAlpha());
}

TEST_F(QuickTimeClipLoading, IgnoresAlphaWhenTheHostSaysSo) {
    parser->AddVideoTrack(1);
    Picture().hasAlpha = 1;
    GiveSettings(NCF_OK, 1);
    Load();
    EXPECT_FALSE(clip->ShowsAlpha());
}

TEST_F(QuickTimeClipLoading, LoadsWithoutHostSettingsAndIgnoresAlpha) {
    parser->AddVideoTrack(1);
    Picture().hasAlpha = 1;
    Load();
    EXPECT_TRUE(clip->IsLoaded());
    EXPECT_FALSE(clip->ShowsAlpha());
    EXPECT_TRUE(
        log->once("NCF_SKIP(0x80040111): componentFactory_->CreateComponent("
                  "NMA::Impl::CompID_HostSettings, NULL, NMA::IID_IHostSettings, "
                  "(void**)&hostSettings) : BaseClip::LoadClipBase"));
}

TEST_F(QuickTimeClipLoading, LoadsWhenTheAlphaSettingWasNeverMade) {
    parser->AddVideoTrack(1);
    Picture().hasAlpha = 1;
    GiveSettings(NCF_E_PARAMETERNOTAVAILABLE, 0);
    Load();
    EXPECT_TRUE(clip->IsLoaded());
    EXPECT_FALSE(clip->ShowsAlpha());
    EXPECT_TRUE(
        log->once("NCF_SKIP(0xa000006a): hostSettings->GetHostSettingBoolean("
                  "NMA::NMAHostSetting_IgnoreAlpha, NMA::IHostSettings::kUserScope, "
                  "&ignoreAlpha_) : BaseClip::LoadClipBase"));
}

TEST_F(QuickTimeClipLoading, WantsProofOfTheFamilysOwnAlpha) {
    parser->AddVideoTrack(1);
    GiveSettings(NCF_OK, 0);
    Picture().hasAlpha = 1;
    Picture().dataFormat = 0x4E567832;  // 'NVx2'

    Load();
    EXPECT_FALSE(clip->ShowsAlpha()) << "no coding";

    Picture().alphaCodings = {0, 0};
    Load();
    EXPECT_FALSE(clip->ShowsAlpha()) << "only empty codings";

    Picture().alphaCodings = {0, 5, 6};
    journal.clear();
    Load();
    EXPECT_TRUE(clip->ShowsAlpha());
    EXPECT_EQ(journal.count("video description.GetNivoAlphaCoding"), 2) << "stops at the first";

    Picture().results["GetNivoAlphaCodingCount"] = NCF_E_FAIL;
    Load();
    EXPECT_TRUE(clip->IsLoaded());
    EXPECT_FALSE(clip->ShowsAlpha()) << "the count can't be read";
}

TEST_F(QuickTimeClipLoading, MakesNoAlphaOfACodingAlone) {
    parser->AddVideoTrack(1);
    GiveSettings(NCF_OK, 0);
    Picture().hasAlpha = 0;
    Picture().dataFormat = 0x4E567832;  // 'NVx2'
    Picture().alphaCodings = {5};
    Load();
    EXPECT_TRUE(clip->IsLoaded());
    EXPECT_FALSE(clip->ShowsAlpha());
    EXPECT_FALSE(log->contains("Movie has alpha!"));
}

TEST_F(QuickTimeClipLoading, ComparesBothLettersOfTheFamilysPrefix) {
    parser->AddVideoTrack(1);
    GiveSettings(NCF_OK, 0);
    Picture().hasAlpha = 1;
    // 'NWx2', 'MVx2', 'NUx2', 'OVx2', 'nvx2', 'xNV2'
    for (const ncfUInt32 code :
         {0x4E577832u, 0x4D567832u, 0x4E557832u, 0x4F567832u, 0x6E767832u, 0x784E5632u}) {
        Picture().dataFormat = code;
        journal.clear();
        Load();
        EXPECT_TRUE(clip->ShowsAlpha()) << std::hex << code;
        EXPECT_EQ(journal.count("video description.GetNivoAlphaCodingCount"), 0);
    }
}

TEST_F(QuickTimeClipLoading, StopsWhenACodingCannotBeRead) {
    parser->AddVideoTrack(1);
    Picture().dataFormat = 0x4E567832;
    Picture().alphaCodings = {1};
    Picture().results["GetNivoAlphaCoding"] = NCF_E_FAIL;
    Load();
    EXPECT_FALSE(clip->IsLoaded());
    EXPECT_TRUE(log->returned("80000008", "vdscr->GetNivoAlphaCoding(i, &alphaCoding)",
                              "QuickTimeClip::LoadClipImpl"));
}

// --- records of the load -----------------------------------------------------------------

TEST_F(QuickTimeClipLoading, RecordsWhatItFound) {
    LoadVideo();
    EXPECT_TRUE(log->once("BaseClip::GetEncodedWidthAndHeightwidth x height: 1920 x 1080"));
    EXPECT_TRUE(log->once("BaseClip::GetImageAspectRatioimage_aspect_ratio: 16/9"));
    EXPECT_TRUE(log->once("BaseClip::LoadClipBasecolor_space: CS_RGB"));
}
