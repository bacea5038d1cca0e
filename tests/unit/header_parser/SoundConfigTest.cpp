// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <ostream>
#include <random>

#include "tests/unit/header_parser/ParsedMovie.h"

// What the decoder's configuration tells of compressed sound, where the fields
// of the description are a template.

namespace {

using movies::Box;
using movies::Bytes;
using movies::SoundFormat;

struct ToldSound {
    ncfUInt32 channels = 0;
    double rate = 0;

    bool operator==(const ToldSound& other) const {
        return channels == other.channels && rate == other.rate;
    }
};

std::ostream& operator<<(std::ostream& out, const ToldSound& told) {
    return out << told.channels << " channels at " << told.rate;
}

// The fields say 2 channels at 48000.
ToldSound ParseConfig(const std::string& codec, const Box& config, bool isWave = false) {
    SoundFormat format;
    format.codec = codec;
    format.extensions = {config};
    format.rate = codec == "mlpa" ? 48000 / 65536.0 : 48000;  // there a whole number
    format.wave = isWave;
    format.version = isWave ? 1 : 0;
    movies::Movie movie;
    movie.tracks = {movies::SoundTrack(format, 4800)};
    movie.tracks[0].mediaTimeScale = 48000;
    const ParsedMovie parsed(movie);
    const auto description = parsed.SoundDescription();
    if (!description) {
        ADD_FAILURE() << parsed.Reason();
        return {};
    }
    return {Ask(description, &IAudioSampleDescription::GetChannelsPerFrame),
            Ask(description, &IAudioSampleDescription::GetSampleRate)};
}

constexpr ToldSound kTemplate{2, 48000};

// With sizes in one byte each, as they need.
Box Esds(unsigned kind, const Bytes& config) {
    const auto size = static_cast<unsigned>(config.size());
    return Box("esds")
        .Version(0)
        .U8(3)
        .U8(20 + size)
        .U16(0)
        .U8(0)
        .U8(4)
        .U8(15 + size)
        .U8(kind)
        .U8(0x15)
        .Zeros(11)
        .U8(5)
        .U8(size)
        .Raw(config);
}

TEST(SoundConfig, OfAacTellsChannelsAndRate) {
    struct Case {
        const char* name;
        Bytes config;
        ToldSound told;
    };
    for (const Case& c : {
             Case{"plain", {0x12, 0x10}, {2, 44100}},
             Case{"one channel", {0x11, 0x88}, {1, 48000}},
             Case{"eight channels", {0x11, 0xB8}, {8, 48000}},
             Case{"rate in full", {0x17, 0x80, 0x05, 0x62, 0xA8}, {5, 2757}},
             Case{"bands in front", {0x2B, 0x92, 0x08, 0x00}, {2, 44100}},
             Case{"stereo in front", {0xEB, 0x8A, 0x08, 0x00}, {2, 44100}},
             Case{"bands behind", {0x13, 0x90, 0x56, 0xE5, 0xA0}, {2, 44100}},
             Case{"no bands behind", {0x13, 0x90, 0x56, 0xE5, 0x00}, {2, 22050}},
             Case{"stereo behind", {0x13, 0x88, 0x56, 0xE5, 0xA5, 0x48, 0x80}, {2, 44100}},
             Case{"stereo denied", {0x13, 0x88, 0x56, 0xE5, 0xA5, 0x48, 0x00}, {1, 44100}},
             Case{"stereo not spoken of", {0x13, 0x88, 0x56, 0xE5, 0xA0}, {2, 44100}},
             Case{"bands of the same rate", {0x13, 0x90, 0x56, 0xE5, 0xB8}, {2, 22050}},
         }) {
        SCOPED_TRACE(c.name);
        for (const unsigned kind : {0x40u, 0x66u, 0x67u, 0x68u}) {
            EXPECT_EQ(ParseConfig("mp4a", Esds(kind, c.config)), c.told);
        }
        EXPECT_EQ(ParseConfig("mp4a", Esds(0x40, c.config), true), c.told);
    }
}

// Arrangement 0: an element lists what there is. Two in front, of which one is
// a pair, one pair behind, one low.
TEST(SoundConfig, OfAacCountsTheChannelsOfAProgram) {
    const Bytes config = {0x11, 0x80, 0x04, 0xC8, 0x05, 0x00, 0x01, 0x08, 0x80};
    EXPECT_EQ(ParseConfig("mp4a", Esds(0x40, config)), (ToldSound{6, 48000}));
}

// Of another kind, here of speech, the same bits mean something else.
TEST(SoundConfig, OfAacWithoutAProgramLeavesTheChannels) {
    const Bytes config = {0x41, 0x80, 0x04, 0xC8, 0x05, 0x00, 0x01, 0x08, 0x80};
    EXPECT_EQ(ParseConfig("mp4a", Esds(0x40, config)), (ToldSound{2, 48000}));
}

// Each bit of the further speakers by itself, from the highest.
TEST(SoundConfig, OfEac3CountsFurtherSpeakersByTheirBits) {
    constexpr unsigned kSpeakers[] = {1, 1, 2, 2, 2, 1, 1, 2, 2};
    for (unsigned i = 0; i < 9; ++i) {
        const Box config = Box("dec3").U16(0x0C00).U8(0x20).U8(0x0F).U16(0x0200 | 0x100u >> i);
        EXPECT_EQ(ParseConfig("ec-3", config), (ToldSound{6 + kSpeakers[i], 48000})) << i;
    }
}

TEST(SoundConfig, OfOtherKindsTellsChannelsAndRate) {
    Box opus("dOps");
    opus.U8(0).U8(1).U16(312).U32(44100).U16(0).U8(0);
    EXPECT_EQ(ParseConfig("Opus", opus), (ToldSound{1, 48000}));
    EXPECT_EQ(ParseConfig("ac-3", Box("dac3").U8(0x50).U8(0x11).U8(0x40)), (ToldSound{2, 44100}));
    EXPECT_EQ(ParseConfig("ac-3", Box("dac3").U8(0x10).U8(0x3D).U8(0x40)), (ToldSound{6, 48000}));
    EXPECT_EQ(ParseConfig("ac-3", Box("dac3").U8(0x12).U8(0x10).U8(0)).rate, 24000);
    EXPECT_EQ(ParseConfig("ec-3", Box("dec3").U16(0x0C00).U8(0x20).U8(0x0F).U8(0)),
              (ToldSound{6, 48000}));
    EXPECT_EQ(ParseConfig("ec-3", Box("dec3").U16(0x0C00).U8(0x20).U8(0x0F).U16(0x0202)),
              (ToldSound{8, 48000}));
    EXPECT_EQ(ParseConfig("fLaC", Box("dfLa").Version(0).U32(0x80000022).Zeros(10).U32(0x0AC440F0)),
              (ToldSound{1, 44100}));
    Box alac("alac");
    alac.Version(0).U32(4096).U8(0).U8(16).U8(40).U8(10).U8(14).U8(6).U16(255).U32(0).U32(0);
    alac.U32(96000);
    EXPECT_EQ(ParseConfig("alac", alac), (ToldSound{6, 96000}));
    EXPECT_EQ(ParseConfig("alac", alac, true), (ToldSound{6, 96000}));
    const Bytes vorbis = {2, 30, 40, 1, 'v', 'o',  'r',  'b', 'i', 's',
                          0, 0,  0,  0, 1,   0x44, 0xAC, 0,   0};
    EXPECT_EQ(ParseConfig("mp4a", Esds(0xDD, vorbis)), (ToldSound{1, 44100}));
    EXPECT_EQ(ParseConfig("mlpa", Box("dmlp").U32(0x10008001).Zeros(6)), (ToldSound{2, 96000}));
    EXPECT_EQ(ParseConfig("mlpa", Box("dmlp").U32(0x80078000).Zeros(6)), (ToldSound{6, 44100}));
    EXPECT_EQ(ParseConfig("mlpa", Box("dmlp").U32(0x0007804F).Zeros(6)), (ToldSound{8, 48000}));
    EXPECT_EQ(ParseConfig("samr", Box("damr").Zeros(9)), (ToldSound{1, 8000}));
    EXPECT_EQ(ParseConfig("sawb", Box("damr").Zeros(9)), (ToldSound{1, 16000}));
}

TEST(SoundConfig, ThatIsMissingLeavesTheFields) {
    for (const char* const codec :
         {"mp4a", "Opus", "ac-3", "ec-3", "fLaC", "alac", "mlpa", "QDM2"}) {
        EXPECT_EQ(ParseConfig(codec, Box("free")), kTemplate) << codec;
    }
    EXPECT_EQ(ParseConfig("mp4a", Esds(0x6B, {})), kTemplate);
    EXPECT_EQ(ParseConfig("mp4a", Esds(0x99, {0x12, 0x10})), kTemplate);
}

// Cut at any byte, a configuration tells what stands in it or nothing.
TEST(SoundConfig, CutShortTellsNothingFalse) {
    const Bytes stereo = {0x13, 0x88, 0x56, 0xE5, 0xA5, 0x48, 0x80};
    const Bytes whole = Esds(0x40, stereo).ToBytes();
    const Bytes body(whole.begin() + 8, whole.end());
    for (std::size_t size = 0; size < body.size(); ++size) {
        const ToldSound told = ParseConfig(
            "mp4a", Box("esds").Raw({body.begin(), body.begin() + static_cast<int>(size)}));
        const bool isPossible = told == kTemplate || told == ToldSound{1, 22050} ||
                                told == ToldSound{1, 44100} || told == ToldSound{2, 44100};
        EXPECT_TRUE(isPossible) << size << ": " << told;
    }
    for (const auto& [codec, config] : {std::pair{"Opus", "dOps"},
                                        {"ac-3", "dac3"},
                                        {"ec-3", "dec3"},
                                        {"fLaC", "dfLa"},
                                        {"alac", "alac"},
                                        {"mlpa", "dmlp"}}) {
        EXPECT_EQ(ParseConfig(codec, Box(config)).channels, 2u) << config;
    }
}

// Sizes within it that say more than there is end where the atom does.
TEST(SoundConfig, WithLyingSizesIsReadAsFarAsItGoes) {
    Box esds("esds");
    esds.Version(0).U8(3).U32(0xFFFFFF7F).U16(0).U8(0).U8(4).U32(0xFFFFFF7F).U8(0x40).U8(0x15);
    esds.Zeros(11).U8(5).U32(0xFFFFFF7F).U16(0x1388);
    EXPECT_EQ(ParseConfig("mp4a", esds), (ToldSound{1, 22050}));
    Box empty("esds");
    empty.Version(0).U8(3).U8(0).U16(0).U8(0).U8(4).U8(0).U8(0x40);
    EXPECT_EQ(ParseConfig("mp4a", empty), kTemplate);
    Box url("esds");
    url.Version(0).U8(3).U8(30).U16(0).U8(0x40).U8(255).Zeros(10);
    EXPECT_EQ(ParseConfig("mp4a", url), kTemplate);
}

TEST(SoundConfig, OfImpossibleNumbersLeavesTheFields) {
    EXPECT_EQ(ParseConfig("mp4a", Esds(0x40, {0x16, 0x90})), kTemplate);  // rate 13
    Box alac("alac");
    alac.Version(0).U32(4096).U8(0).U8(16).U8(40).U8(10).U8(14).U8(0).U16(255).U32(0).U32(0);
    alac.U32(0xFFFFFFFF);
    EXPECT_EQ(ParseConfig("alac", alac), kTemplate);
    EXPECT_EQ(ParseConfig("mlpa", Box("dmlp").U32(0xF0078000).Zeros(6)), kTemplate);
}

TEST(SoundConfig, OfRandomBytesIsTakenOrLeft) {
    const unsigned seed = std::random_device()();
    SCOPED_TRACE("seed " + std::to_string(seed));
    std::mt19937 random(seed);
    const char* const codecs[][2] = {{"mp4a", "esds"}, {"Opus", "dOps"}, {"ac-3", "dac3"},
                                     {"ec-3", "dec3"}, {"fLaC", "dfLa"}, {"alac", "alac"},
                                     {"mlpa", "dmlp"}};
    for (int i = 0; i < 3000; ++i) {
        Bytes bytes(random() % 40);
        for (auto& byte : bytes) {
            byte = static_cast<std::uint8_t>(random());
        }
        const auto& codec = codecs[random() % std::size(codecs)];
        const Box box = random() % 2 && codec[0] == std::string("mp4a") ? Esds(0x40, bytes)
                                                                        : Box(codec[1]).Raw(bytes);
        const ToldSound told = ParseConfig(codec[0], box);
        ASSERT_GE(told.rate, 1.0);
        ASSERT_LE(told.rate, 1e9);
        ASSERT_LE(told.channels, 255u);
    }
}

TEST(SoundConfig, OfIsoLinearSoundTellsDepthAndOrder) {
    struct Case {
        const char* codec;
        unsigned bits;
    };
    for (const Case& c : {Case{"ipcm", 16}, Case{"ipcm", 24}, Case{"ipcm", 32}, Case{"fpcm", 32},
                          Case{"fpcm", 64}}) {
        for (const bool isLittle : {false, true}) {
            SoundFormat format;
            format.codec = c.codec;
            format.bits = 16;  // a template
            format.extensions = {Box("pcmC").Version(0).U8(isLittle ? 1 : 0).U8(c.bits)};
            movies::Movie movie;
            movie.tracks = {movies::SoundTrack(format, 4800)};
            movie.tracks[0].samples[0].size = c.bits / 4;
            const auto description = ParsedMovie(movie).SoundDescription();
            ASSERT_TRUE(description) << c.codec;
            EXPECT_EQ(Ask(description, &IAudioSampleDescription::GetBitsPerChannel), c.bits);
            EXPECT_EQ(Ask(description, &IAudioSampleDescription::GetBytesPerPacket), c.bits / 4);
            EXPECT_EQ(Ask(description, &IAudioSampleDescription::IsLPCM), 1);
            EXPECT_EQ(Ask(description, &IAudioSampleDescription::IsLittleEndian), isLittle);
            EXPECT_EQ(Ask(description, &IAudioSampleDescription::IsConstantBitRate), 1);
        }
    }
}

TEST(SoundConfig, OfIsoLinearSoundRefusesDepthsThatItDoesNotHave) {
    for (const unsigned bits : {0u, 8u, 20u, 64u, 255u}) {
        SoundFormat format;
        format.codec = "ipcm";
        format.extensions = {Box("pcmC").Version(0).U8(1).U8(bits)};
        movies::Movie movie;
        movie.tracks = {movies::SoundTrack(format, 4800)};
        EXPECT_EQ(ParsedMovie(movie).Reason(),
                  "'ipcm' has 2 channels of " + std::to_string(bits) + " bits");
    }
}

}  // namespace
