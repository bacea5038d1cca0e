// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Sound whose container tells less, or something else, than comes out of its
// decoder: what is described, what is offered and what is delivered agree.

#include <algorithm>
#include <cmath>
#include <random>

#include "reference_host/cliphost/SoundReader.h"
#include "tests/system/EssenceSupport.h"
#include "tests/system/Facts.h"
#include "tests/system/SoundMovies.h"
#include "tests/system/SystemTest.h"

namespace {

using cliphost::Essence;
using cliphost::SoundReader;
using movies::Bytes;

class SoundForms : public SystemTest {
protected:
    // A tone in packets of AAC.
    SoundPackets AacOf(int seconds, int rate) {
        return SoundPacketsOf(Make("-f lavfi -i sine=440:d=" + std::to_string(seconds) +
                                       ":sample_rate=" + std::to_string(rate) +
                                       " -c:a aac -aac_pns 0",
                                   "a.m4a"));
    }
    std::filesystem::path WriteSound(const movies::Track& track, const std::string& name) {
        movies::Movie movie;
        movie.timeScale = 44100;
        movie.tracks = {track};
        return Write(movie, name);
    }
    // What the description says: channels, rate, frames.
    struct Said {
        std::string channels, rate, length;
    };
    Said Described(const std::filesystem::path& movie) {
        const auto sounds = Sounds(Describe(movie));
        if (sounds.size() != 1) {
            ADD_FAILURE() << movie << " has " << sounds.size() << " sounds";
            return {};
        }
        return {Fact(sounds[0], "Channels"), Fact(sounds[0], "AudioSamplingRate"),
                Fact(sounds[0], "Length")};
    }
    // All that is delivered of the sound, which is the last track; the form is held
    // against the description.
    EssenceBytes Delivered(const std::filesystem::path& movie) {
        const Said said = Described(movie);
        Essence essence(session(), movie);
        SoundReader reader(essence, essence.tracks().back());
        EXPECT_EQ(std::to_string(reader.form().channels), said.channels);
        EXPECT_EQ(std::to_string(reader.form().rate) + "/1", said.rate);
        EXPECT_EQ(std::to_string(reader.Count()), said.length);
        const auto block = reader.Read(0, reader.Count());
        EXPECT_FALSE(block.isSilence);
        return {block.bytes, block.bytes + block.size};
    }
    // Ranges, each read by a reader of its own, are those of `all`.
    void ExpectRangesOf(const std::filesystem::path& movie, const EssenceBytes& all) {
        std::mt19937 random(11);
        for (int i = 0; i < 12; ++i) {
            Essence essence(session(), movie);
            SoundReader reader(essence, essence.tracks().at(0));
            ExpectRandomRange(reader, random, all);
        }
    }
    // `got` is a piece of one channel's `whole`, from `frame` on.
    static void ExpectIn(const EssenceBytes& whole, const EssenceBytes& got, std::size_t frame) {
        ASSERT_GE(whole.size(), frame * 3 + got.size());
        const auto from = whole.begin() + static_cast<std::ptrdiff_t>(frame * 3);
        const auto differs = std::mismatch(got.begin(), got.end(), from);
        EXPECT_TRUE(differs.first == got.end())
            << "from frame " << (differs.first - got.begin()) / 3;
    }
    // `wanted` may go on behind the clip's length, by less than an edit unit.
    static void ExpectSame(const EssenceBytes& got, const EssenceBytes& wanted) {
        ASSERT_GE(got.size(), 1000u);
        ASSERT_GE(wanted.size(), got.size());
        ASSERT_LT(wanted.size() - got.size(), got.size() / 20);
        const auto differs = std::mismatch(got.begin(), got.end(), wanted.begin());
        EXPECT_TRUE(differs.first == got.end()) << "from byte " << differs.first - got.begin();
    }
};

// Clips of sound alone last whole edit units, of which the session has 25 a second.
std::size_t InEditUnits(double seconds, std::size_t rate) {
    return static_cast<std::size_t>(seconds * 25) * rate / 25;
}

// The high byte of a sample of 24 bits.
int HighByte(const EssenceBytes& sound, std::size_t sample) {
    return static_cast<signed char>(sound.at(sample * 3 + 2));
}

// How often the samples of a range rise through zero.
int RisesIn(const EssenceBytes& sound, std::size_t from, std::size_t count) {
    int rises = 0;
    for (std::size_t i = from; i < from + count; ++i) {
        rises += HighByte(sound, i) < 0 && HighByte(sound, i + 1) >= 0;
    }
    return rises;
}

constexpr char kHum[] = "-f lavfi -i sine=440:d=1:sample_rate=";

TEST_F(SoundForms, OfCompressedSoundAreThoseThatItsDecoderGives) {
    struct Kind {
        const char* arguments;
        const char* name;
        const char* decoder = "";
    };
    for (const Kind& kind :
         {Kind{"-c:a libmp3lame", "mp3.mp4"}, Kind{"-c:a mp2", "mp2.mp4", "-c:a mp2float "},
          Kind{"-c:a libvorbis", "vorbis.mp4"}, Kind{"-c:a libmp3lame", "mp3.mov"},
          Kind{"-c:a mp2", "mp2.mov", "-c:a mp2float "},
          Kind{"-c:a ac3", "ac3.mp4", "-cons_noisegen 1 "},
          Kind{"-c:a flac -strict -2", "flac.mp4"}, Kind{"-c:a alac", "alac.mp4"},
          Kind{"-c:a aac -aac_pns 0", "aac.mp4"}}) {
        for (const int channels : {1, 2}) {
            SCOPED_TRACE(kind.name + std::string(" ") + std::to_string(channels));
            const auto movie = Make(
                kHum + std::string("48000 -ac ") + std::to_string(channels) + " " + kind.arguments,
                kind.name);
            EXPECT_EQ(Described(movie).channels, std::to_string(channels));
            EXPECT_EQ(Described(movie).rate, "48000/1");
            const CommandResult wanted =
                RunCommand("ffmpeg -nostdin -v quiet " + std::string(kind.decoder) + "-i " +
                           Quoted(movie) + " -f s24le -c:a pcm_s24le -");
            ExpectSame(Delivered(movie), {wanted.out.begin(), wanted.out.end()});
        }
    }
}

// A track begins with two channels and goes on with one: both of the two have it.
TEST_F(SoundForms, ThatChangeChannelsOnTheWayAreMixed) {
    const auto two = Make(kHum + std::string("44100 -ac 2 -c:a libmp3lame -write_xing 0 "
                                             "-id3v2_version 0"),
                          "two.mp3");
    const auto one = Make(
        "-f lavfi -i sine=997:d=1:sample_rate=44100 -c:a libmp3lame -write_xing 0 -id3v2_version 0",
        "one.mp3");
    movies::SoundFormat format;
    format.codec = ".mp3";
    format.rate = 44100;
    const SoundPackets first = SoundPacketsOf(two);
    const SoundPackets second = SoundPacketsOf(one);
    const auto movie =
        WriteSound(SoundTrackOf(Joined(first, second), format, 44100, 1152), "both.mov");
    EXPECT_EQ(Described(movie).channels, "2");
    const EssenceBytes got = Delivered(movie);
    const double packets = static_cast<double>(first.size() + second.size());
    ASSERT_EQ(got.size(), InEditUnits(packets * 1152 / 44100, 44100) * 6);
    // Behind the seam, where the decoder has settled, it is what one channel gives.
    const auto alone = WriteSound(SoundTrackOf(second, format, 44100, 1152), "alone.mov");
    const EssenceBytes wanted = Decoded(alone, "-ac 2 -f s24le -c:a pcm_s24le");
    const std::size_t settled = 4 * 1152 * 6;
    ASSERT_EQ(wanted.size(), second.size() * 1152 * 6);
    const EssenceBytes tail(
        got.begin() + static_cast<std::ptrdiff_t>(first.size() * 1152 * 6 + settled), got.end());
    std::size_t most = 0;
    for (std::size_t i = 0; i + 2 < tail.size(); i += 3) {
        const auto word = [](const EssenceBytes& from, std::size_t at) {
            return static_cast<std::int32_t>(static_cast<std::uint32_t>(
                       from[at] << 8 | from[at + 1] << 16 | from[at + 2] << 24)) /
                   256;
        };
        most = std::max<std::size_t>(
            most, static_cast<std::size_t>(std::abs(word(tail, i) - word(wanted, settled + i))));
    }
    EXPECT_LE(most, 2u);
    ExpectRangesOf(movie, got);
}

// The higher rate of the second half is brought to that of the first, so it
// lasts as long and sounds as high as before.
TEST_F(SoundForms, ThatChangeTheRateOnTheWayAreResampled) {
    const std::string plain = " -c:a libmp3lame -b:a 192k -write_xing 0 -id3v2_version 0";
    const auto slow = Make("-f lavfi -i sine=440:d=1:sample_rate=44100" + plain, "slow.mp3");
    const auto fast = Make("-f lavfi -i sine=1000:d=2:sample_rate=48000" + plain, "fast.mp3");
    movies::SoundFormat format;
    format.codec = ".mp3";
    format.channels = 1;
    format.rate = 44100;
    const SoundPackets first = SoundPacketsOf(slow);
    const SoundPackets second = SoundPacketsOf(fast);
    // A time unit in which packets of either rate last whole numbers.
    movies::Track track = SoundTrackOf(Joined(first, second), format, 7056000, 1152 * 160);
    for (std::size_t i = first.size(); i < track.samples.size(); ++i) {
        track.samples[i].duration = 1152 * 147;
    }
    const auto movie = WriteSound(track, "both.mov");
    EXPECT_EQ(Described(movie).rate, "44100/1");
    const EssenceBytes got = Delivered(movie);
    const double seconds = static_cast<double>(first.size()) * 1152 / 44100 +
                           static_cast<double>(second.size()) * 1152 / 48000;
    EXPECT_EQ(got.size(), InEditUnits(seconds, 44100) * 3);
    // A second out of the middle of the second half rises through zero a
    // thousand times, at the level of the first.
    const std::size_t from = first.size() * 1152 + 22050;
    int loudest = 0;
    for (std::size_t i = from; i < from + 44100; ++i) {
        loudest = std::max(loudest, std::abs(HighByte(got, i)));
    }
    EXPECT_NEAR(RisesIn(got, from, 44100), 1000, 1);
    EXPECT_NEAR(loudest, 16, 1);  // an eighth of full scale
    ExpectRangesOf(movie, got);
}

// The configuration of AAC stands in a movie's description; here that of plain
// AAC is made into one that announces more, so that decoders double the rate,
// and make two channels of one unless it denies that.
TEST_F(SoundForms, OfAnnouncedExtensionsOfAacAreThoseThatComeOut) {
    const SoundPackets packets = AacOf(1, 22050);
    struct Kind {
        const char* name;
        Bytes config;
        const char* channels;
    };
    for (const Kind& kind :
         {Kind{"bands, told behind", {0x13, 0x88, 0x56, 0xE5, 0xA0}, "2"},
          Kind{"bands, told behind, no stereo", {0x13, 0x88, 0x56, 0xE5, 0xA5, 0x48, 0x00}, "1"},
          Kind{"stereo, told behind", {0x13, 0x88, 0x56, 0xE5, 0xA5, 0x48, 0x80}, "2"},
          Kind{"bands, told in front", {0x2B, 0x8A, 0x08, 0x00}, "2"},
          Kind{"stereo, told in front", {0xEB, 0x8A, 0x08, 0x00}, "2"},
          // The extension names 24000, between the core's rate and twice that.
          Kind{"bands of an odd rate, told in front", {0x2B, 0x8B, 0x08, 0x00}, "2"},
          Kind{"bands of an odd rate, told behind", {0x13, 0x88, 0x56, 0xE5, 0xB0}, "2"},
          // 96000, more than twice the core's.
          Kind{"bands of a high rate, told in front", {0x2B, 0x88, 0x08, 0x00}, "2"}}) {
        for (const bool isWave : {false, true}) {
            SCOPED_TRACE(kind.name + std::string(isWave ? " in wave" : ""));
            movies::SoundFormat format = Mpeg4Sound(0x40, kind.config, 2, 22050);
            format.wave = isWave;
            format.version = isWave ? 1 : 0;
            const auto movie = WriteSound(SoundTrackOf(packets, format, 22050, 1024), "more.mov");
            const Said said = Described(movie);
            EXPECT_EQ(said.rate, "44100/1");
            EXPECT_EQ(said.channels, kind.channels);
            const double seconds = static_cast<double>(packets.size()) * 1024 / 22050;
            EXPECT_EQ(said.length, std::to_string(InEditUnits(seconds, 44100)));
            const EssenceBytes got = Delivered(movie);
            ExpectSame(got, Decoded(movie, "-f s24le -c:a pcm_s24le"));
            ExpectRangesOf(movie, got);
        }
    }
}

// Packets of AAC that double the rate without a word in the description: what it
// says is what both readers say, and what is delivered.
TEST_F(SoundForms, OfExtensionsOfAacThatNothingAnnouncesAreThoseOfTheCore) {
    const SoundPackets packets = WithEmptyBandExtension(AacOf(2, 22050));
    const auto movie = WriteSound(
        SoundTrackOf(packets, Mpeg4Sound(0x40, {0x13, 0x88}, 1, 22050), 22050, 1024), "more.mov");
    // The decoder does find the extension.
    EXPECT_GT(Decoded(movie, "-f s24le -c:a pcm_s24le").size(), packets.size() * 2000 * 3);
    const Said said = Described(movie);
    EXPECT_EQ(said.rate, "22050/1");
    EXPECT_EQ(said.channels, "1");
    const double seconds = static_cast<double>(packets.size()) * 1024 / 22050;
    EXPECT_EQ(said.length, std::to_string(InEditUnits(seconds, 22050)));
    const EssenceBytes got = Delivered(movie);
    ASSERT_EQ(got.size(), InEditUnits(seconds, 22050) * 3);
    EXPECT_NEAR(RisesIn(got, 11025, 22050), 440, 1);
    ExpectRangesOf(movie, got);
}

// Other tracks do not count, though to describe a picture like this one the
// library reads on, and then knows more of the sound as well.
TEST_F(SoundForms, OfTheCoreStayWhereAPictureIsReadBefore) {
    const SoundPackets packets = WithEmptyBandExtension(AacOf(2, 22050));
    const auto alone = WriteSound(
        SoundTrackOf(packets, Mpeg4Sound(0x40, {0x13, 0x88}, 1, 22050), 22050, 1024), "alone.mov");
    const auto both = Make("-f lavfi -i testsrc=d=2:r=25:s=64x64 -i " + Quoted(alone) +
                               " -map 0:v -map 1:a -c:v mpeg4 -c:a copy",
                           "both.mov");
    const Said said = Described(both);
    EXPECT_EQ(said.rate, "22050/1");
    EXPECT_EQ(said.channels, "1");
    EXPECT_GT(Delivered(both).size(), 2u * 22050 * 3 * 9 / 10);
}

// The fields of a description say a rate that its packets do not have: from the
// first block on they are brought to it.
TEST_F(SoundForms, HaveTheRateOfTheFieldsWhateverThePacketsHave) {
    const auto plain = Make(kHum + std::string("44100 -ac 1 -c:a libmp3lame -write_xing 0 "
                                               "-id3v2_version 0"),
                            "plain.mp3");
    movies::SoundFormat format;
    format.codec = ".mp3";
    format.channels = 1;
    format.rate = 48000;
    const SoundPackets packets = SoundPacketsOf(plain);
    const auto movie = WriteSound(SoundTrackOf(packets, format, 44100, 1152), "other.mov");
    const Said said = Described(movie);
    EXPECT_EQ(said.rate, "48000/1");
    const double seconds = static_cast<double>(packets.size()) * 1152 / 44100;
    EXPECT_EQ(said.length, std::to_string(InEditUnits(seconds, 48000)));
    const EssenceBytes got = Delivered(movie);
    EXPECT_NEAR(RisesIn(got, 4800, 24000), 220, 1);
    ExpectRangesOf(movie, got);
}

// The decoder makes 44100 of what is described with 22050, and a second is left
// out in the middle.
TEST_F(SoundForms, KeepAGapWhileTheRateIsConverted) {
    const SoundPackets packets = WithEmptyBandExtension(AacOf(2, 22050));
    const movies::SoundFormat format = Mpeg4Sound(0x40, {0x13, 0x88}, 1, 22050);
    movies::Track track = SoundTrackOf(packets, format, 22050, 1024);
    track.samples[8].duration += 22050;
    const EssenceBytes got = Delivered(WriteSound(track, "gap.mov"));
    const auto isSilent = [&](std::size_t from, std::size_t to) {
        return std::all_of(got.begin() + static_cast<std::ptrdiff_t>(from * 3),
                           got.begin() + static_cast<std::ptrdiff_t>(to * 3),
                           [](auto byte) { return byte == 0; });
    };
    ASSERT_GT(got.size(), 3u * (22050 + 20 * 1024));
    EXPECT_FALSE(isSilent(8 * 1024, 9 * 1024 - 100));
    EXPECT_TRUE(isSilent(9 * 1024 + 100, 9 * 1024 + 22050 - 100));
    EXPECT_FALSE(isSilent(9 * 1024 + 22050 + 100, 10 * 1024 + 22050));
    EXPECT_FALSE(isSilent(18 * 1024 + 22050, 19 * 1024 + 22050));
}

// The edit begins within a packet, in units that are the sound's frames or not:
// what is heard is what the media holds from there on, from its first frame.
TEST_F(SoundForms, AreThoseOfTheMediaFromAnEditWithinAPacket) {
    const SoundPackets packets = AacOf(3, 44100);
    const movies::SoundFormat format = Mpeg4Sound(0x40, {0x12, 0x08, 0x56, 0xE5, 0x00}, 1, 44100);
    const EssenceBytes whole =
        Delivered(WriteSound(SoundTrackOf(packets, format, 44100, 1024), "whole.mov"));
    struct Units {
        std::uint32_t scale, packet;
    };
    for (const Units& units : {Units{48000, 1115}, Units{44100, 1024}}) {
        for (const std::int64_t start : {1, 500, 1023, 1114, 1115, 1500, 1800, 2230, 3000}) {
            SCOPED_TRACE(std::to_string(start) + " of " + std::to_string(units.scale));
            movies::Track track = SoundTrackOf(packets, format, units.scale, units.packet);
            movies::Edit edit;
            edit.duration = 2 * 44100;
            edit.mediaTime = start;
            track.edits = {edit};
            const auto movie = WriteSound(track, "cut.mov");
            const EssenceBytes got = Delivered(movie);
            ASSERT_EQ(got.size(), 2u * 44100 * 3);
            const std::int64_t frame = (start * 44100 + units.scale / 2) / units.scale;
            ExpectIn(whole, got, static_cast<std::size_t>(frame));
            ExpectRangesOf(movie, got);
        }
    }
}

// The units are those of the core, of which the decoder makes two frames each.
TEST_F(SoundForms, AreThoseOfTheMediaFromAnEditInUnitsOfTheCore) {
    const SoundPackets packets = AacOf(3, 22050);
    const movies::SoundFormat format =
        Mpeg4Sound(0x40, {0x13, 0x88, 0x56, 0xE5, 0xA5, 0x48, 0x00}, 1, 22050);
    const EssenceBytes whole =
        Delivered(WriteSound(SoundTrackOf(packets, format, 22050, 1024), "whole.mov"));
    for (const std::int64_t start : {500, 1024, 2624}) {
        SCOPED_TRACE(start);
        movies::Track track = SoundTrackOf(packets, format, 22050, 1024);
        movies::Edit edit;
        edit.duration = 2 * 44100;
        edit.mediaTime = start;
        track.edits = {edit};
        const auto movie = WriteSound(track, "cut.mov");
        const EssenceBytes got = Delivered(movie);
        ASSERT_EQ(got.size(), 2u * 44100 * 3);
        ExpectIn(whole, got, static_cast<std::size_t>(start * 2));
        ExpectRangesOf(movie, got);
    }
}

// A writer rounded the length of each packet, not its end: 1115 units of 48000
// for 1024 frames at 44100. The sound goes on without a gap.
TEST_F(SoundForms, AreContinuousWhereEachStepIsRounded) {
    const SoundPackets packets = AacOf(4, 44100);
    const movies::SoundFormat format = Mpeg4Sound(0x40, {0x12, 0x08, 0x56, 0xE5, 0x00}, 1, 44100);
    const auto exact = WriteSound(SoundTrackOf(packets, format, 44100, 1024), "exact.mov");
    const auto rounded = WriteSound(SoundTrackOf(packets, format, 48000, 1115), "rounded.mov");
    const EssenceBytes wanted = Delivered(exact);
    const EssenceBytes got = Delivered(rounded);
    ASSERT_GE(got.size(), wanted.size());  // it claims to last a little longer
    ExpectSame(wanted, got);
    ExpectRangesOf(rounded, got);
}

// What one packet's own step leaves empty is silence, and what follows it is
// in its place.
TEST_F(SoundForms, KeepTheGapThatAStepLeaves) {
    const SoundPackets packets = AacOf(2, 44100);
    const movies::SoundFormat format = Mpeg4Sound(0x40, {0x12, 0x08, 0x56, 0xE5, 0x00}, 1, 44100);
    const auto exact = WriteSound(SoundTrackOf(packets, format, 44100, 1024), "exact.mov");
    movies::Track track = SoundTrackOf(packets, format, 48000, 1115);
    track.samples[40].duration += 4800;  // 4410 frames
    const auto gap = WriteSound(track, "gap.mov");
    EssenceBytes wanted = Delivered(exact);
    wanted.insert(wanted.begin() + 41 * 1024 * 3, 4410 * 3, 0);
    const EssenceBytes got = Delivered(gap);
    ExpectSame(got, wanted);
    ExpectRangesOf(gap, got);
}

TEST_F(SoundForms, OfTelephoneSoundHaveAllBlocksOfASample) {
    const SoundPackets blocks = TelephoneBlocks(60, 5);
    movies::SoundFormat format;
    format.codec = "samr";
    format.channels = 2;  // a template
    format.rate = 8000;
    const auto single = WriteSound(SoundTrackOf(blocks, format, 8000, 160), "single.mov");
    SoundPackets threes;
    for (std::size_t i = 0; i < blocks.size(); i += 3) {
        movies::Bytes sample;
        for (std::size_t j = i; j < i + 3; ++j) {
            sample.insert(sample.end(), blocks[j].begin(), blocks[j].end());
        }
        threes.push_back(sample);
    }
    const auto several = WriteSound(SoundTrackOf(threes, format, 8000, 480), "several.mov");
    EXPECT_EQ(Described(several).channels, "1");
    EXPECT_EQ(Described(several).rate, "8000/1");
    EXPECT_EQ(Described(several).length, "9600");
    const EssenceBytes wanted = Delivered(single);
    ASSERT_EQ(wanted.size(), 60u * 160 * 3);
    EXPECT_GT(std::count_if(wanted.end() - 480, wanted.end(), [](auto byte) { return byte != 0; }),
              200);
    ExpectSame(Delivered(several), wanted);
}

// Fragments that use the second of two descriptions: the first says another
// number of channels.
TEST_F(SoundForms, OfFragmentsAreThoseOfTheDescriptionInUse) {
    const auto plain =
        Make(kHum + std::string("48000 -ac 1 -c:a libopus -frag_duration 200000 "
                                "-movflags frag_keyframe+empty_moov+default_base_moof"),
             "one.mp4");
    Bytes bytes = ReadFile(plain);
    const auto place = [&](const std::string& name) {
        const auto at = std::search(bytes.begin(), bytes.end(), name.begin(), name.end());
        EXPECT_NE(at, bytes.end()) << name;
        return static_cast<std::size_t>(at - bytes.begin()) - 4;
    };
    const auto add = [&](std::size_t at, std::size_t more) {
        const std::size_t sum = (bytes[at + 2] << 8 | bytes[at + 3]) + more;
        ASSERT_LT(sum, 65536u);
        bytes[at + 2] = static_cast<std::uint8_t>(sum >> 8);
        bytes[at + 3] = static_cast<std::uint8_t>(sum);
    };
    const std::size_t entry = place("stsd") + 16;
    const std::size_t size = bytes[entry + 2] * 256u + bytes[entry + 3];
    Bytes two(bytes.begin() + static_cast<std::ptrdiff_t>(entry),
              bytes.begin() + static_cast<std::ptrdiff_t>(entry + size));
    two[25] = 2;
    two[place("dOps") - entry + 9] = 2;
    add(place("stsd") + 12, 1);  // how many there are
    add(place("trex") + 16, 1);  // which one fragments use
    for (const char* const name : {"moov", "trak", "mdia", "minf", "stbl", "stsd"}) {
        add(place(name), size);
    }
    bytes.insert(bytes.begin() + static_cast<std::ptrdiff_t>(entry), two.begin(), two.end());
    const auto movie = Write(bytes, "two.mov");
    EXPECT_EQ(Described(movie).channels, "2");
    const EssenceBytes got = Delivered(movie);
    // The decoder gives the one channel on both.
    EssenceBytes wanted;
    const EssenceBytes one = Delivered(Write(ReadFile(plain), "one.mov"));
    for (std::size_t i = 0; i + 2 < one.size(); i += 3) {
        const auto at = one.begin() + static_cast<std::ptrdiff_t>(i);
        wanted.insert(wanted.end(), at, at + 3);
        wanted.insert(wanted.end(), at, at + 3);
    }
    ExpectSame(got, wanted);
}

// A movie in fragments has an edit that leaves out what primes the decoder, or
// nothing but the decoder's configuration tells of it. A picture that begins with
// the priming keeps its distance to the sound.
TEST_F(SoundForms, InFragmentsAreWithoutThePrimingOfOpus) {
    struct Kind {
        const char* flags;
        const char* picture;
        std::size_t silence;
    };
    const char* const picture = "-f lavfi -i testsrc=d=2:s=64x64:r=25 -c:v mpeg4 ";
    for (const Kind& kind : {Kind{"empty_moov", "", 0}, Kind{"delay_moov", "", 0},
                             Kind{"empty_moov", picture, 312}, Kind{"delay_moov", picture, 0}}) {
        SCOPED_TRACE(kind.flags + std::string(kind.picture));
        const auto movie =
            Make("-f lavfi -i sine=440:b=4:d=2:sample_rate=48000 " + std::string(kind.picture) +
                     "-c:a libopus -movflags frag_keyframe+" + kind.flags,
                 "fragments.mp4");
        const CommandResult heard = RunCommand("ffmpeg -nostdin -v quiet -i " + Quoted(movie) +
                                               " -f s24le -c:a pcm_s24le -");
        EssenceBytes wanted(kind.silence * 3);
        wanted.insert(wanted.end(), heard.out.begin(), heard.out.end());
        ExpectSame(Delivered(movie), wanted);
    }
}

// Blocks that say they hold no data: the ffmpeg command gives no sound for them
// either, and no file of silence is left.
TEST_F(SoundForms, OfTelephoneBlocksWithoutDataAreRefused) {
    movies::SoundFormat format;
    format.codec = "samr";
    format.channels = 1;
    format.rate = 8000;
    const auto movie = WriteSound(
        SoundTrackOf(SoundPackets(50, Bytes(50, 0x7C)), format, 8000, 8000), "empty.mov");
    const auto wav = folder() / "a.wav";
    ExpectSays(RunCliphost("audio " + Quoted(movie) + " -o " + Quoted(wav)), 1,
               "none of its samples from 0 to 399999 could be read");
    EXPECT_FALSE(std::filesystem::exists(wav));
    EXPECT_EQ(RunCommand("ffmpeg -nostdin -v quiet -i " + Quoted(movie) + " -f s16le -").out, "");
}

// Each description tells of one channel, each packet holds two: together they are
// more than a movie may have, and the reason is told by whatever verb.
TEST_F(SoundForms, ThatTakeMoreChannelsTogetherThanAreToldAreRefused) {
    const auto two = Make(kHum + std::string("44100 -ac 2 -c:a libmp3lame -write_xing 0 "
                                             "-id3v2_version 0"),
                          "two.mp3");
    movies::SoundFormat format;
    format.codec = ".mp3";
    format.channels = 1;
    format.rate = 44100;
    movies::Movie movie;
    movie.timeScale = 44100;
    SoundPackets packets = SoundPacketsOf(two);
    packets.resize(8);
    movie.tracks.assign(513, SoundTrackOf(packets, format, 44100, 1152));
    const auto path = Write(movie, "many.mov");
    for (const char* const verb : {"describe ", "formats ", "samples "}) {
        ExpectSays(RunCliphost(verb + Quoted(path)), 1,
                   "many.mov: the multimedia library, which has to decode it, refuses it: the "
                   "sound tracks of the movie have more than 1024 channels in total");
    }
}

// Linear sound of the ISO forms is read by the host itself where its depth is
// one that the host takes, and comes bit for bit out of the provider.
TEST_F(SoundForms, OfIsoLinearSoundAreLinear) {
    struct Kind {
        const char* codec;
        unsigned bits;
        bool isLittle;
        const char* source;
        const char* label;
    };
    for (const Kind& kind : {Kind{"ipcm", 16, true, "s16le", "little-endian 2 x 48000/1"},
                             Kind{"ipcm", 24, false, "s24be", "big-endian 2 x 48000/1"},
                             Kind{"ipcm", 32, true, "s32le", "provider 2 x 48000/1"},
                             Kind{"fpcm", 32, true, "f32le", "provider 2 x 48000/1"},
                             Kind{"fpcm", 32, false, "f32be", "provider 2 x 48000/1"},
                             Kind{"fpcm", 64, true, "f64le", "provider 2 x 48000/1"},
                             Kind{"fpcm", 64, false, "f64be", "provider 2 x 48000/1"}}) {
        SCOPED_TRACE(kind.codec + std::string(" ") + kind.source);
        const auto raw = Make(
            "-f lavfi -i sine=440:d=0.2:sample_rate=48000 -ac 2 -f " + std::string(kind.source),
            "raw");
        const CommandResult wanted =
            RunCommand("ffmpeg -nostdin -v quiet -f " + std::string(kind.source) +
                       " -ar 48000 -ac 2 -i " + Quoted(raw) + " -f s24le -c:a pcm_s24le -");
        for (const unsigned version : {0u, 1u, 2u}) {
            SCOPED_TRACE("version " + std::to_string(version));
            movies::SoundFormat format;
            format.codec = kind.codec;
            format.version = version;
            format.bits = kind.bits;
            format.extensions = {
                movies::Box("pcmC").Version(0).U8(kind.isLittle ? 1 : 0).U8(kind.bits)};
            movies::Track track = movies::SoundTrack(format, 9600);
            track.samples[0].size = kind.bits / 8 * 2;
            track.data = ReadFile(raw);
            ASSERT_EQ(track.data.size(), 9600u * kind.bits / 8 * 2);
            const auto movie = WriteSound(track, "linear.mov");
            const std::string line = SoundLine(Describe(movie));
            EXPECT_EQ(line.substr(0, std::string(kind.label).size()), kind.label) << line;
            EXPECT_NE(line.find(" 9600 samples"), std::string::npos) << line;
            ExpectSame(Delivered(movie), {wanted.out.begin(), wanted.out.end()});
        }
    }
}

}  // namespace
