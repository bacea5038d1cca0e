// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/movie_writer/Movie.h"

#include <zlib.h>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <filesystem>
#include <fstream>

#include "reference_host/movie_writer/TrackAtoms.h"

namespace movies {

namespace {

using Layout = std::vector<std::vector<Chunk>>;  // chunks of each track

Box MovieHeader(const Movie& movie) {
    std::uint64_t duration = 0;
    for (const Track& track : movie.tracks) {
        duration = std::max(duration,
                            track.trackDuration.value_or(TrackDurationOf(track, movie.timeScale)));
    }
    duration = movie.duration.value_or(duration);
    Box box("mvhd");
    box.Version(movie.headerVersion);
    if (movie.headerVersion == 1) {
        box.U64(movie.creationTime).U64(movie.creationTime).U32(movie.timeScale).U64(duration);
    } else {
        box.U32(movie.creationTime).U32(movie.creationTime).U32(movie.timeScale).U32(duration);
    }
    box.Fixed16(1).U16(0x0100).Zeros(10);
    for (std::size_t i = 0; i < 9; ++i) {
        i % 3 == 2 ? box.Fixed30(movie.matrix[i]) : box.Fixed16(movie.matrix[i]);
    }
    return box.Zeros(24).U32(movie.nextTrackId);
}

Box PlainHeader(const Movie& movie, const Layout& layout) {
    Box box("moov");
    Put(box, MovieHeader(movie), movie.replaced, movie.omitted);
    for (std::size_t i = 0; i < movie.tracks.size(); ++i) {
        const Track& track = movie.tracks[i];
        const auto place = static_cast<std::uint32_t>(i + 1);
        Put(box,
            TrackBox(track, track.id ? track.id : place, movie.timeScale, movie.creationTime,
                     layout[i]),
            movie.replaced, movie.omitted);
    }
    box.Add(movie.inHeader);
    return box;
}

Box Compressed(const Box& header) {
    const Bytes plain = header.ToBytes();
    uLongf size = compressBound(static_cast<uLong>(plain.size()));
    Bytes packed(size);
    compress2(packed.data(), &size, plain.data(), static_cast<uLong>(plain.size()), 9);
    packed.resize(size);
    return Box("moov").Add(
        Box("cmov").Add(Box("dcom").Code("zlib")).Add(Box("cmvd").U32(plain.size()).Raw(packed)));
}

Bytes Header(const Movie& movie, const Layout& layout) {
    Box box = PlainHeader(movie, layout);
    if (movie.compressed) {
        box = Compressed(box);
    }
    if (movie.largeHeader) {
        box.LargeSize();
    }
    if (movie.headerToEnd) {
        box.SizeToEnd();
    }
    return box.ToBytes();
}

Bytes Join(const std::vector<Box>& boxes) {
    Bytes bytes;
    for (const Box& box : boxes) {
        const Bytes more = box.ToBytes();
        bytes.insert(bytes.end(), more.begin(), more.end());
    }
    return bytes;
}

// Chunks of all tracks in turn, as a recorder writes them; the place behind
// the last.
std::uint64_t PlaceChunks(const Movie& movie, std::uint64_t position, Layout& layout) {
    std::size_t longest = 0;
    for (const auto& chunks : layout) {
        longest = std::max(longest, chunks.size());
    }
    for (std::size_t i = 0; i < longest; ++i) {
        for (std::size_t track = 0; track < layout.size(); ++track) {
            if (i < layout[track].size()) {
                layout[track][i].position = position;
                position += layout[track][i].size + movie.tracks[track].gapBetweenChunks;
            }
        }
    }
    return position;
}

void PlaceData(const Movie& movie, const Layout& layout, MadeMovie& made) {
    for (std::size_t i = 0; i < layout.size(); ++i) {
        const Track& track = movie.tracks[i];
        std::size_t used = 0;
        for (const Chunk& chunk : layout[i]) {
            if (used == track.data.size() && track.fill == 0) {
                break;
            }
            const auto size = static_cast<std::size_t>(chunk.size);
            const std::size_t taken = std::min(size, track.data.size() - used);
            const auto begin = track.data.begin() + static_cast<std::ptrdiff_t>(used);
            Bytes bytes(begin, begin + static_cast<std::ptrdiff_t>(taken));
            if (track.fill != 0) {
                bytes.resize(size, track.fill);
            }
            used += taken;
            made.pieces.emplace_back(chunk.position, std::move(bytes));
        }
    }
}

void Append(MadeMovie& made, Bytes bytes) {
    const std::uint64_t position = made.size;
    made.size += bytes.size();
    if (!bytes.empty()) {
        made.pieces.emplace_back(position, std::move(bytes));
    }
}

// The header with its final offsets, in the room that the first try took: a
// compressed header may come out shorter or longer, so it gets some slack.
Bytes FittedHeader(const Movie& movie, const Layout& layout, std::size_t room) {
    Bytes header = Header(movie, layout);
    if (header.size() + 8 <= room) {
        const Bytes rest = Box("free").Zeros(room - header.size() - 8).ToBytes();
        header.insert(header.end(), rest.begin(), rest.end());
    }
    return header;
}

}  // namespace

MadeMovie Build(const Movie& movie) {
    Layout layout;
    for (const Track& track : movie.tracks) {
        layout.push_back(ChunksOf(track));
    }
    MadeMovie made;
    if (!movie.brand.empty()) {
        Append(made, Box("ftyp").Code(movie.brand).U32(0x200).Code(movie.brand).ToBytes());
    }
    Append(made, Join(movie.leading));

    const bool inFront = movie.header == Place::kBeforeMedia;
    const std::size_t first = Header(movie, layout).size();
    const std::size_t room = movie.compressed ? first + 1024 : first;
    const Bytes between = Join(movie.between);
    if (inFront) {
        made.headerPosition = made.size;
        made.size += room + between.size();
    }

    Box media("mdat");
    if (movie.largeMedia) {
        media.LargeSize();
    }
    if (movie.mediaToEnd) {
        media.SizeToEnd();
    }
    const std::uint64_t mediaStart = made.size;
    const std::uint64_t dataStart = mediaStart + media.HeaderSize() + movie.filler;
    const std::uint64_t dataEnd = PlaceChunks(movie, dataStart, layout);
    made.pieces.emplace_back(mediaStart,
                             media.HeaderBytes(dataEnd - mediaStart - media.HeaderSize()));
    PlaceData(movie, layout, made);
    made.size = dataEnd;

    if (inFront) {
        Bytes header = FittedHeader(movie, layout, room);
        made.headerSize = movie.compressed ? Header(movie, layout).size() : header.size();
        header.insert(header.end(), between.begin(), between.end());
        made.pieces.emplace_back(made.headerPosition, std::move(header));
    } else {
        Append(made, between);
        made.headerPosition = made.size;
        Append(made, Header(movie, layout));
        made.headerSize = made.size - made.headerPosition;
    }
    Append(made, Join(movie.trailing));
    return made;
}

Bytes MadeMovie::Range(std::uint64_t position, std::uint64_t wanted) const {
    Bytes bytes(static_cast<std::size_t>(wanted), 0);
    for (const auto& [start, piece] : pieces) {
        const std::uint64_t from = std::max(start, position);
        const std::uint64_t to = std::min(start + piece.size(), position + wanted);
        if (from < to) {
            std::copy(piece.begin() + static_cast<std::ptrdiff_t>(from - start),
                      piece.begin() + static_cast<std::ptrdiff_t>(to - start),
                      bytes.begin() + static_cast<std::ptrdiff_t>(from - position));
        }
    }
    return bytes;
}

Bytes MadeMovie::ToBytes() const {
    return Range(0, size);
}

bool MadeMovie::WriteTo(const std::filesystem::path& path) const {
    {
        std::ofstream stream(path, std::ios::binary | std::ios::trunc);
        for (const auto& [position, piece] : pieces) {
            stream.seekp(static_cast<std::streamoff>(position));
            stream.write(reinterpret_cast<const char*>(piece.data()),
                         static_cast<std::streamsize>(piece.size()));
        }
        if (!stream.flush()) {
            return false;
        }
    }
    std::error_code error;
    std::filesystem::resize_file(path, size, error);
    return !error;
}

Track VideoTrack(const VideoFormat& format, std::uint64_t frames, std::uint32_t timeScale,
                 std::uint32_t frameDuration, std::uint32_t bytesPerFrame) {
    Track track;
    track.handler = "vide";
    track.mediaTimeScale = timeScale;
    track.descriptions = {format.ToBox()};
    track.samples = {{frames, bytesPerFrame, frameDuration}};
    track.width = format.width;
    track.height = format.height;
    return track;
}

Track SoundTrack(const SoundFormat& format, std::uint64_t frames) {
    Track track;
    track.handler = "soun";
    track.mediaTimeScale = static_cast<std::uint32_t>(format.rate);
    track.descriptions = {format.ToBox()};
    track.samples = {{frames, format.channels * ((format.bits + 7) / 8), 1}};
    track.samplesPerChunk = std::max<std::uint64_t>(1, track.mediaTimeScale / 2);
    return track;
}

Track TimecodeTrack(const TimecodeFormat& format, std::int64_t startFrame, std::uint64_t frames) {
    Track track;
    track.handler = "tmcd";
    track.mediaTimeScale = format.timeScale;
    track.descriptions = {format.ToBox()};
    track.samples = {{1, 4, static_cast<std::uint32_t>(frames * format.frameDuration)}};
    const auto number = static_cast<std::uint32_t>(startFrame);
    for (int shift = 24; shift >= 0; shift -= 8) {
        track.data.push_back(static_cast<std::uint8_t>(number >> shift));
    }
    return track;
}

Track OtherTrack(const std::string& handler, std::uint64_t samples, std::uint32_t timeScale,
                 std::uint32_t duration) {
    Track track;
    track.handler = handler;
    track.mediaTimeScale = timeScale;
    track.descriptions = {Box(handler).Zeros(6).U16(1)};
    track.samples = {{samples, 16, duration}};
    return track;
}

}  // namespace movies
