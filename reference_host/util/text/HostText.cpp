// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/text/HostText.h"

#include "text/Encodings.h"

namespace host::text {

namespace {

// Reads the buffer that one of the raw accessors shows.
template <class Unit, class Decode>
std::u32string ReadRaw(INCFString* string, NCFRESULT (INCFString::*accessor)(Unit**),
                       Decode decode) {
    Unit* units = nullptr;
    if ((string->*accessor)(&units) < 0 || units == nullptr) {
        return {};
    }
    return decode(std::basic_string_view<Unit>(units, string->GetLength()));
}

}  // namespace

std::u32string Read(INCFString* string) {
    if (string == nullptr) {
        return {};
    }
    switch (string->GetEncoding()) {
        case kNCFASCII:
        case kNCFUTF8:
            return ReadRaw(string, &INCFString::GetRawUTF8, encodings::FromUtf8);
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

std::string ReadUtf8(INCFString* string) {
    return encodings::ToUtf8Lossy(Read(string));
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
