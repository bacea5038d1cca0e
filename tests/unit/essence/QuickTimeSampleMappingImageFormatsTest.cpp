// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/essence/support/MappingFixture.h"

namespace {

using namespace QuickTime;

// Picture, alpha when asked for, sound.
class ImageFormats : public MappingFixture {
protected:
    void Movie(std::vector<ncfUInt32> codes, bool alpha = false) {
        AddVideo(1);
        AddAudio(2);
        clip->setAlpha(alpha);
        property->storageType = 1;
        property->codes = std::move(codes);
        Bind();
        EXPECT_EQ(QueryImages(), NCF_OK);
        journal.clear();
        log->clear();
        host->console().clear();
    }
    ncfUInt64 BufferSize(ncfUInt32 track) {
        ncfUInt16 alignment = 0;
        ncfUInt64 size = 77;
        EXPECT_EQ(mapping->GetWorkingImageBufferRequirements(track, &alignment, &size), NCF_OK);
        EXPECT_EQ(alignment, 1);
        return size;
    }
    NCFRESULT Get(ncfUInt32 track, ncfUInt32 index, int null = -1) {
        ncfUInt32* out[8];
        for (int i = 0; i < 8; ++i) {
            fields[i] = 77;
            out[i] = i == null ? nullptr : &fields[i];
        }
        return mapping->GetImageFormat(track, index, out[0], out[1], out[2], out[3], out[4], out[5],
                                       out[6], out[7]);
    }
    ncfUInt32 fields[8] = {};
    const char* const badTrack = "GetMediaTrack(trackNMA, track)";
    const char* const badFormat = "track->GetMediaFormat(formatIndex, mediaFormat)";
};

// --- the list -----------------------------------------------------------------------

TEST_F(ImageFormats, CountsWithoutTheLock) {
    Movie({kBGRAPixelFormat, kb64aPixelFormat});
    ncfUInt32 count = 0;
    EXPECT_EQ(mapping->GetNumberOfImageFormats(0, &count), NCF_OK);
    EXPECT_EQ(count, 2u);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(ImageFormats, CountNeedsAnOutputThenAPictureTrack) {
    Movie({kBGRAPixelFormat});
    ncfUInt32 count = 77;
    EXPECT_EQ(mapping->GetNumberOfImageFormats(9, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Check("CHK_INARG(numFormats)", "GetNumberOfImageFormats")));
    EXPECT_EQ(mapping->GetNumberOfImageFormats(9, &count), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Record("80000003", badTrack, "GetNumberOfImageFormats")));
    log->clear();
    EXPECT_EQ(mapping->GetNumberOfImageFormats(1, &count), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->records().empty()) << "sound is refused silently";
    EXPECT_EQ(count, 77u);
}

TEST_F(ImageFormats, TellsAFormatUnderTheLock) {
    Movie({kb64aPixelFormat});
    EXPECT_EQ(Get(0, 0), NCF_OK);
    const ncfUInt32 expected[] = {
        PF_ARGB, CSS_4444, CT_USHORT_BE_VideoRange, CRT_VideoRange, CS_RGB, 256, 256, 1};
    for (int i = 0; i < 8; ++i) {
        EXPECT_EQ(fields[i], expected[i]) << i;
    }
    EXPECT_EQ(journal.lines(), (Lines{"lock", "unlock"}));
}

TEST_F(ImageFormats, BadTrackOutranksANullOutput) {
    Movie({kBGRAPixelFormat});
    EXPECT_EQ(Get(9, 0, 0), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Record("80000003", badTrack, "GetImageFormat")));
    EXPECT_FALSE(log->contains("CHK_INARG"));
}

TEST_F(ImageFormats, EachOutputIsNeeded) {
    Movie({kBGRAPixelFormat});
    const char* const names[] = {"pixelFormat",        "chromaSubSampling", "componentFormat",
                                 "componentRangeType", "colorSpace",        "fieldOrder",
                                 "frameLayout",        "orientation"};
    for (int i = 0; i < 8; ++i) {
        EXPECT_EQ(Get(0, 0, i), NCF_E_INVALIDARG);
        EXPECT_TRUE(log->once(Check(std::string("CHK_INARG(") + names[i] + ")", "GetImageFormat")));
    }
    EXPECT_TRUE(journal.lines().empty()) << "before the lock";
}

TEST_F(ImageFormats, FormatPastTheEndOrOfAnotherKindIsRefused) {
    Movie({kBGRAPixelFormat});
    EXPECT_EQ(Get(0, 1), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Record("80000003", badFormat, "GetImageFormat")));
    EXPECT_EQ(Get(1, 0), NCF_E_INVALIDARG) << "a sound track";
    mapping->mediaTracks_[0]->AddFormat(QTAudioFormat(SF_PCM_INT_LE, 3, 24));
    EXPECT_EQ(Get(0, 1), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(image_format)", "GetImageFormat")));
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 1), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(image_format)", "SetWorkingImageFormat")));
}

// --- the choice --------------------------------------------------------------------------

TEST_F(ImageFormats, FirstChoiceBringsTheReaderUnderTheLock) {
    Movie({kBGRAPixelFormat});
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    const Lines lines = journal.lines();
    EXPECT_EQ(lines.front(), "lock");
    EXPECT_EQ(lines[1], "console 4: Player negotiated for QuickTime format: BGRA 8-bit \n");
    const Lines end(lines.end() - 4, lines.end());
    EXPECT_EQ(end, (Lines{"wrapper.GetQTVideoReader", "reader.SetOutputPixelFormat BGRA 0 0",
                          "reader.InitQT", "unlock"}));
    EXPECT_EQ(journal.count("reader.ReleaseQT"), 0);
    EXPECT_EQ(mapping->mediaTracks_[0]->GetSelectedIndex(), 0u);
    EXPECT_TRUE(mapping->mediaTracks_[0]->GetSelectedFormat());
}

TEST_F(ImageFormats, ChoosesUnderTheLock) {
    Movie({kBGRAPixelFormat, kb64aPixelFormat});
    std::vector<ncfUInt32> chosen;
    lock->whenLocked = [&] {
        const MediaTrack& track = *mapping->mediaTracks_[0];
        chosen.push_back(track.GetSelectedFormat() ? 77 : track.GetSelectedIndex());
    };
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 1), NCF_OK);
    EXPECT_EQ(chosen, std::vector<ncfUInt32>{0}) << "nothing is chosen before the lock";
    EXPECT_EQ(mapping->mediaTracks_[0]->GetSelectedIndex(), 1u);
}

TEST_F(ImageFormats, SameChoiceAgainChangesAndTellsNothing) {
    Movie({kBGRAPixelFormat});
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    journal.clear();
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    EXPECT_EQ(journal.lines(), (Lines{"lock", "unlock"}));
    EXPECT_EQ(Console(4, "Player negotiated for QuickTime format: BGRA 8-bit \n"), 1);
}

TEST_F(ImageFormats, AnotherChoiceRestartsTheSameReader) {
    Movie({kBGRAPixelFormat, kb64aPixelFormat});
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    journal.clear();
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 1), NCF_OK);
    EXPECT_EQ(journal.lines(),
              (Lines{"lock", "console 4: Player negotiated for QuickTime format: b64a \n",
                     "reader.ReleaseQT", "reader.SetOutputPixelFormat b64a 0 0", "reader.InitQT",
                     "unlock"}));
}

TEST_F(ImageFormats, ChoiceOnTheAlphaTrackRestartsTheReaderWithItsRecipe) {
    Movie({kBGRAPixelFormat}, true);
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    journal.clear();
    EXPECT_EQ(mapping->SetWorkingImageFormat(1, 0), NCF_OK);
    EXPECT_EQ(journal.count("reader.ReleaseQT"), 1);
    EXPECT_EQ(journal.count("reader.SetOutputPixelFormat BGRA 0 0"), 1);
    EXPECT_EQ(journal.count("reader.InitQT"), 1);
}

TEST_F(ImageFormats, LabelsFollowTheReadersCode) {
    struct Row {
        ncfUInt32 code;
        const char* label;
    };
    const Row rows[] = {{k2vuyPixelFormat, "2vuy"},    {kBGRAPixelFormat, "BGRA 8-bit"},
                        {kv210PixelFormat, "V210"},    {kb64aPixelFormat, "b64a"},
                        {kb48rPixelFormat, "b48r"},    {kr4flPixelFormat, "r4fl"},
                        {kNVZ2PixelFormat, "Unknown"}, {0, "Unknown"}};
    Movie({kBGRAPixelFormat});
    for (const Row& row : rows) {
        QTImageFormat format;
        format.fieldOrder = 1;
        format.qt_params.fourCC = row.code;
        MediaTrack& track = *mapping->mediaTracks_[0];
        track.AddFormat(format);
        host->console().clear();
        EXPECT_EQ(mapping->SetWorkingImageFormat(0, track.GetNumberOfFormats() - 1), NCF_OK);
        EXPECT_EQ(
            Console(4, std::string("Player negotiated for QuickTime format: ") + row.label + " \n"),
            1);
    }
    EXPECT_EQ(journal.startingWith("wrapper.Prepare"), Lines{"wrapper.PreparePixelFormat v210"})
        << "for that code alone, its result ignored";
}

TEST_F(ImageFormats, TenBitRowOfTheTablePrintsItsRecipe) {
    Movie({kv210PixelFormat});
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    EXPECT_EQ(Console(4, "Player negotiated for QuickTime format: 2vuy \n"), 1);
    EXPECT_TRUE(journal.startingWith("wrapper.Prepare").empty());
}

TEST_F(ImageFormats, ChoicePastTheEndLeavesSelectionAndReader) {
    Movie({kBGRAPixelFormat, kb64aPixelFormat});
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 1), NCF_OK);
    const MediaFormatPtr selected = mapping->mediaTracks_[0]->GetSelectedFormat();
    journal.clear();
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 2), NCF_E_INVALIDARG);
    EXPECT_EQ(journal.lines(), (Lines{"lock", "unlock"}));
    EXPECT_EQ(mapping->mediaTracks_[0]->GetSelectedIndex(), 1u);
    EXPECT_EQ(mapping->mediaTracks_[0]->GetSelectedFormat(), selected);
    EXPECT_TRUE(log->once(Record("80000003", badFormat, "SetWorkingImageFormat")));
}

TEST_F(ImageFormats, ChoiceOfATrackOfTheWrongKindIsRefusedBeforeTheLock) {
    Movie({kBGRAPixelFormat});
    EXPECT_EQ(mapping->SetWorkingImageFormat(1, 0), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->records().empty());
    EXPECT_EQ(mapping->SetWorkingImageFormat(9, 0), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Record("80000003", badTrack, "SetWorkingImageFormat")));
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(ImageFormats, FailureToStartLeavesTheSelectionChangedAndSaysSo) {
    Movie({kBGRAPixelFormat, kb64aPixelFormat});
    wrapper->picture->results["InitQT"] = NCF_E_HANDLE;
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 1), NCF_E_HANDLE);
    EXPECT_EQ(mapping->mediaTracks_[0]->GetSelectedIndex(), 1u);
    EXPECT_TRUE(mapping->mediaTracks_[0]->GetSelectedFormat());
    EXPECT_TRUE(log->once(Record("80000006",
                                 "_videoReaderHolder->InitQT( QTWrapper::kUseDecompressionSession)",
                                 "SetWorkingImageFormat")));
    wrapper->picture->results.clear();
    journal.clear();
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 1), NCF_OK) << "chosen already";
    EXPECT_EQ(journal.count("reader.InitQT"), 0);
}

TEST_F(ImageFormats, ReaderMayRefuseReleaseAndPixelFormat) {
    Movie({kBGRAPixelFormat, kb64aPixelFormat});
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_OK);
    wrapper->picture->results = {{"ReleaseQT", NCF_E_FAIL},
                                 {"SetOutputPixelFormat b64a 0 0", NCF_E_FAIL}};
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 1), NCF_OK);
}

TEST_F(ImageFormats, ChoiceNeedsWrapperAndReader) {
    Movie({kBGRAPixelFormat, kb64aPixelFormat});
    host->refuseCreation(QTWrapper::CompID_QuickTimeWrapper, NCF_E_OUTOFMEMORY);
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 0), NCF_E_OUTOFMEMORY);
    EXPECT_TRUE(log->once(
        Record("80000002", "media_->GetQuickTimeInterface(qtWrapper)", "SetWorkingImageFormat")));
    host->clearRefusals();
    wrapper->results["GetQTVideoReader"] = NCF_E_NOTFOUND;
    EXPECT_EQ(mapping->SetWorkingImageFormat(0, 1), NCF_E_NOTFOUND);
    EXPECT_TRUE(log->once(Record("8000000c", "media_->GetQuickTimeVideoReader(_videoReaderHolder)",
                                 "SetWorkingImageFormat")));
}

// --- sizes -----------------------------------------------------------------------------------

TEST_F(ImageFormats, HeightIsThatOfAFieldWhereThereAreTwo) {
    Movie({kBGRAPixelFormat});
    struct Row {
        ncfUInt32 order;
        ncfUInt32 height;
    };
    clip->setSize(1920, 1081);
    for (const Row& row : {Row{256, 1081}, Row{512, 540}, Row{4096, 540}}) {
        clip->setFieldOrder(row.order);
        ncfUInt32 width = 0;
        ncfUInt32 height = 0;
        EXPECT_EQ(mapping->GetWorkingImageSize(99, &width, &height), NCF_OK) << "no track is read";
        EXPECT_EQ(width, 1920u);
        EXPECT_EQ(height, row.height);
    }
    clip->setSize(1920, 1080);
    EXPECT_EQ(BufferSize(0), 8294400u) << "the buffer stays that of a frame";
}

TEST_F(ImageFormats, SizeAsksTheClipBeforeTheLockAndTheFieldsUnderIt) {
    Movie({kBGRAPixelFormat});
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    EXPECT_EQ(mapping->GetWorkingImageSize(0, &width, &height), NCF_OK);
    EXPECT_EQ(journal.lines(), (Lines{"clip.GetEncodedWidthAndHeight", "lock",
                                      "clip.GetTemporalFieldOrder", "unlock"}));
}

TEST_F(ImageFormats, SizeOfAnotherFieldOrderFailsSilentlyWithTheWidthWritten) {
    Movie({kBGRAPixelFormat});
    clip->setFieldOrder(kFieldOrderUndetermined);
    ncfUInt32 width = 77;
    ncfUInt32 height = 77;
    EXPECT_EQ(mapping->GetWorkingImageSize(0, &width, &height), NCF_E_FAIL);
    EXPECT_EQ(width, 1920u);
    EXPECT_EQ(height, 77u);
    EXPECT_TRUE(log->records().empty());
}

TEST_F(ImageFormats, SizeNeedsItsOutputsAndTheClip) {
    Movie({kBGRAPixelFormat});
    ncfUInt32 width = 77;
    ncfUInt32 height = 77;
    EXPECT_EQ(mapping->GetWorkingImageSize(0, nullptr, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Check("CHK_INARG(width)", "GetWorkingImageSize")));
    EXPECT_EQ(mapping->GetWorkingImageSize(0, &width, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Check("CHK_INARG(height)", "GetWorkingImageSize")));
    clip->results = {{"GetTemporalFieldOrder", NCF_E_ABORT}};
    EXPECT_EQ(mapping->GetWorkingImageSize(0, &width, &height), NCF_E_ABORT);
    EXPECT_TRUE(log->once(Record("80000007", "media_->GetTemporalFieldOrder(&temporalFieldOrder)",
                                 "GetWorkingImageSize")));
    clip->results = {{"GetEncodedWidthAndHeight", NCF_E_HANDLE}};
    EXPECT_EQ(mapping->GetWorkingImageSize(0, &width, &height), NCF_E_HANDLE);
    EXPECT_TRUE(
        log->once(Record("80000006", "media_->GetEncodedWidthAndHeight(width, &movieHeight)",
                         "GetWorkingImageSize")));
    mapping->media_.reset();
    EXPECT_EQ(mapping->GetWorkingImageSize(0, &width, &height), NMA_E_NOTINITIALIZED);
}

TEST_F(ImageFormats, BufferHoldsAFrameOfTheFormat) {
    Movie(
        {k2vuyPixelFormat, kBGRAPixelFormat, kb64aPixelFormat, kr4flPixelFormat, kv210PixelFormat});
    const ncfUInt64 sizes[] = {4147200, 8294400, 16588800, 16588800, 8294400};
    EXPECT_EQ(BufferSize(0), sizes[0]) << "the first format before any is chosen";
    for (ncfUInt32 i = 0; i < 5; ++i) {
        ASSERT_EQ(mapping->SetWorkingImageFormat(0, i), NCF_OK);
        EXPECT_EQ(BufferSize(0), sizes[i]);
    }
}

TEST_F(ImageFormats, BufferOfAlphaHoldsOneOrTwoPlanes) {
    Movie({kBGRAPixelFormat, kb64aPixelFormat}, true);
    EXPECT_EQ(BufferSize(1), 2073600u);
    ASSERT_EQ(mapping->SetWorkingImageFormat(1, 1), NCF_OK);
    EXPECT_EQ(BufferSize(1), 4147200u);
}

TEST_F(ImageFormats, OnlyTheTenBitRowRoundsItsWidth) {
    Movie({k2vuyPixelFormat, kv210PixelFormat});
    clip->setSize(1000, 10);
    EXPECT_EQ(BufferSize(0), 20000u);
    ASSERT_EQ(mapping->SetWorkingImageFormat(0, 1), NCF_OK);
    EXPECT_EQ(BufferSize(0), 1008u * 10 * 4);
    ncfUInt32 aligned = 0;
    mapping->GetAlignedWidth(CT_V210, 0, &aligned);
    EXPECT_EQ(aligned, 4294967232u);
    mapping->GetAlignedWidth(CT_UCHAR, 0, &aligned);
    EXPECT_EQ(aligned, 0u);
    mapping->GetAlignedWidth(CT_V210, 1, nullptr);
}

TEST_F(ImageFormats, BufferSizeIsWorkedOutIn32Bits) {
    Movie({kb64aPixelFormat});
    clip->setSize(23171, 23171);
    EXPECT_EQ(BufferSize(0), static_cast<ncfUInt32>(23171u * 23171u * 8u));
    EXPECT_LT(BufferSize(0), 23171ull * 23171 * 8);
}

TEST_F(ImageFormats, BufferRequirementsTakeTheLockTwice) {
    Movie({kBGRAPixelFormat});
    BufferSize(0);
    EXPECT_EQ(journal.lines(),
              (Lines{"lock", "clip.GetEncodedWidthAndHeight", "lock", "unlock", "unlock"}));
}

TEST_F(ImageFormats, AlignmentIsWrittenEvenWhenTheRequirementsFail) {
    Movie({kBGRAPixelFormat});
    ncfUInt16 alignment = 77;
    ncfUInt64 size = 77;
    EXPECT_EQ(mapping->GetWorkingImageBufferRequirements(0, nullptr, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(
        log->once(Check("CHK_INARG(bufferStartAlignment)", "GetWorkingImageBufferRequirements")));
    EXPECT_EQ(mapping->GetWorkingImageBufferRequirements(0, &alignment, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Check("CHK_INARG(maxBufferSize)", "GetWorkingImageBufferRequirements")));
    EXPECT_EQ(alignment, 77);
    EXPECT_EQ(mapping->GetWorkingImageBufferRequirements(9, &alignment, &size), NCF_E_INVALIDARG);
    EXPECT_EQ(alignment, 1);
    EXPECT_TRUE(log->once(Record("80000003", badTrack, "GetWorkingImageBufferRequirements")));
    alignment = 77;
    EXPECT_EQ(mapping->GetWorkingImageBufferRequirements(1, &alignment, &size), NCF_E_INVALIDARG)
        << "a sound track";
    EXPECT_EQ(alignment, 1);
    clip->results["GetEncodedWidthAndHeight"] = NCF_E_ABORT;
    EXPECT_EQ(mapping->GetWorkingImageBufferRequirements(0, &alignment, &size), NCF_E_ABORT);
    EXPECT_TRUE(log->once(Record("80000007", "media_->GetEncodedWidthAndHeight(&width, &height)",
                                 "GetWorkingImageBufferRequirements")));
    EXPECT_EQ(size, 77u);
}

TEST_F(ImageFormats, TrackWithoutFormatsHasNoBuffer) {
    AddVideo(1);
    Bind();
    ncfUInt16 alignment = 77;
    ncfUInt64 size = 77;
    EXPECT_EQ(mapping->GetWorkingImageBufferRequirements(0, &alignment, &size), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Record("80000003",
                                 "track->GetMediaFormat(track->GetSelectedIndex(), mediaFormat)",
                                 "GetWorkingImageBufferRequirements")));
}

}  // namespace
