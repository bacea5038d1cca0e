// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// cut_seeds FROM TO: makes seeds from the movies of a folder. Headers are kept whole;
// of the media data the first bytes are kept, which contain the first samples.

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

namespace {

namespace fs = std::filesystem;

constexpr std::uint64_t kMediaKept = 32768;
constexpr std::uint64_t kLargestSeed = 262144;

std::uint64_t Number(const char* bytes, int count) {
    std::uint64_t value = 0;
    for (int i = 0; i < count; ++i) {
        value = value << 8 | static_cast<unsigned char>(bytes[i]);
    }
    return value;
}

void SetNumber(char* bytes, int count, std::uint64_t value) {
    for (int i = 0; i < count; ++i) {
        bytes[i] = static_cast<char>(value >> (8 * (count - 1 - i)));
    }
}

std::string Read(std::ifstream& stream, std::uint64_t at, std::uint64_t size) {
    std::string bytes(static_cast<std::size_t>(size), '\0');
    stream.clear();
    stream.seekg(static_cast<std::streamoff>(at));
    stream.read(bytes.data(), static_cast<std::streamsize>(size));
    bytes.resize(static_cast<std::size_t>(std::max<std::streamsize>(stream.gcount(), 0)));
    return bytes;
}

std::string Cut(const fs::path& movie) {
    std::ifstream stream(movie, std::ios::binary);
    const std::uint64_t end = fs::file_size(movie);
    std::string seed;
    std::uint64_t at = 0;
    while (at < end && seed.size() <= kLargestSeed) {
        const std::string head = Read(stream, at, 16);
        const bool isLong = head.size() == 16 && Number(head.data(), 4) == 1;
        std::uint64_t size =
            head.size() < 8 ? 0 : Number(head.data() + (isLong ? 8 : 0), isLong ? 8 : 4);
        if (size < 8 || size > end - at) {
            size = end - at;  // no atom, or one to the end
        }
        const bool isData = head.size() >= 8 && (std::memcmp(head.data() + 4, "mdat", 4) == 0 ||
                                                 std::memcmp(head.data() + 4, "free", 4) == 0);
        std::string atom = Read(
            stream, at, isData ? std::min(size, kMediaKept) : std::min(size, kLargestSeed + 1));
        if (isData && atom.size() < size && Number(head.data(), 4) != 0) {
            SetNumber(atom.data() + (isLong ? 8 : 0), isLong ? 8 : 4, atom.size());
        }
        seed += atom;
        at += size;
    }
    return seed;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::fputs("usage: cut_seeds FROM TO\n", stderr);
        return 2;
    }
    int made = 0, left = 0;
    for (const auto& entry : fs::recursive_directory_iterator(argv[1])) {
        if (!entry.is_regular_file()) {
            continue;
        }
        const std::string seed = Cut(entry.path());
        if (seed.size() > kLargestSeed) {
            ++left;
            continue;
        }
        std::ofstream(
            fs::path(argv[2]) / (std::to_string(made++) + entry.path().extension().string()),
            std::ios::binary)
            << seed;
    }
    std::printf("%d seeds", made);
    if (left > 0) {
        std::printf("; %d files with headers above %d KB are left out", left,
                    static_cast<int>(kLargestSeed / 1024));
    }
    std::printf("\n");
    return made > 0 ? 0 : 1;
}
