// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/ParamText.h"

#include <charconv>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <string>

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/plugin/GuidText.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils::ParamText {
namespace {

// Requires: `at` is zero-terminated. Moves `at` behind the number.
ncfUInt64 TakeSigned(const char*& at) {
    char* end = nullptr;
    const ncfSInt64 value = std::strtoll(at, &end, 10);
    if (end == at) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    at = end;
    return static_cast<ncfUInt64>(value);
}

// A minus sign is taken too and wraps, as scanners of unsigned numbers do.
ncfUInt64 TakeUnsigned(const char*& at) {
    char* end = nullptr;
    const ncfUInt64 value = std::strtoull(at, &end, 10);
    if (end == at) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    at = end;
    return value;
}

// Whether a number that no float holds is too large, rather than too small: told
// by the place of its first digit that is not 0. Requires: `at` is a number
// without sign, as from_chars took it.
bool IsTooLarge(const char* at, const char* end) {
    ncfSInt64 places = 0;  // before the point; below 0 for zeros behind it
    bool started = false;
    bool behindPoint = false;
    for (; at != end && *at != 'e' && *at != 'E'; ++at) {
        if (*at == '.') {
            behindPoint = true;
            continue;
        }
        started = started || *at != '0';
        if (started != behindPoint) {
            places += started ? 1 : -1;
        }
    }
    const ncfSInt64 exponent = at == end ? 0 : std::strtoll(at + 1, nullptr, 10);
    return exponent > -places;
}

// Decimal, with a point, whatever the locale of the process.
float TakeFloat(const char* at) {
    at += std::strspn(at, " \t\n\v\f\r");
    const bool isNegative = *at == '-';
    if (isNegative || *at == '+') {
        ++at;
    }
    float value = 0;
    const auto scanned = std::from_chars(at, at + std::strlen(at), value);
    if (*at == '-' || scanned.ec == std::errc::invalid_argument) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    if (scanned.ec == std::errc::result_out_of_range) {
        value = IsTooLarge(at, scanned.ptr) ? std::numeric_limits<float>::infinity() : 0.0f;
    }
    return isNegative ? -value : value;
}

}  // namespace

void Read(const NMAString& text, ncfSInt32& out) {
    const char* at = text.GetUTF8String();
    out = static_cast<ncfSInt32>(static_cast<ncfUInt32>(TakeSigned(at)));
}

void Read(const NMAString& text, ncfUInt32& out) {
    const char* at = text.GetUTF8String();
    out = static_cast<ncfUInt32>(TakeUnsigned(at));
}

void Read(const NMAString& text, ncfSInt64& out) {
    const char* at = text.GetUTF8String();
    out = static_cast<ncfSInt64>(TakeSigned(at));
}

void Read(const NMAString& text, ncfUInt64& out) {
    const char* at = text.GetUTF8String();
    out = TakeUnsigned(at);
}

// The number is taken in single precision, and its bits become the low half of
// the result, whose high half stays zero. So 1.5 reads as about 5.3e-315. Hosts
// know the value by this form: widening it properly would change what they see.
void Read(const NMAString& text, double& out) {
    static_assert(sizeof(float) == sizeof(ncfUInt32) && sizeof(double) == sizeof(ncfUInt64),
                  "the bits of a float fill half a double");
    const float scanned = TakeFloat(text.GetUTF8String());
    ncfUInt32 low = 0;
    std::memcpy(&low, &scanned, sizeof low);
    const ncfUInt64 bits = low;
    std::memcpy(&out, &bits, sizeof out);
}

void Read(const NMAString& text, NMAParamRational& out) {
    const char* at = text.GetUTF8String();
    NMAParamRational value;
    value.numerator = static_cast<ncfSInt64>(TakeSigned(at));
    if (*at != '/') {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    ++at;
    value.denominator = static_cast<ncfSInt64>(TakeSigned(at));
    out = value;
}

void Read(const NMAString& text, GUID& out) {
    if (!StringToGUID(text, &out)) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
}

bool IsTrue(const NMAString& text) {
    return std::strcmp(text.GetUTF8String(), kParamTrue) == 0;
}

// Six places behind a point, whatever the locale of the process.
NMAString Write(double value) {
    char digits[384];  // the largest double has 309 places before the point
    const auto end =
        std::to_chars(digits, digits + sizeof digits - 1, value, std::chars_format::fixed, 6);
    *end.ptr = '\0';
    return NMAString(digits);
}

NMAString Write(const NMAParamRational& value) {
    const std::string text =
        std::to_string(value.numerator) + "/" + std::to_string(value.denominator);
    return NMAString(text.c_str());
}

NMAString Write(const GUID& value) {
    return GUIDToString(value);
}

NMAString WriteFlag(bool value) {
    return NMAString(value ? kParamTrue : kParamFalse);
}

}  // namespace NMA::XMLUtils::ParamText
