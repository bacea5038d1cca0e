// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "public_include/SimpleFileIO.h"
#include "source/plugin/ByteVector.h"

// Pieces of a file that tell a movie from others, for both kinds of clip.

// The most that is taken from one place of a file.
inline constexpr ncfUInt64 kHashChunkSize = 1048576;

// Reads a range behind what `content` holds; a range that the file can't fill
// gives NCF_E_FAIL and leaves nothing behind. An empty one adds nothing. A
// failed read is logged under the function's name as `statement`.
NCFRESULT AppendFileRange(const char* function, const char* statement,
                          NMA::Impl::SimpleFileIO& file_reader, ncfUInt64 offset, ncfUInt64 size,
                          ByteVector& content);
