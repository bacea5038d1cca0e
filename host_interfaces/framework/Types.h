// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstdint>

// Fixed-width integers of the component framework. Nothing that crosses an
// interface uses `long`, `wchar_t` arithmetic or `bool`: their sizes differ
// between the platforms.
using ncfSInt8 = std::int8_t;
using ncfUInt8 = std::uint8_t;
using ncfSInt16 = std::int16_t;
using ncfUInt16 = std::uint16_t;
using ncfSInt32 = std::int32_t;
using ncfUInt32 = std::uint32_t;
using ncfSInt64 = std::int64_t;
using ncfUInt64 = std::uint64_t;

// 0 is false, anything else true. Signed and 32 bits wide because several
// flags of the clips are handed out as outputs of this type.
using ncfBool = ncfSInt32;

// One code unit of each text encoding.
using ncfUTF8 = char;
using ncfUTF16 = char16_t;
using ncfUTF32 = char32_t;
using ncfWCHAR = wchar_t;

// Negative is failure, zero success; a few operations name further
// non-negative answers.
using NCFRESULT = std::int32_t;
