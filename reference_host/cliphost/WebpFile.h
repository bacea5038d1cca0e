// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "reference_host/cliphost/Picture.h"

namespace cliphost {

// A picture of three channels of 8 bits as the bytes of a WebP file, in no more than so many
// where a lower quality can bring that about; empty when the picture can't be one.
std::vector<unsigned char> ToWebp(const Picture& picture, std::size_t mostBytes);

}  // namespace cliphost
