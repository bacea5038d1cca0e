// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <random>
#include <string>
#include <vector>

#include "reference_host/cliphost/Essence.h"
#include "reference_host/cliphost/FrameReader.h"
#include "reference_host/cliphost/SoundReader.h"
#include "tests/system/Command.h"

// What the essence tests compare with: FFmpeg's own commands over the same file.

using EssenceBytes = std::vector<std::uint8_t>;

// What ffmpeg gives for a movie with arguments between it and the output, and
// `before` in front of the movie.
EssenceBytes Decoded(const std::filesystem::path& movie, const std::string& arguments,
                     const std::string& before = "");

// A packet of a stream as ffprobe reads it, without edit lists, in file order of
// the stream, which is that of decoding.
struct Packet {
    std::uint64_t position = 0;
    std::uint64_t size = 0;
    std::int64_t time = 0;  // of presentation, in the stream's units
    bool isKey = false;
};
std::vector<Packet> PacketsOf(const std::filesystem::path& movie, const std::string& stream);

// All frames of a track, one behind the other; fails the test where one fails.
EssenceBytes AllFrames(cliphost::Essence& essence, cliphost::TrackKind kind,
                       const std::string& format);
EssenceBytes OneFrame(cliphost::FrameReader& reader, std::uint64_t frame);

// Signal to noise in decibels, infinite when equal, 0 when the sizes differ.
double SignalToNoise(const EssenceBytes& a, const EssenceBytes& b);
double SignalToNoise16(const std::vector<std::uint16_t>& a, const std::vector<std::uint16_t>& b);

// A random range of a sound is what `all`, the whole sound, holds there.
void ExpectRandomRange(cliphost::SoundReader& reader, std::mt19937& random,
                       const EssenceBytes& all);
