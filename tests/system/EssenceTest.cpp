// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Sample maps, through the module: where samples lie, in which order they are
// shown, and that two maps of one clip do not disturb each other. What is
// expected comes from ffprobe.

#include <algorithm>
#include <numeric>

#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/SampleMap.h"
#include "tests/system/EssenceSupport.h"
#include "tests/system/SystemTest.h"

namespace {

using cliphost::ClipTrack;
using cliphost::Essence;
using cliphost::FrameReader;
using cliphost::MappedSample;
using cliphost::TrackKind;

class EssenceMap : public SystemTest {
protected:
    std::vector<MappedSample> Samples(Essence& essence, ncfUInt32 track) {
        ncfUInt64 count = 0;
        EXPECT_EQ(essence.map().GetNumberOfSamples(track, &count), NCF_OK);
        std::vector<MappedSample> samples(static_cast<std::size_t>(count));
        for (std::size_t i = 0; i < samples.size(); ++i) {
            EXPECT_EQ(cliphost::ReadMappedSample(essence.map(), track, i, samples[i]), NCF_OK) << i;
        }
        return samples;
    }
};

constexpr const char* kPictures[] = {"h264_bframes.mov",
                                     "h264_with_aac.mov",
                                     "h264_header_first.mov",
                                     "h264_mp4_header_last.mp4",
                                     "xdcam_ex_1080i50.mov",
                                     "mpeg2.mov",
                                     "mpeg4.mov",
                                     "prores_with_pcm.mov",
                                     "dv_pal.mov",
                                     "imx50_pal.mov",
                                     "mjpeg.mov",
                                     "png_alpha.mov",
                                     "animation.mov",
                                     "v210_720.mov",
                                     "2vuy.mov",
                                     "one_picture.mov",
                                     "three_sounds.mov"};

// Asked sample by sample, the module says what the program works out at once, also
// where pictures are displayed far away or nowhere.
void ExpectOffsetsOfTheModule(Essence& essence) {
    const ClipTrack& track = *essence.First(TrackKind::Picture);
    const auto worked =
        cliphost::WorkOutOffsets(cliphost::DisplayTimesOf(essence.movie(), essence.Which(track)));
    ncfUInt64 count = 0;
    ASSERT_EQ(essence.map().GetNumberOfSamples(track.number, &count), NCF_OK);
    ASSERT_EQ(worked.size(), count);
    for (ncfUInt64 i = 0; i < count; ++i) {
        ASSERT_EQ(worked[i], cliphost::AskOffset(essence.map(), track.number, i)) << i;
    }
}

TEST_F(EssenceMap, FindsTheOffsetsThatTheModuleTellsOneByOne) {
    movies::VideoFormat format;
    format.codec = "mp4v";
    for (const std::int32_t step : {0, 1, 7, 450, 1001, -333}) {
        SCOPED_TRACE(step);
        movies::Movie movie;
        movie.tracks.push_back(movies::VideoTrack(format, 0, 25000, 1000, 10));
        for (std::int32_t i = 0; i < 300; ++i) {
            movies::SampleRun run;
            run.size = 10;
            run.duration = i % 50 == 3 ? 900 : 1000;
            run.displayOffset = (i * 37 % 11) * 1000 + i * step;
            movie.tracks[0].samples.push_back(run);
        }
        movie.tracks[0].offsetVersion = 1;
        Essence essence(session(), Write(movie, std::to_string(step) + ".mov"));
        ExpectOffsetsOfTheModule(essence);
    }
}

TEST_F(EssenceMap, FindsTheOffsetsOfMoviesThatTheLibraryReads) {
    const auto movie = Make(
        "-f lavfi -i testsrc2=s=160x90:r=25:d=4 -vf "
        "'setpts=(N+N*N/8)/25/TB' -vsync passthrough -c:v libx264 -bf 3 "
        "-pix_fmt yuv420p -movflags frag_keyframe+empty_moov",
        "fragments.mp4");
    Essence essence(session(), movie);
    ExpectOffsetsOfTheModule(essence);
}

TEST_F(EssenceMap, TellsWhereEveryPictureLies) {
    for (const char* const name : kPictures) {
        SCOPED_TRACE(name);
        Essence essence(session(), MadeMovie(name));
        const auto samples = Samples(essence, 0);
        const auto packets = PacketsOf(MadeMovie(name), "v:0");
        ASSERT_FALSE(packets.empty());
        ASSERT_EQ(samples.size(), packets.size());
        for (std::size_t i = 0; i < samples.size(); ++i) {
            EXPECT_EQ(samples[i].position, packets[i].position) << i;
            EXPECT_EQ(samples[i].size, packets[i].size) << i;
            EXPECT_EQ(samples[i].properties == 1024, packets[i].isKey) << i;
            EXPECT_EQ(samples[i].contiguousSamples, 1) << i;
        }
    }
}

// At place i in the order of decoding stands one picture, at place i of the
// display another: how many steps lie between them.
TEST_F(EssenceMap, TellsHowFarThePictureLiesThatIsShownAtAPlace) {
    for (const char* const name : kPictures) {
        SCOPED_TRACE(name);
        Essence essence(session(), MadeMovie(name));
        const auto samples = Samples(essence, 0);
        const auto packets = PacketsOf(MadeMovie(name), "v:0");
        ASSERT_EQ(samples.size(), packets.size());
        std::vector<std::size_t> shown(packets.size());
        std::iota(shown.begin(), shown.end(), 0);
        std::stable_sort(shown.begin(), shown.end(), [&](std::size_t a, std::size_t b) {
            return packets[a].time < packets[b].time;
        });
        for (std::size_t i = 0; i < samples.size(); ++i) {
            ASSERT_TRUE(samples[i].temporalOffset.has_value()) << i;
            EXPECT_EQ(*samples[i].temporalOffset,
                      static_cast<std::int64_t>(shown[i]) - static_cast<std::int64_t>(i))
                << i;
        }
    }
}

TEST_F(EssenceMap, OfCompressedSoundIsThatOfItsPackets) {
    for (const char* const name : {"aac.mov", "aac.m4a", "alac.mov"}) {
        SCOPED_TRACE(name);
        Essence essence(session(), MadeMovie(name));
        const auto samples = Samples(essence, 0);
        const auto packets = PacketsOf(MadeMovie(name), "a:0");
        ASSERT_FALSE(packets.empty());
        ASSERT_EQ(samples.size(), packets.size());
        for (std::size_t i = 0; i < samples.size(); ++i) {
            EXPECT_EQ(samples[i].position, packets[i].position) << i;
            EXPECT_EQ(samples[i].size, packets[i].size) << i;
        }
    }
}

// A sample of PCM is one of each channel; ffprobe gives many in a packet.
TEST_F(EssenceMap, OfPcmHoldsThePacketsOneBehindTheOther) {
    struct Sound {
        const char* name;
        ncfUInt32 track;
        const char* stream;
    };
    for (const Sound& sound :
         {Sound{"prores_with_pcm.mov", 1, "a:0"}, Sound{"three_sounds.mov", 1, "a:0"},
          Sound{"three_sounds.mov", 3, "a:2"}, Sound{"pcm_s24le.mov", 0, "a:0"}}) {
        SCOPED_TRACE(std::string(sound.name) + " " + sound.stream);
        const auto movie = MadeMovie(sound.name);
        Essence essence(session(), movie);
        const auto runs =
            cliphost::ReadRuns(essence.map(), sound.track, std::filesystem::file_size(movie));
        EXPECT_TRUE(runs.faults.empty());
        std::vector<std::pair<std::uint64_t, std::uint64_t>> wanted;  // joined packets
        for (const Packet& packet : PacketsOf(movie, sound.stream)) {
            if (!wanted.empty() && wanted.back().first + wanted.back().second == packet.position) {
                wanted.back().second += packet.size;
            } else {
                wanted.emplace_back(packet.position, packet.size);
            }
        }
        ASSERT_FALSE(wanted.empty());
        ASSERT_EQ(runs.runs.size(), wanted.size());
        std::uint64_t samples = 0;
        for (std::size_t i = 0; i < wanted.size(); ++i) {
            EXPECT_EQ(runs.runs[i].position, wanted[i].first) << i;
            EXPECT_EQ(runs.runs[i].bytes, wanted[i].second) << i;
            samples += runs.runs[i].count;
        }
        EXPECT_EQ(samples, runs.samples);
    }
}

// A header counts sound that is coded in blocks frame by frame, so each frame has
// the place of its block, and all of them are one run here.
TEST_F(EssenceMap, OfBlocksOfSoundHoldsEachBlockOnce) {
    for (const char* const codec : {"adpcm_ima_wav", "adpcm_ms"}) {
        SCOPED_TRACE(codec);
        const auto movie = Make("-f lavfi -i sine=440:d=1 -ac 2 -c:a " + std::string(codec),
                                (std::string(codec) + ".mov"));
        const auto packets = PacketsOf(movie, "a:0");
        ASSERT_GT(packets.size(), 10u);
        Essence essence(session(), movie);
        const auto runs = cliphost::ReadRuns(essence.map(), 0, std::filesystem::file_size(movie));
        EXPECT_TRUE(runs.faults.empty());
        ASSERT_EQ(runs.runs.size(), 1u);
        EXPECT_EQ(runs.runs[0].count, runs.samples);
        EXPECT_EQ(runs.runs[0].position, packets.front().position);
        EXPECT_EQ(runs.bytes, std::accumulate(packets.begin(), packets.end(), std::uint64_t{0},
                                              [](std::uint64_t sum, const Packet& packet) {
                                                  return sum + packet.size;
                                              }));
        const auto inBlock = static_cast<std::uint64_t>(packets[1].time - packets[0].time);
        for (std::size_t i = 0; i < packets.size(); ++i) {
            cliphost::MappedSample sample;
            ASSERT_EQ(cliphost::ReadMappedSample(essence.map(), 0, i * inBlock, sample), NCF_OK);
            EXPECT_EQ(sample.position, packets[i].position) << i;
            EXPECT_EQ(sample.size, packets[i].size) << i;
        }
    }
}

TEST_F(EssenceMap, HasSumsThatAgreeWithTheFileForEveryMovie) {
    int tracks = 0;
    for (const auto& entry : std::filesystem::directory_iterator(MadeMoviesFolder())) {
        if (entry.path().extension() != ".mov") {
            continue;
        }
        SCOPED_TRACE(entry.path());
        Essence essence(session(), entry.path());
        for (const ClipTrack& track : essence.tracks()) {
            const auto runs = cliphost::ReadRuns(essence.map(), track.number, entry.file_size());
            EXPECT_EQ(runs.result, NCF_OK) << track.number;
            EXPECT_EQ(runs.faults, std::vector<std::string>()) << track.number;
            EXPECT_GT(runs.bytes, 0u) << track.number;
            ++tracks;
        }
    }
    EXPECT_GT(tracks, 100);
}

TEST_F(EssenceMap, CountsTheTracksThatTheDescriptionHas) {
    Essence essence(session(), MadeMovie("three_sounds.mov"));
    ASSERT_EQ(essence.tracks().size(), 4u);
    EXPECT_EQ(essence.tracks()[0].kind, TrackKind::Picture);
    EXPECT_EQ(essence.tracks()[0].length, 10u);
    for (ncfUInt32 track = 1; track < 4; ++track) {
        EXPECT_EQ(essence.tracks()[track].kind, TrackKind::Sound);
        EXPECT_EQ(essence.tracks()[track].length, 19200u);
        EXPECT_FALSE(essence.Obstacle(essence.tracks()[track]));
        ncfUInt32 channels = 0;
        EXPECT_EQ(essence.map().GetNumberOfChannels(track, &channels), NCF_OK);
        EXPECT_EQ(channels, track == 1 ? 1u : track == 2 ? 2u : 6u);
    }
}

// Behind a second picture track the sound has another number in the module than
// in the description, so it can't be had; the user is told.
TEST_F(EssenceMap, SaysThatTheSoundBehindASecondPictureCantBeDelivered) {
    const auto movie =
        Make("-i " + Quoted(MadeMovie("mjpeg.mov")) + " -i " + Quoted(MadeMovie("pcm_s16le.mov")) +
                 " -map 0:v -map 0:v -map 1:a -c copy",
             "two_pictures.mov");
    {
        Essence essence(session(), movie);
        ASSERT_EQ(essence.tracks().size(), 2u);
        EXPECT_FALSE(essence.Obstacle(essence.tracks()[0]));
        EXPECT_NE(essence.Obstacle(essence.tracks()[1]).reason.find("more than one picture track"),
                  std::string::npos);
    }
    const CommandResult result =
        RunCliphost("audio " + Quoted(movie) + " -o " + Quoted(folder() / "a.wav"));
    EXPECT_EQ(result.status, 1);
    EXPECT_NE(result.out.find("more than one picture track"), std::string::npos) << result.out;
    EXPECT_FALSE(std::filesystem::exists(folder() / "a.wav"));
}

// Two picture tracks of other sizes and lengths, whose ids do not rise in file
// order. Where the headers are read the first of the file counts, else that of
// the lowest id; all that is said and delivered is of one track.
TEST_F(EssenceMap, IsThatOfThePictureTrackThatIsDescribedAndDelivered) {
    const struct {
        const char* name;
        const char* options;
        std::uint64_t pictures;
        int width;
    } kMovies[] = {{"whole.mov", "", 10, 64},
                   {"fragments.mp4", "-movflags frag_keyframe+empty_moov", 5, 32}};
    for (const auto& each : kMovies) {
        SCOPED_TRACE(each.name);
        const auto movie = Make(
            "-f lavfi -i testsrc2=s=64x48:r=25:d=0.4 "
            "-f lavfi -i testsrc2=s=32x16:r=25:d=0.2 -map 0 -map 1 -c:v mpeg4 "
            "-streamid 0:5 -streamid 1:2 -use_stream_ids_as_track_ids 1 " +
                std::string(each.options),
            each.name);
        Essence essence(session(), movie);
        const ClipTrack& track = essence.Track(std::nullopt, TrackKind::Picture);
        EXPECT_EQ(track.length, each.pictures);
        EXPECT_EQ(track.shape.numerator, each.width == 64 ? 4 : 2);
        const auto packets = PacketsOf(movie, each.width == 64 ? "v:0" : "v:1");
        const auto samples = Samples(essence, track.number);
        ASSERT_EQ(samples.size(), each.pictures);
        ASSERT_EQ(packets.size(), each.pictures);
        for (std::size_t i = 0; i < samples.size(); ++i) {
            EXPECT_EQ(samples[i].position, packets[i].position);
            EXPECT_EQ(samples[i].size, packets[i].size);
        }
        FrameReader reader(essence, track, "2vuy");
        EXPECT_EQ(reader.width(), each.width);
        EXPECT_EQ(reader.Count(), each.pictures);
        EXPECT_GT(SignalToNoise(
                      OneFrame(reader, each.pictures - 1),
                      Decoded(movie, std::string("-map ") + (each.width == 64 ? "0:v:0" : "0:v:1") +
                                         " -vsync 0 -vf 'select=eq(n\\," +
                                         std::to_string(each.pictures - 1) +
                                         ")' -f rawvideo -pix_fmt uyvy422")),
                  30.0);
    }
}

TEST_F(EssenceMap, OfOneClipIsMadeTwiceAndEachServesItsOwnFormat) {
    const auto movie = MadeMovie("prores_with_pcm.mov");
    EssenceBytes wanted2vuy, wantedB64a;
    {
        Essence alone(session(), movie);
        wanted2vuy = AllFrames(alone, TrackKind::Picture, "2vuy");
        wantedB64a = AllFrames(alone, TrackKind::Picture, "b64a");
    }
    host::Ref<NMA::IMediaContainer3> container;
    ASSERT_EQ(cliphost::OpenContainer(session(), movie, container), NCF_OK);
    host::Ref<NMA::ISampleMapping> maps[2];
    host::Ref<NMA::IUncompressedImageProvider> pictures[2];
    host::Ref<NMA::ISampleProvider> providers[2];
    for (ncfUInt32 i = 0; i < 2; ++i) {
        ASSERT_EQ(container->GetSampleMapping(maps[i].Out()), NCF_OK);
        ASSERT_EQ(host::Query(maps[i].get(), pictures[i]), NCF_OK);
        ASSERT_EQ(host::Query(maps[i].get(), providers[i]), NCF_OK);
        ASSERT_EQ(pictures[i]->SetWorkingImageFormat(0, i), NCF_OK);
        ASSERT_EQ(providers[i]->Setup(0), NCF_OK);
    }
    EXPECT_NE(maps[0].get(), maps[1].get());
    // The container ends; the maps hold the clip.
    container.Reset();
    const auto request = host::MakeRef<host::SampleRequest>();
    for (std::size_t frame = 0; frame < 5; ++frame) {
        for (std::size_t i = 0; i < 2; ++i) {
            const EssenceBytes& wanted = i == 0 ? wanted2vuy : wantedB64a;
            request->Ask(0, frame, 1);
            ASSERT_EQ(providers[i]->ProvideSampleRange(request.get(), 0), NCF_OK);
            const auto size = static_cast<std::size_t>(request->buffer().validBytes());
            ASSERT_EQ(size * 5, wanted.size());
            EXPECT_TRUE(std::equal(request->buffer().bytes(), request->buffer().bytes() + size,
                                   wanted.begin() + static_cast<std::ptrdiff_t>(frame * size)))
                << "map " << i << ", frame " << frame;
        }
    }
}

}  // namespace
