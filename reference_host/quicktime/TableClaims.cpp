// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/TableClaims.h"

#include <algorithm>
#include <array>
#include <limits>
#include <utility>
#include <vector>

#include "reference_host/header_parser/Movie.h"
#include "reference_host/header_parser/StoredAtom.h"

// Atoms are walked as the library walks them, which forgives much: an atom that
// ends behind its parent ends with it, and unknown ones are stepped over.

namespace host {
namespace {

using header_parser::ByteSource;
using header_parser::Code;
using header_parser::StoredAtom;
using header_parser::StoredAtoms;
using header_parser::StoredEntries;
using header_parser::StoredTable;

constexpr int kDeepest = 12;
// Sound is indexed in pieces of as many samples at least.
constexpr ncfUInt64 kSamplesOfASoundPiece = 160;
constexpr ncfUInt64 kMostHeaderToUnpack = ncfUInt64{64} << 20;

// What a track's tables say before they are put together.
struct TrackTables {
    ncfUInt64 samples = 0;
    ncfUInt64 chunks = 0;
    StoredTable durations;  // stts: samples, time units
    StoredTable runs;       // stsc: first chunk, samples of a chunk, description
    StoredTable syncs;      // stss
    StoredTable edits;      // elst
    bool hasLongEdits = false;
    bool isSound = false;
    ncfUInt32 timeScale = 0;
};

enum class Claim { Samples, DisplayTimes, Groups, Fragments, Edits };
constexpr std::array<const char*, 5> kClaimWords = {
    "'stsz' counts", "'ctts' counts", "'sbgp' counts", "'trun' counts", "the edits play"};

class Walker {
public:
    // `fileLength`: of the file that the bytes come from. `isPlain`: the bytes came
    // out of a packed header, and none is packed twice.
    Walker(ByteSource& source, ncfUInt64 fileLength, bool isPlain)
        : source_(source),
          fileLength_(fileLength),
          isPlain_(isPlain),
          limit_(std::max(fileLength, kClaimsAlwaysFine)) {}

    std::string Run() {
        Walk(StoredAtoms(source_), 0);
        return problem_;
    }

private:
    // Whether an atom is of version 1, whose numbers are of 64 bits.
    bool IsLong(const StoredAtom& atom) { return source_.U32(atom.begin) >> 24 == 1; }

    // What a header atom tells behind version, flags and two dates.
    ncfUInt32 NumberIn(const StoredAtom& header) {
        return source_.U32(header.begin + (IsLong(header) ? 20 : 12));
    }

    void Walk(StoredAtoms atoms, int depth) {
        for (StoredAtom atom; problem_.empty() && depth < kDeepest && atoms.Next(atom);) {
            Visit(atom, depth);
        }
    }

    void Visit(const StoredAtom& atom, int depth) {
        switch (atom.type) {
            case Code("trak"):
                ReadTrack(atom, depth);
                return;
            case Code("cmov"):
                if (!isPlain_) {
                    Unpack(atom);
                }
                return;
            case Code("moov"):
            case Code("mdia"):
            case Code("minf"):
            case Code("dinf"):
            case Code("stbl"):
            case Code("edts"):
            case Code("mvex"):
            case Code("udta"):
            case Code("moof"):
            case Code("traf"):
            case Code("tref"):
                Walk(StoredAtoms(source_, atom.begin, atom.end), depth + 1);
                return;
            case Code("hdlr"):
                tables_.isSound = tables_.isSound || source_.U32(atom.begin + 8) == Code("soun");
                return;
            case Code("mdhd"):
                tables_.timeScale = NumberIn(atom);
                return;
            case Code("mvhd"):
                timeScale_ = NumberIn(atom);
                return;
            case Code("stsz"):
            case Code("stz2"):
                tables_.samples = std::max<ncfUInt64>(tables_.samples, source_.U32(atom.begin + 8));
                return;
            case Code("stco"):
                tables_.chunks = std::max(tables_.chunks, TableIn(atom, 4).count);
                return;
            case Code("co64"):
                tables_.chunks = std::max(tables_.chunks, TableIn(atom, 8).count);
                return;
            case Code("stts"):
                tables_.durations = TableIn(atom, 8);
                return;
            case Code("stsc"):
                tables_.runs = TableIn(atom, 12);
                return;
            case Code("stss"):
                tables_.syncs = TableIn(atom, 4);
                return;
            case Code("elst"):
                tables_.hasLongEdits = IsLong(atom);
                tables_.edits = TableIn(atom, tables_.hasLongEdits ? 20 : 12);
                return;
            case Code("ctts"):
                Add(Claim::DisplayTimes, SumOfFirsts(TableIn(atom, 8)));
                return;
            case Code("sbgp"): {
                // The kind of group stands in front of the count.
                const ncfUInt64 kind = IsLong(atom) ? 8 : 4;
                Add(Claim::Groups, SumOfFirsts({source_, atom.begin + kind, atom.end, 8}));
                return;
            }
            case Code("tkhd"):
                numbers_.resize(static_cast<std::size_t>(tracks_));
                if (!numbers_.empty()) {
                    numbers_.back() = NumberIn(atom);
                }
                return;
            case Code("tfhd"):
                fragmentOf_ = source_.U32(atom.begin + 4);
                return;
            case Code("trun"):
                Add(Claim::Fragments, source_.U32(atom.begin + 4));
                return;
            default:
                return;
        }
    }

    StoredTable TableIn(const StoredAtom& atom, ncfUInt64 entrySize) {
        return {source_, atom.begin, atom.end, entrySize};
    }

    // Gives each entry of a table, as numbers of 32 bits.
    template <std::size_t Numbers, class Each>
    void ForEach(const StoredTable& table, Each each) {
        StoredEntries<Numbers> entries(source_, table);
        for (std::array<ncfUInt32, Numbers> entry; entries.Next(entry);) {
            each(entry);
        }
    }

    ncfUInt64 SumOfFirsts(const StoredTable& table) {
        ncfUInt64 sum = 0;
        ForEach<2>(table, [&](const std::array<ncfUInt32, 2>& entry) { sum += entry[0]; });
        return sum;
    }

    void Add(Claim claim, ncfUInt64 count) {
        ncfUInt64& sum = sums_[static_cast<std::size_t>(claim)];
        sum += std::min(count, std::numeric_limits<ncfUInt64>::max() - sum);
        if (sum > limit_ && problem_.empty()) {
            const ncfUInt64 track = claim == Claim::Fragments ? TrackOfFragment() : tracks_;
            problem_ = (track > 0 ? "track " + std::to_string(track) + ": " : std::string()) +
                       kClaimWords[static_cast<std::size_t>(claim)] + " " + std::to_string(count) +
                       " samples" +
                       (count <= limit_ ? ", " + std::to_string(sum) + " with those before," : "") +
                       " and a file of " + std::to_string(fileLength_) + " bytes can't hold them";
        }
    }

    // The place in the file, from 1, of the track that a fragment goes on with; 0 for
    // none that is told.
    ncfUInt64 TrackOfFragment() const {
        const auto found = std::find(numbers_.begin(), numbers_.end(), fragmentOf_);
        return found == numbers_.end() ? 0 : static_cast<ncfUInt64>(found - numbers_.begin()) + 1;
    }

    void ReadTrack(const StoredAtom& atom, int depth) {
        const TrackTables outer = std::exchange(tables_, {});
        ++tracks_;
        Walk(StoredAtoms(source_, atom.begin, atom.end), depth + 1);
        Add(Claim::Samples, IndexEntries());
        if (tables_.edits.count > 0 && tables_.samples > limit_ / tables_.edits.count) {
            Add(Claim::Edits, PlayedSamples());
        }
        tables_ = outer;
    }

    // Sound whose samples are single ones is indexed by pieces of chunks.
    ncfUInt64 IndexEntries() {
        bool hasSingleSamples = tables_.isSound && tables_.durations.count == 1;
        if (hasSingleSamples) {
            hasSingleSamples = source_.U32(tables_.durations.begin + 4) == 1;
        }
        if (!hasSingleSamples) {
            return tables_.samples;
        }
        ncfUInt64 entries = 0;
        ncfUInt64 first = 0, pieces = 0;
        const auto addUpTo = [&](ncfUInt64 next) {
            const ncfUInt64 end = std::min(next, tables_.chunks + 1);
            entries += end > first ? (end - first) * pieces : 0;
        };
        ForEach<3>(tables_.runs, [&](const std::array<ncfUInt32, 3>& run) {
            addUpTo(run[0]);
            first = std::max<ncfUInt64>(run[0], 1);
            pieces = run[1] / kSamplesOfASoundPiece + 1;
        });
        addUpTo(tables_.chunks + 1);
        return entries;
    }

    // An edit plays samples for its duration, and those around it that lead from
    // a sync sample and to the next one.
    ncfUInt64 PlayedSamples() {
        ncfUInt64 shortest = std::numeric_limits<ncfUInt32>::max();
        ForEach<2>(tables_.durations, [&](const std::array<ncfUInt32, 2>& run) {
            shortest = run[0] > 0 ? std::min<ncfUInt64>(shortest, run[1]) : shortest;
        });
        ncfUInt64 around = tables_.syncs.count > 0 ? 0 : 1, last = 1;
        ForEach<1>(tables_.syncs, [&](const std::array<ncfUInt32, 1>& sync) {
            around = std::max<ncfUInt64>(around, sync[0] > last ? sync[0] - last : 0);
            last = std::max<ncfUInt64>(last, sync[0]);
        });
        if (tables_.syncs.count > 0 && tables_.samples >= last) {
            around = std::max(around, tables_.samples - last + 1);
        }
        ncfUInt64 played = 0;
        const auto add = [&](double duration) {
            const double units = timeScale_ == 0 ? 0.0 : duration * tables_.timeScale / timeScale_;
            const double samples = (shortest == 0 ? static_cast<double>(tables_.samples)
                                                  : units / static_cast<double>(shortest)) +
                                   2.0 * static_cast<double>(around) + 1.0;
            played +=
                static_cast<ncfUInt64>(std::min(samples, static_cast<double>(tables_.samples)));
        };
        if (tables_.hasLongEdits) {
            ForEach<5>(tables_.edits, [&](const std::array<ncfUInt32, 5>& edit) {
                add(edit[0] * 4294967296.0 + edit[1]);
            });
        } else {
            ForEach<3>(tables_.edits, [&](const std::array<ncfUInt32, 3>& edit) { add(edit[0]); });
        }
        return played;
    }

    // A header in packed form is looked at as what comes out of it.
    void Unpack(const StoredAtom& atom) {
        const ncfUInt64 begin = atom.begin - 8;
        const ncfUInt64 size = atom.end - begin;
        header_parser::HeaderBytes bytes;
        ncfUInt8* const room = size > kMostHeaderToUnpack ? nullptr : bytes.Room(size);
        if (!room || !source_.Read(begin, room, size)) {
            problem_ = "the compressed movie header is too large";
            return;
        }
        bytes.Extend(size);
        const auto verdict = header_parser::Inflate(bytes, {});
        if (verdict.Refused()) {
            problem_ = verdict.reason;
            return;
        }
        header_parser::UnpackedBytes plain(std::move(bytes));
        problem_ = Walker(plain, fileLength_, true).Run();
    }

    ByteSource& source_;
    const ncfUInt64 fileLength_;
    const bool isPlain_;
    const ncfUInt64 limit_;  // of the sums
    TrackTables tables_;
    ncfUInt32 timeScale_ = 0;
    ncfUInt64 tracks_ = 0;
    std::vector<ncfUInt32> numbers_;  // of the tracks, by their places in the file
    ncfUInt32 fragmentOf_ = 0;        // the number of its track
    std::array<ncfUInt64, kClaimWords.size()> sums_{};
    std::string problem_;
};

}  // namespace

std::string FindImpossibleTable(const std::filesystem::path& path) {
    header_parser::FileBytes file(path);
    return Walker(file, file.Length(), false).Run();
}

}  // namespace host
