// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Movies.h"

#include <algorithm>
#include <cerrno>
#include <fstream>
#include <type_traits>

#include "reference_host/system/Paths.h"
#include "reference_host/validate/Trial.h"

namespace validate {
namespace {

using movies::Box;
using movies::Bytes;
using movies::Movie;
using movies::Track;

Track Picture(std::uint64_t frames = 25) {
    movies::VideoFormat format;
    format.codec = "apcn";
    format.width = 320;
    format.height = 240;
    return movies::VideoTrack(format, frames, 25, 1, 4000);
}

Track Sound(std::uint64_t frames = 48000) {
    return movies::SoundTrack(movies::SoundFormat(), frames);
}

Movie WholeMovie() {
    Movie movie;
    movie.tracks = {Picture(), Sound(), movies::TimecodeTrack(movies::TimecodeFormat(), 90000, 25)};
    return movie;
}

// Why the system refused to write. Streams tell no reason of their own.
std::error_code LastError() {
    return {errno != 0 ? errno : EIO, std::generic_category()};
}

SampleMovie Write(const Movie& movie, const std::filesystem::path& file, const char* about) {
    errno = 0;
    if (!movies::Build(movie).WriteTo(file)) {
        throw CannotWrite{file, LastError()};
    }
    return {about, file};
}

SampleMovie Write(const Bytes& bytes, const std::filesystem::path& file, const char* about) {
    WriteBytes(bytes, file);
    return {about, file};
}

Bytes Cut(Bytes bytes, std::size_t size) {
    bytes.resize(std::min(bytes.size(), size));
    return bytes;
}

Bytes FromText(std::string_view text) {
    return {text.begin(), text.end()};
}

Movie HeaderFirst() {
    Movie movie = WholeMovie();
    movie.header = movies::Place::kBeforeMedia;
    return movie;
}

Movie Of(Track track) {
    Movie movie;
    movie.tracks = {std::move(track)};
    return movie;
}

Bytes Nested(int depth) {
    Box box("moov");
    for (int i = 0; i < depth; ++i) {
        box = Box("trak").Add(box);
    }
    return Box("moov").Add(box).ToBytes();
}

Track WithTable(const Box& table) {
    Track track = Picture();
    track.replaced = {table};
    return track;
}

}  // namespace

std::vector<SampleMovie> WriteSoundMovies(const std::filesystem::path& folder) {
    Movie alone;
    alone.tracks = {Sound()};
    Movie two = WholeMovie();
    two.tracks.push_back(Sound(96000));
    return {WriteSoundMovie(folder), Write(Of(Picture()), folder / "picture.mov", "picture alone"),
            Write(alone, folder / "sound.mov", "sound alone"),
            Write(two, folder / "two sounds.mov", "picture and two sounds"),
            Write(HeaderFirst(), folder / "header_first.mov", "its header before the media")};
}

SampleMovie WriteSoundMovie(const std::filesystem::path& folder) {
    return Write(WholeMovie(), folder / "whole.mov", "picture, sound and timecode");
}

Bytes BytesOfSoundMovie() {
    Movie movie = WholeMovie();
    movie.tracks[1] = Sound(4800);  // short, since it is written often
    return movies::Build(movie).ToBytes();
}

std::vector<SampleMovie> WriteBrokenMovies(const std::filesystem::path& folder) {
    const Bytes whole = movies::Build(HeaderFirst()).ToBytes();
    return {Write(Bytes{}, folder / "empty.mov", "no byte"),
            Write(FromText("x"), folder / "one.mov", "one byte"),
            Write(FromText("This is a text and no movie.\n"), folder / "text.mov", "a text"),
            Write(Bytes(100000, 0), folder / "zeros.mov", "zeros"),
            Write(Cut(whole, 7), folder / "atom.mov", "less than an atom"),
            Write(Cut(whole, 300), folder / "header.mov", "less than its header"),
            Write(Cut(whole, whole.size() / 2), folder / "half.mov", "half of its media"),
            Write(Box("moov").ToBytes(), folder / "bare.mov", "a header with nothing in it"),
            Write(Movie(), folder / "trackless.mov", "no track")};
}

std::vector<SampleMovie> WriteHostileMovies(const std::filesystem::path& folder) {
    constexpr std::uint64_t kMost = 0xFFFFFFFF;
    Bytes large = Box("moov").ToBytes();
    large[0] = 0x7F;
    Movie timeless = WholeMovie();
    timeless.timeScale = 0;
    Movie endless = WholeMovie();
    endless.duration = kMost;
    Track flat = Picture();
    flat.mediaTimeScale = 0;
    Track away = Picture();
    away.dataReferences = {{"alis", false, "/no/such/file.mov"}};
    movies::VideoFormat vast;
    vast.width = 0xFFFF;
    vast.height = 0xFFFF;
    Track edited = Picture();
    edited.edits = {{kMost, -1, 1.0}, {kMost, 0x7FFFFFFF, 0.0}};
    return {
        Write(large, folder / "claims.mov", "an atom that claims 2 GB"),
        Write(Nested(2000), folder / "nested.mov", "atoms 2000 deep"),
        Write(Of(WithTable(Box("stsz").Version(0).U32(0).U32(kMost))), folder / "sizes.mov",
              "a table that claims 4,294,967,295 samples"),
        Write(Of(WithTable(Box("stts").Version(0).U32(1).U32(kMost).U32(kMost))),
              folder / "times.mov", "samples that last longer than 64 bits count"),
        Write(Of(WithTable(Box("stco").Version(0).U32(1).U32(kMost))), folder / "place.mov",
              "media beyond the end of the file"),
        Write(Of(WithTable(Box("stsc").Version(0).U32(1).U32(0).U32(0).U32(0))),
              folder / "chunks.mov", "chunks that begin with number 0"),
        Write(Of(WithTable(Box("stsd").Version(0).U32(kMost))), folder / "descriptions.mov",
              "a table that claims 4,294,967,295 descriptions"),
        Write(timeless, folder / "timeless.mov", "a time scale of 0"),
        Write(Of(flat), folder / "flat.mov", "a track with a time scale of 0"),
        Write(endless, folder / "endless.mov", "a header that claims the longest duration"),
        Write(Of(away), folder / "away.mov", "media in another file, which is not there"),
        Write(Of(movies::VideoTrack(vast, 25, 25, 1)), folder / "vast.mov",
              "pictures of 65,535 x 65,535"),
        Write(Of(edited), folder / "edited.mov", "edits beyond the end of the media"),
    };
}

std::vector<SampleMovie> WriteHugeMovies(const std::filesystem::path& folder) {
    Movie far = WholeMovie();
    far.filler = std::uint64_t{5} << 30;
    far.largeMedia = true;
    far.header = movies::Place::kBeforeMedia;
    Movie behind = WholeMovie();
    behind.filler = std::uint64_t{5} << 30;
    behind.largeMedia = true;
    for (Movie* const movie : {&far, &behind}) {
        for (Track& track : movie->tracks) {
            track.largeOffsets = true;
        }
    }
    Movie many = Of(Picture(200000));
    return {Write(far, folder / "far.mov", "5 GiB, its header in front"),
            Write(behind, folder / "behind.mov", "5 GiB, its header at the end"),
            Write(many, folder / "many.mov", "200,000 frames")};
}

std::vector<SampleMovie> WriteOddlyNamedMovies(const std::filesystem::path& folder) {
    std::vector<std::string> names = {
        "with a blank.mov",
        "quote\"s and 'more'.mov",
        "100%s %n.mov",
        "\xC3\xBC\xE2\x82\xAC\xF0\x9F\x8E\x9E.mov",
        "line\nend.mov",
        ".hidden.mov",
        "UPPER.MOV",
        "two.dots.mov",
        std::string(240, 'n') + ".mov",
    };
    // Where names are characters, such a byte would be half of one, which not every disk takes.
    if (std::is_same_v<std::filesystem::path::value_type, char>) {
        names.push_back("no UTF-8 \xFF.mov");
    }
    std::vector<SampleMovie> written;
    for (const std::string& name : names) {
        const std::filesystem::path file = folder / host::system::PathOfText(name);
        if (host::system::NameProblem(file).empty()) {
            written.push_back(Write(WholeMovie(), file, "a sound movie under an odd name"));
        }
    }
    return written;
}

Bytes Changed(Bytes bytes, std::mt19937_64& numbers) {
    constexpr std::uint8_t kTelling[] = {0x00, 0x01, 0x7F, 0x80, 0xFF};
    const std::uint64_t changes = 1 + numbers() % 8;
    for (std::uint64_t i = 0; i < changes && !bytes.empty(); ++i) {
        const std::size_t at = numbers() % bytes.size();
        switch (numbers() % 4) {
            case 0:
                bytes[at] = kTelling[numbers() % std::size(kTelling)];
                break;
            case 1:
                bytes[at] ^= static_cast<std::uint8_t>(1u << numbers() % 8);
                break;
            case 2:
                bytes.resize(at);
                break;
            default:
                bytes.insert(bytes.begin() + static_cast<std::ptrdiff_t>(at), numbers() % 9, 0xFF);
                break;
        }
    }
    return bytes;
}

void WriteBytes(const Bytes& bytes, const std::filesystem::path& file) {
    errno = 0;
    std::ofstream stream(file, std::ios::binary | std::ios::trunc);
    stream.write(reinterpret_cast<const char*>(bytes.data()),
                 static_cast<std::streamsize>(bytes.size()));
    if (!stream.flush()) {
        throw CannotWrite{file, LastError()};
    }
}

void MakeFolder(const std::filesystem::path& folder) {
    std::error_code error;
    std::filesystem::create_directory(folder, error);
    if (error) {
        throw CannotWrite{folder, error};
    }
}

void CutFile(const std::filesystem::path& file, std::uintmax_t size) {
    std::error_code error;
    std::filesystem::resize_file(file, size, error);
    if (error) {
        throw CannotWrite{file, error};
    }
}

}  // namespace validate
