// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "host_interfaces/framework/Types.h"
#include "reference_host/quicktime/AvOwners.h"

namespace host {

// Sound as whole numbers of 32 bits, channels interleaved, from any form that a
// decoder gives: narrower numbers are shifted up, floating-point ones are
// rounded and held within the range. Appends to `words`; false for a form that
// is unknown or does not have `channels`.
bool AppendSoundWords(const AVFrame& frame, int channels, std::vector<ncfSInt32>& words);

// Writes the upper `bytes` (1 to 4) of each word.
void StoreSoundWords(const ncfSInt32* words, std::size_t count, int bytes, bool littleEndian,
                     ncfUInt8* to);

}  // namespace host
