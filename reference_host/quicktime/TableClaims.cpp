// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/TableClaims.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <fstream>
#include <limits>
#include <utility>
#include <vector>

#include "reference_host/header_parser/Movie.h"

// Atoms are walked as the library walks them, which forgives much: an atom that
// ends behind its parent ends with it, and unknown ones are stepped over.

namespace host {
namespace {

using header_parser::Code;
using header_parser::LoadU32;
using header_parser::LoadU64;

constexpr int kDeepest = 12;
// Entries that are read at a time.
constexpr ncfUInt64 kPiece = 4096;
// Sound is indexed in pieces of as many samples at least.
constexpr ncfUInt64 kSamplesOfASoundPiece = 160;
constexpr ncfUInt64 kMostHeaderToUnpack = ncfUInt64{64} << 20;

// Bytes of a file, or of a header that was unpacked from it.
class Source {
public:
    virtual ~Source() = default;
    virtual ncfUInt64 Length() const = 0;
    virtual bool Read(ncfUInt64 position, ncfUInt8* to, std::size_t size) = 0;
};

class FileSource final : public Source {
public:
    explicit FileSource(const std::filesystem::path& path) : stream_(path, std::ios::binary) {
        stream_.seekg(0, std::ios::end);
        const std::streamoff end = stream_.tellg();
        length_ = end > 0 ? static_cast<ncfUInt64>(end) : 0;
    }
    ncfUInt64 Length() const override { return length_; }
    bool Read(ncfUInt64 position, ncfUInt8* to, std::size_t size) override {
        if (position > length_ || size > length_ - position) {
            return false;
        }
        stream_.clear();
        stream_.seekg(static_cast<std::streamoff>(position));
        return static_cast<bool>(
            stream_.read(reinterpret_cast<char*>(to), static_cast<std::streamsize>(size)));
    }

private:
    std::ifstream stream_;
    ncfUInt64 length_ = 0;
};

class MemorySource final : public Source {
public:
    explicit MemorySource(header_parser::HeaderBytes bytes) : bytes_(std::move(bytes)) {}
    ncfUInt64 Length() const override { return bytes_.Size(); }
    bool Read(ncfUInt64 position, ncfUInt8* to, std::size_t size) override {
        if (position > Length() || size > Length() - position) {
            return false;
        }
        std::memcpy(to, bytes_.begin() + position, size);
        return true;
    }

private:
    header_parser::HeaderBytes bytes_;
};

// A table of entries of one size.
struct Table {
    ncfUInt64 position = 0;
    ncfUInt64 count = 0;  // that the atom really holds
};

// What a track's tables say before they are put together.
struct TrackTables {
    ncfUInt64 samples = 0;
    ncfUInt64 chunks = 0;
    Table durations;  // stts: samples, time units
    Table runs;       // stsc: first chunk, samples of a chunk, description
    Table syncs;      // stss
    Table edits;      // elst
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
    Walker(Source& source, ncfUInt64 fileLength, bool isPlain)
        : source_(source),
          fileLength_(fileLength),
          isPlain_(isPlain),
          limit_(std::max(fileLength, kClaimsAlwaysFine)) {}

    std::string Run() {
        Walk(0, source_.Length(), 0);
        return problem_;
    }

private:
    ncfUInt32 Number(ncfUInt64 position) {
        ncfUInt8 bytes[4] = {};
        return source_.Read(position, bytes, sizeof bytes) ? LoadU32(bytes) : 0;
    }

    // Whether an atom is of version 1, whose numbers are of 64 bits.
    bool IsLong(ncfUInt64 position) { return Number(position) >> 24 == 1; }

    void Walk(ncfUInt64 position, ncfUInt64 end, int depth) {
        ncfUInt8 head[16];
        while (problem_.empty() && depth < kDeepest && end - position >= 8 &&
               source_.Read(position, head, 8)) {
            ncfUInt64 size = LoadU32(head);
            ncfUInt64 body = 8;
            if (size == 1 && end - position >= 16 && source_.Read(position, head, 16)) {
                size = LoadU64(head + 8);
                body = 16;
            }
            if (size == 0 || size > end - position) {
                size = end - position;
            }
            if (size < body) {
                return;
            }
            Visit(LoadU32(head + 4), position + body, position + size, depth);
            position += size;
        }
    }

    void Visit(ncfUInt32 code, ncfUInt64 position, ncfUInt64 end, int depth) {
        const ncfUInt64 size = end - position;
        switch (code) {
            case Code("trak"):
                ReadTrack(position, end, depth);
                return;
            case Code("cmov"):
                if (!isPlain_) {
                    Unpack(position, end);
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
                Walk(position, end, depth + 1);
                return;
            case Code("hdlr"):
                tables_.isSound = tables_.isSound || Number(position + 8) == Code("soun");
                return;
            case Code("mdhd"):
                tables_.timeScale = Number(position + (IsLong(position) ? 20 : 12));
                return;
            case Code("mvhd"):
                timeScale_ = Number(position + (IsLong(position) ? 20 : 12));
                return;
            case Code("stsz"):
            case Code("stz2"):
                tables_.samples = std::max<ncfUInt64>(tables_.samples, Number(position + 8));
                return;
            case Code("stco"):
                tables_.chunks = std::max(tables_.chunks, Entries(position, size, 4).count);
                return;
            case Code("co64"):
                tables_.chunks = std::max(tables_.chunks, Entries(position, size, 8).count);
                return;
            case Code("stts"):
                tables_.durations = Entries(position, size, 8);
                return;
            case Code("stsc"):
                tables_.runs = Entries(position, size, 12);
                return;
            case Code("stss"):
                tables_.syncs = Entries(position, size, 4);
                return;
            case Code("elst"):
                tables_.hasLongEdits = IsLong(position);
                tables_.edits = Entries(position, size, tables_.hasLongEdits ? 20 : 12);
                return;
            case Code("ctts"):
                Add(Claim::DisplayTimes, SumOfFirsts(Entries(position, size, 8)));
                return;
            case Code("sbgp"): {
                // The kind of group stands in front of the count.
                const ncfUInt64 skipped = IsLong(position) ? 8 : 4;
                Add(Claim::Groups, SumOfFirsts(Entries(position + skipped,
                                                       size < skipped ? 0 : size - skipped, 8)));
                return;
            }
            case Code("tkhd"):
                numbers_.resize(static_cast<std::size_t>(tracks_));
                if (!numbers_.empty()) {
                    numbers_.back() = Number(position + (IsLong(position) ? 20 : 12));
                }
                return;
            case Code("tfhd"):
                fragmentOf_ = Number(position + 4);
                return;
            case Code("trun"):
                Add(Claim::Fragments, Number(position + 4));
                return;
            default:
                return;
        }
    }

    // The table behind version, flags and count.
    Table Entries(ncfUInt64 position, ncfUInt64 size, ncfUInt64 entry) {
        if (size < 8) {
            return {};
        }
        return {position + 8, std::min<ncfUInt64>(Number(position + 4), (size - 8) / entry)};
    }

    // Gives each entry of a table, as numbers of 32 bits.
    template <std::size_t Numbers, class Each>
    void ForEach(const Table& table, Each each) {
        std::vector<ncfUInt8> bytes;
        for (ncfUInt64 i = 0; i < table.count; i += kPiece) {
            const ncfUInt64 now = std::min(kPiece, table.count - i);
            bytes.resize(static_cast<std::size_t>(now * Numbers * 4));
            if (!source_.Read(table.position + i * Numbers * 4, bytes.data(), bytes.size())) {
                return;
            }
            for (ncfUInt64 k = 0; k < now; ++k) {
                std::array<ncfUInt32, Numbers> numbers;
                for (std::size_t n = 0; n < Numbers; ++n) {
                    numbers[n] = LoadU32(&bytes[static_cast<std::size_t>(k * Numbers + n) * 4]);
                }
                each(numbers);
            }
        }
    }

    ncfUInt64 SumOfFirsts(const Table& table) {
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

    void ReadTrack(ncfUInt64 position, ncfUInt64 end, int depth) {
        const TrackTables outer = std::exchange(tables_, {});
        ++tracks_;
        Walk(position, end, depth + 1);
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
            hasSingleSamples = Number(tables_.durations.position + 4) == 1;
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
    void Unpack(ncfUInt64 position, ncfUInt64 end) {
        const ncfUInt64 size = end - position + 8;
        header_parser::HeaderBytes bytes;
        ncfUInt8* const room = size > kMostHeaderToUnpack ? nullptr : bytes.Room(size);
        if (!room || !source_.Read(position - 8, room, static_cast<std::size_t>(size))) {
            problem_ = "the compressed movie header is too large";
            return;
        }
        bytes.Extend(size);
        const auto verdict = header_parser::Inflate(bytes, {});
        if (verdict.Refused()) {
            problem_ = verdict.reason;
            return;
        }
        MemorySource plain(std::move(bytes));
        problem_ = Walker(plain, fileLength_, true).Run();
    }

    Source& source_;
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
    FileSource file(path);
    return Walker(file, file.Length(), false).Run();
}

}  // namespace host
