// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Changes to movies: most of them in the header, which is where movies differ
// and a small part of a file.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstring>
#include <optional>
#include <vector>

extern "C" std::size_t LLVMFuzzerMutate(std::uint8_t* data, std::size_t size, std::size_t most);

namespace {

struct Range {
    std::size_t begin;
    std::size_t end;
};

std::uint32_t SizeAt(const std::uint8_t* bytes) {
    return static_cast<std::uint32_t>(bytes[0]) << 24 | static_cast<std::uint32_t>(bytes[1]) << 16 |
           static_cast<std::uint32_t>(bytes[2]) << 8 | bytes[3];
}

// One of the headers of a movie: its 'moov' or a 'moof'.
std::optional<Range> FindHeader(const std::uint8_t* data, std::size_t size, unsigned random) {
    std::vector<Range> headers;
    for (std::size_t at = 0; size - at >= 8;) {
        const std::size_t length = SizeAt(data + at);
        if (length < 8 || length > size - at) {
            break;
        }
        if (std::memcmp(data + at + 4, "moov", 4) == 0 ||
            std::memcmp(data + at + 4, "moof", 4) == 0) {
            headers.push_back({at, at + length});
        }
        at += length;
    }
    if (headers.empty()) {
        return std::nullopt;
    }
    return headers[random % headers.size()];
}

void SetSize(std::uint8_t* bytes, std::size_t size) {
    for (int i = 0; i < 4; ++i) {
        bytes[i] = static_cast<std::uint8_t>(size >> (24 - 8 * i));
    }
}

}  // namespace

extern "C" std::size_t LLVMFuzzerCustomMutator(std::uint8_t* data, std::size_t size,
                                               std::size_t most, unsigned seed) {
    const std::optional<Range> header = FindHeader(data, size, seed / 8);
    if (!header || header->end - header->begin <= 8 || seed % 8 == 0) {
        return LLVMFuzzerMutate(data, size, most);
    }
    // Its body is changed; the atom keeps the right size, and what follows moves.
    const std::size_t body = header->begin + 8;
    const std::vector<std::uint8_t> rest(data + header->end, data + size);
    const std::size_t length =
        LLVMFuzzerMutate(data + body, header->end - body, most - body - rest.size());
    std::copy(rest.begin(), rest.end(), data + body + length);
    SetSize(data + header->begin, length + 8);
    return body + length + rest.size();
}
