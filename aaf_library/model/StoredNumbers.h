// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstring>

#include "aaf_library/model/PropertyValue.h"

namespace aaf {

// Numbers and ids as stored values hold them: little-endian, without padding.

inline void AppendNumber(std::uint64_t value, std::size_t size, Bytes& out) {
    std::uint8_t bytes[sizeof value];
    for (std::size_t i = 0; i < sizeof value; ++i) {
        bytes[i] = static_cast<std::uint8_t>(value >> (8 * i));
    }
    out.insert(out.end(), bytes, bytes + size);
}

inline std::uint64_t UnsignedAt(const std::uint8_t* at, std::size_t size) {
    std::uint64_t value = 0;
    for (std::size_t i = 0; i < size; ++i) {
        value |= static_cast<std::uint64_t>(at[i]) << (8 * i);
    }
    return value;
}

inline aafInt64 SignedAt(const std::uint8_t* at, std::size_t size) {
    const unsigned shift = static_cast<unsigned>(64 - 8 * size);
    return static_cast<aafInt64>(UnsignedAt(at, size) << shift) >> shift;
}

inline constexpr std::size_t kGuidSize = 16;

inline void PutGuid(const GUID& id, std::uint8_t* at) {
    for (std::size_t i = 0; i < 4; ++i) {
        at[i] = static_cast<std::uint8_t>(id.Data1 >> (8 * i));
    }
    for (std::size_t i = 0; i < 2; ++i) {
        at[4 + i] = static_cast<std::uint8_t>(id.Data2 >> (8 * i));
        at[6 + i] = static_cast<std::uint8_t>(id.Data3 >> (8 * i));
    }
    std::memcpy(at + 8, id.Data4, 8);
}

inline void AppendGuid(const GUID& id, Bytes& out) {
    std::uint8_t bytes[kGuidSize];
    PutGuid(id, bytes);
    out.insert(out.end(), bytes, bytes + kGuidSize);
}

inline GUID GuidAt(const std::uint8_t* at) {
    GUID id{};
    id.Data1 = static_cast<decltype(id.Data1)>(UnsignedAt(at, 4));
    id.Data2 = static_cast<decltype(id.Data2)>(UnsignedAt(at + 4, 2));
    id.Data3 = static_cast<decltype(id.Data3)>(UnsignedAt(at + 6, 2));
    std::memcpy(id.Data4, at + 8, 8);
    return id;
}

// An indirect value: byte order mark, id of the type, the value in stored form.
inline constexpr std::uint8_t kLittleEndianMark = 0x4C;
inline constexpr std::size_t kIndirectHead = 1 + kGuidSize;

}  // namespace aaf
