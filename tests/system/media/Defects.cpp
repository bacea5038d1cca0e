// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/media/Defects.h"

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <fstream>
#include <iterator>

namespace {

using Bytes = std::vector<unsigned char>;

struct Atom {
    std::string type;
    std::uint64_t payload = 0;  // position
    std::uint64_t end = 0;      // as claimed
};

// A file and its atoms, read in the plainest way.
class AtomFile {
public:
    explicit AtomFile(const std::filesystem::path& file)
        : stream_(file, std::ios::binary), size_(std::filesystem::file_size(file)) {}

    std::uint64_t size() const { return size_; }

    std::uint64_t Number(std::uint64_t position, int bytes) {
        unsigned char buffer[8] = {};
        stream_.clear();
        stream_.seekg(static_cast<std::streamoff>(position));
        stream_.read(reinterpret_cast<char*>(buffer), bytes);
        std::uint64_t value = 0;
        for (int i = 0; i < bytes; ++i) {
            value = value << 8 | buffer[i];
        }
        return value;
    }

    // Atoms one after the other within a range; the last may claim too much.
    std::vector<Atom> Children(std::uint64_t from, std::uint64_t to) {
        std::vector<Atom> atoms;
        while (from + 8 <= to && atoms.size() < 10000) {
            std::uint64_t length = Number(from, 4);
            const std::uint64_t code = Number(from + 4, 4);
            std::uint64_t header = 8;
            if (length == 1) {
                length = Number(from + 8, 8);
                header = 16;
            } else if (length == 0) {
                length = to - from;
            }
            std::string type;
            for (int shift = 24; shift >= 0; shift -= 8) {
                type += static_cast<char>(code >> shift & 0xFF);
            }
            if (length < header || length > UINT64_MAX / 2) {
                break;
            }
            atoms.push_back({type, from + header, from + length});
            from += length;
        }
        return atoms;
    }

    // All atoms of a type, however deep within the containers of a header.
    std::vector<Atom> Within(const Atom& atom, const std::string& type) {
        static const char* const kContainers[] = {"moov", "trak", "mdia", "minf", "stbl"};
        std::vector<Atom> found;
        for (const Atom& child : Children(atom.payload, std::min(atom.end, size_))) {
            if (child.type == type) {
                found.push_back(child);
            }
            if (std::find(std::begin(kContainers), std::end(kContainers), child.type) !=
                std::end(kContainers)) {
                const auto deeper = Within(child, type);
                found.insert(found.end(), deeper.begin(), deeper.end());
            }
        }
        return found;
    }

private:
    std::ifstream stream_;
    std::uint64_t size_;
};

bool StartsLikeAMovie(const std::vector<Atom>& top) {
    static const char* const kFirst[] = {"ftyp", "moov", "mdat", "free", "skip", "wide",
                                         "pnot", "uuid", "moof", "styp", "sidx"};
    return !top.empty() && std::any_of(std::begin(kFirst), std::end(kFirst),
                                       [&](const char* type) { return top[0].type == type; });
}

// A track whose first run of chunks is not the first chunk, or that names chunks
// that are not there.
bool HasBrokenChunkTable(AtomFile& file, const Atom& moov) {
    for (const Atom& table : file.Within(moov, "stbl")) {
        const auto runs = file.Within(table, "stsc");
        auto offsets = file.Within(table, "stco");
        if (offsets.empty()) {
            offsets = file.Within(table, "co64");
        }
        if (runs.empty() || offsets.empty()) {
            return true;
        }
        const std::uint64_t chunks = file.Number(offsets[0].payload + 4, 4);
        const std::uint64_t count = file.Number(runs[0].payload + 4, 4);
        for (std::uint64_t i = 0; i < count; ++i) {
            const std::uint64_t first = file.Number(runs[0].payload + 8 + 12 * i, 4);
            if (first > chunks || (i == 0 && first != 1)) {
                return true;
            }
        }
    }
    return false;
}

bool IsShorterThanAFrame(const ProbedFile& probed, double editorRate) {
    return probed.Of("video").empty() && !probed.Of("audio").empty() &&
           probed.duration * editorRate < 1;
}

bool HasSlowVideo(const ProbedFile& probed) {
    const auto videos = probed.Of("video");
    return !videos.empty() && videos[0].averageRate > 0 && videos[0].averageRate < 0.5;
}

}  // namespace

std::vector<std::string> DefectsOf(const std::filesystem::path& path, const ProbedFile& probed,
                                   double editorRate) {
    AtomFile file(path);
    if (file.size() == 0) {
        return {"empty"};
    }
    const auto top = file.Children(0, file.size());
    if (!StartsLikeAMovie(top)) {
        return {"no movie of the family"};
    }
    std::vector<std::string> defects;
    const auto add = [&defects](bool applies, const char* name) {
        if (applies) {
            defects.push_back(name);
        }
    };
    const auto find = [&top](const std::string& type) {
        return std::find_if(top.begin(), top.end(),
                            [&type](const Atom& atom) { return atom.type == type; });
    };
    const auto moov = find("moov");
    if (moov == top.end()) {
        // Pieces without a header are fragments that belong to another file.
        return {find("moof") != top.end() ? "fragmented" : "without a movie header"};
    }
    if (moov->end > file.size()) {
        return {"cut in the movie header"};
    }
    add(find("moof") != top.end() || !file.Within(*moov, "mvex").empty(), "fragmented");
    add(HasBrokenChunkTable(file, *moov), "broken chunk table");
    add(probed.Of("video").empty() && probed.Of("audio").empty(), "no picture and no sound");
    add(IsShorterThanAFrame(probed, editorRate), "sound shorter than a frame");
    add(HasSlowVideo(probed), "less than a picture in two seconds");
    return defects;
}
