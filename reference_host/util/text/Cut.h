// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string_view>

namespace host::text {

// Whether a text in UTF-8 would be cut there inside a character.
inline bool IsInsideCharacter(std::string_view utf8, std::size_t at) {
    return at < utf8.size() && (static_cast<unsigned char>(utf8[at]) & 0xC0) == 0x80;
}

// As many whole characters from the start of a text as so many bytes have room for. Bytes that are
// no UTF-8 are cut anywhere.
inline std::string_view StartOf(std::string_view utf8, std::size_t mostBytes) {
    constexpr std::size_t kLongestCharacter = 4;
    for (std::size_t back = 0; back < kLongestCharacter && back <= mostBytes; ++back) {
        if (!IsInsideCharacter(utf8, mostBytes - back)) {
            return utf8.substr(0, mostBytes - back);
        }
    }
    return utf8.substr(0, mostBytes);
}

}  // namespace host::text
