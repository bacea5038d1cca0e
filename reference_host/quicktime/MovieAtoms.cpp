// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/MovieAtoms.h"

#include <algorithm>
#include <fstream>
#include <limits>

namespace host {
namespace {

constexpr int kDeepest = 8;
constexpr std::size_t kMostTracks = 65536;
constexpr ncfUInt32 kMostReferences = 4096;
constexpr std::size_t kMostDescriptionChanges = 65536;
constexpr ncfUInt64 kMostEdits = 4096;

constexpr ncfUInt32 Code(const char (&text)[5]) {
    return static_cast<ncfUInt32>(static_cast<unsigned char>(text[0])) << 24 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[1])) << 16 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[2])) << 8 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[3]));
}

// Walks the atoms that lead to the few numbers wanted and steps over all
// others, so the cost does not grow with the media.
class Walker {
public:
    Walker(const std::filesystem::path& path, MovieAtoms& out)
        : stream_(path, std::ios::binary), out_(out) {
        stream_.seekg(0, std::ios::end);
        const std::streamoff end = stream_.tellg();
        length_ = end > 0 ? static_cast<ncfUInt64>(end) : 0;
    }

    void Run() { Walk(0, length_, 0); }

private:
    bool Read(ncfUInt64 position, ncfUInt8* to, std::size_t size) {
        if (size > length_ || position > length_ - size) {
            return false;
        }
        stream_.clear();
        stream_.seekg(static_cast<std::streamoff>(position));
        return static_cast<bool>(
            stream_.read(reinterpret_cast<char*>(to), static_cast<std::streamsize>(size)));
    }
    static ncfUInt64 Number(const ncfUInt8* bytes, int count) {
        ncfUInt64 value = 0;
        for (int i = 0; i < count; ++i) {
            value = value << 8 | bytes[i];
        }
        return value;
    }

    void Walk(ncfUInt64 position, ncfUInt64 end, int depth) {
        ncfUInt8 head[16];
        while (end - position >= 8 && Read(position, head, 8)) {
            ncfUInt64 size = Number(head, 4);
            const ncfUInt32 code = static_cast<ncfUInt32>(Number(head + 4, 4));
            ncfUInt64 body = 8;
            if (size == 1 && Read(position, head, 16)) {
                size = Number(head + 8, 8);
                body = 16;
            } else if (size == 0) {
                size = end - position;
            }
            if (size < body || size > end - position) {
                return;
            }
            Visit(code, position + body, position + size, depth);
            position += size;
        }
    }

    void Visit(ncfUInt32 code, ncfUInt64 position, ncfUInt64 end, int depth) {
        switch (code) {
            case Code("moof"):
                out_.isFragmented = out_.isFragmented || depth == 0;
                return;
            case Code("trak"):
                if (out_.tracks.size() < kMostTracks) {
                    out_.tracks.emplace_back();
                    Descend(position, end, depth);
                }
                return;
            case Code("moov"):
            case Code("mdia"):
            case Code("minf"):
            case Code("dinf"):
            case Code("stbl"):
            case Code("edts"):
                Descend(position, end, depth);
                return;
            case Code("mvhd"):
                ReadMovieHeader(position, end);
                return;
            case Code("tkhd"):
                ReadTrackHeader(position, end);
                return;
            case Code("mdhd"):
                ReadMediaHeader(position, end);
                return;
            case Code("stsd"):
                ReadDescriptions(position, end, depth);
                return;
            case Code("pcmC"):
                ReadLinearKind(position, end);
                return;
            case Code("elst"):
                ReadEdits(position, end);
                return;
            case Code("stts"):
                FindDurations(position, end);
                return;
            case Code("stsc"):
                ReadChunks(position, end);
                return;
            case Code("dref"):
                ReadReferences(position, end);
                return;
            default:
                return;
        }
    }

    void Descend(ncfUInt64 position, ncfUInt64 end, int depth) {
        if (depth < kDeepest) {
            Walk(position, end, depth + 1);
        }
    }

    void ReadMovieHeader(ncfUInt64 position, ncfUInt64 end) {
        ncfUInt8 bytes[32];
        if (end - position < 32 || !Read(position, bytes, sizeof bytes)) {
            return;
        }
        const bool isLong = bytes[0] == 1;
        out_.timeScale = static_cast<ncfUInt32>(Number(bytes + (isLong ? 20 : 12), 4));
        out_.duration = isLong ? Number(bytes + 24, 8) : Number(bytes + 16, 4);
    }

    void ReadTrackHeader(ncfUInt64 position, ncfUInt64 end) {
        ncfUInt8 bytes[36];
        if (out_.tracks.empty() || end - position < 36 || !Read(position, bytes, sizeof bytes)) {
            return;
        }
        const bool isLong = bytes[0] == 1;
        out_.tracks.back().id = static_cast<ncfUInt32>(Number(bytes + (isLong ? 20 : 12), 4));
        out_.tracks.back().duration = isLong ? Number(bytes + 28, 8) : Number(bytes + 20, 4);
    }

    void ReadMediaHeader(ncfUInt64 position, ncfUInt64 end) {
        ncfUInt8 bytes[32];
        const std::size_t least = 20;
        if (out_.tracks.empty() || end - position < least || !Read(position, bytes, least)) {
            return;
        }
        const bool isLong = bytes[0] == 1;
        if (isLong && (end - position < sizeof bytes || !Read(position, bytes, sizeof bytes))) {
            return;
        }
        out_.tracks.back().mediaTimeScale =
            static_cast<ncfUInt32>(Number(bytes + (isLong ? 20 : 12), 4));
        out_.tracks.back().mediaDuration = isLong ? Number(bytes + 24, 8) : Number(bytes + 16, 4);
    }

    void ReadEdits(ncfUInt64 position, ncfUInt64 end) {
        constexpr ncfUInt64 kPlain = 0x10000;
        ncfUInt8 bytes[20];
        if (out_.tracks.empty() || end - position < 8 || !Read(position, bytes, 8)) {
            return;
        }
        const bool isLong = bytes[0] == 1;
        const ncfUInt64 size = isLong ? 20 : 12;
        const ncfUInt64 count = std::min(Number(bytes + 4, 4), (end - position - 8) / size);
        std::vector<MovieAtoms::Edit> edits;
        for (ncfUInt64 i = 0; i < count; ++i) {
            if (count > kMostEdits ||
                !Read(position + 8 + size * i, bytes, static_cast<std::size_t>(size)) ||
                Number(bytes + size - 4, 4) != kPlain) {
                return;
            }
            const ncfUInt64 time = isLong ? Number(bytes + 8, 8) : Number(bytes + 4, 4);
            edits.push_back(
                {isLong ? Number(bytes, 8) : Number(bytes, 4),
                 isLong ? static_cast<ncfSInt64>(time)
                        : ncfSInt64{static_cast<ncfSInt32>(static_cast<ncfUInt32>(time))}});
        }
        out_.tracks.back().edits = std::move(edits);
    }

    void ReadDescriptions(ncfUInt64 position, ncfUInt64 end, int depth) {
        ncfUInt8 bytes[8];
        if (!out_.tracks.empty() && end - position >= 8 && Read(position, bytes, sizeof bytes)) {
            // No description is shorter than its own head.
            const ncfUInt64 most = (end - position - 8) / 16;
            const ncfUInt64 count = Number(bytes + 4, 4);
            out_.tracks.back().descriptionCount =
                static_cast<ncfUInt32>(count < most ? count : most);
            ReadFirstDescription(position + 8, end, bytes[0] != 0, depth);
        }
    }

    // The size of pictures, and of the one kind of sound whose form stands in an
    // atom behind the fields, that. In a list of the ISO form version 1 adds none.
    void ReadFirstDescription(ncfUInt64 position, ncfUInt64 end, bool isIso, int depth) {
        constexpr ncfUInt64 kFields = 36;
        constexpr ncfUInt64 kFieldsOfVersion1 = kFields + 16;
        constexpr ncfUInt64 kFieldsOfVersion2 = kFields + 36;
        ncfUInt8 bytes[kFields + 4];
        if (end - position < sizeof bytes || !Read(position, bytes, sizeof bytes)) {
            return;
        }
        out_.tracks.back().width = static_cast<ncfUInt32>(Number(bytes + 32, 2));
        out_.tracks.back().height = static_cast<ncfUInt32>(Number(bytes + 34, 2));
        const ncfUInt64 size = Number(bytes, 4);
        const ncfUInt64 code = Number(bytes + 4, 4);
        const ncfUInt64 version = Number(bytes + 16, 2);
        const ncfUInt64 fields = version == 2
                                     ? std::max(kFieldsOfVersion2, Number(bytes + kFields, 4))
                                 : version == 1 && !isIso ? kFieldsOfVersion1
                                                          : kFields;
        const bool isLinear = code == Code("ipcm") || code == Code("fpcm");
        if (isLinear && size >= fields && size <= end - position) {
            Descend(position + fields, position + size, depth);
        }
    }

    // The table may be long, and few ask for it.
    void FindDurations(ncfUInt64 position, ncfUInt64 end) {
        ncfUInt8 bytes[8];
        if (!out_.tracks.empty() && !out_.tracks.back().durationsAt && end - position >= 8 &&
            Read(position, bytes, sizeof bytes)) {
            out_.tracks.back().durationsAt = position + 8;
            out_.tracks.back().durationEntries =
                static_cast<ncfUInt32>(std::min(Number(bytes + 4, 4), (end - position - 8) / 8));
        }
    }

    void ReadLinearKind(ncfUInt64 position, ncfUInt64 end) {
        ncfUInt8 bytes[6];
        if (!out_.tracks.empty() && end - position >= 6 && Read(position, bytes, sizeof bytes)) {
            out_.tracks.back().isLittleEndian = (bytes[4] & 1) != 0;
            out_.tracks.back().linearBits = bytes[5];
        }
    }

    // Each entry: first chunk, samples of a chunk, description. Tracks of one
    // description are left alone, for the table may be long.
    void ReadChunks(ncfUInt64 position, ncfUInt64 end) {
        ncfUInt8 bytes[12];
        if (out_.tracks.empty() || out_.tracks.back().descriptionCount < 2 || end - position < 8 ||
            !Read(position, bytes, 8)) {
            return;
        }
        const ncfUInt64 most = (end - position - 8) / 12;
        const ncfUInt64 count = std::min(Number(bytes + 4, 4), most);
        std::vector<ncfUInt64>& changes = out_.tracks.back().descriptionChanges;
        ncfUInt64 samples = 0, chunk = 1, perChunk = 0, description = 0;
        for (ncfUInt64 i = 0; i < count && changes.size() < kMostDescriptionChanges &&
                              Read(position + 8 + 12 * i, bytes, sizeof bytes);
             ++i) {
            const ncfUInt64 first = Number(bytes, 4);
            if (first < chunk) {
                return;
            }
            samples += (first - chunk) * perChunk;
            const ncfUInt64 now = Number(bytes + 8, 4);
            if (i > 0 && now != description) {
                changes.push_back(samples);
            }
            chunk = first;
            perChunk = Number(bytes + 4, 4);
            description = now;
        }
    }

    // A reference whose lowest flag is set means this very file.
    void ReadReferences(ncfUInt64 position, ncfUInt64 end) {
        ncfUInt8 bytes[12];
        position += 8;
        for (ncfUInt32 i = 0; i < kMostReferences && position < end && end - position >= 12 &&
                              !out_.tracks.empty() && Read(position, bytes, sizeof bytes);
             ++i) {
            if ((bytes[11] & 1) == 0) {
                out_.tracks.back().needsOtherFiles = true;
            }
            const ncfUInt64 size = Number(bytes, 4);
            if (size < 12) {
                return;
            }
            position += size;
        }
    }

    std::ifstream stream_;
    ncfUInt64 length_ = 0;
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
    std::ifstream stream(path, std::ios::binary);
    if (!track.durationsAt ||
        !stream.seekg(static_cast<std::streamoff>(track.durationsAt.value()))) {
        return std::nullopt;
    }
    const auto number = [](const ncfUInt8* bytes) {
        return ncfUInt64{bytes[0]} << 24 | ncfUInt64{bytes[1]} << 16 | ncfUInt64{bytes[2]} << 8 |
               bytes[3];
    };
    SampleDurations sum;
    ncfUInt8 entry[8];
    for (ncfUInt32 i = 0; i < track.durationEntries; ++i) {
        if (!stream.read(reinterpret_cast<char*>(entry), sizeof entry)) {
            return std::nullopt;
        }
        const ncfUInt64 units = number(entry) * number(entry + 4);
        if (units > kMost - sum.units) {
            return std::nullopt;
        }
        sum.samples += number(entry);
        sum.units += units;
    }
    return sum;
}

MovieAtoms ReadMovieAtoms(const std::filesystem::path& path) {
    MovieAtoms atoms;
    Walker(path, atoms).Run();
    return atoms;
}

}  // namespace host
