// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>

// Fixed values of the streams in which properties are stored.

namespace aaf::stored {

inline constexpr std::uint8_t kLittleEndianMark = 0x4C;
inline constexpr std::uint8_t kBigEndianMark = 0x42;
inline constexpr std::uint8_t kStreamMark = 0x55;  // content of no particular byte order
inline constexpr std::uint8_t kPropertiesVersion = 32;

// Keys of an index run upwards from zero, so none is free at the top.
inline constexpr std::uint32_t kNoLastFreeKey = 0xFFFFFFFF;

// Readers take one for "in use"; some refuse any other number.
inline constexpr std::uint32_t kSetReferenceCount = 1;

inline constexpr std::size_t kAuidKeySize = 16;
inline constexpr std::size_t kMobIdKeySize = 32;

constexpr bool IsKeySize(std::size_t size) {
    return size == kAuidKeySize || size == kMobIdKeySize;
}

}  // namespace aaf::stored
