// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/HostText.h"

#include <utility>

#include "text/Encodings.h"

namespace host::text {

namespace {

// Reads the buffer that one of the raw accessors shows.
template <class Unit, class Decode>
auto ReadRaw(INCFString* string, NCFRESULT (INCFString::*accessor)(Unit**), Decode decode)
    -> decltype(decode({})) {
    Unit* units = nullptr;
    if ((string->*accessor)(&units) < 0 || units == nullptr) {
        return {};
    }
    return decode(std::basic_string_view<Unit>(units, string->GetLength()));
}

}  // namespace

AsHeld ReadAsHeld(INCFString* string) {
    if (string == nullptr) {
        return {};
    }
    switch (string->GetEncoding()) {
        case kNCFASCII:
        case kNCFUTF8:
            return ReadRaw(string, &INCFString::GetRawUTF8,
                           [](std::string_view units) { return std::string(units); });
        case kNCFUTF16:
            return ReadRaw(string, &INCFString::GetRawUTF16, encodings::FromUtf16);
        case kNCFUTF32:
            return ReadRaw(string, &INCFString::GetRawUTF32,
                           [](std::u32string_view units) { return std::u32string(units); });
        case kNCFWCHAR:
            return ReadRaw(string, &INCFString::GetRawWCHAR, encodings::FromWide);
        default:
            return {};
    }
}

std::u32string Read(INCFString* string) {
    AsHeld held = ReadAsHeld(string);
    const auto* const utf8 = std::get_if<std::string>(&held);
    return utf8 != nullptr ? encodings::FromUtf8(*utf8) : std::move(std::get<std::u32string>(held));
}

std::string ReadUtf8(INCFString* string) {
    AsHeld held = ReadAsHeld(string);
    auto* const utf8 = std::get_if<std::string>(&held);
    return utf8 != nullptr ? std::move(*utf8)
                           : encodings::ToUtf8Lossy(std::get<std::u32string>(held));
}

NCFRESULT Assign(INCFString* string, std::u32string_view text, ncfUInt32 keepAs) {
    if (string == nullptr) {
        return NCF_E_POINTER;
    }
    std::u16string units;
    if (!encodings::ToUtf16(text, units)) {
        return NCF_E_FAIL;
    }
    return string->AssignUTF16(keepAs, units.data(), static_cast<ncfUInt32>(units.size()));
}

}  // namespace host::text
