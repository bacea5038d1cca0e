// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>

namespace cliphost {

// The address of a frame, "01:00:00:00" or, where numbers are dropped, "01:00:00;00". Behind 24
// hours it begins again, as on a tape. Empty where no frames are counted.
std::string TimecodeText(std::int64_t frame, std::int64_t framesPerSecond, bool isDrop);

}  // namespace cliphost
