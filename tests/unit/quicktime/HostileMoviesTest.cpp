// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <random>

#include "tests/unit/quicktime/MadeMovie.h"

using namespace quicktime_tests;

namespace {

// Asks everything of a file; only that it comes back is expected.
void AskEverything(const std::filesystem::path& path) {
    const auto wrapper = OpenWrapper(path);
    if (!wrapper) {
        return;
    }
    ncfSInt32 num = 0, den = 0;
    ncfUInt64 length = 0;
    wrapper->DetermineMovieEditRateAndLength(0, 25, 0, &num, &den, &length, nullptr, 0, 1);
    ncfBool a = 0, b = 0;
    wrapper->MovieTrackDurationIssues(25, 1, 10, &a, &b);
    wrapper->MovieContainsAlpha(QTWrapper::kAlphaCheckForQTNMA, &a);
    host::Ref<QTWrapper::IQTVideoReader> video;
    if (wrapper->GetQTVideoReader(video.Out()) == NCF_OK && video->InitQT(0) == NCF_OK) {
        video->SetOutputPixelFormat(Code("2vuy"), 0, 0);
        if (video->GetFrameBufferSize(0xFFFFFFFF, 0, 0) < (1u << 24)) {
            for (const ncfUInt64 number : {0u, 9u, 3u, 20u}) {
                Picture(*video, number);
            }
        }
    }
    host::Ref<QTWrapper::IQTAudioReader> audio;
    wrapper->GetQTAudioReader(audio.Out());
    host::Ref<QTWrapper::IQTWSampleTable> table;
    wrapper->GetSampleTable(table.Out());
    for (ncfUInt32 track = 1; track <= wrapper->GetNumberOfTracks() && track < 10; ++track) {
        ncfUInt32 channels = 0;
        if (audio && audio->SetParams(track, 3, 1, 48000.0, channels) == NCF_OK) {
            Bytes room(3000);
            ncfUInt64 count = 100;
            audio->ReadSamples(track, 500, &count, room.data(), room.size(), 0, 0);
        }
        ncfUInt64 next = 0;
        table->GetNextDiscontiguousDataAttributeChange(track, 1, &next);
        table->GetMaxDataSize(track);
    }
}

Bytes SmallMovie() {
    return MadeMovie(
               "-f lavfi -i testsrc2=s=64x48:r=25:d=0.4 -f lavfi -i sine=d=0.4 -c:v mpeg4 -bf 2 "
               "-c:a pcm_s16le -timecode 01:00:00:00 -movflags +faststart")
        .Content();
}

TEST(HostileMovies, CutAnywhereComeBack) {
    NEEDS_FFMPEG();
    const Bytes whole = SmallMovie();
    for (std::size_t size = 0; size < whole.size(); size += 97) {
        const MadeMovie cut(Bytes(whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(size)),
                            ".mov");
        AskEverything(cut.Path());
    }
}

TEST(HostileMovies, WithBitsTurnedComeBack) {
    NEEDS_FFMPEG();
    const Bytes whole = SmallMovie();
    std::mt19937 random(11);
    for (int i = 0; i < 150; ++i) {
        Bytes broken = whole;
        for (int turn = 0; turn < 4; ++turn) {
            // Half of them within the headers, which come first.
            const std::size_t range = turn % 2 == 0 ? 3000 : broken.size();
            broken[random() % std::min(range, broken.size())] ^=
                static_cast<std::uint8_t>(1u << random() % 8);
        }
        SCOPED_TRACE(i);
        AskEverything(MadeMovie(broken, ".mov").Path());
    }
}

TEST(HostileMovies, FilesOfNothingAreRefused) {
    for (const char* text : {"", "x", "not a movie at all, only words", "{\"a\": 1}"}) {
        const std::string content = text;
        const MadeMovie file(Bytes(content.begin(), content.end()), ".mov");
        EXPECT_FALSE(OpenWrapper(file.Path())) << text;
    }
}

// A list of other files reaches none of them.
TEST(HostileMovies, ListsReachNoOtherFiles) {
    const std::string list = "ffconcat version 1.0\nfile 'http://127.0.0.1:9/a.mov'\n";
    const MadeMovie file(Bytes(list.begin(), list.end()), ".ffconcat");
    AskEverything(file.Path());
    const auto wrapper = OpenWrapper(file.Path());
    EXPECT_TRUE(!wrapper || wrapper->GetNumberOfTracks() == 0);
}

}  // namespace
