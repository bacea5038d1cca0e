// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "host_interfaces/framework/Types.h"

// The level pass over sixteen bytes at a time, by arithmetic that gives the
// entries of the level tables exactly. Each does the whole blocks at the start
// of `pixels` and gives their bytes; what follows is for the tables.

// B G R A, a byte each.
std::size_t RemapBytesWide(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode);
// Little-endian words, alpha last.
std::size_t RemapLittleWordsWide(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode);
// Big-endian words, alpha first.
std::size_t RemapBigWordsWide(ncfUInt8* pixels, std::size_t size, ncfUInt32 mode);
