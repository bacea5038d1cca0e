// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/unit/essence/support/MappingFixture.h"

namespace {

// Track 0 is picture 7, track 1 is sound 8.
class SampleQueries : public MappingFixture {
protected:
    SampleQueries() {
        AddVideo(7);
        AddAudio(8);
        Bind();
        ncfUInt32 qtTrack = 0;
        mapping->AAFTrackToQuickTimeTrack(0, &qtTrack);
        journal.clear();
    }
    EssenceTrack& Picture() { return clip->video[0]; }
    EssenceTrack& Sound() { return clip->audio[0]; }
    const char* const unmapped = "AAFTrackToQuickTimeTrack(trackNMA, &trackQT)";
};

// --- tracks and channels -------------------------------------------------------------

TEST_F(SampleQueries, TrackCountIsTheAnswerAndAFailureIsNegative) {
    clip->trackCount = 5;
    EXPECT_EQ(interface->GetNumberOfTracks(), 5);
    clip->results["GetTrackCount"] = NMA_E_NODATA;
    EXPECT_EQ(interface->GetNumberOfTracks(), NMA_E_NODATA);
    EXPECT_TRUE(
        log->once(Record("a000006f", "media_->GetTrackCount(&trackCount)", "GetNumberOfTracks")));
}

TEST_F(SampleQueries, TrackCountWithoutAClipIsNotInitialized) {
    mapping->media_.reset();
    EXPECT_EQ(interface->GetNumberOfTracks(), NMA_E_NOTINITIALIZED);
}

TEST_F(SampleQueries, PictureHasOneChannelAndTouchesNoMap) {
    mapping->_trackRemapVect.clear();
    ncfUInt32 channels = 9;
    EXPECT_EQ(interface->GetNumberOfChannels(0, &channels), NCF_OK);
    EXPECT_EQ(channels, 1u);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(SampleQueries, SoundHasTheChannelsThatTheWrapperTells) {
    ncfUInt32 channels = 9;
    EXPECT_EQ(interface->GetNumberOfChannels(1, &channels), NCF_OK);
    EXPECT_EQ(channels, 6u);
    EXPECT_EQ(wrapper->lastTrack, 8u);
}

TEST_F(SampleQueries, ChannelsAreOneFromTheStart) {
    EXPECT_EQ(interface->GetNumberOfChannels(0, nullptr), NCF_E_POINTER);
    EXPECT_TRUE(log->once(Check("CHK_PTR(numChannels)", "GetNumberOfChannels")));
    ncfUInt32 channels = 9;
    EXPECT_EQ(interface->GetNumberOfChannels(2, &channels), NCF_E_INVALIDARG);
    EXPECT_EQ(channels, 1u);
    EXPECT_TRUE(
        log->once(Record("80000003", "GetMediaTrack(trackNMA, track)", "GetNumberOfChannels")));
    channels = 9;
    wrapper->results["GetAudioInfoForTrack"] = NCF_E_ABORT;
    EXPECT_EQ(interface->GetNumberOfChannels(1, &channels), NCF_E_ABORT);
    EXPECT_EQ(channels, 1u);
    EXPECT_TRUE(
        log->once(Record("80000007",
                         "qtWrapper->GetAudioInfoForTrack(trackQT, numChannels, NULL, NULL, "
                         "NULL, NULL, NULL, NULL, NULL, NULL)",
                         "GetNumberOfChannels")));
}

TEST_F(SampleQueries, ChannelsNeedTheWrapper) {
    host->refuseCreation(QTWrapper::CompID_QuickTimeWrapper, NCF_E_OUTOFMEMORY);
    ncfUInt32 channels = 9;
    EXPECT_EQ(interface->GetNumberOfChannels(1, &channels), NCF_E_OUTOFMEMORY);
    EXPECT_TRUE(log->once(
        Record("80000002", "media_->GetQuickTimeInterface(qtWrapper)", "GetNumberOfChannels")));
}

// Behind a second picture the list of tracks has the sound one place later than
// the map.
TEST_F(SampleQueries, ChannelsBehindASecondPictureFollowTheListAndNotTheMap) {
    AddVideo(9);
    mapping->mediaTracks_.clear();
    mapping->_trackRemapVect.clear();
    Bind();
    ncfUInt32 channels = 9;
    EXPECT_EQ(interface->GetNumberOfChannels(1, &channels), NCF_OK);
    EXPECT_EQ(channels, 1u) << "the second picture";
    channels = 9;
    EXPECT_EQ(interface->GetNumberOfChannels(2, &channels), NCF_E_FAIL);
    EXPECT_EQ(channels, 1u);
    EXPECT_TRUE(log->once(Record("80000008", unmapped, "GetNumberOfChannels")));
    EXPECT_EQ(journal.count("wrapper.GetAudioInfoForTrack"), 0);
}

// --- what every operation checks ---------------------------------------------------------

TEST_F(SampleQueries, EveryOutputIsNeeded) {
    struct Case {
        const char* argument;
        const char* operation;
        NCFRESULT result;
    };
    ncfUInt64 flags = 0;
    const Case cases[] = {
        {"numSamples", "GetNumberOfSamples", interface->GetNumberOfSamples(0, nullptr)},
        {"sizeInBytesPtr", "GetSampleSize", interface->GetSampleSize(0, 0, nullptr)},
        {"positionInBytes", "GetSamplePosition", interface->GetSamplePosition(0, 0, nullptr)},
        {"offsetInSamples", "GetSampleTemporalOffset",
         interface->GetSampleTemporalOffset(0, 0, nullptr)},
        {"flagsPtr", "GetSampleProperties", interface->GetSampleProperties(0, 0, nullptr, nullptr)},
        {"numDependenciesPtr", "GetSampleProperties",
         interface->GetSampleProperties(0, 0, &flags, nullptr)},
        {"sizeInSamples", "GetEncodedUnitSizeInSamples",
         interface->GetEncodedUnitSizeInSamples(0, 0, nullptr)},
        {"sample", "GetEncodedUnitFirstSample",
         interface->GetEncodedUnitFirstSample(0, 0, nullptr)},
        {"unit", "GetEncodedUnitContainingSample",
         interface->GetEncodedUnitContainingSample(0, 0, nullptr)},
        {"numSamples", "GetNumberOfContiguousSamples",
         interface->GetNumberOfContiguousSamples(0, 0, nullptr)},
        {"numBytes", "GetNumberOfContiguousBytes",
         interface->GetNumberOfContiguousBytes(0, 0, nullptr)},
    };
    for (const Case& check : cases) {
        EXPECT_EQ(check.result, NCF_E_INVALIDARG) << check.operation;
        EXPECT_TRUE(
            log->once(Check(std::string("CHK_INARG(") + check.argument + ")", check.operation)))
            << check.operation << " " << check.argument;
    }
}

TEST_F(SampleQueries, OutputIsAskedForBeforeTheTrack) {
    ncfUInt64 flags = 0;
    for (const NCFRESULT result :
         {interface->GetNumberOfSamples(2, nullptr), interface->GetSampleSize(2, 0, nullptr),
          interface->GetSamplePosition(2, 0, nullptr),
          interface->GetSampleTemporalOffset(2, 0, nullptr),
          interface->GetSampleProperties(2, 0, &flags, nullptr),
          interface->GetNumberOfContiguousSamples(2, 0, nullptr),
          interface->GetNumberOfContiguousBytes(2, 0, nullptr)}) {
        EXPECT_EQ(result, NCF_E_INVALIDARG);
    }
    EXPECT_EQ(interface->GetNumberOfChannels(2, nullptr), NCF_E_POINTER);
    EXPECT_TRUE(host->console().lines().empty()) << "the map was not asked";
}

TEST_F(SampleQueries, NoClipIsTheMapsFailure) {
    mapping->media_.reset();
    ncfUInt64 out = 77;
    EXPECT_EQ(interface->GetNumberOfSamples(1, &out), NCF_E_POINTER);
    EXPECT_EQ(out, 77u);
    EXPECT_TRUE(log->once(Check("CHK_PTR(media_)", "AAFTrackToQuickTimeTrack")));
    EXPECT_TRUE(log->once(Record("80000005", unmapped, "GetNumberOfSamples")));
}

TEST_F(SampleQueries, UnmappedTrackFailsInTheMap) {
    ncfUInt64 out = 77;
    ncfSInt64 offset = 77;
    ncfUInt32 dependencies = 77;
    EXPECT_EQ(interface->GetNumberOfSamples(2, &out), NCF_E_FAIL);
    EXPECT_EQ(interface->GetSampleSize(2, 0, &out), NCF_E_FAIL);
    EXPECT_EQ(interface->GetSamplePosition(2, 0, &out), NCF_E_FAIL);
    EXPECT_EQ(interface->GetSampleTemporalOffset(2, 0, &offset), NCF_E_FAIL);
    EXPECT_EQ(interface->GetSampleProperties(2, 0, &out, &dependencies), NCF_E_FAIL);
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(2, 0, &offset), NCF_E_FAIL);
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(2, 0, &out), NCF_E_FAIL);
    EXPECT_EQ(out, 77u);
    EXPECT_EQ(offset, 77);
    EXPECT_EQ(dependencies, 77u);
    for (const char* operation :
         {"GetNumberOfSamples", "GetSampleSize", "GetSamplePosition", "GetSampleTemporalOffset",
          "GetSampleProperties", "GetNumberOfContiguousSamples", "GetNumberOfContiguousBytes"}) {
        EXPECT_TRUE(log->once(Record("80000008", unmapped, operation))) << operation;
    }
}

TEST_F(SampleQueries, NoQueryTakesTheLock) {
    ncfUInt64 out = 0;
    ncfSInt64 offset = 0;
    ncfUInt32 small = 0;
    Sound().next = 4;
    interface->GetNumberOfTracks();
    interface->GetNumberOfChannels(1, &small);
    interface->GetNumberOfSamples(1, &out);
    interface->GetSampleSize(1, 0, &out);
    interface->GetSamplePosition(1, 0, &out);
    interface->GetSampleTemporalOffset(1, 0, &offset);
    interface->GetSampleProperties(1, 0, &out, &small);
    interface->GetNumberOfContiguousSamples(1, 0, &offset);
    interface->GetNumberOfContiguousBytes(1, 0, &out);
    EXPECT_EQ(journal.count("lock"), 0);
}

// --- one sample ---------------------------------------------------------------------------

TEST_F(SampleQueries, SamplesOfTheHostStartAtZeroAndThoseOfTheClipAtOne) {
    ncfUInt64 out = 0;
    ncfUInt32 dependencies = 0;
    ncfSInt64 offset = 0;
    Sound().next = 4;
    interface->GetSampleSize(1, 0, &out);
    interface->GetSamplePosition(1, 0, &out);
    interface->GetSampleProperties(1, 0, &out, &dependencies);
    interface->GetSampleTemporalOffset(1, 0, &offset);
    interface->GetNumberOfContiguousSamples(1, 0, &offset);
    EXPECT_EQ(
        journal.lines(),
        (Lines{"clip.GetDataSizePerSample 8 1", "clip.GetDataOffset 8 1", "clip.GetSampleFlags 8 1",
               "clip.GetNumSamples", "clip.GetDecodeDuration 8 1", "clip.GetDisplayOffset 8 1",
               "clip.GetTrackType", "clip.GetNextDiscontiguousDataAttributeChange 8 1"}));
}

TEST_F(SampleQueries, SampleCountIsTheClips) {
    ncfUInt64 out = 0;
    EXPECT_EQ(interface->GetNumberOfSamples(1, &out), NCF_OK);
    EXPECT_EQ(out, 10u);
    clip->results["GetNumSamples"] = NCF_E_ABORT;
    EXPECT_EQ(interface->GetNumberOfSamples(1, &out), NCF_E_ABORT);
    EXPECT_TRUE(log->once(
        Record("80000007", "media_->GetNumSamples(trackQT, numSamples)", "GetNumberOfSamples")));
}

TEST_F(SampleQueries, SizeWritesTheLowHalfOfTheCallersVariable) {
    ncfUInt64 out = 0xFFFFFFFFFFFFFFFF;
    EXPECT_EQ(interface->GetSampleSize(1, 4, &out), NCF_OK);
    ncfUInt32 halves[2];
    std::memcpy(halves, &out, sizeof halves);
    EXPECT_EQ(halves[0], 105u);
    EXPECT_EQ(halves[1], 0xFFFFFFFFu);
}

TEST_F(SampleQueries, SizeAndPropertiesNarrowTheSampleAndPositionDoesNot) {
    ncfUInt64 out = 0;
    ncfUInt32 dependencies = 0;
    for (const ncfUInt64 sample :
         {ncfUInt64{0x7FFFFFFF}, ncfUInt64{0x100000004}, ncfUInt64{0xFFFFFFFF}}) {
        interface->GetSampleSize(1, sample, &out);
        interface->GetSampleProperties(1, sample, &out, &dependencies);
        interface->GetSamplePosition(1, sample, &out);
    }
    EXPECT_EQ(journal.lines(),
              (Lines{"clip.GetDataSizePerSample 8 -2147483648", "clip.GetSampleFlags 8 -2147483648",
                     "clip.GetDataOffset 8 2147483648", "clip.GetDataSizePerSample 8 5",
                     "clip.GetSampleFlags 8 5", "clip.GetDataOffset 8 4294967301",
                     "clip.GetDataSizePerSample 8 0", "clip.GetSampleFlags 8 0",
                     "clip.GetDataOffset 8 4294967296"}));
}

TEST_F(SampleQueries, PositionIsWrittenOnSuccessOnly) {
    ncfUInt64 out = 77;
    EXPECT_EQ(interface->GetSamplePosition(0, 2, &out), NCF_OK);
    EXPECT_EQ(out, 8000u);
    clip->results = {{"GetDataOffset", NCF_E_NOTFOUND}, {"GetDataSizePerSample", NCF_E_HANDLE}};
    EXPECT_EQ(interface->GetSamplePosition(0, 2, &out), NCF_E_NOTFOUND);
    EXPECT_EQ(interface->GetSampleSize(0, 2, &out), NCF_E_HANDLE);
    EXPECT_EQ(out, 8000u);
    EXPECT_TRUE(log->once(Record("8000000c",
                                 "media_->GetDataOffset(trackQT, sample + 1, &tmpPositionInBytes)",
                                 "GetSamplePosition")));
    EXPECT_TRUE(log->once(Record("80000006",
                                 "media_->GetDataSizePerSample(trackQT, (long)sample + 1, "
                                 "(ncfUInt32*)sizeInBytesPtr)",
                                 "GetSampleSize")));
}

TEST_F(SampleQueries, PropertiesFollowTheKindOfSample) {
    struct Row {
        ncfUInt32 kind;
        ncfUInt64 flags;
        ncfUInt32 dependencies;
    };
    for (const Row& row : {Row{1, 1024, 0}, Row{2, 4096, 2}, Row{3, 2048, 1}}) {
        Picture().flags = row.kind;
        ncfUInt64 flags = 77;
        ncfUInt32 dependencies = 77;
        EXPECT_EQ(interface->GetSampleProperties(0, 0, &flags, &dependencies), NCF_OK);
        EXPECT_EQ(flags, row.flags);
        EXPECT_EQ(dependencies, row.dependencies);
    }
}

TEST_F(SampleQueries, UnknownKindOfSampleFailsSilentlyAndWritesNothing) {
    ncfUInt64 flags = 77;
    ncfUInt32 dependencies = 77;
    for (const ncfUInt32 kind : {0u, 4u, 0xFFFFFFFFu}) {
        Picture().flags = kind;
        EXPECT_EQ(interface->GetSampleProperties(0, 0, &flags, &dependencies), NCF_E_FAIL);
    }
    EXPECT_EQ(flags, 77u);
    EXPECT_EQ(dependencies, 77u);
    EXPECT_TRUE(log->records().empty());
    clip->results["GetSampleFlags"] = NCF_E_ABORT;
    EXPECT_EQ(interface->GetSampleProperties(0, 0, &flags, &dependencies), NCF_E_ABORT);
    EXPECT_TRUE(log->once(Record("80000007",
                                 "media_->GetSampleFlags(trackQT, (long)sample + 1, &sampleFlags)",
                                 "GetSampleProperties")));
}

// --- runs -----------------------------------------------------------------------------------

TEST_F(SampleQueries, EveryPictureIsARunOfItsOwn) {
    ncfSInt64 run = 77;
    Picture().next = 4;
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(0, 2, &run), NCF_OK);
    EXPECT_EQ(run, 1);
    EXPECT_EQ(journal.lines(), Lines{"clip.GetTrackType"});
}

TEST_F(SampleQueries, RunOfSoundEndsBeforeTheNextChange) {
    ncfSInt64 run = 77;
    Sound().next = 8;
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 2, &run), NCF_OK);
    EXPECT_EQ(run, 5);
    EXPECT_EQ(journal.lines().back(), "clip.GetNextDiscontiguousDataAttributeChange 8 3");
}

TEST_F(SampleQueries, RunThatEndsAtTheSampleIsMinusOneWithSuccess) {
    ncfSInt64 run = 77;
    Sound().next = 4;
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 4, &run), NCF_OK);
    EXPECT_EQ(run, -1);
}

TEST_F(SampleQueries, RunThatEndsBeforeTheSampleIsUnexpected) {
    ncfSInt64 run = 77;
    ncfUInt64 bytes = 77;
    Sound().next = 3;
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 4, &run), NCF_E_UNEXPECTED);
    EXPECT_EQ(run, -2) << "the count is out before the end is looked at";
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 4, &bytes), NCF_E_UNEXPECTED);
    EXPECT_EQ(bytes, 77u);
    EXPECT_TRUE(log->records().empty());
}

TEST_F(SampleQueries, EndIsComparedWithASign) {
    ncfSInt64 run = 77;
    Sound().next = 0xFFFFFFFFFFFFFFFF;  // -1, below every sample
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 0, &run), NCF_E_UNEXPECTED);
    ncfUInt64 bytes = 77;
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 0, &bytes), NCF_E_UNEXPECTED);
    EXPECT_EQ(bytes, 77u);
}

TEST_F(SampleQueries, FailedWalkGivesOneSampleAtTheStartAndNoneLater) {
    Sound().nextResult = NCF_E_ABORT;
    ncfSInt64 run = 77;
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 0, &run), NCF_OK);
    EXPECT_EQ(run, 1);
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 3, &run), NCF_OK);
    EXPECT_EQ(run, 0);
    EXPECT_TRUE(log->records().empty()) << "this failure is not told";
    ncfUInt64 bytes = 77;
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 0, &bytes), NCF_E_ABORT);
    EXPECT_TRUE(
        log->once(Record("80000007",
                         "media_->GetNextDiscontiguousDataAttributeChange(trackQT, sample + "
                         "1, &lastSample)",
                         "GetNumberOfContiguousBytes")));
}

TEST_F(SampleQueries, FailedWalkThatToldAnEndIsStillOneSampleAndComparedWithIt) {
    ncfSInt64 run = 77;
    Sound().next = 8;
    for (const NCFRESULT answer : {NCF_E_ABORT, NCFRESULT{1}}) {
        Sound().nextResult = answer;
        EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 2, &run), NCF_OK);
        EXPECT_EQ(run, 1) << "only zero counts as found";
        EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 9, &run), NCF_E_UNEXPECTED);
        EXPECT_EQ(run, 1);
    }
}

TEST_F(SampleQueries, WalkThatSucceedsWithoutAnEndGivesNone) {
    Sound().next = 0;
    ncfSInt64 run = 77;
    ncfUInt64 bytes = 77;
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 0, &run), NCF_OK);
    EXPECT_EQ(run, -1) << "0 is not below sample 0";
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 3, &run), NCF_OK);
    EXPECT_EQ(run, 0);
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 3, &bytes), NCF_OK);
    EXPECT_EQ(bytes, 0u);
}

TEST_F(SampleQueries, RunNeedsTheKindOfTrack) {
    clip->results["GetTrackType"] = NCF_E_NOTFOUND;
    ncfSInt64 run = 77;
    EXPECT_EQ(interface->GetNumberOfContiguousSamples(1, 0, &run), NCF_E_NOTFOUND);
    EXPECT_EQ(run, 77);
    EXPECT_TRUE(log->once(Record("8000000c", "media_->GetTrackType(trackQT, &trackType)",
                                 "GetNumberOfContiguousSamples")));
}

TEST_F(SampleQueries, BytesOfARunReachFromItsFirstToTheEndOfItsLastSample) {
    Sound().next = 6;
    ncfUInt64 bytes = 0;
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 1, &bytes), NCF_OK);
    // Samples 2 to 5 of the clip: positions 7000 and 10000, the last one 105 long.
    EXPECT_EQ(bytes, 3105u);
    EXPECT_EQ(journal.lines(),
              (Lines{"clip.GetNextDiscontiguousDataAttributeChange 8 2", "clip.GetDataOffset 8 2",
                     "clip.GetDataOffset 8 5", "clip.GetDataSizePerSample 8 5"}));
}

TEST_F(SampleQueries, BytesOfAPictureRunAreCountedLikeSound) {
    Picture().next = 3;
    ncfUInt64 bytes = 0;
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(0, 0, &bytes), NCF_OK);
    EXPECT_EQ(bytes, 1102u);
}

TEST_F(SampleQueries, BytesNarrowTheLastSample) {
    Sound().next = 0x100000006;
    ncfUInt64 bytes = 0;
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 0, &bytes), NCF_OK);
    EXPECT_EQ(journal.lines()[2], "clip.GetDataOffset 8 4294967301");
    EXPECT_EQ(journal.lines()[3], "clip.GetDataSizePerSample 8 5");
}

TEST_F(SampleQueries, BytesOfARunThatEndsAtTheSampleAreCountedBackwards) {
    Sound().next = 4;
    ncfUInt64 bytes = 0;
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 4, &bytes), NCF_OK);
    // From sample 5 of the clip at 10000 back to sample 3 at 8000, 103 long.
    EXPECT_EQ(static_cast<ncfSInt64>(bytes), -1897);
    // An end of zero is not below sample 0 either.
    Sound().next = 0;
    journal.clear();
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 0, &bytes), NCF_OK);
    EXPECT_EQ(journal.lines(),
              (Lines{"clip.GetNextDiscontiguousDataAttributeChange 8 1", "clip.GetDataOffset 8 1",
                     "clip.GetDataOffset 8 -1", "clip.GetDataSizePerSample 8 -1"}));
}

TEST_F(SampleQueries, BytesGiveTheFailureOfEachCall) {
    Sound().next = 6;
    ncfUInt64 bytes = 77;
    clip->results = {{"GetDataOffset", NCF_E_ABORT}};
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 1, &bytes), NCF_E_ABORT);
    clip->results = {{"GetDataOffset 8 5", NCF_E_NOTFOUND}};
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 1, &bytes), NCF_E_NOTFOUND);
    EXPECT_TRUE(log->once(Record("8000000c",
                                 "media_->GetDataOffset(trackQT, lastSample - 1, &lastPosition)",
                                 "GetNumberOfContiguousBytes")));
    clip->results = {{"GetDataSizePerSample", NCF_E_HANDLE}};
    EXPECT_EQ(interface->GetNumberOfContiguousBytes(1, 1, &bytes), NCF_E_HANDLE);
    EXPECT_EQ(bytes, 77u);
    EXPECT_TRUE(
        log->once(Record("80000007", "media_->GetDataOffset(trackQT, sample + 1, &startPosition)",
                         "GetNumberOfContiguousBytes")));
    EXPECT_TRUE(log->once(
        Record("80000006", "media_->GetDataSizePerSample(trackQT, (long)lastSample-1, &lastSize)",
               "GetNumberOfContiguousBytes")));
}

// --- units ------------------------------------------------------------------------------------

TEST_F(SampleQueries, UnitIsOneSampleOfAnyTrack) {
    ncfUInt64 out = 0;
    EXPECT_EQ(interface->GetEncodedUnitSizeInSamples(99, 5, &out), NCF_OK);
    EXPECT_EQ(out, 1u);
    EXPECT_EQ(interface->GetEncodedUnitFirstSample(99, 5, &out), NCF_OK);
    EXPECT_EQ(out, 5u);
    EXPECT_EQ(interface->GetEncodedUnitContainingSample(99, 6, &out), NCF_OK);
    EXPECT_EQ(out, 6u);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(SampleQueries, UnitsAnswerAsSamplesDo) {
    ncfUInt64 out = 0;
    EXPECT_EQ(interface->GetNumberOfEncodedUnits(1, &out), NCF_OK);
    EXPECT_EQ(out, 10u);
    EXPECT_EQ(interface->GetEncodedUnitPosition(1, 2, &out), NCF_OK);
    EXPECT_EQ(out, 8000u);
    out = 0;
    EXPECT_EQ(interface->GetEncodedUnitSize(1, 2, &out), NCF_OK);
    EXPECT_EQ(out, 103u);
    Sound().next = 8;
    ncfSInt64 run = 0;
    EXPECT_EQ(interface->GetNumberOfContiguousEncodedUnits(1, 2, &run), NCF_OK);
    EXPECT_EQ(run, 5);
    RecordingNMALog lines;
    EXPECT_EQ(interface->GetEncodedUnitStride(1, 2, &out), NCF_E_NOTIMPL);
    ASSERT_EQ(lines.lines().size(), 1u);
    EXPECT_EQ(lines.lines()[0].text, "QuickTimeSampleMapping::GetSampleStride: Not Implemented");
}

// A mapping with sample operations of its own.
struct OwnSamples final : NMA::Impl::QuickTimeSampleMapping {
    using QuickTimeSampleMapping::QuickTimeSampleMapping;
    NCFRESULT GetNumberOfSamples(ncfUInt32, ncfUInt64*) override { return 101; }
    NCFRESULT GetSampleStride(ncfUInt32, ncfUInt64, ncfUInt64*) override { return 102; }
    NCFRESULT GetSamplePosition(ncfUInt32, ncfUInt64, ncfUInt64*) override { return 103; }
    NCFRESULT GetSampleSize(ncfUInt32, ncfUInt64, ncfUInt64*) override { return 104; }
    NCFRESULT GetNumberOfContiguousSamples(ncfUInt32, ncfUInt64, ncfSInt64*) override {
        return 105;
    }
};

TEST_F(SampleQueries, UnitsGoThroughTheInterface) {
    OwnSamples own(nullptr);
    EXPECT_EQ(own.GetNumberOfEncodedUnits(0, nullptr), 101);
    EXPECT_EQ(own.GetEncodedUnitStride(0, 0, nullptr), 102);
    EXPECT_EQ(own.GetEncodedUnitPosition(0, 0, nullptr), 103);
    EXPECT_EQ(own.GetEncodedUnitSize(0, 0, nullptr), 104);
    EXPECT_EQ(own.GetNumberOfContiguousEncodedUnits(0, 0, nullptr), 105);
}

// --- refused --------------------------------------------------------------------------------

TEST_F(SampleQueries, TellsTheProcessLoggerWhatIsNotImplemented) {
    RecordingNMALog lines;
    EXPECT_EQ(interface->GetSampleStride(0, 0, nullptr), NCF_E_NOTIMPL);
    EXPECT_EQ(interface->GetSampleDependency(0, 0, 0, nullptr), NCF_E_NOTIMPL);
    EXPECT_EQ(interface->RegisterSampleRangeHint(0, 0, 0), NCF_E_NOTIMPL);
    EXPECT_EQ(interface->UnregisterSampleRangeHint(0, 0, 0), NCF_E_NOTIMPL);
    EXPECT_EQ(interface->SetStorageCallback(nullptr), NCF_E_NOTIMPL);
    std::vector<std::string> texts;
    for (const auto& line : lines.lines()) {
        EXPECT_EQ(line.level, 8u);
        texts.push_back(line.text);
    }
    EXPECT_EQ(texts, (Lines{"QuickTimeSampleMapping::GetSampleStride: Not Implemented",
                            "QuickTimeSampleMapping::GetSampleDependency: Not Implemented",
                            "QuickTimeSampleMapping::RegisterSampleRangeHint: Not Implemented",
                            "QuickTimeSampleMapping::UnregisterSampleRangeHint: Not Implemented",
                            "QuickTimeSampleMapping::SetStorageCallback: Not Implemented"}));
    EXPECT_TRUE(host->console().lines().empty());
}

}  // namespace
