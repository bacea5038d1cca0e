// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/Printable.h"

#include <algorithm>

#include "text/Encodings.h"

namespace host::text {

namespace {

struct Range {
    char32_t first;
    char32_t last;
};
constexpr Range kControls[] = {
    {0x00, 0x1F},     {0x7F, 0x9F},
    {0x200E, 0x200F}, {0x2028, 0x2029},  // ends of a line and of a paragraph
    {0x202A, 0x202E},                    // embedded and overridden directions
    {0x2066, 0x2069},                    // isolated directions
};

void AppendEscaped(char32_t c, std::string& out) {
    static constexpr char kDigits[] = "0123456789ABCDEF";
    switch (c) {
        case U'\n':
            out += "\\n";
            return;
        case U'\r':
            out += "\\r";
            return;
        case U'\t':
            out += "\\t";
            return;
        default:
            break;
    }
    for (const char byte : encodings::ToUtf8Lossy(std::u32string_view(&c, 1))) {
        const auto value = static_cast<unsigned char>(byte);
        out += {'\\', 'x', kDigits[value >> 4], kDigits[value & 15]};
    }
}

}  // namespace

bool IsControl(char32_t c) {
    for (const Range& range : kControls) {
        if (c >= range.first && c <= range.last) {
            return true;
        }
    }
    return false;
}

namespace {

std::string Escaped(std::string_view utf8, bool keepsLineEnds) {
    const bool isPlain = std::all_of(utf8.begin(), utf8.end(), [&](char c) {
        return (c >= ' ' && c <= '~') || (keepsLineEnds && c == '\n');
    });
    if (isPlain) {
        return std::string(utf8);
    }
    std::string out;
    out.reserve(utf8.size());
    for (const char32_t c : encodings::FromUtf8(utf8)) {
        const bool isKept = keepsLineEnds && c == U'\n';
        if (!isKept && (IsControl(c) || encodings::IsSurrogate(c))) {
            AppendEscaped(c, out);
        } else {
            out += encodings::ToUtf8Lossy(std::u32string_view(&c, 1));
        }
    }
    return out;
}

}  // namespace

std::string Printable(std::string_view utf8) {
    return Escaped(utf8, false);
}

std::string PrintableLines(std::string_view utf8) {
    return Escaped(utf8, true);
}

}  // namespace host::text
