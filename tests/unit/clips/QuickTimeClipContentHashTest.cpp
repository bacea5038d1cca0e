// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The bytes that give a movie its identity.

#include "tests/unit/clips/ClipFixture.h"

namespace {

using Bytes = ByteVector;

class QuickTimeClipContentHash : public ClipTest {
protected:
    QuickTimeClipContentHash() : QuickTimeClipContentHash(9000) {}
    explicit QuickTimeClipContentHash(std::size_t size) : ClipTest(CountingBytes(size)) {
        whole = CountingBytes(size);
        parser->headerPosition = 100;
        parser->headerSize = 300;
        parser->AddVideoTrack(1);
        SetChunk(Video(), 2000, 50);
    }
    template <class Track>
    void SetChunk(Track& track, ncfUInt64 position, ncfUInt64 size) {
        track.table->chunkPosition = position;
        track.table->chunkSize = size;
    }
    Bytes Part(std::size_t position, std::size_t size) const {
        return Bytes(whole.begin() + static_cast<std::ptrdiff_t>(position),
                     whole.begin() + static_cast<std::ptrdiff_t>(position + size));
    }
    static Bytes Joined(Bytes left, const Bytes& right) {
        left.insert(left.end(), right.begin(), right.end());
        return left;
    }
    NCFRESULT Ask() {
        content.assign(3, 0xEE);
        return clip->GetContentForHash(content);
    }

    std::vector<ncfUInt8> whole;
    Bytes content;
};

class QuickTimeClipContentHashOfLargeFile : public QuickTimeClipContentHash {
protected:
    QuickTimeClipContentHashOfLargeFile() : QuickTimeClipContentHash(3200000) {}
};

}  // namespace

TEST_F(QuickTimeClipContentHash, TakesTheHeaderThenAChunkOfEachTrack) {
    SetChunk(*parser->AddOtherTrack(4), 5000, 10);
    SetChunk(*parser->AddTimecodeTrack(3), 4000, 4);
    SetChunk(*parser->AddAudioTrack(2), 3000, 20);
    Load();
    ASSERT_EQ(Ask(), NCF_OK);
    Bytes expected = Part(100, 300);
    for (const Bytes& chunk : {Part(2000, 50), Part(3000, 20), Part(4000, 4), Part(5000, 10)}) {
        expected = Joined(expected, chunk);
    }
    EXPECT_EQ(content, expected);
}

TEST_F(QuickTimeClipContentHash, TakesEveryTrackOfEachKind) {
    SetChunk(*parser->AddVideoTrack(11), 2100, 7);
    SetChunk(*parser->AddAudioTrack(2), 3000, 20);
    SetChunk(*parser->AddAudioTrack(12), 3100, 8);
    SetChunk(*parser->AddTimecodeTrack(3), 4000, 4);
    SetChunk(*parser->AddTimecodeTrack(13), 4100, 5);
    SetChunk(*parser->AddOtherTrack(4), 5000, 10);
    SetChunk(*parser->AddOtherTrack(14), 5100, 6);
    Load();
    ASSERT_EQ(Ask(), NCF_OK);
    Bytes expected = Part(100, 300);
    for (const Bytes& chunk : {Part(2000, 50), Part(2100, 7), Part(3000, 20), Part(3100, 8),
                               Part(4000, 4), Part(4100, 5), Part(5000, 10), Part(5100, 6)}) {
        expected = Joined(expected, chunk);
    }
    EXPECT_EQ(content, expected);
}

TEST_F(QuickTimeClipContentHash, RestsOnTheHeaderAloneWithExternalMedia) {
    parser->selfContained = 0;
    Load();
    ASSERT_EQ(Ask(), NCF_OK);
    EXPECT_EQ(content, Part(100, 300));
}

TEST_F(QuickTimeClipContentHash, SkipsATrackWithoutSamples) {
    SetChunk(*parser->AddAudioTrack(2), 3000, 20);
    Video().table->numSamples = 0;
    Load();
    journal.clear();
    ASSERT_EQ(Ask(), NCF_OK);
    EXPECT_EQ(content, Joined(Part(100, 300), Part(3000, 20)));
    EXPECT_EQ(journal.count("video 1 table.GetChunkFromTheMiddle"), 0);
}

TEST_F(QuickTimeClipContentHash, AddsNothingForAnEmptyChunk) {
    SetChunk(Video(), 2000, 0);
    Load();
    ASSERT_EQ(Ask(), NCF_OK);
    EXPECT_EQ(content, Part(100, 300));
}

TEST_F(QuickTimeClipContentHashOfLargeFile, TakesTheFirstMebibyteOfALargeChunk) {
    SetChunk(Video(), 1000, 3000000);
    Load();
    ASSERT_EQ(Ask(), NCF_OK);
    EXPECT_EQ(content, Joined(Part(100, 300), Part(1000, 1048576)));
}

TEST_F(QuickTimeClipContentHash, ReadsFromSampleOneWhenTheChunkIsCutOff) {
    SetChunk(Video(), 8990, 11);  // one byte too many
    Video().table->dataOffset = 700;
    Load();
    ASSERT_EQ(Ask(), NCF_OK);
    EXPECT_EQ(content, Joined(Part(100, 300), Part(700, 11)));
    EXPECT_EQ(Video().table->lastArgument, 1u);
}

TEST_F(QuickTimeClipContentHash, ReadsAChunkThatEndsWithTheFile) {
    SetChunk(Video(), 8990, 10);
    Load();
    ASSERT_EQ(Ask(), NCF_OK);
    EXPECT_EQ(content, Joined(Part(100, 300), Part(8990, 10)));
}

TEST_F(QuickTimeClipContentHash, StaysWithTheChunkWhenSampleOneCannotBeAsked) {
    SetChunk(Video(), 90000, 10);
    Video().table->results["GetDataOffset"] = NCF_E_FAIL;
    RecordingNMALog lines(1);
    Load();
    EXPECT_EQ(Ask(), NMA_E_NODATA) << "the read behind the end";
    EXPECT_TRUE(log->returned("a000006f", "file_reader.Read(offset, &local[0], size, &actualRead)",
                              "QuickTimeClip::GetContentForHash"));
    EXPECT_EQ(content, Part(100, 300)) << "what was gathered so far";
}

TEST_F(QuickTimeClipContentHash, DoesNotWrapAroundTheEndOfNumbers) {
    SetChunk(Video(), 0xFFFFFFFFFFFFFFF0ull, 0x20);
    Video().table->dataOffset = 40;
    Load();
    ASSERT_EQ(Ask(), NCF_OK);
    EXPECT_EQ(content, Joined(Part(100, 300), Part(40, 0x20)));
}

TEST_F(QuickTimeClipContentHash, RefusesAHeaderThatTheFileCannotFill) {
    RecordingNMALog lines(1);
    parser->headerPosition = 0;
    parser->headerSize = 9001;
    Load();
    log->clear();
    EXPECT_EQ(Ask(), NCF_E_FAIL);
    EXPECT_TRUE(content.empty());
    EXPECT_TRUE(log->records().empty()) << "no line of its own";
    parser->headerSize = 0x100000000ull;
    EXPECT_EQ(Ask(), NCF_E_FAIL) << "longer than a read";
}

TEST_F(QuickTimeClipContentHash, GathersInOrder) {
    parser->AddAudioTrack(2);
    Load();
    journal.clear();
    ASSERT_EQ(Ask(), NCF_OK);
    EXPECT_EQ(
        journal.lines(),
        (std::vector<std::string>{
            "parser.GetMOOVAtom", "parser.GetVideoTrackCount", "parser.GetVideoTrackInfo",
            "parser.GetAudioTrackCount", "parser.GetAudioTrackInfo", "parser.GetTimeCodeTrackCount",
            "parser.GetOtherTrackCount", "parser.IsMovieSelfContained", "video 1.GetSampleTable",
            "video 1 table.GetNumSamples", "video 1 table.GetChunkFromTheMiddle",
            "audio 2.GetSampleTable", "audio 2 table.GetNumSamples",
            "audio 2 table.GetChunkFromTheMiddle"}));
}

TEST_F(QuickTimeClipContentHash, StopsAtEveryFailure) {
    SetChunk(*parser->AddAudioTrack(2), 3000, 20);
    parser->AddTimecodeTrack(3);
    parser->AddOtherTrack(4);
    Load();
    struct {
        FakeCalls* calls;
        const char* operation;
        const char* expression;
    } const kSteps[] = {
        {parser, "GetMOOVAtom", "qtParser_->GetMOOVAtom(&offset, &size)"},
        {parser, "GetVideoTrackCount", "qtParser_->GetVideoTrackCount(&trackCount)"},
        {parser, "GetVideoTrackInfo", "qtParser_->GetVideoTrackInfo(i, &pVideoTrack)"},
        {parser, "GetAudioTrackCount", "qtParser_->GetAudioTrackCount(&trackCount)"},
        {parser, "GetAudioTrackInfo", "qtParser_->GetAudioTrackInfo(i, &pAudioTrack)"},
        {parser, "GetTimeCodeTrackCount", "qtParser_->GetTimeCodeTrackCount(&trackCount)"},
        {parser, "GetTimeCodeTrackInfo", "qtParser_->GetTimeCodeTrackInfo(i, &pTrack)"},
        {parser, "GetOtherTrackCount", "qtParser_->GetOtherTrackCount(&trackCount)"},
        {parser, "GetOtherTrackInfo", "qtParser_->GetOtherTrackInfo(i, &pTrack)"},
        {parser, "IsMovieSelfContained", "qtParser_->IsMovieSelfContained(&isSelfContained)"},
        {parser->audioTracks[0], "GetSampleTable", "tracks[i]->GetSampleTable(&pTable)"},
        {parser->audioTracks[0]->table, "GetNumSamples", "pTable->GetNumSamples(&numSamples)"},
        {parser->audioTracks[0]->table, "GetChunkFromTheMiddle",
         "pTable->GetChunkFromTheMiddle(&offset, &size)"},
    };
    for (const auto& step : kSteps) {
        step.calls->results[step.operation] = NCF_E_ABORT;
        log->clear();
        EXPECT_EQ(Ask(), NCF_E_ABORT) << step.operation;
        EXPECT_TRUE(log->returned("80000007", step.expression, "QuickTimeClip::GetContentForHash"))
            << step.operation;
        step.calls->results.clear();
    }
    EXPECT_EQ(Ask(), NCF_OK);
}

TEST_F(QuickTimeClipContentHash, StopsAtATrackWithoutItsCommonInterface) {
    parser->AddAudioTrack(2);
    Load();
    struct {
        FakeCalls* track;
        const char* expression;
    } const kTracks[] = {
        {&Video(), "pVideoTrack->QueryInterface(IID_ITrackInfo, (void**)pTrack.outArg())"},
        {parser->audioTracks[0],
         "pAudioTrack->QueryInterface(IID_ITrackInfo, (void**)pTrack.outArg())"}};
    for (const auto& step : kTracks) {
        step.track->results["QueryInterface"] = NCF_E_NOINTERFACE;
        log->clear();
        EXPECT_EQ(Ask(), NCF_E_NOINTERFACE);
        ASSERT_EQ(log->records().size(), 1u);
        EXPECT_NE(log->records()[0].text.find(step.expression), std::string::npos);
        EXPECT_EQ(content, Part(100, 300)) << "what was gathered so far";
        step.track->results.clear();
    }
}

TEST_F(QuickTimeClipContentHash, AFileThatIsGoneIsThrown) {
    Load();
    RecordingNMALog lines(1);
    std::filesystem::remove(std::filesystem::u8path(file.path()));
    try {
        Ask();
        ADD_FAILURE() << "nothing was thrown";
    } catch (NCFRESULT thrown) {
        EXPECT_EQ(thrown, NCF_E_HANDLE);
    }
    EXPECT_TRUE(content.empty());
}

TEST_F(QuickTimeClipContentHash, GivesCopiesOfAMovieOneIdentity) {
    Load();
    ASSERT_EQ(Ask(), NCF_OK);
    const Bytes first = content;
    std::vector<ncfUInt8> changed = whole;
    changed[8000] ^= 0xFF;  // outside header and chunk
    const TempFile copy(changed, "copy.mov");
    NCFSmartPtr<INCFConsole> console(&host->console());
    NCFSmartPtr<INCFComponentFactory> factory(host->factory());
    clip.reset(new QuickTimeClip(HostText(copy.path()), console, factory));
    ASSERT_EQ(Ask(), NCF_OK);
    EXPECT_EQ(content, first);
}
