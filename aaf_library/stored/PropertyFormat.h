// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>

// Fixed values of the streams in which properties are stored.

namespace aaf::stored {

inline constexpr std::uint8_t littleEndianMark = 0x4C;
inline constexpr std::uint8_t bigEndianMark = 0x42;
inline constexpr std::uint8_t streamMark = 0x55;  // content of no particular byte order
inline constexpr std::uint8_t propertiesVersion = 32;

// Keys of an index run upwards from zero, so none is free at the top.
inline constexpr std::uint32_t noLastFreeKey = 0xFFFFFFFF;

// Readers take one for "in use"; some refuse any other number.
inline constexpr std::uint32_t setReferenceCount = 1;

inline constexpr std::size_t auidKeySize = 16;
inline constexpr std::size_t mobIdKeySize = 32;

constexpr bool isKeySize(std::size_t size) {
    return size == auidKeySize || size == mobIdKeySize;
}

}  // namespace aaf::stored
