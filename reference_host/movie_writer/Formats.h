// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "reference_host/movie_writer/Box.h"

// Sample descriptions: fill in what the movie is about, the rest stands.
namespace movies {

struct VideoFormat {
    std::string codec = "avc1";
    unsigned width = 1920;
    unsigned height = 1080;
    unsigned depth = 24;
    std::string vendor;  // empty: 0
    std::string compressorName;
    unsigned dataReference = 1;

    std::optional<std::pair<unsigned, unsigned>> fields;  // fiel: count, detail
    std::optional<std::array<unsigned, 3>> nclc;          // primaries, transfer, matrix
    std::optional<std::array<unsigned, 3>> nclx;          // the same, ISO form
    std::optional<std::pair<std::uint32_t, std::uint32_t>> pixelAspect;  // pasp
    std::optional<std::array<std::int32_t, 8>> cleanAperture;  // width, height, x, y as fractions
    std::optional<double> gamma;

    // The project's own user atoms, see docs/user_atoms.md.
    std::optional<std::string> rasterText;
    std::optional<std::string> colorText;
    std::optional<std::uint32_t> resolutionId;
    std::optional<std::vector<std::uint32_t>> alphaCodings;

    std::vector<Box> extensions;  // further atoms, in front of the others
    bool closingZero = false;     // four zero bytes behind the last atom

    Box ToBox() const;
};

// Flags of `lpcm` descriptions.
enum LinearFlags : unsigned {
    kLinearFloat = 1,
    kLinearBigEndian = 2,
    kLinearSigned = 4,
    kLinearPacked = 8,
};

struct SoundFormat {
    std::string codec = "sowt";
    unsigned version = 0;
    unsigned channels = 2;
    unsigned bits = 16;  // what the bits field says; version 2: the true depth
    double rate = 48000;
    unsigned dataReference = 1;

    // Versions 1 and 2. Bytes of 0 are worked out of bits and channels.
    int compressionId = 0;
    unsigned framesPerPacket = 1;
    unsigned bytesPerPacket = 0;  // of one channel in version 1, of all in version 2
    unsigned bytesPerFrame = 0;   // of all channels, version 1
    unsigned bytesPerSample = 2;
    unsigned linearFlags = kLinearSigned | kLinearPacked;  // version 2

    bool wave = false;                 // wraps enda in a wave atom with frma
    std::optional<bool> littleEndian;  // enda
    bool channelLayout = false;        // chan
    std::vector<Box> extensions;

    Box ToBox() const;
};

// Flags of `tmcd` descriptions.
enum TimecodeFlags : unsigned {
    kTimecodeDrop = 1,
    kTimecode24Hours = 2,
    kTimecodeNegative = 4,
    kTimecodeCounter = 8,
};

struct TimecodeFormat {
    std::uint32_t timeScale = 25;
    std::uint32_t frameDuration = 1;
    unsigned numFrames = 25;
    unsigned flags = kTimecode24Hours;
    bool wideReserve = false;  // three bytes behind the number of frames, not one
    std::string reelName;
    unsigned dataReference = 1;

    Box ToBox() const;
};

}  // namespace movies
