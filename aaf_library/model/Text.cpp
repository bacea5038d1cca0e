// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/Text.h"

#include <algorithm>
#include <cstring>
#include <string_view>

#include "host_interfaces/aaf/AAFResultCodes.h"
#include "text/Encodings.h"

namespace aaf {

namespace {

// Characters that are one unit of every encoding, and the same number.
template <class Text>
bool IsAscii(const Text& text) {
    return std::all_of(text.begin(), text.end(), [](auto c) { return (c & ~0x7F) == 0; });
}

bool IsAsciiUtf16(const std::uint8_t* bytes, std::size_t size) {
    unsigned beyond = 0;
    for (std::size_t i = 0; i + 1 < size; i += 2) {
        beyond |= (bytes[i] & 0x80u) | bytes[i + 1];
    }
    return beyond == 0;
}

template <class Units>
void AppendUnits(const Units& units, Bytes& out) {
    const std::size_t before = out.size();
    out.resize(before + 2 * units.size());
    auto* to = out.data() + before;
    for (const auto unit : units) {
        *to++ = static_cast<std::uint8_t>(unit);
        *to++ = static_cast<std::uint8_t>(unit >> 8);
    }
}

}  // namespace

void AppendUtf16(const aafCharacter* text, std::size_t count, Bytes& out) {
    const std::wstring_view wide(text, count);
    if (IsAscii(wide)) {
        AppendUnits(wide, out);
    } else {
        AppendUnits(encodings::ToUtf16Lossy(encodings::FromWide(wide)), out);
    }
}

std::wstring FromUtf16(const std::uint8_t* bytes, std::size_t size) {
    std::wstring text(size / 2, L'\0');
    for (wchar_t& unit : text) {
        unit = static_cast<wchar_t>(bytes[0] | bytes[1] << 8);
        bytes += 2;
    }
    if (IsAscii(text)) {
        return text;
    }
    return encodings::ToWideLossy(encodings::FromUtf16(std::u16string(text.begin(), text.end())));
}

std::size_t CountOfUtf16(const std::uint8_t* bytes, std::size_t size) {
    return IsAsciiUtf16(bytes, size) ? size / 2 : FromUtf16(bytes, size).size();
}

HRESULT CopyUtf16(const std::uint8_t* bytes, std::size_t size, void* buffer,
                  std::size_t bufferBytes) {
    if (!IsAsciiUtf16(bytes, size)) {
        const std::wstring text = FromUtf16(bytes, size);
        const std::size_t needed = text.size() * sizeof(aafCharacter);
        if (bufferBytes < needed) {
            return AAFRESULT_SMALLBUF;
        }
        std::memcpy(buffer, text.data(), needed);
        return AAFRESULT_SUCCESS;
    }
    if (bufferBytes / sizeof(aafCharacter) < size / 2) {
        return AAFRESULT_SMALLBUF;
    }
    // The caller's memory need not be aligned for characters.
    auto* to = static_cast<std::uint8_t*>(buffer);
    for (std::size_t i = 0; i < size / 2; ++i) {
        const aafCharacter character = bytes[2 * i];
        std::memcpy(to + i * sizeof character, &character, sizeof character);
    }
    return AAFRESULT_SUCCESS;
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

bool IsSameElementName(const std::wstring& left, const std::wstring& right) {
    const std::wstring prefix = L"kAAF";
    const auto startOf = [&](const std::wstring& name) {
        return name.compare(0, prefix.size(), prefix) == 0 ? prefix.size() : 0;
    };
    return left.compare(startOf(left), std::wstring::npos, right, startOf(right),
                        std::wstring::npos) == 0;
}

std::wstring Widen(const char* ascii) {
    return {ascii, ascii + std::strlen(ascii)};
}

namespace {

template <class Character>
HRESULT CopyCharacters(const Character* text, std::size_t size, aafCharacter* buffer,
                       aafUInt32 bufferBytes) {
    if (buffer == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (bufferBytes / sizeof(aafCharacter) < size + 1) {
        return AAFRESULT_SMALLBUF;
    }
    std::copy_n(text, size + 1, buffer);
    return AAFRESULT_SUCCESS;
}

HRESULT SizeOf(std::size_t characters, aafUInt32* bytes) {
    if (bytes == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *bytes = static_cast<aafUInt32>((characters + 1) * sizeof(aafCharacter));
    return AAFRESULT_SUCCESS;
}

}  // namespace

HRESULT CopyText(const std::wstring& text, aafCharacter* buffer, aafUInt32 bufferBytes) {
    return CopyCharacters(text.c_str(), text.size(), buffer, bufferBytes);
}

HRESULT TextSize(const std::wstring& text, aafUInt32* bytes) {
    return SizeOf(text.size(), bytes);
}

HRESULT CopyAscii(const char* text, aafCharacter* buffer, aafUInt32 bufferBytes) {
    return CopyCharacters(text, std::strlen(text), buffer, bufferBytes);
}

HRESULT AsciiSize(const char* text, aafUInt32* bytes) {
    return SizeOf(std::strlen(text), bytes);
}

}  // namespace aaf
