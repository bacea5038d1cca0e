// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/MovieAtoms.h"

#include <algorithm>
#include <array>
#include <limits>

namespace host {
namespace {

using header_parser::Code;
using header_parser::FileBytes;
using header_parser::LoadU16;
using header_parser::LoadU32;
using header_parser::LoadU64;
using header_parser::StoredAtom;
using header_parser::StoredAtoms;
using header_parser::StoredEntries;
using header_parser::StoredTable;

constexpr int kDeepest = 8;
constexpr std::size_t kMostTracks = 65536;
constexpr ncfUInt32 kMostReferences = 4096;
constexpr std::size_t kMostDescriptionChanges = 65536;
constexpr ncfUInt64 kMostEdits = 4096;

// Walks the atoms that lead to the few numbers wanted and steps over all
// others, so the cost does not grow with the media.
class Walker {
public:
    Walker(const std::filesystem::path& path, MovieAtoms& out) : source_(path), out_(out) {}

    void Run() { Walk(StoredAtoms(source_), 0); }

private:
    void Walk(StoredAtoms atoms, int depth) {
        for (StoredAtom atom; atoms.Next(atom) && !atom.isCutShort;) {
            Visit(atom, depth);
        }
    }

    void Visit(const StoredAtom& atom, int depth) {
        switch (atom.type) {
            case Code("moof"):
                out_.isFragmented = out_.isFragmented || depth == 0;
                return;
            case Code("trak"):
                if (out_.tracks.size() < kMostTracks) {
                    out_.tracks.emplace_back();
                    Descend(atom.begin, atom.end, depth);
                }
                return;
            case Code("moov"):
            case Code("mdia"):
            case Code("minf"):
            case Code("dinf"):
            case Code("stbl"):
            case Code("edts"):
                Descend(atom.begin, atom.end, depth);
                return;
            case Code("mvhd"):
                ReadTimes(atom, 0, out_.timeScale, out_.duration);
                return;
            default:
                if (!out_.tracks.empty()) {
                    VisitInTrack(atom, out_.tracks.back(), depth);
                }
        }
    }

    void VisitInTrack(const StoredAtom& atom, MovieAtoms::Track& track, int depth) {
        switch (atom.type) {
            case Code("tkhd"):
                ReadTimes(atom, 4, track.id, track.duration);
                return;
            case Code("mdhd"):
                ReadTimes(atom, 0, track.mediaTimeScale, track.mediaDuration);
                return;
            case Code("stsd"):
                ReadDescriptions(atom, track, depth);
                return;
            case Code("pcmC"):
                ReadLinearKind(atom, track);
                return;
            case Code("elst"):
                ReadEdits(atom, track);
                return;
            case Code("stts"):
                if (!track.durations && atom.Size() >= 8) {
                    track.durations = StoredTable(source_, atom.begin, atom.end, 8);
                }
                return;
            case Code("stsc"):
                ReadChunks(atom, track);
                return;
            case Code("dref"):
                ReadReferences(atom, track);
                return;
            default:
                return;
        }
    }

    void Descend(ncfUInt64 begin, ncfUInt64 end, int depth) {
        if (depth < kDeepest) {
            Walk(StoredAtoms(source_, begin, end), depth + 1);
        }
    }

    // The first bytes of an atom; false when it has fewer.
    template <std::size_t Size>
    bool Read(const StoredAtom& atom, ncfUInt8 (&bytes)[Size]) {
        return atom.Size() >= Size && source_.Read(atom.begin, bytes, Size);
    }

    // The number and, `between` bytes further on, the duration in a header: behind
    // version, flags and two dates, which version 1 has in 64 bits like the duration.
    void ReadTimes(const StoredAtom& atom, ncfUInt64 between, ncfUInt32& number,
                   ncfUInt64& duration) {
        const bool isLong = IsLong(atom);
        const ncfUInt64 numberAt = isLong ? 20 : 12;
        const ncfUInt64 durationAt = numberAt + 4 + between;
        ncfUInt8 bytes[8] = {};
        if (atom.Size() >= durationAt + (isLong ? 8 : 4) &&
            source_.Read(atom.begin + durationAt, isLong ? bytes : bytes + 4, isLong ? 8 : 4)) {
            number = source_.U32(atom.begin + numberAt);
            duration = LoadU64(bytes);
        }
    }

    bool IsLong(const StoredAtom& atom) { return source_.U32(atom.begin) >> 24 == 1; }

    void ReadEdits(const StoredAtom& atom, MovieAtoms::Track& track) {
        if (atom.Size() < 8) {
            return;
        }
        if (IsLong(atom)) {
            ReadEdits<5>(atom, track, [](const std::array<ncfUInt32, 5>& entry) {
                return MovieAtoms::Edit{
                    ncfUInt64{entry[0]} << 32 | entry[1],
                    static_cast<ncfSInt64>(ncfUInt64{entry[2]} << 32 | entry[3])};
            });
        } else {
            ReadEdits<3>(atom, track, [](const std::array<ncfUInt32, 3>& entry) {
                return MovieAtoms::Edit{entry[0], ncfSInt64{static_cast<ncfSInt32>(entry[1])}};
            });
        }
    }

    template <std::size_t Numbers, class ToEdit>
    void ReadEdits(const StoredAtom& atom, MovieAtoms::Track& track, ToEdit toEdit) {
        constexpr ncfUInt32 kPlainRate = 0x10000;
        const StoredTable table(source_, atom.begin, atom.end, Numbers * 4);
        StoredEntries<Numbers> entries(source_, table);
        std::vector<MovieAtoms::Edit> edits;
        for (std::array<ncfUInt32, Numbers> entry; entries.Next(entry);) {
            if (table.count > kMostEdits || entry.back() != kPlainRate) {
                return;
            }
            edits.push_back(toEdit(entry));
        }
        if (!entries.Failed()) {
            track.edits = std::move(edits);
        }
    }

    void ReadDescriptions(const StoredAtom& atom, MovieAtoms::Track& track, int depth) {
        ncfUInt8 bytes[8];
        if (Read(atom, bytes)) {
            // No description is shorter than its own head.
            track.descriptionCount =
                static_cast<ncfUInt32>(StoredTable(source_, atom.begin, atom.end, 16).count);
            ReadFirstDescription({0, atom.begin + 8, atom.end}, track, bytes[0] != 0, depth);
        }
    }

    // The size of pictures, and of the one kind of sound whose form stands in an
    // atom behind the fields, that. In a list of the ISO form version 1 adds none.
    void ReadFirstDescription(const StoredAtom& list, MovieAtoms::Track& track, bool isIso,
                              int depth) {
        constexpr ncfUInt64 kFields = 36;
        constexpr ncfUInt64 kFieldsOfVersion1 = kFields + 16;
        constexpr ncfUInt64 kFieldsOfVersion2 = kFields + 36;
        ncfUInt8 bytes[kFields + 4];
        if (!Read(list, bytes)) {
            return;
        }
        track.width = LoadU16(bytes + 32);
        track.height = LoadU16(bytes + 34);
        const ncfUInt64 size = LoadU32(bytes);
        const ncfUInt32 code = LoadU32(bytes + 4);
        const ncfUInt16 version = LoadU16(bytes + 16);
        const ncfUInt64 fields =
            version == 2 ? std::max<ncfUInt64>(kFieldsOfVersion2, LoadU32(bytes + kFields))
            : version == 1 && !isIso ? kFieldsOfVersion1
                                     : kFields;
        const bool isLinear = code == Code("ipcm") || code == Code("fpcm");
        if (isLinear && size >= fields && size <= list.Size()) {
            Descend(list.begin + fields, list.begin + size, depth);
        }
    }

    void ReadLinearKind(const StoredAtom& atom, MovieAtoms::Track& track) {
        ncfUInt8 bytes[6];
        if (Read(atom, bytes)) {
            track.isLittleEndian = (bytes[4] & 1) != 0;
            track.linearBits = bytes[5];
        }
    }

    // Each entry: first chunk, samples of a chunk, description. Tracks of one
    // description are left alone, for the table may be long.
    void ReadChunks(const StoredAtom& atom, MovieAtoms::Track& track) {
        if (track.descriptionCount < 2) {
            return;
        }
        StoredEntries<3> entries(source_, StoredTable(source_, atom.begin, atom.end, 12));
        std::array<ncfUInt32, 3> run, former{1, 0, 0};
        ncfUInt64 samples = 0;
        for (bool isFirst = true; track.descriptionChanges.size() < kMostDescriptionChanges &&
                                  entries.Next(run) && run[0] >= former[0];
             isFirst = false) {
            samples += ncfUInt64{run[0] - former[0]} * former[1];
            if (!isFirst && run[2] != former[2]) {
                track.descriptionChanges.push_back(samples);
            }
            former = run;
        }
    }

    // A reference whose lowest flag is set means this very file.
    void ReadReferences(const StoredAtom& atom, MovieAtoms::Track& track) {
        ncfUInt8 bytes[12];
        StoredAtom rest{0, atom.begin + 8, atom.end};
        for (ncfUInt32 i = 0; i < kMostReferences && rest.begin < rest.end && Read(rest, bytes);
             ++i) {
            track.needsOtherFiles = track.needsOtherFiles || (bytes[11] & 1) == 0;
            if (LoadU32(bytes) < sizeof bytes) {
                return;
            }
            rest.begin += LoadU32(bytes);
        }
    }

    FileBytes source_;
    MovieAtoms& out_;
};

}  // namespace

const MovieAtoms::Track* MovieAtoms::Find(ncfUInt32 id) const {
    for (const Track& track : tracks) {
        if (track.id == id) {
            return &track;
        }
    }
    return nullptr;
}

std::optional<SampleDurations> SumDurations(const std::filesystem::path& path,
                                            const MovieAtoms::Track& track) {
    constexpr ncfUInt64 kMost = std::numeric_limits<ncfUInt64>::max() / 2;
    if (!track.durations) {
        return std::nullopt;
    }
    FileBytes source(path);
    StoredEntries<2> runs(source, *track.durations);
    SampleDurations sum;
    for (std::array<ncfUInt32, 2> run; runs.Next(run);) {
        const ncfUInt64 units = ncfUInt64{run[0]} * run[1];
        if (units > kMost - sum.units) {
            return std::nullopt;
        }
        sum.samples += run[0];
        sum.units += units;
    }
    return runs.Failed() ? std::nullopt : std::optional(sum);
}

MovieAtoms ReadMovieAtoms(const std::filesystem::path& path) {
    MovieAtoms atoms;
    Walker(path, atoms).Run();
    return atoms;
}

}  // namespace host
