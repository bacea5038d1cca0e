// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

#ifdef _WIN32
#include <guiddef.h>
#else
#include <cstring>

// 128-bit identifier in the layout of the platform's component model: the
// first three fields are numbers in machine order, the rest are bytes.
struct GUID {
    std::uint32_t Data1;
    std::uint16_t Data2;
    std::uint16_t Data3;
    std::uint8_t Data4[8];
};

inline bool operator==(const GUID& left, const GUID& right) {
    return std::memcmp(&left, &right, sizeof(GUID)) == 0;
}
inline bool operator!=(const GUID& left, const GUID& right) {
    return !(left == right);
}
#endif

static_assert(sizeof(GUID) == 16, "an identifier is sixteen bytes on every platform");

namespace ncf_detail {

constexpr unsigned HexDigit(char c) {
    return c >= '0' && c <= '9'   ? static_cast<unsigned>(c - '0')
           : c >= 'a' && c <= 'f' ? static_cast<unsigned>(c - 'a' + 10)
           : c >= 'A' && c <= 'F' ? static_cast<unsigned>(c - 'A' + 10)
                                  : throw "not a hexadecimal digit";
}

constexpr unsigned long long HexRun(const char* text, int digits) {
    unsigned long long value = 0;
    for (int i = 0; i < digits; ++i) {
        value = value << 4 | HexDigit(text[i]);
    }
    return value;
}

}  // namespace ncf_detail

// Makes an identifier of its usual text form, eight, four, four, four and
// twelve hexadecimal digits. A malformed constant does not compile.
constexpr GUID ncfGuid(const char (&text)[37]) {
    using ncf_detail::HexRun;
    GUID id{};
    id.Data1 = static_cast<decltype(id.Data1)>(HexRun(text, 8));
    id.Data2 = static_cast<decltype(id.Data2)>(HexRun(text + 9, 4));
    id.Data3 = static_cast<decltype(id.Data3)>(HexRun(text + 14, 4));
    for (int i = 0; i < 8; ++i) {
        const int at = i < 2 ? 19 + 2 * i : 20 + 2 * i;
        id.Data4[i] = static_cast<unsigned char>(HexRun(text + at, 2));
    }
    return id;
}
