// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/Text.h"

#include <algorithm>

#include "host_interfaces/aaf/AAFResultCodes.h"
#include "text/Encodings.h"

namespace aaf {

void AppendUtf16(const aafCharacter* text, std::size_t count, Bytes& out) {
    out.reserve(out.size() + 2 * count);
    for (const char16_t unit : encodings::ToUtf16Lossy(encodings::FromWide({text, count}))) {
        out.push_back(static_cast<std::uint8_t>(unit));
        out.push_back(static_cast<std::uint8_t>(unit >> 8));
    }
}

std::wstring FromUtf16(const std::uint8_t* bytes, std::size_t size) {
    std::u16string units;
    units.reserve(size / 2);
    for (std::size_t at = 0; at + 1 < size; at += 2) {
        units.push_back(static_cast<char16_t>(bytes[at] | bytes[at + 1] << 8));
    }
    return encodings::ToWideLossy(encodings::FromUtf16(units));
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
