// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Movies whose media are damaged or cut: one bad frame is one failure, and everything
// else is delivered.

#include <algorithm>
#include <fstream>
#include <nlohmann/json.hpp>

#include "reference_host/cliphost/SampleMap.h"
#include "reference_host/cliphost/SoundReader.h"
#include "tests/system/EssenceSupport.h"
#include "tests/system/SystemTest.h"

namespace {

using cliphost::Essence;
using cliphost::FrameReader;
using cliphost::MappedSample;
using cliphost::TrackKind;

class EssenceBroken : public SystemTest {
protected:
    // A copy of a movie with the bytes of one stored picture overwritten.
    std::filesystem::path Damaged(const char* name, std::uint64_t sample) {
        const auto movie = MadeMovie(name);
        const auto copy = folder() / (std::string("damaged_") + name);
        std::filesystem::copy_file(movie, copy, std::filesystem::copy_options::overwrite_existing);
        Essence essence(session(), movie);
        MappedSample mapped;
        EXPECT_EQ(cliphost::ReadMappedSample(essence.map(), 0, sample, mapped), NCF_OK);
        std::fstream stream(copy, std::ios::binary | std::ios::in | std::ios::out);
        stream.seekp(static_cast<std::streamoff>(mapped.position));
        const std::string noise(static_cast<std::size_t>(mapped.size), '\x5A');
        stream.write(noise.data(), static_cast<std::streamsize>(noise.size()));
        EXPECT_TRUE(stream.good());
        return copy;
    }
    // A movie whose header comes first, cut to a share of its bytes.
    std::filesystem::path Cut(const std::filesystem::path& movie, double share) {
        const auto copy = folder() / ("cut_" + movie.filename().string());
        std::filesystem::copy_file(movie, copy, std::filesystem::copy_options::overwrite_existing);
        const auto size = static_cast<double>(std::filesystem::file_size(movie));
        std::filesystem::resize_file(copy, static_cast<std::uintmax_t>(size * share));
        return copy;
    }
    std::filesystem::path HeaderFirst(const char* name) {
        const auto movie =
            Make("-i " + Quoted(MadeMovie(name)) + " -map 0 -c copy -movflags +faststart",
                 (std::string("first_") + name));
        return movie;
    }
};

// No memory is allocated for what the file can't hold, and every verb that delivers
// or promises pictures says why.
TEST_F(EssenceBroken, PicturesOfAFalseSizeAreNamedByEveryVerb) {
    for (const char* const encoder : {"mpeg4", "png", "rawvideo"}) {
        SCOPED_TRACE(encoder);
        const auto movie =
            Make("-f lavfi -i testsrc=s=64x48:r=25 -f lavfi -i sine -t 0.12 -c:a pcm_s16le -c:v " +
                     std::string(encoder),
                 "large.mov");
        movies::Bytes bytes = ReadFile(movie);
        const std::string table = "stsd";
        const auto description =
            std::search(bytes.begin(), bytes.end(), table.begin(), table.end());
        ASSERT_GT(bytes.end() - description, 48);
        std::fill_n(description + 44, 4, std::uint8_t{0xFF});
        Write(bytes, movie.filename().string());
        const std::string reason =
            "cliphost: " + movie.string() +
            ": track 1 of the file: the file claims pictures of 65535 x 65535, ";
        const std::string output = " -o " + Quoted(folder() / "a.png");
        for (const std::string verb : {"formats", "frame", "contact", "describe"}) {
            SCOPED_TRACE(verb);
            const bool isDescribed = verb == "describe";
            const bool isWritten = verb == "frame" || verb == "contact";
            const CommandResult ran = RunCliphost(verb + (isDescribed ? " --quiet " : " ") +
                                                  Quoted(movie) + (isWritten ? output : ""));
            ExpectSays(ran, isDescribed ? 0 : 1,
                       "its description is damaged: copy the file again from where it came");
            EXPECT_EQ(ran.out.rfind(reason, 0), 0u) << ran.out;
        }
        EXPECT_FALSE(std::filesystem::exists(folder() / "a.png"));
        const auto described =
            nlohmann::json::parse(RunCommand(Quoted(ProgramFolder() / "cliphost") +
                                             " describe --json " + Quoted(movie) + " 2>/dev/null")
                                      .out)[0];
        EXPECT_TRUE(described.contains("description"));
        EXPECT_EQ(described["hint"],
                  "its description is damaged: copy the file again from where it came");
        const CommandResult sound =
            RunCliphost("audio " + Quoted(movie) + " -o " + Quoted(folder() / "a.wav"));
        EXPECT_EQ(sound.status, 0) << sound.out;
    }
}

// Each picture of these stands alone, so only the damaged one may suffer.
TEST_F(EssenceBroken, PictureFailsAndAllOthersAreServed) {
    for (const char* const name : {"png.mov", "mjpeg.mov", "prores_with_pcm.mov"}) {
        SCOPED_TRACE(name);
        const auto damaged = Damaged(name, 1);
        EssenceBytes whole;
        {
            Essence good(session(), MadeMovie(name));
            whole = AllFrames(good, TrackKind::Picture, "");
        }
        Essence essence(session(), damaged);
        FrameReader reader(essence, *essence.First(TrackKind::Picture), "");
        const auto frameAt = [&](std::size_t frame) {
            const auto size = static_cast<std::ptrdiff_t>(reader.frameBytes());
            const auto start = whole.begin() + static_cast<std::ptrdiff_t>(frame) * size;
            return EssenceBytes(start, start + size);
        };
        EXPECT_TRUE(OneFrame(reader, 0) == frameAt(0));
        EXPECT_LT(reader.Read(1), 0);
        EXPECT_NE(reader.Read(1), NMA_E_NODATA);
        EXPECT_TRUE(OneFrame(reader, 2) == frameAt(2));
        EXPECT_LT(reader.Read(1), 0) << "asked again";
        EXPECT_TRUE(OneFrame(reader, 0) == frameAt(0));
    }
}

TEST_F(EssenceBroken, PictureIsToldAndLeftOutByTheProgram) {
    const auto damaged = Damaged("png.mov", 1);
    const auto out = folder() / "frames";
    const CommandResult result =
        RunCliphost("frame " + Quoted(damaged) + " --range 0: -o " + Quoted(out));
    EXPECT_EQ(result.status, 1);
    EXPECT_NE(result.out.find("frame 1 is left out"), std::string::npos) << result.out;
    EXPECT_TRUE(std::filesystem::exists(out / "damaged_png_000000.png"));
    EXPECT_FALSE(std::filesystem::exists(out / "damaged_png_000001.png"));
    EXPECT_TRUE(std::filesystem::exists(out / "damaged_png_000002.png"));
    // Alone it leaves no file at all.
    const auto single = folder() / "single.png";
    EXPECT_EQ(RunCliphost("frame " + Quoted(damaged) + " --frame 1 -o " + Quoted(single)).status,
              1);
    EXPECT_FALSE(std::filesystem::exists(single));
}

TEST_F(EssenceBroken, LongGroupIsServedFromItsNextWholePicture) {
    // Two groups of five; the first is damaged in its key picture.
    const auto movie = Make(
        "-f lavfi -i testsrc2=s=320x180:r=25:d=0.4 -c:v "
        "libx264 -preset ultrafast -g 5 -x264-params scenecut=0 -bf 0 -pix_fmt yuv420p",
        "groups.mov");
    EssenceBytes whole;
    MappedSample first;
    {
        Essence good(session(), movie);
        whole = AllFrames(good, TrackKind::Picture, "");
        ASSERT_EQ(cliphost::ReadMappedSample(good.map(), 0, 0, first), NCF_OK);
    }
    {
        std::fstream stream(movie, std::ios::binary | std::ios::in | std::ios::out);
        stream.seekp(static_cast<std::streamoff>(first.position));
        stream << std::string(static_cast<std::size_t>(first.size), '\x5A');
    }
    Essence essence(session(), movie);
    FrameReader reader(essence, *essence.First(TrackKind::Picture), "");
    EXPECT_LT(reader.Read(0), 0);
    for (std::size_t frame = 5; frame < 10; ++frame) {
        const auto size = static_cast<std::ptrdiff_t>(reader.frameBytes());
        const auto start = whole.begin() + static_cast<std::ptrdiff_t>(frame) * size;
        EXPECT_TRUE(OneFrame(reader, frame) == EssenceBytes(start, start + size)) << frame;
    }
}

TEST_F(EssenceBroken, CutFileServesWhatIsThere) {
    const auto movie = HeaderFirst("mjpeg.mov");
    EssenceBytes whole;
    {
        Essence good(session(), movie);
        whole = AllFrames(good, TrackKind::Picture, "");
    }
    const auto cut = Cut(movie, 0.6);
    Essence essence(session(), cut);
    // Its bytes can't be hashed, so it has no description; its map is whole.
    EXPECT_TRUE(essence.undescribed());
    ASSERT_EQ(essence.tracks().size(), 1u);
    EXPECT_EQ(essence.tracks()[0].length, 4u);
    FrameReader reader(essence, *essence.First(TrackKind::Picture), "");
    const auto size = static_cast<std::ptrdiff_t>(reader.frameBytes());
    int served = 0, refused = 0;
    for (std::uint64_t frame = 0; frame < 4; ++frame) {
        MappedSample mapped;
        ASSERT_EQ(cliphost::ReadMappedSample(essence.map(), 0, frame, mapped), NCF_OK);
        const bool isThere = mapped.position + mapped.size <= std::filesystem::file_size(cut);
        const NCFRESULT result = reader.Read(frame);
        if (isThere) {
            const auto start = whole.begin() + static_cast<std::ptrdiff_t>(frame) * size;
            EXPECT_EQ(result, NCF_OK) << frame;
            EXPECT_TRUE(std::equal(reader.bytes(), reader.bytes() + size, start)) << frame;
            ++served;
        } else {
            EXPECT_LT(result, 0) << frame;
            ++refused;
        }
    }
    EXPECT_GT(served, 0);
    EXPECT_GT(refused, 0);
}

TEST_F(EssenceBroken, CutFileIsToldByTheSums) {
    const auto cut = Cut(HeaderFirst("mjpeg.mov"), 0.6);
    const CommandResult result = RunCliphost("samples " + Quoted(cut));
    EXPECT_EQ(result.status, 1);
    EXPECT_NE(result.out.find("wrong: "), std::string::npos) << result.out;
    EXPECT_NE(result.out.find("the file ends at"), std::string::npos) << result.out;
}

TEST_F(EssenceBroken, CutSoundIsServedToItsEndAndSilentFromThere) {
    const auto movie = HeaderFirst("pcm_s16le.mov");
    const auto cut = Cut(movie, 0.5);
    const EssenceBytes whole = Decoded(movie, "-f s24le -c:a pcm_s24le");
    Essence essence(session(), cut);
    cliphost::SoundReader reader(essence, essence.tracks().at(0));
    EXPECT_EQ(reader.Count(), 19200u);
    const auto start = reader.Read(0, 4000);
    EXPECT_FALSE(start.isSilence);
    EXPECT_TRUE(std::equal(start.bytes, start.bytes + start.size, whole.begin()));
    EXPECT_TRUE(reader.Read(15000, 1000).isSilence);
    // The rest after the silence still works.
    EXPECT_FALSE(reader.Read(100, 100).isSilence);
}

TEST_F(EssenceBroken, SilenceIsToldByTheProgramAndTheFileStays) {
    const auto cut = Cut(HeaderFirst("pcm_s16le.mov"), 0.2);
    const auto wav = folder() / "a.wav";
    const CommandResult result =
        RunCliphost("audio " + Quoted(cut) + " --start 8000 -o " + Quoted(wav));
    EXPECT_EQ(result.status, 1) << result.out;
    EXPECT_NE(result.out.find("give --rate 48000"), std::string::npos) << result.out;
    EXPECT_FALSE(std::filesystem::exists(wav));
    // Longer than what is read at a time.
    const auto whole =
        Make("-f lavfi -i sine=r=48000:d=4 -c:a pcm_s16le -movflags +faststart", "long.mov");
    ExpectSays(RunCliphost("audio " + Quoted(Cut(whole, 0.4)) + " --rate 48000 -o " + Quoted(wav)),
               1, "could not be read and are silent");
    EXPECT_EQ(Decoded(wav, "-f s24le -c:a pcm_s24le").size(), 192000u * 3);
}

// The end of the file lies within what is read at a time, so the module gives no
// sign of it. What is hashed lies in front of the cut: the movie has a description.
TEST_F(EssenceBroken, SoundThatIsCutWithinABlockIsToldWithItsCount) {
    for (const char* const codec : {"pcm_s16le", "aac -aac_pns 0", "alac"}) {
        SCOPED_TRACE(codec);
        const auto whole = Make(
            "-f lavfi -i testsrc=d=3:r=25:s=64x64 -f lavfi "
            "-i sine=r=48000:d=3 -c:v mjpeg -movflags +faststart -c:a " +
                std::string(codec),
            "whole.mov");
        const auto cut = Cut(whole, 0.9);
        const auto wav = folder() / "a.wav";
        const CommandResult result = RunCliphost("audio " + Quoted(cut) + " -o " + Quoted(wav));
        const EssenceBytes got = Decoded(wav, "-f s24le -c:a pcm_s24le");
        ASSERT_EQ(got.size(), 144000u * 3);
        const auto heard = std::find_if(got.rbegin(), got.rend(), [](auto byte) { return byte; });
        const auto silent = static_cast<std::size_t>(heard - got.rbegin()) / 3;
        EXPECT_GT(silent, 5000u);
        ExpectSays(result, 1,
                   "track 2 of the file: the file ends at byte " +
                       std::to_string(std::filesystem::file_size(cut)) + ", so samples ");
        ExpectSays(result, 1,
                   "are missing or cut off; " + std::to_string(silent) +
                       " of 144000 samples could not be read and are silent");
        // In front of it nothing is amiss.
        const CommandResult front =
            RunCliphost("audio " + Quoted(cut) + " --count " + std::to_string(144000 - silent) +
                        " -o " + Quoted(wav));
        EXPECT_EQ(front.status, 0) << front.out;
        EXPECT_EQ(front.out.find("missing"), std::string::npos) << front.out;
        // One more is.
        ExpectSays(RunCliphost("audio " + Quoted(cut) + " --count " +
                               std::to_string(144001 - silent) + " -o " + Quoted(wav)),
                   1, "off; 1 of ");
    }
}

TEST_F(EssenceBroken, SoundOfWhichNothingCanBeReadLeavesNoFile) {
    const auto cut = Cut(HeaderFirst("pcm_s16le.mov"), 0.2);
    for (const char* const output : {"a.wav", "b.wav"}) {
        std::ofstream(folder() / "b.wav") << "before";
        ExpectSays(RunCliphost("audio " + Quoted(cut) + " --start 8000 --rate 48000 -o " +
                               Quoted(folder() / output)),
                   1, "so samples 3702 to 19199 of its table are missing or cut off");
    }
    EXPECT_FALSE(std::filesystem::exists(folder() / "a.wav"));
    EXPECT_EQ(std::filesystem::file_size(folder() / "b.wav"), 6u) << "what was there stays";
    const CommandResult streamed =
        RunCommand(Quoted(ProgramFolder() / "cliphost") + " audio " + Quoted(cut) +
                   " --start 8000 --rate 48000 -o - 2>/dev/null");
    EXPECT_EQ(streamed.status, 1);
    EXPECT_EQ(streamed.out, "");
}

}  // namespace
