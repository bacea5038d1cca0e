// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Paths.h"

#include <cstdint>

namespace aaf {

namespace {

constexpr std::uint32_t kStrayByte = 0xDC00;

void AppendUtf8(std::uint32_t point, std::string& out) {
    const auto put = [&out](std::uint32_t byte) { out.push_back(static_cast<char>(byte)); };
    if (point < 0x80) {
        put(point);
    } else if (point < 0x800) {
        put(0xC0 | point >> 6);
        put(0x80 | (point & 0x3F));
    } else if (point < 0x10000) {
        put(0xE0 | point >> 12);
        put(0x80 | (point >> 6 & 0x3F));
        put(0x80 | (point & 0x3F));
    } else {
        put(0xF0 | (point >> 18 & 0x07));
        put(0x80 | (point >> 12 & 0x3F));
        put(0x80 | (point >> 6 & 0x3F));
        put(0x80 | (point & 0x3F));
    }
}

// Bytes of the sequence that starts here and its code point; 0 when there is
// no whole, shortest one.
std::size_t Sequence(const std::string& text, std::size_t at, std::uint32_t& point) {
    const auto byte = [&text](std::size_t index) {
        return static_cast<std::uint32_t>(static_cast<unsigned char>(text[index]));
    };
    const std::uint32_t first = byte(at);
    const std::size_t length = first < 0x80   ? 1
                               : first < 0xC2 ? 0
                               : first < 0xE0 ? 2
                               : first < 0xF0 ? 3
                               : first < 0xF5 ? 4
                                              : 0;
    if (length == 0 || at + length > text.size()) {
        return 0;
    }
    point = length == 1 ? first : first & (0x7Fu >> length);
    for (std::size_t next = 1; next < length; ++next) {
        if ((byte(at + next) & 0xC0) != 0x80) {
            return 0;
        }
        point = point << 6 | (byte(at + next) & 0x3F);
    }
    const std::uint32_t least = length == 3 ? 0x800 : length == 4 ? 0x10000 : 0;
    const bool surrogate = point >= 0xD800 && point < 0xE000;
    return point < least || point > 0x10FFFF || surrogate ? 0 : length;
}

void AppendWide(std::uint32_t point, std::wstring& out) {
    if (sizeof(wchar_t) == 2 && point >= 0x10000) {
        out.push_back(static_cast<wchar_t>(0xD800 + ((point - 0x10000) >> 10)));
        out.push_back(static_cast<wchar_t>(0xDC00 + ((point - 0x10000) & 0x3FF)));
    } else {
        out.push_back(static_cast<wchar_t>(point));
    }
}

}  // namespace

std::filesystem::path PathOf(const wchar_t* text) {
    if (sizeof(wchar_t) == sizeof(std::filesystem::path::value_type)) {
        return std::filesystem::path(text);
    }
    std::string bytes;
    for (; *text != 0; ++text) {
        const auto point = static_cast<std::uint32_t>(*text);
        if (point >= kStrayByte + 0x80 && point <= kStrayByte + 0xFF) {
            bytes.push_back(static_cast<char>(point - kStrayByte));
        } else {
            AppendUtf8(point, bytes);
        }
    }
    return std::filesystem::path(bytes);
}

std::wstring WideOf(const std::string& utf8) {
    std::wstring out;
    for (std::size_t at = 0; at < utf8.size();) {
        std::uint32_t point = 0;
        const std::size_t length = Sequence(utf8, at, point);
        if (length == 0) {
            point = kStrayByte + static_cast<unsigned char>(utf8[at]);
        }
        AppendWide(point, out);
        at += length == 0 ? 1 : length;
    }
    return out;
}

}  // namespace aaf
