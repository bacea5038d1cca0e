// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
// The searching operations of the string component. Places are code units of
// the encoding held, and what is not there is no failure but place -1: callers
// stop at failures, and most names lack the word that is looked for.
#include "reference_host/framework/Guard.h"
#include "reference_host/framework/String.h"
#include "text/Encodings.h"

namespace host {

namespace {

constexpr ncfSInt32 kNotFound = -1;

bool Encode(std::u32string_view text, std::string& out) {
    return encodings::ToUtf8(text, out);
}
bool Encode(std::u32string_view text, std::u16string& out) {
    return encodings::ToUtf16(text, out);
}
bool Encode(std::u32string_view text, std::u32string& out) {
    return encodings::ToUtf32(text, out);
}
bool Encode(std::u32string_view text, std::wstring& out) {
    return encodings::ToWide(text, out);
}

ncfSInt32 Place(std::size_t at) {
    return at == std::string::npos ? kNotFound : static_cast<ncfSInt32>(at);
}

}  // namespace

NCFRESULT String::FindCharacter(ncfUTF32 character, ncfSInt32 from, ncfBool forward,
                                ncfSInt32* at) {
    return Guarded([&] {
        Need(at);
        *at = std::visit(
            [&](const auto& text) -> ncfSInt32 {
                std::decay_t<decltype(text)> wanted;
                if (!Encode({&character, 1}, wanted)) {
                    return kNotFound;
                }
                if (forward != 0) {
                    return Place(text.find(wanted, from < 0 ? 0 : std::size_t(from)));
                }
                return from < 0 ? kNotFound : Place(text.rfind(wanted, std::size_t(from)));
            },
            units_);
        return NCF_OK;
    });
}

NCFRESULT String::FindWCHAR(const ncfWCHAR* text, ncfUInt32 units, ncfUInt32 from, ncfSInt32* at) {
    if (text == nullptr || at == nullptr) {
        return NCF_E_POINTER;
    }
    const std::wstring* held = std::get_if<std::wstring>(&units_);
    if (held == nullptr) {
        return NCF_E_FAIL;
    }
    const std::wstring_view wanted =
        units == kNCFZeroTerminated ? std::wstring_view(text) : std::wstring_view(text, units);
    *at = Place(held->find(wanted, from));
    return NCF_OK;
}

}  // namespace host
