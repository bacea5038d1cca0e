// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/Movie.h"

#include <fmt/format.h>

#include <algorithm>
#include <limits>

#include "reference_host/header_parser/NumberLimits.h"

namespace header_parser {

namespace {

struct MovieHeader {
    Atom atom;  // none before it is read
    std::optional<ncfUInt64> duration;
};

Verdict ReadMovieHeader(const Atom& mvhd, Movie& movie, MovieHeader& header) {
    ByteReader reader(mvhd.begin, mvhd.end);
    const unsigned version = reader.U8();
    reader.Skip(3);
    ncfUInt64 duration = 0;
    if (version == 1) {
        movie.creationTime = reader.U64();
        reader.Skip(8);
        movie.timeScale = reader.U32();
        duration = reader.U64();
    } else {
        movie.creationTime = reader.U32();
        reader.Skip(4);
        movie.timeScale = reader.U32();
        duration = reader.U32();
    }
    if (version > 1) {
        return OfUnknownVersion(mvhd, version);
    }
    if (reader.Failed()) {
        return CutShort(mvhd);
    }
    if (movie.timeScale == 0) {
        return Broken(mvhd, "'mvhd' gives a time scale of 0");
    }
    const ncfUInt64 unknown = version == 1 ? std::numeric_limits<ncfUInt64>::max() : kMax32;
    if (duration != 0 && duration != unknown) {
        header.duration = duration;
    }
    header.atom = mvhd;
    return Fine();
}

// The tracks need the movie's time scale, and mvhd need not stand first.
struct HeaderParts {
    MovieHeader header;
    std::vector<Atom> tracks;
};

Verdict SortParts(const ParserLimits& limits, Movie& movie, HeaderParts& parts) {
    AtomList atoms(movie.bytes.begin(), movie.bytes.end());
    Atom atom;
    while (atoms.Next(atom)) {
        Verdict verdict;
        if (atom.type == Code("mvhd") && !parts.header.atom) {
            verdict = ReadMovieHeader(atom, movie, parts.header);
        } else if (atom.type == Code("trak")) {
            parts.tracks.push_back(atom);
        } else if (atom.type == Code("mvex")) {
            verdict = NotSupported(atom, "the movie is fragmented, as 'mvex' shows");
        } else if (atom.type == Code("rmra")) {
            verdict = NotSupported(atom, "the movie only refers to other files, by 'rmra'");
        }
        if (verdict.Refused()) {
            return verdict;
        }
        if (parts.tracks.size() > limits.maxTracks) {
            return TooMuch(atom,
                           fmt::format("the movie has more than {} tracks", limits.maxTracks));
        }
    }
    // Zeros among the tracks are what a header looks like behind the end of a
    // cut file.
    const Verdict verdict = VerdictOn(atoms, "'moov'");
    if (verdict.Refused()) {
        return verdict;
    }
    return parts.header.atom ? Fine() : Broken("'moov' holds no 'mvhd'");
}

ncfUInt32 ChannelsOf(const Track& track) {
    ncfUInt32 most = 0;
    for (const SoundDescription& description : track.sound) {
        most = std::max(most, description.channels);
    }
    return most;
}

Verdict SetDuration(const MovieHeader& header, Movie& movie) {
    if (header.duration && *header.duration > kMax32) {
        return NotSupported(
            header.atom,
            fmt::format("the movie's duration of {} units does not fit 32 bits", *header.duration));
    }
    ncfUInt32 longest = 0;
    bool isShorterThanTold = false;
    for (const Track& track : movie.tracks) {
        longest = std::max(longest, track.duration);
        isShorterThanTold = isShorterThanTold || track.isShorterThanTold;
    }
    movie.duration = static_cast<ncfUInt32>(header.duration.value_or(longest));
    // The header repeats what its longest track tells.
    if (isShorterThanTold) {
        movie.duration = std::min(movie.duration, longest);
    }
    return Fine();
}

}  // namespace

Verdict ReadMovie(HeaderBytes&& bytes, const ParserLimits& limits, Movie& movie) {
    movie.bytes = std::move(bytes);
    Verdict verdict = Inflate(movie.bytes, limits, &movie.isUnpacked);
    HeaderParts parts;
    if (!verdict.Refused()) {
        verdict = SortParts(limits, movie, parts);
    }
    if (verdict.Refused()) {
        return verdict;
    }
    ncfUInt32 channels = 0;
    for (const Atom& trak : parts.tracks) {
        movie.tracks.emplace_back();
        verdict = ReadTrack(trak, movie.timeScale, limits, movie.tracks.back());
        if (verdict.Refused()) {
            return verdict;
        }
        const std::vector<bool>& isInFile = movie.tracks.back().isInFile;
        movie.isSelfContained = movie.isSelfContained && std::find(isInFile.begin(), isInFile.end(),
                                                                   false) == isInFile.end();
        channels += ChannelsOf(movie.tracks.back());
        if (channels > limits.maxSoundChannels) {
            return TooMuch("the sound tracks of the movie have more than 1024 channels in total");
        }
        movie.ofKind[static_cast<std::size_t>(movie.tracks.back().kind)].push_back(
            static_cast<ncfUInt32>(movie.tracks.size() - 1));
    }
    return SetDuration(parts.header, movie);
}

}  // namespace header_parser
