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
