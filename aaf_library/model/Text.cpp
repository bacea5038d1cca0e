// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/Text.h"

#include <algorithm>

#include "host_interfaces/aaf/AAFResultCodes.h"

namespace aaf {

namespace {

constexpr std::uint32_t kReplacement = 0xFFFD;

bool IsHigh(std::uint32_t unit) {
    return unit >= 0xD800 && unit < 0xDC00;
}
bool IsLow(std::uint32_t unit) {
    return unit >= 0xDC00 && unit < 0xE000;
}

void AppendUnit(std::uint32_t unit, Bytes& out) {
    out.push_back(static_cast<std::uint8_t>(unit));
    out.push_back(static_cast<std::uint8_t>(unit >> 8));
}

}  // namespace

void AppendUtf16(const aafCharacter* text, std::size_t count, Bytes& out) {
    out.reserve(out.size() + 2 * count);
    for (std::size_t i = 0; i < count; ++i) {
        std::uint32_t character = static_cast<std::uint32_t>(text[i]);
        if constexpr (sizeof(aafCharacter) == 2) {
            AppendUnit(character, out);
            continue;
        }
        if (character > 0x10FFFF) {
            character = kReplacement;
        }
        if (character < 0x10000) {
            AppendUnit(character, out);
        } else {
            AppendUnit(0xD800 + ((character - 0x10000) >> 10), out);
            AppendUnit(0xDC00 + ((character - 0x10000) & 0x3FF), out);
        }
    }
}

std::wstring FromUtf16(const std::uint8_t* bytes, std::size_t size) {
    std::wstring text;
    text.reserve(size / 2);
    const auto unitAt = [&](std::size_t at) {
        return static_cast<std::uint32_t>(bytes[at] | bytes[at + 1] << 8);
    };
    for (std::size_t at = 0; at + 1 < size; at += 2) {
        std::uint32_t character = unitAt(at);
        const bool pair =
            sizeof(aafCharacter) > 2 && IsHigh(character) && at + 3 < size && IsLow(unitAt(at + 2));
        if (pair) {
            character = 0x10000 + ((character - 0xD800) << 10) + (unitAt(at + 2) - 0xDC00);
            at += 2;
        }
        text.push_back(static_cast<wchar_t>(character));
    }
    return text;
}

Bytes StoredText(const std::wstring& text) {
    Bytes bytes;
    AppendUtf16(text.c_str(), text.size() + 1, bytes);
    return bytes;
}

std::wstring TextOfStored(const Bytes& bytes) {
    std::wstring text = FromUtf16(bytes.data(), bytes.size());
    text.resize(std::min(text.find(L'\0'), text.size()));
    return text;
}

std::wstring Widen(const char* ascii) {
    std::wstring text;
    for (; *ascii != '\0'; ++ascii) {
        text.push_back(static_cast<wchar_t>(*ascii));
    }
    return text;
}

HRESULT CopyText(const std::wstring& text, aafCharacter* buffer, aafUInt32 bufferBytes) {
    if (buffer == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (bufferBytes / sizeof(aafCharacter) < text.size() + 1) {
        return AAFRESULT_SMALLBUF;
    }
    std::copy_n(text.c_str(), text.size() + 1, buffer);
    return AAFRESULT_SUCCESS;
}

HRESULT TextSize(const std::wstring& text, aafUInt32* bytes) {
    if (bytes == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *bytes = static_cast<aafUInt32>((text.size() + 1) * sizeof(aafCharacter));
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
