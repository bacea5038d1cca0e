// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "reference_host/movie_writer/Movie.h"

// Movies of compressed sound that FFmpeg does not write: its packets, put into
// the tests' own header.

using SoundPackets = std::vector<movies::Bytes>;

// The packets of the first sound stream of a file.
SoundPackets SoundPacketsOf(const std::filesystem::path& file);
SoundPackets Joined(const SoundPackets& first, const SoundPackets& second);

// A track with each packet as a sample of `duration` in units of `timeScale`.
movies::Track SoundTrackOf(const SoundPackets& packets, const movies::SoundFormat& format,
                           std::uint32_t timeScale, std::uint32_t duration);

// The description of sound by number of its kind, as in MPEG-4, with the
// decoder's configuration, which may be empty.
movies::SoundFormat Mpeg4Sound(unsigned kind, const movies::Bytes& config, unsigned channels,
                               double rate);

// Packets of AAC, each with an extension of spectral bands that says nothing:
// decoders that find it make the upper half of the bands out of it.
SoundPackets WithEmptyBandExtension(const SoundPackets& packets);

// Blocks of the narrow telephone sound, of the lowest rate: twenty milliseconds
// in thirteen bytes each.
SoundPackets TelephoneBlocks(std::size_t count, unsigned seed);
