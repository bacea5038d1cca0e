// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "text/Encodings.h"

#include <algorithm>

namespace encodings {

namespace {

constexpr char32_t kReplacement = 0xFFFD;
constexpr char32_t kLastCharacter = 0x10FFFF;
constexpr char32_t kCarriedByte = 0xDC00;

bool IsCarriedByte(char32_t c) {
    return c >= kCarriedByte + 0x80 && c <= kCarriedByte + 0xFF;
}

// What the first byte of a sequence promises: how many bytes follow, and the
// smallest character that needs so many.
struct Lead {
    int following;
    char32_t bits;
    char32_t smallest;
};

bool ReadLead(unsigned char byte, Lead& lead) {
    if (byte >= 0xC2 && byte <= 0xDF) {
        lead = {1, byte & 0x1Fu, 0x80};
    } else if (byte >= 0xE0 && byte <= 0xEF) {
        lead = {2, byte & 0x0Fu, 0x800};
    } else if (byte >= 0xF0 && byte <= 0xF4) {
        lead = {3, byte & 0x07u, 0x10000};
    } else {
        return false;
    }
    return true;
}

// The character that starts at `at`; 0 bytes used when it is not well-formed.
std::size_t ReadSequence(std::string_view text, std::size_t at, char32_t& character) {
    Lead lead{};
    if (!ReadLead(static_cast<unsigned char>(text[at]), lead)) {
        return 0;
    }
    const auto length = static_cast<std::size_t>(lead.following) + 1;
    if (text.size() - at < length) {
        return 0;
    }
    char32_t value = lead.bits;
    for (std::size_t i = 1; i < length; ++i) {
        const auto byte = static_cast<unsigned char>(text[at + i]);
        if ((byte & 0xC0) != 0x80) {
            return 0;
        }
        value = value << 6 | (byte & 0x3Fu);
    }
    if (value < lead.smallest || value > kLastCharacter || IsSurrogate(value)) {
        return 0;
    }
    character = value;
    return length;
}

void AppendSequence(char32_t c, std::string& out) {
    if (c < 0x80) {
        out.push_back(static_cast<char>(c));
        return;
    }
    if (c >= 0x10000) {
        out.push_back(static_cast<char>(0xF0 | c >> 18));
        out.push_back(static_cast<char>(0x80 | (c >> 12 & 0x3F)));
        out.push_back(static_cast<char>(0x80 | (c >> 6 & 0x3F)));
    } else if (c >= 0x800) {
        out.push_back(static_cast<char>(0xE0 | c >> 12));
        out.push_back(static_cast<char>(0x80 | (c >> 6 & 0x3F)));
    } else {
        out.push_back(static_cast<char>(0xC0 | c >> 6));
    }
    out.push_back(static_cast<char>(0x80 | (c & 0x3F)));
}

bool AppendUtf8(char32_t c, std::string& out) {
    if (IsCarriedByte(c)) {
        out.push_back(static_cast<char>(c - kCarriedByte));
        return true;
    }
    if (IsSurrogate(c) || c > kLastCharacter) {
        return false;
    }
    AppendSequence(c, out);
    return true;
}

template <class Text>
bool AppendPairs(char32_t c, Text& out) {
    using Unit = typename Text::value_type;
    if (c > kLastCharacter) {
        return false;
    }
    if (c < 0x10000) {
        out.push_back(static_cast<Unit>(c));
        return true;
    }
    out.push_back(static_cast<Unit>(0xD800 + ((c - 0x10000) >> 10)));
    out.push_back(static_cast<Unit>(0xDC00 + ((c - 0x10000) & 0x3FF)));
    return true;
}

bool AppendUtf16(char32_t c, std::u16string& out) {
    return AppendPairs(c, out);
}

bool AppendWide(char32_t c, std::wstring& out) {
    if constexpr (sizeof(wchar_t) == 2) {
        return AppendPairs(c, out);
    }
    if (c > kLastCharacter) {
        return false;
    }
    out.push_back(static_cast<wchar_t>(c));
    return true;
}

template <class Text>
std::u32string FromPairs(const Text& text) {
    std::u32string out;
    out.reserve(text.size());
    for (std::size_t i = 0; i < text.size(); ++i) {
        const char32_t unit = static_cast<char32_t>(text[i]) & 0xFFFF;
        const char32_t next = i + 1 < text.size() ? static_cast<char32_t>(text[i + 1]) & 0xFFFF : 0;
        if (unit >= 0xD800 && unit <= 0xDBFF && next >= 0xDC00 && next <= 0xDFFF) {
            out.push_back(0x10000 + ((unit - 0xD800) << 10) + (next - 0xDC00));
            ++i;
        } else {
            out.push_back(unit);
        }
    }
    return out;
}

// Most texts are ASCII, which every encoding holds in the same numbers.
template <class Text>
bool IsAscii(const Text& text) {
    char32_t all = 0;
    for (const auto unit : text) {
        all |= static_cast<char32_t>(unit);  // a negative one becomes a large number
    }
    return all < 0x80;
}

// Runs `append` over all characters into a fresh text, handed over only when
// every one had its place.
template <class Text, class Append>
bool Encode(std::u32string_view text, Text& out, Append append) {
    if (IsAscii(text)) {
        out.assign(text.begin(), text.end());
        return true;
    }
    Text made;
    made.reserve(text.size());
    for (const char32_t c : text) {
        if (!append(c, made)) {
            return false;
        }
    }
    out = std::move(made);
    return true;
}

template <class Text, class Append>
Text EncodeLossy(std::u32string_view text, Append append) {
    if (IsAscii(text)) {
        return Text(text.begin(), text.end());
    }
    Text made;
    made.reserve(text.size());
    for (const char32_t c : text) {
        if (!append(c, made)) {
            append(kReplacement, made);
        }
    }
    return made;
}

}  // namespace

bool IsSurrogate(char32_t c) {
    return c >= 0xD800 && c <= 0xDFFF;
}

bool HoldsSurrogate(std::u32string_view text) {
    return std::any_of(text.begin(), text.end(), IsSurrogate);
}

std::u32string FromUtf8(std::string_view text) {
    if (IsAscii(text)) {
        return {text.begin(), text.end()};
    }
    std::u32string out;
    out.reserve(text.size());
    std::size_t at = 0;
    while (at < text.size()) {
        const auto byte = static_cast<unsigned char>(text[at]);
        char32_t character = byte;
        std::size_t used = 1;
        if (byte >= 0x80) {
            used = ReadSequence(text, at, character);
        }
        if (used == 0) {
            character = kCarriedByte + byte;
            used = 1;
        }
        out.push_back(character);
        at += used;
    }
    return out;
}

std::u32string FromUtf16(std::u16string_view text) {
    return FromPairs(text);
}

std::u32string FromWide(std::wstring_view text) {
    if constexpr (sizeof(wchar_t) == 2) {
        return FromPairs(text);
    }
    return {text.begin(), text.end()};
}

bool ToAscii(std::u32string_view text, std::string& out) {
    return Encode(text, out, [](char32_t c, std::string& made) {
        made.push_back(static_cast<char>(c));
        return c < 0x80;
    });
}

bool ToUtf8(std::u32string_view text, std::string& out) {
    return Encode(text, out, AppendUtf8);
}

bool ToUtf16(std::u32string_view text, std::u16string& out) {
    return Encode(text, out, AppendUtf16);
}

bool ToUtf32(std::u32string_view text, std::u32string& out) {
    return Encode(text, out, [](char32_t c, std::u32string& made) {
        made.push_back(c);
        return c <= kLastCharacter;
    });
}

bool ToWide(std::u32string_view text, std::wstring& out) {
    return Encode(text, out, AppendWide);
}

std::string ToUtf8Lossy(std::u32string_view text) {
    return EncodeLossy<std::string>(text, AppendUtf8);
}

std::u16string ToUtf16Lossy(std::u32string_view text) {
    return EncodeLossy<std::u16string>(text, AppendUtf16);
}

std::wstring ToWideLossy(std::u32string_view text) {
    return EncodeLossy<std::wstring>(text, AppendWide);
}

}  // namespace encodings
