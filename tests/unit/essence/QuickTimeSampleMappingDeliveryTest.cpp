// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/essence/support/MappingFixture.h"

namespace {

using namespace QuickTime;

// A picture of two pixels by one, with alpha when asked for, and sound 2
// behind it; a request and its buffer.
class Delivery : public MappingFixture {
protected:
    ~Delivery() override {
        if (request) {
            request->Release();
        }
    }
    void Movie(std::vector<ncfUInt32> codes, bool alpha = false) {
        AddVideo(1);
        AddAudio(2);
        clip->setAlpha(alpha);
        clip->setSize(2, 1);
        property->storageType = 1;
        property->codes = std::move(codes);
        Bind();
        EXPECT_EQ(QueryImages(), NCF_OK);
        EXPECT_EQ(QuerySound(), NCF_OK);
        buffer = new FakeBuffer(&journal);
        request = new FakeRequest(&journal, buffer);
    }
    void Choose(ncfUInt32 track, ncfUInt32 index) {
        EXPECT_EQ(mapping->SetWorkingImageFormat(track, index), NCF_OK);
        journal.clear();
        host->console().clear();
    }
    void ChooseSound(ncfUInt32 track) {
        EXPECT_EQ(mapping->SetWorkingAudioFormat(track, 0), NCF_OK);
        journal.clear();
    }
    NCFRESULT Ask(ncfUInt32 track, ncfUInt64 sample = 0, ncfUInt64 count = 1) {
        request->track = track;
        request->sample = sample;
        request->count = count;
        return mapping->ProvideSampleRange(request, 0);
    }
    std::vector<ncfUInt8>& Frame() { return wrapper->picture->frame; }
    NCFRESULT Provide() { return mapping->ProvideSampleRange(request, 12345); }

    FakeBuffer* buffer = nullptr;
    FakeRequest* request = nullptr;
    using Bytes = std::vector<ncfUInt8>;
};

// --- the request ------------------------------------------------------------------------

TEST_F(Delivery, NeedsARequest) {
    Movie({kBGRAPixelFormat});
    journal.clear();
    EXPECT_EQ(mapping->ProvideSampleRange(nullptr, 0), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Check("CHK_INARG(pAVBuffer)", "ProvideSampleRange")));
    EXPECT_TRUE(journal.lines().empty()) << "before the lock";
}

TEST_F(Delivery, GivesTheFailureOfTheRequestUnderTheLock) {
    Movie({kBGRAPixelFormat});
    journal.clear();
    request->results = {{"GetSampleRange", NCF_E_ABORT}};
    EXPECT_EQ(Ask(0), NCF_E_ABORT);
    EXPECT_EQ(journal.lines(), (Lines{"lock", "request.GetSampleRange", "unlock"}));
    request->results = {{"GetBuffer", NCF_E_HANDLE}};
    EXPECT_EQ(Ask(0), NCF_E_HANDLE);
    EXPECT_TRUE(
        log->once(Record("80000007", "pAVBuffer->GetSampleRange(&trackNMA, &sample, &numSamples)",
                         "ProvideSampleRange")));
    EXPECT_TRUE(
        log->once(Record("80000006", "pAVBuffer->GetBuffer(&pBuffer)", "ProvideSampleRange")));
}

TEST_F(Delivery, RequestWithoutABufferIsRefused) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    ChooseSound(1);
    Frame().assign(8, 0);
    request->bufferless = true;
    EXPECT_EQ(Ask(0), NCF_E_POINTER);
    EXPECT_EQ(Ask(1), NCF_E_POINTER);
    EXPECT_EQ(journal.lines().back(), "unlock");
}

TEST_F(Delivery, TrackThatIsNotThereIsInvalid) {
    Movie({kBGRAPixelFormat});
    EXPECT_EQ(Ask(9), NCF_E_INVALIDARG);
    EXPECT_TRUE(
        log->once(Record("80000003", "GetMediaTrack(trackNMA, track)", "ProvideSampleRange")));
}

// --- pictures ---------------------------------------------------------------------------------

TEST_F(Delivery, PictureBeforeAChoiceIsNotInitialized) {
    Movie({kBGRAPixelFormat});
    log->clear();
    EXPECT_EQ(Ask(0), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(Ask(0, 0, 2), NMA_E_NOTINITIALIZED) << "before the count is looked at";
    EXPECT_TRUE(log->records().empty());
    EXPECT_TRUE(buffer->bytes.empty());
}

TEST_F(Delivery, PictureIsReadIntoTheHostsMemoryAndMadeOpaqueInOneOrderOfCalls) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    Frame() = {1, 2, 3, 4, 5, 6, 7, 8};
    EXPECT_EQ(Ask(0, 5), NCF_OK);
    EXPECT_EQ(journal.lines(),
              (Lines{"lock", "request.GetSampleRange", "request.GetBuffer", "clip.HasOneFrame",
                     "clip.GetEncodedWidthAndHeight", "reader.SetOutputPixelFormat BGRA 0 0",
                     "reader.GetFrameBufferSize 4294967295 5 0", "lock", "unlock",
                     "buffer.Allocate 8 1", "buffer.GetBufferPointer", "reader.ReadFrame 5 0",
                     "buffer.SetComplete 3 8 0", "unlock"}));
    EXPECT_EQ(wrapper->picture->destination, buffer->bytes.data()) << "no copy in between";
    EXPECT_EQ(buffer->bytes, (Bytes{1, 2, 3, 255, 5, 6, 7, 255}));
}

TEST_F(Delivery, LevelsAreAppliedAsOfTheLastLookForFormats) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    Frame() = {16, 235, 128, 4, 0, 255, 17, 8};
    clip->setLevels(Expand_Levels);
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(buffer->bytes, (Bytes{16, 235, 128, 255, 0, 255, 17, 255}));
    EXPECT_EQ(mapping->RefreshBasedOnUIParams(), NCF_OK);
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(buffer->bytes, (Bytes{0, 255, 130, 255, 0, 255, 1, 255}));
}

TEST_F(Delivery, YCbCrIsDeliveredAsItIs) {
    Movie({k2vuyPixelFormat});
    Choose(0, 0);
    Frame() = {1, 2, 3, 4};
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(buffer->bytes, (Bytes{1, 2, 3, 4}));
}

TEST_F(Delivery, AlphaReadsAWholeFrameAsideAndDeliversOneByteAPixel) {
    Movie({kBGRAPixelFormat}, true);
    Choose(1, 0);
    Frame() = {1, 2, 3, 4, 5, 6, 7, 8};
    EXPECT_EQ(Ask(1), NCF_OK);
    EXPECT_NE(wrapper->picture->destination, buffer->bytes.data());
    EXPECT_EQ(buffer->bytes, (Bytes{4, 8}));
    EXPECT_EQ(journal.count("buffer.Allocate 2 1"), 1);
    EXPECT_EQ(journal.count("buffer.SetComplete 3 2 0"), 1);
}

TEST_F(Delivery, FloatPictureIsConvertedToWords) {
    Movie({kr4flPixelFormat});
    Choose(0, 0);
    const float pixels[8] = {1.0f, 0.0f, 128.0f / 255.0f, 128.0f / 255.0f,
                             0.5f, 0.0f, 128.0f / 255.0f, 128.0f / 255.0f};
    Frame().resize(sizeof pixels);
    std::memcpy(Frame().data(), pixels, sizeof pixels);
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(buffer->bytes, (Bytes{255, 255, 16, 0, 16, 0, 16, 0, 255, 255, 16, 0, 16, 0, 16, 0}));
}

TEST_F(Delivery, TracksOfOneReaderTellItTheirFormatBeforeEachFrame) {
    Movie({kb64aPixelFormat, kBGRAPixelFormat}, true);
    Choose(0, 0);
    Choose(1, 1);
    Frame().assign(8, 0);
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(Ask(1), NCF_OK);
    EXPECT_EQ(journal.startingWith("reader.Set"), (Lines{"reader.SetOutputPixelFormat b64a 0 0",
                                                         "reader.SetOutputPixelFormat BGRA 0 0"}));
}

TEST_F(Delivery, MovieOfOneFrameGivesItEverywhere) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    clip->oneFrame = 1;
    Frame().assign(8, 0);
    EXPECT_EQ(Ask(0, 0), NCF_OK);
    EXPECT_EQ(Ask(0, 1000), NCF_OK);
    EXPECT_EQ(journal.count("reader.ReadFrame 0 0"), 2);
    EXPECT_EQ(journal.count("reader.GetFrameBufferSize 4294967295 0 0"), 2);
}

TEST_F(Delivery, PicturesGoOneByOne) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    for (const ncfUInt64 count : {0, 2}) {
        EXPECT_EQ(Ask(0, 0, count), NCF_E_FAIL);
    }
    EXPECT_EQ(log->count(Check("NCFASSERT( 1 == numSamples )", "ProvideSampleRange")), 2);
    EXPECT_TRUE(journal.startingWith("reader.").empty());
    EXPECT_TRUE(buffer->bytes.empty());
}

TEST_F(Delivery, FrameOfUnknownSizeFailsBeforeTheBuffer) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    EXPECT_EQ(Ask(0, 99), NCF_E_FAIL);
    EXPECT_TRUE(log->once(Check("NCFASSERT( nQuickTimeBufSize )", "ProvideSampleRange")));
    EXPECT_TRUE(journal.startingWith("buffer.").empty());
}

TEST_F(Delivery, FrameThatCannotBeReadLeavesTheBufferIncomplete) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    Frame().assign(8, 0);
    for (const NCFRESULT code : {NMA_E_NODATA, NCF_E_FAIL, NCFRESULT{7}}) {
        wrapper->picture->results["ReadFrame"] = code;
        host->console().clear();
        EXPECT_EQ(Ask(0, 12), code);
        EXPECT_FALSE(buffer->complete);
        EXPECT_EQ(buffer->bytes.size(), 8u) << "allocated";
        EXPECT_EQ(Console(1, "QuickTime failed to get video sample with number: 12 !\n"), 1);
    }
    wrapper->picture->results.clear();
    EXPECT_EQ(Ask(0, 12), NCF_OK) << "the next request works";
}

TEST_F(Delivery, SampleNumberIsToldIn32Bits) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    Frame().assign(8, 0);
    wrapper->picture->results["ReadFrame"] = NCF_E_FAIL;
    EXPECT_EQ(Ask(0, 0x1FFFFFFFF), NCF_E_FAIL);
    EXPECT_EQ(Console(1, "QuickTime failed to get video sample with number: -1 !\n"), 1);
}

TEST_F(Delivery, FrameThatMayNotBeReadGivesAPositiveCode) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    Frame().assign(8, 0);
    wrapper->picture->results["ReadFrame"] = NCF_E_ACCESSDENIED;
    EXPECT_EQ(Ask(0), 0x0AEA0066);
    EXPECT_FALSE(buffer->complete);
    EXPECT_EQ(Console(1, "QuickTime failed to get video sample with number: 0 !\n"), 1);
}

TEST_F(Delivery, ReaderLargerThanTheBufferNeverWritesIntoIt) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    Frame().assign(12, 9);
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_NE(wrapper->picture->destination, buffer->bytes.data());
    EXPECT_EQ(buffer->bytes, (Bytes{9, 9, 9, 255, 9, 9, 9, 255})) << "what fits";
}

TEST_F(Delivery, ReaderSmallerThanTheBufferLeavesTheRest) {
    Movie({k2vuyPixelFormat});
    Choose(0, 0);
    Frame() = {1, 2, 3};
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(buffer->bytes, (Bytes{1, 2, 3, 0xAA}));
    EXPECT_EQ(journal.count("buffer.SetComplete 3 4 0"), 1);
}

TEST_F(Delivery, WhatAReaderLeavesOutOfAConvertedFrameIsZero) {
    Movie({kBGRAPixelFormat}, true);
    Choose(1, 0);
    clip->setSize(256, 1);
    Frame().assign(1024, 9);
    EXPECT_EQ(Ask(1), NCF_OK);
    EXPECT_EQ(buffer->bytes, Bytes(256, 9));
    wrapper->picture->frameSize = 1024;
    Frame() = {1, 2, 3, 4};
    EXPECT_EQ(Ask(1), NCF_OK);
    Bytes expected(256, 0);
    expected[0] = 4;
    EXPECT_EQ(buffer->bytes, expected) << "nothing of the frame before";
}

TEST_F(Delivery, MemoryOfAConvertedFrameIsKeptForTheNextOne) {
    Movie({kBGRAPixelFormat}, true);
    Choose(1, 0);
    Frame() = {1, 2, 3, 4, 5, 6, 7, 8};
    EXPECT_EQ(Ask(1), NCF_OK);
    const void* const first = wrapper->picture->destination;
    EXPECT_EQ(first, mapping->scratch_.data());
    Frame() = {1, 2, 3, 9};
    EXPECT_EQ(Ask(1), NCF_OK);
    EXPECT_EQ(wrapper->picture->destination, first) << "for a smaller one too";
    Frame() = {1, 2, 3, 4, 5, 6, 7, 8};
    EXPECT_EQ(Ask(1), NCF_OK);
    EXPECT_EQ(wrapper->picture->destination, first);
    EXPECT_EQ(buffer->bytes, (Bytes{4, 8}));
}

TEST_F(Delivery, FailedReadLeavesNothingInTheNextConvertedFrame) {
    Movie({kBGRAPixelFormat}, true);
    Choose(1, 0);
    Frame() = {9, 9, 9, 9, 9, 9, 9, 9};
    EXPECT_EQ(Ask(1), NCF_OK);
    wrapper->picture->results["ReadFrame"] = NCF_E_FAIL;
    EXPECT_EQ(Ask(1), NCF_E_FAIL);
    wrapper->picture->results.clear();
    wrapper->picture->frameSize = 8;
    Frame() = {1, 2, 3, 4};
    EXPECT_EQ(Ask(1), NCF_OK);
    EXPECT_EQ(buffer->bytes, (Bytes{4, 0}));
}

TEST_F(Delivery, LevelsReachWhatAConversionLeavesOut) {
    Movie({kr4flPixelFormat});
    Choose(0, 0);
    Frame().assign(31, 0);  // no whole row
    mapping->levelRemap_ = Expand_Levels;
    EXPECT_EQ(Ask(0), NCF_OK);
    const auto word = static_cast<ncfUInt16>((0xAAAA - 4096) * 1.1688453);
    const auto high = static_cast<ncfUInt8>(word >> 8);
    const auto low = static_cast<ncfUInt8>(word);
    EXPECT_EQ(buffer->bytes, (Bytes{255, 255, high, low, high, low, high, low, 255, 255, high, low,
                                    high, low, high, low}));
}

TEST_F(Delivery, ConvertedFrameOfAnUndefinedFormatHasNoLevels) {
    Movie({kr4flPixelFormat});
    QTImageFormat format = Format(0, 0);
    format.componentFormat = CT_UNDEFINED;
    mapping->mediaTracks_[0]->AddFormat(format);
    Choose(0, 1);
    mapping->levelRemap_ = Expand_Levels;
    Frame().assign(32, 0);
    EXPECT_EQ(Ask(0), NCF_E_FAIL);
    EXPECT_TRUE(
        log->once(Check("NCFASSERT( CT_UNDEFINED != componentType )", "ProvideSampleRange")));
    EXPECT_FALSE(buffer->complete);
    EXPECT_EQ(buffer->bytes[0], 0) << "alpha as it was read";
    EXPECT_EQ(buffer->bytes[1], 0);
    EXPECT_EQ((Bytes(buffer->bytes.begin() + 4, buffer->bytes.begin() + 6)), (Bytes{0x94, 0x6F}))
        << "green of no colour at all, in video range";
}

TEST_F(Delivery, PictureWhoseSizeWrapsIsCutToTheBuffer) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    clip->setSize(65536, 65536);
    Frame().assign(64, 9);
    EXPECT_EQ(Ask(0), NCF_OK) << "the size wraps to 0: nothing is written";
    EXPECT_TRUE(buffer->bytes.empty());
    EXPECT_EQ(journal.count("buffer.Allocate 0 1"), 1);
}

TEST_F(Delivery, FormatsThatAreNotDefinedAreAssertedAfterTheRead) {
    Movie({kBGRAPixelFormat});
    QTImageFormat format = Format(0, 0);
    format.pixelFormat = PF_UNDEFINED;
    mapping->mediaTracks_[0]->AddFormat(format);
    format = Format(0, 0);
    format.componentFormat = CT_UNDEFINED;
    mapping->mediaTracks_[0]->AddFormat(format);
    Frame().assign(8, 1);
    Choose(0, 1);
    EXPECT_EQ(Ask(0), NCF_E_FAIL);
    Choose(0, 2);
    EXPECT_EQ(Ask(0), NCF_E_FAIL);
    EXPECT_EQ(journal.count("reader.ReadFrame 0 0"), 1);
    EXPECT_TRUE(log->once(Check("NCFASSERT( PF_UNDEFINED != pixelFormat )", "ProvideSampleRange")));
    EXPECT_TRUE(
        log->once(Check("NCFASSERT( CT_UNDEFINED != componentType )", "ProvideSampleRange")));
    EXPECT_FALSE(buffer->complete);
}

TEST_F(Delivery, GivesTheFailureOfEachStepOfAPicture) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    Frame().assign(8, 0);
    const std::pair<const char*, const char*> clipCalls[] = {
        {"HasOneFrame", "media_->HasOneFrame(&isOneFrame)"},
        {"GetEncodedWidthAndHeight", "media_->GetEncodedWidthAndHeight(&width, &height)"},
    };
    for (const auto& call : clipCalls) {
        clip->results = {{call.first, NCF_E_ABORT}};
        EXPECT_EQ(Ask(0), NCF_E_ABORT);
        EXPECT_TRUE(log->once(Record("80000007", call.second, "ProvideSampleRange")));
    }
    clip->results.clear();
    const std::pair<const char*, const char*> bufferCalls[] = {
        {"Allocate", "pBuffer->Allocate(nOutputBufSize, 1)"},
        {"GetBufferPointer", "pBuffer->GetBufferPointer((void**)&pOutputBuffer)"},
        {"SetComplete", "pBuffer->SetComplete(kNCFBuffer_Complete, nOutputBufSize, NCF_OK)"},
    };
    for (const auto& call : bufferCalls) {
        buffer->results = {{call.first, NCF_E_OUTOFMEMORY}};
        EXPECT_EQ(Ask(0), NCF_E_OUTOFMEMORY);
        EXPECT_TRUE(log->once(Record("80000002", call.second, "ProvideSampleRange")));
    }
    buffer->results.clear();
    buffer->givesNull = true;
    EXPECT_EQ(Ask(0), NCF_E_POINTER) << "a buffer without memory";
    buffer->givesNull = false;
    mapping->mediaTracks_[0]->SetSelectedIndex(8);
    EXPECT_EQ(Ask(0), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Record("80000003",
                                 "track->GetMediaFormat(track->GetSelectedIndex(), mediaFormat)",
                                 "ProvideSampleRange")));
    mapping->mediaTracks_[0]->AddFormat(QTAudioFormat(SF_PCM_INT_LE, 3, 24));
    mapping->mediaTracks_[0]->SetSelectedIndex(1);
    EXPECT_EQ(Ask(0), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(video_format)", "ProvideSampleRange")));
}

TEST_F(Delivery, ReaderMayRefuseThePixelFormat) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    Frame().assign(8, 0);
    wrapper->picture->results["SetOutputPixelFormat BGRA 0 0"] = NCF_E_FAIL;
    EXPECT_EQ(Ask(0), NCF_OK);
}

TEST_F(Delivery, FlagsAreNotRead) {
    Movie({kBGRAPixelFormat});
    Choose(0, 0);
    Frame().assign(8, 0);
    EXPECT_EQ(Provide(), NCF_OK);
}

// --- sound --------------------------------------------------------------------------------------

TEST_F(Delivery, SoundIsReadIntoTheHostsMemoryInOneOrderOfCalls) {
    Movie({kBGRAPixelFormat});
    ChooseSound(1);
    EXPECT_EQ(Ask(1, 48000, 10), NCF_OK);
    Lines lines = journal.lines();
    lines.erase(std::remove_if(lines.begin(), lines.end(),
                               [](const std::string& line) { return line.find("clip.") == 0; }),
                lines.end());
    EXPECT_EQ(lines,
              (Lines{"lock", "request.GetSampleRange", "request.GetBuffer", "buffer.Allocate 60 1",
                     "buffer.GetBufferPointer", "sound.ReadSamples 2 48000 10 60 0",
                     "buffer.SetComplete 3 60 0", "unlock"}));
    EXPECT_EQ(buffer->bytes, Bytes(60, 0x55));
}

TEST_F(Delivery, SoundThatCannotBeReadIsSilenceAndNoFailure) {
    Movie({kBGRAPixelFormat});
    ChooseSound(1);
    for (const NCFRESULT code : {NMA_E_NODATA, NCFRESULT{1}}) {
        wrapper->sound->results["ReadSamples"] = code;
        host->console().clear();
        buffer->complete = false;
        EXPECT_EQ(Ask(1, 0, 10), NCF_OK);
        EXPECT_EQ(buffer->bytes, Bytes(60, 0));
        EXPECT_TRUE(buffer->complete);
        EXPECT_EQ(
            Console(1, "QuickTime failed to extract audio, filling the buffers with silence!\n"),
            1);
    }
}

TEST_F(Delivery, ShortReadCompletesWithTheFullSizeAndItsTailAsItWas) {
    Movie({kBGRAPixelFormat});
    ChooseSound(1);
    wrapper->sound->filled = 12;
    EXPECT_EQ(Ask(1, 0, 3), NCF_OK);
    Bytes expected(12, 0x55);
    expected.resize(18, 0xAA);
    EXPECT_EQ(buffer->bytes, expected);
    EXPECT_EQ(journal.count("buffer.SetComplete 3 18 0"), 1);
}

TEST_F(Delivery, NoSamplesFailBeforeTheBuffer) {
    Movie({kBGRAPixelFormat});
    ChooseSound(1);
    EXPECT_EQ(Ask(1, 0, 0), NCF_E_FAIL);
    EXPECT_TRUE(log->once(Check("NCFASSERT( memNeeded )", "ProvideSampleRange")));
    EXPECT_TRUE(journal.startingWith("buffer.").empty());
}

TEST_F(Delivery, SoundWithoutAChoiceReadsTheFirstFormatAndOneChannel) {
    Movie({kBGRAPixelFormat});
    journal.clear();
    EXPECT_EQ(Ask(1, 0, 10), NCF_OK);
    EXPECT_EQ(journal.count("sound.ReadSamples 2 0 10 30 0"), 1);
    EXPECT_TRUE(journal.startingWith("sound.SetParams").empty());
}

TEST_F(Delivery, SoundSizeIsWorkedOutIn64Bits) {
    Movie({kBGRAPixelFormat});
    ChooseSound(1);
    buffer->results["Allocate"] = NCF_E_OUTOFMEMORY;
    EXPECT_EQ(Ask(1, 0, ncfUInt64{1} << 32), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(journal.count("buffer.Allocate 25769803776 1"), 1);
    EXPECT_TRUE(
        log->once(Record("80000002", "pBuffer->Allocate(memToAlloc, 1)", "ProvideSampleRange")));
}

TEST_F(Delivery, GivesTheFailureOfEachStepOfSound) {
    Movie({kBGRAPixelFormat});
    ChooseSound(1);
    const std::pair<const char*, const char*> bufferCalls[] = {
        {"GetBufferPointer", "pBuffer->GetBufferPointer((void**)&pWorkingBuffer)"},
        {"SetComplete",
         "pBuffer->SetComplete( kNCFBuffer_Complete, numSamples * numAudioChannels * "
         "bytesPerSample, NCF_OK)"},
    };
    for (const auto& call : bufferCalls) {
        buffer->results = {{call.first, NCF_E_ABORT}};
        EXPECT_EQ(Ask(1), NCF_E_ABORT);
        EXPECT_TRUE(log->once(Record("80000007", call.second, "ProvideSampleRange")));
    }
    buffer->results.clear();
    buffer->givesNull = true;
    EXPECT_EQ(Ask(1), NCF_E_POINTER) << "a buffer without memory";
    buffer->givesNull = false;
    mapping->_trackRemapVect.assign(1, 1);
    journal.clear();
    EXPECT_EQ(Ask(1), NCF_E_FAIL);
    EXPECT_EQ(journal.count("buffer.GetBufferPointer"), 1) << "the buffer comes before the map";
    EXPECT_TRUE(log->once(
        Record("80000008", "AAFTrackToQuickTimeTrack(trackNMA, &trackQT)", "ProvideSampleRange")));
    MediaTrack& track = *mapping->mediaTracks_[1];
    track.SetSelectedIndex(2);
    EXPECT_EQ(Ask(1), NCF_E_INVALIDARG);
    EXPECT_TRUE(log->once(Record("80000003",
                                 "track->GetMediaFormat(track->GetSelectedIndex(), mediaFormat)",
                                 "ProvideSampleRange")));
    track.AddFormat(QTAudioFormat(SF_PCM_INT_LE, 0, 24));
    EXPECT_EQ(Ask(1), NCF_E_FAIL);
    EXPECT_TRUE(log->once(Check("NCFASSERT( bytesPerSample )", "ProvideSampleRange")));
    track.AddFormat(QTImageFormat());
    track.SetSelectedIndex(3);
    EXPECT_EQ(Ask(1), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(audio_format)", "ProvideSampleRange")));
}

TEST_F(Delivery, SoundNeedsATrackThatKeepsAChannelCount) {
    Movie({kBGRAPixelFormat});
    mapping->mediaTracks_[1].reset(new SoundTrackWithoutChannels);
    mapping->mediaTracks_[1]->AddFormat(QTAudioFormat(SF_PCM_INT_LE, 3, 24));
    EXPECT_EQ(Ask(1), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(audio_track)", "ProvideSampleRange")));
    EXPECT_EQ(mapping->SetWorkingAudioFormat(1, 0), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(audio_track)", "SetWorkingAudioFormat")));
}

TEST_F(Delivery, SoundBeforeTheAudioQueryIsNotInitialized) {
    AddAudio(2);
    Bind();
    request = new FakeRequest(&journal, new FakeBuffer(&journal));
    EXPECT_EQ(Ask(0, 0, 10), NMA_E_NOTINITIALIZED);
    EXPECT_TRUE(log->records().empty());
}

TEST_F(Delivery, SoundBehindASecondPictureTrackCannotBeDelivered) {
    AddVideo(5);
    Movie({kBGRAPixelFormat});
    journal.clear();
    EXPECT_EQ(Ask(2, 0, 10), NCF_E_FAIL) << "picture, picture, sound against picture, sound";
    EXPECT_EQ(Console(2,
                      "QuickTimeSampleMapping::AAFTrackToQuickTimeTrack: Index into vector is "
                      "larger than vector size.\n"),
              1);
}

// A second mapping over the same clip shares its readers.
TEST_F(Delivery, MappingsOfOneClipShareItsReaders) {
    Movie({kBGRAPixelFormat, kb64aPixelFormat});
    Choose(0, 0);
    FakeLock* const ours = lock;
    void* made = nullptr;
    ASSERT_EQ(
        CreateInstanceOf<OpenMapping>(host->unknown(), nullptr, NMA::IID_ISampleMapping, &made),
        NCF_OK);
    auto* const other = dynamic_cast<OpenMapping*>(static_cast<NMA::ISampleMapping*>(made));
    ASSERT_EQ(other->SetMediaContainer(clip), NCF_OK);
    NCFSmartPtr<INCFString> path;
    path.attach(MakeHostString("/movies/a.mov"));
    other->SetFilePath(path);
    void* images = nullptr;
    ASSERT_EQ(other->QueryInterface(NMA::IID_IUncompressedImageProvider, &images), NCF_OK);
    static_cast<INCFUnknown*>(images)->Release();
    ASSERT_EQ(other->SetWorkingImageFormat(0, 1), NCF_OK);
    EXPECT_EQ(journal.count("wrapper.GetQTVideoReader"), 0) << "the clip has it";
    EXPECT_EQ(mapping->mediaTracks_[0]->GetSelectedIndex(), 0u) << "choices are apart";
    Frame().assign(8, 0);
    EXPECT_EQ(Ask(0), NCF_OK);
    EXPECT_EQ(journal.startingWith("reader.Set").back(), "reader.SetOutputPixelFormat BGRA 0 0");
    static_cast<NMA::ISampleMapping*>(made)->Release();
    lock = ours;
}

// The reader is the clip's, but a mapping stops it only once it uses it. Then
// every other mapping needs a Setup.
TEST_F(Delivery, CleanupOfAMappingWithoutAChoiceLeavesTheOthersReaderAlone) {
    Movie({kBGRAPixelFormat, kb64aPixelFormat});
    Choose(0, 0);
    FakeLock* const ours = lock;
    void* made = nullptr;
    ASSERT_EQ(
        CreateInstanceOf<OpenMapping>(host->unknown(), nullptr, NMA::IID_ISampleMapping, &made),
        NCF_OK);
    auto* const other = dynamic_cast<OpenMapping*>(static_cast<NMA::ISampleMapping*>(made));
    NCFSmartPtr<INCFString> path;
    path.attach(MakeHostString("/movies/a.mov"));
    other->SetFilePath(path);
    ASSERT_EQ(other->SetMediaContainer(clip), NCF_OK);
    void* images = nullptr;
    ASSERT_EQ(other->QueryInterface(NMA::IID_IUncompressedImageProvider, &images), NCF_OK);
    static_cast<INCFUnknown*>(images)->Release();
    journal.clear();
    EXPECT_EQ(other->Setup(0), NCF_OK);
    EXPECT_EQ(other->Cleanup(0), NCF_OK);
    EXPECT_TRUE(journal.startingWith("reader.").empty());

    ASSERT_EQ(other->SetWorkingImageFormat(0, 1), NCF_OK);
    journal.clear();
    EXPECT_EQ(other->Cleanup(0), NCF_OK);
    EXPECT_EQ(journal.lines(), Lines{"reader.ReleaseQT"});
    EXPECT_EQ(other->Cleanup(0), NCF_OK);
    EXPECT_EQ(journal.count("reader.ReleaseQT"), 2) << "each one goes to the reader";
    Frame().assign(8, 0);
    EXPECT_EQ(Ask(0), NMA_E_NOTINITIALIZED) << "the reader that both use is stopped";
    EXPECT_EQ(mapping->Setup(0), NCF_OK);
    journal.clear();
    EXPECT_EQ(Ask(0), NCF_OK) << "the first one's choice stands";
    EXPECT_EQ(journal.startingWith("reader.Set").back(), "reader.SetOutputPixelFormat BGRA 0 0");
    static_cast<NMA::ISampleMapping*>(made)->Release();
    lock = ours;
}

}  // namespace
