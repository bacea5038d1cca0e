// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <ostream>

#include "tests/unit/header_parser/ParsedMovie.h"

namespace {

using movies::Box;
using movies::SoundFormat;

struct Sound {
    ncfUInt32 channels = 0;
    ncfUInt32 bits = 0;
    double rate = 0;
    ncfUInt32 bytes = 0;
    bool linear = false;
    bool little = false;
    bool constant = false;

    bool operator==(const Sound& other) const {
        return channels == other.channels && bits == other.bits && rate == other.rate &&
               bytes == other.bytes && linear == other.linear && little == other.little &&
               constant == other.constant;
    }
};

std::ostream& operator<<(std::ostream& out, const Sound& s) {
    return out << s.channels << " channels, " << s.bits << " bits, " << s.rate << " Hz, " << s.bytes
               << " bytes, linear " << s.linear << ", little " << s.little << ", constant "
               << s.constant;
}

ParsedMovie ParseMovie(const Box& entry, ncfUInt32 timeScale = 48000) {
    movies::Movie movie;
    movie.tracks = {movies::SoundTrack(SoundFormat(), 4800)};
    movie.tracks[0].mediaTimeScale = timeScale;
    movie.tracks[0].descriptions = {entry};
    return ParsedMovie(movie);
}

Sound Parse(const Box& entry, ncfUInt32 timeScale = 48000) {
    const auto description = ParseMovie(entry, timeScale).SoundDescription();
    if (!description) {
        return Sound();
    }
    Sound sound;
    sound.channels = Ask(description, &IAudioSampleDescription::GetChannelsPerFrame);
    sound.bits = Ask(description, &IAudioSampleDescription::GetBitsPerChannel);
    sound.rate = Ask(description, &IAudioSampleDescription::GetSampleRate);
    sound.bytes = Ask(description, &IAudioSampleDescription::GetBytesPerPacket);
    sound.linear = Ask(description, &IAudioSampleDescription::IsLPCM) == 1;
    sound.little = Ask(description, &IAudioSampleDescription::IsLittleEndian) == 1;
    sound.constant = Ask(description, &IAudioSampleDescription::IsConstantBitRate) == 1;
    return sound;
}

Sound Linear(ncfUInt32 channels, ncfUInt32 bits, bool little, double rate = 48000) {
    return {channels, bits, rate, channels * bits / 8, true, little, true};
}

SoundFormat Format(const char* codec, unsigned bits = 16, unsigned version = 0,
                   unsigned channels = 2) {
    SoundFormat format;
    format.codec = codec;
    format.bits = bits;
    format.version = version;
    format.channels = channels;
    return format;
}

TEST(SoundDescription, TellsTheOldLinearCodesInVersions0And1) {
    for (const unsigned version : {0u, 1u}) {
        EXPECT_EQ(Parse(Format("sowt", 16, version).ToBox()), Linear(2, 16, true));
        EXPECT_EQ(Parse(Format("twos", 16, version).ToBox()), Linear(2, 16, false));
        EXPECT_EQ(Parse(Format("twos", 8, version, 1).ToBox()), Linear(1, 8, false));
        EXPECT_EQ(Parse(Format("raw ", 8, version, 1).ToBox()), Linear(1, 8, false));
        EXPECT_EQ(Parse(Format("NONE", 8, version).ToBox()), Linear(2, 8, false));
        EXPECT_EQ(Parse(Format("NONE", 16, version).ToBox()), Linear(2, 16, false));
    }
}

TEST(SoundDescription, RefusesMoreChannelsThanAnyRecorderWrites) {
    EXPECT_EQ(Parse(Format("sowt", 16, 0, 1024).ToBox()), Linear(1024, 16, true));
    EXPECT_EQ(ParseMovie(Format("sowt", 16, 0, 1025).ToBox()).Reason(),
              "'sowt' has 1025 channels, at most 1024 are read");
}

TEST(SoundDescription, TakesACodeOfZeroForTheOldestLinearSound) {
    SoundFormat format;
    format.codec = std::string(4, '\0');
    EXPECT_EQ(Parse(format.ToBox()), Linear(2, 16, false));
    format.bits = 8;
    EXPECT_EQ(Parse(format.ToBox()), Linear(2, 8, false));
}

// The bits field says 16 for whatever is larger; the code tells.
TEST(SoundDescription, TakesTheDepthOfTheLargerCodesFromTheCode) {
    struct Case {
        const char* codec;
        unsigned bits;
    };
    for (const Case& c : {Case{"in24", 24}, Case{"in32", 32}, Case{"fl32", 32}, Case{"fl64", 64}}) {
        for (const unsigned version : {0u, 1u}) {
            SoundFormat format = Format(c.codec, 16, version, 6);
            EXPECT_EQ(Parse(format.ToBox()), Linear(6, c.bits, false)) << c.codec;
            format.littleEndian = true;
            EXPECT_EQ(Parse(format.ToBox()), Linear(6, c.bits, true)) << c.codec;
            format.wave = true;
            EXPECT_EQ(Parse(format.ToBox()), Linear(6, c.bits, true)) << c.codec;
            format.littleEndian = false;
            format.channelLayout = true;
            EXPECT_EQ(Parse(format.ToBox()), Linear(6, c.bits, false)) << c.codec;
        }
    }
}

TEST(SoundDescription, KeepsTheOrderOfACodeThatFixesIt) {
    SoundFormat format = Format("twos", 16, 1);
    format.wave = true;
    format.littleEndian = true;
    EXPECT_EQ(Parse(format.ToBox()), Linear(2, 16, false));
    format.codec = "sowt";
    format.littleEndian = false;
    EXPECT_EQ(Parse(format.ToBox()), Linear(2, 16, true));
}

TEST(SoundDescription, TakesAnImpossibleDepthForTheCodesUsualOne) {
    EXPECT_EQ(Parse(Format("sowt", 0).ToBox()), Linear(2, 16, true));
    EXPECT_EQ(Parse(Format("raw ", 0).ToBox()), Linear(2, 8, false));
}

TEST(SoundDescription, ReadsLinearSoundOfVersion2ByItsFlags) {
    SoundFormat format = Format("lpcm", 24, 2, 6);
    format.rate = 96000.5;
    format.linearFlags = movies::kLinearSigned | movies::kLinearPacked;
    EXPECT_EQ(Parse(format.ToBox()), Linear(6, 24, true, 96000.5));
    format.linearFlags |= movies::kLinearBigEndian;
    EXPECT_EQ(Parse(format.ToBox()), Linear(6, 24, false, 96000.5));
    format = Format("lpcm", 32, 2, 1);
    format.linearFlags = movies::kLinearFloat | movies::kLinearPacked;
    EXPECT_EQ(Parse(format.ToBox()), Linear(1, 32, true));
}

TEST(SoundDescription, CallsSoundWithGapsOrPlanesNotLinear) {
    SoundFormat format = Format("lpcm", 24, 2, 2);
    format.bytesPerPacket = 8;  // each channel in four bytes
    EXPECT_EQ(Parse(format.ToBox()), (Sound{2, 24, 48000, 8, false, true, true}));
    format.bytesPerPacket = 0;
    format.linearFlags = movies::kLinearSigned | 32;
    EXPECT_FALSE(Parse(format.ToBox()).linear);
}

TEST(SoundDescription, HasNoDepthForCompressedSound) {
    SoundFormat format = Format("mp4a", 16, 1);
    format.compressionId = -2;
    format.framesPerPacket = 1024;
    format.bytesPerFrame = 4;
    EXPECT_EQ(Parse(format.ToBox()), (Sound{2, 0, 48000, 0, false, false, false}));
    EXPECT_EQ(Parse(Format("ac-3").ToBox()), (Sound{2, 0, 48000, 0, false, false, false}));
}

TEST(SoundDescription, GivesThePacketOfCompressedSoundOfConstantSize) {
    EXPECT_EQ(Parse(Format("ulaw").ToBox()), (Sound{2, 0, 48000, 2, false, false, true}));
    EXPECT_EQ(Parse(Format("alaw", 16, 0, 1).ToBox()), (Sound{1, 0, 48000, 1, false, false, true}));
    EXPECT_EQ(Parse(Format("ima4").ToBox()), (Sound{2, 0, 48000, 68, false, false, true}));
    SoundFormat format = Format("agsm", 16, 1, 1);
    format.framesPerPacket = 160;
    format.bytesPerFrame = 33;
    EXPECT_EQ(Parse(format.ToBox()), (Sound{1, 0, 48000, 33, false, false, true}));
    format = Format("abcd", 0, 2, 2);
    format.bytesPerPacket = 200;
    format.framesPerPacket = 500;
    EXPECT_EQ(Parse(format.ToBox()), (Sound{2, 0, 48000, 200, false, false, true}));
}

TEST(SoundDescription, TakesTheRateOfTheMediaWhereItHasNone) {
    SoundFormat format = Format("sowt");
    format.rate = 0;
    EXPECT_EQ(Parse(format.ToBox(), 192000).rate, 192000.0);
}

TEST(SoundDescription, KeepsAFractionOfARate) {
    SoundFormat format = Format("sowt");
    format.rate = 22254.5454;
    EXPECT_NEAR(Parse(format.ToBox()).rate, 22254.5454, 1.0 / 65536);
}

TEST(SoundDescription, TakesRatesFrom1To1000000000) {
    SoundFormat format = Format("lpcm", 16, 2);
    for (const double rate : {1.0, 1e9}) {
        format.rate = rate;
        EXPECT_EQ(Parse(format.ToBox()).rate, rate);
    }
}

// In a list of the ISO form version 1 has no further fields, so the next bytes
// are extensions already.
TEST(SoundDescription, OfVersion1InAnIsoListHasItsExtensionsAtOnce) {
    movies::Movie movie;
    movie.tracks = {movies::SoundTrack(SoundFormat(), 4800)};
    Box entry("in24");
    entry.Zeros(6).U16(1).U16(1).Zeros(6).U16(2).U16(16).U32(0).Fixed16(48000);
    entry.Add(Box("enda").U16(1));
    movie.tracks[0].replaced = {Box("stsd").Version(1).U32(1).Add(entry)};
    const auto description = ParsedMovie(movie).SoundDescription();
    ASSERT_TRUE(description);
    EXPECT_EQ(Ask(description, &IAudioSampleDescription::IsLittleEndian), 1);
}

TEST(SoundTrack, CountsAByteOfOldLinearSoundAsAWholeFrame) {
    movies::Movie movie;
    movies::Track track = movies::SoundTrack(Format("twos", 16, 1), 1000);
    track.claimedSampleSize = 1;
    track.samplesPerChunk = 300;
    movie.tracks = {track};
    const ParsedMovie parsed(movie);
    const auto table = parsed.Samples();
    ASSERT_TRUE(table) << parsed.Reason();
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataSizePerSample, 1), 4u);
    EXPECT_EQ(Ask(table, &IQTSampleTable::GetMaxDataSizeInBytes), 4u);
    const ncfUInt64 first = AskSample(table, &IQTSampleTable::GetDataOffset, 1);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataOffset, 300), first + 299 * 4);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataOffset, 1000), first + 999 * 4);
    ncfUInt64 position = 0, size = 0;
    ASSERT_EQ(table->GetChunkFromTheMiddle(&position, &size), NCF_OK);
    EXPECT_EQ(position, first + 600 * 4);
    EXPECT_EQ(size, 300u * 4);
}

TEST(SoundTrack, PlacesFramesOfPacketsAtTheirPacket) {
    movies::Movie movie;
    movies::Track track = movies::SoundTrack(Format("ima4", 16, 0, 1), 640);
    track.claimedSampleSize = 1;
    track.samplesPerChunk = 320;  // five packets of 34 bytes
    movie.tracks = {track};
    const auto table = ParsedMovie(movie).Samples();
    ASSERT_TRUE(table);
    const ncfUInt64 first = AskSample(table, &IQTSampleTable::GetDataOffset, 1);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataOffset, 64), first);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataOffset, 65), first + 34);
    EXPECT_EQ(AskSample(table, &IQTSampleTable::GetDataSizePerSample, 65), 34u);
    ncfUInt64 position = 0, size = 0;
    ASSERT_EQ(table->GetChunkFromTheMiddle(&position, &size), NCF_OK);
    EXPECT_EQ(size, 170u);
}

TEST(SoundTrack, IsConstantWhenAllSamplesHaveOneSizeAndDuration) {
    movies::Movie movie;
    movie.tracks = {movies::SoundTrack(Format("sowt"), 1000)};
    ncfUInt32 answer = 9;
    EXPECT_EQ(ParsedMovie(movie).Sound()->HasConstantSampleRate(nullptr), 0);
    EXPECT_EQ(ParsedMovie(movie).Sound()->HasConstantSampleRate(&answer), 0);
    EXPECT_EQ(answer, 0u);
    movie.tracks[0].samples = {{999, 4, 1}, {1, 8, 1}};
    EXPECT_EQ(ParsedMovie(movie).Sound()->HasConstantSampleRate(&answer), 1);
    EXPECT_EQ(answer, 1u);
    movie.tracks[0].samples = {{999, 4, 1}, {1, 4, 2}};
    EXPECT_EQ(ParsedMovie(movie).Sound()->HasConstantSampleRate(&answer), 1);
    // A table that tells the same size for each one.
    movie.tracks[0].samples = {{1000, 4, 1}};
    movie.tracks[0].compactSizeBits = 8;
    EXPECT_EQ(ParsedMovie(movie).Sound()->HasConstantSampleRate(&answer), 0);
    EXPECT_EQ(answer, 0u);
}

}  // namespace
