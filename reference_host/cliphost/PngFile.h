// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "reference_host/cliphost/Picture.h"

namespace cliphost {

// A picture as the bytes of a PNG file; empty when the picture can't be one.
std::vector<unsigned char> ToPng(const Picture& picture);

}  // namespace cliphost
