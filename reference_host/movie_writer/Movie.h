// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "reference_host/movie_writer/Formats.h"

// Makes QuickTime and ISO base media files, in memory or on disk:
//
//     Movie movie;
//     movie.tracks.push_back(VideoTrack(VideoFormat(), 100, 25000, 1000));
//     movie.tracks.push_back(SoundTrack(SoundFormat(), 192000));
//     movie.tracks.push_back(TimecodeTrack(TimecodeFormat(), 90000, 100));
//     Build(movie).WriteTo("sample.mov");
//
// Everything is a plain field with a value that makes a sound movie; who makes one
// changes what it is about. Media bytes are holes unless a track says what
// they are, so a movie of many gigabytes costs no disk.
namespace movies {

struct SampleRun {
    std::uint64_t count = 1;
    std::uint32_t size = 1000;   // bytes of each
    std::uint32_t duration = 1;  // media time units of each
    std::int32_t displayOffset = 0;
    bool sync = true;
    bool disposable = false;
    unsigned description = 1;
};

struct Edit {
    std::uint64_t duration = 0;  // movie time units
    std::int64_t mediaTime = 0;  // media time units, -1 for an empty edit
    double rate = 1.0;
};

struct DataReference {
    std::string type = "url ";  // url, alis or rsrc
    bool selfContained = true;
    std::string text;
};

using Matrix = std::array<double, 9>;
inline constexpr Matrix kIdentity = {1, 0, 0, 0, 1, 0, 0, 0, 1};
inline constexpr Matrix kRotated90 = {0, 1, 0, -1, 0, 0, 0, 0, 1};
inline constexpr Matrix kRotated180 = {-1, 0, 0, 0, -1, 0, 0, 0, 1};
inline constexpr Matrix kRotated270 = {0, -1, 0, 1, 0, 0, 0, 0, 1};

struct Track {
    std::string handler = "vide";
    std::uint32_t id = 0;  // 0: its place among the tracks, from 1
    std::uint32_t flags = 0xF;
    std::uint32_t mediaTimeScale = 600;
    std::vector<Box> descriptions;
    std::vector<SampleRun> samples;
    std::uint64_t samplesPerChunk = 10;
    std::uint32_t gapBetweenChunks = 0;  // bytes
    std::vector<Edit> edits;             // none: no edit list
    std::vector<DataReference> dataReferences = {DataReference()};
    Matrix matrix = kIdentity;
    double width = 0;
    double height = 0;

    // Worked out of the samples unless given.
    std::optional<std::uint64_t> mediaDuration;
    std::optional<std::uint64_t> trackDuration;  // movie time units

    // Media bytes: those of the first samples one after the other, then
    // `fill`; a fill of 0 leaves holes.
    Bytes data;
    std::uint8_t fill = 0;

    // Forms of the tables.
    unsigned headerVersion = 0;                      // tkhd and mdhd
    unsigned editVersion = 0;                        // elst
    unsigned offsetVersion = 0;                      // ctts
    bool largeOffsets = false;                       // co64
    unsigned compactSizeBits = 0;                    // stz2 with this field size
    std::optional<std::uint32_t> claimedSampleSize;  // stsz says this size for all

    // Bends the atoms within the track: `replaced` stands in for an atom of
    // its type (`added` goes in besides, at the end of the sample table),
    // `omitted` names types that are left out.
    std::vector<Box> replaced;
    std::vector<Box> added;
    std::vector<std::string> omitted;
    std::vector<Box> userData;
    std::vector<Box> inTrack;  // in trak behind the others, such as tref
};

enum class Place { kBeforeMedia, kBehindMedia };

struct Movie {
    std::vector<Track> tracks;
    std::uint32_t timeScale = 600;
    std::optional<std::uint64_t> duration;     // the longest track unless given
    std::uint64_t creationTime = 3786825600u;  // 2024-01-01, in seconds from 1904
    std::uint32_t nextTrackId = 0xFFFFFFFF;
    unsigned headerVersion = 0;  // mvhd
    Matrix matrix = kIdentity;

    Place header = Place::kBehindMedia;
    std::string brand = "qt  ";  // empty: no ftyp
    bool largeMedia = false;     // 64-bit size of mdat
    bool mediaToEnd = false;     // size 0 of mdat; only with the header in front
    bool largeHeader = false;    // 64-bit size of moov
    bool headerToEnd = false;    // size 0 of moov; only with the header behind
    bool compressed = false;     // cmov with zlib
    std::uint64_t filler = 0;    // unused bytes in front of the media, a hole

    std::vector<Box> leading;   // behind ftyp
    std::vector<Box> between;   // between header and media
    std::vector<Box> trailing;  // at the end
    std::vector<Box> inHeader;  // in moov behind the tracks, such as udta, meta, mvex
    std::vector<Box> replaced;
    std::vector<std::string> omitted;
};

struct MadeMovie {
    std::uint64_t size = 0;
    std::uint64_t headerPosition = 0;  // of moov
    std::uint64_t headerSize = 0;
    std::vector<std::pair<std::uint64_t, Bytes>> pieces;  // the rest is zero

    Bytes ToBytes() const;                                  // whole, so for small movies
    bool WriteTo(const std::filesystem::path& path) const;  // with holes
    // The bytes [position, position + size), zeros past the end.
    Bytes Range(std::uint64_t position, std::uint64_t size) const;
};

MadeMovie Build(const Movie& movie);

// Tracks as they are mostly wanted. A video frame has `bytesPerFrame` bytes;
// a sound sample is one frame of all channels.
Track VideoTrack(const VideoFormat& format, std::uint64_t frames, std::uint32_t timeScale,
                 std::uint32_t frameDuration, std::uint32_t bytesPerFrame = 1000);
Track SoundTrack(const SoundFormat& format, std::uint64_t frames);
// One sample with the start as a frame number, `frames` long.
Track TimecodeTrack(const TimecodeFormat& format, std::int64_t startFrame, std::uint64_t frames);
// Another kind of track, such as "text", with one description of that code.
Track OtherTrack(const std::string& handler, std::uint64_t samples, std::uint32_t timeScale,
                 std::uint32_t duration);

}  // namespace movies
