// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/TimecodeText.h"

#include <fmt/format.h>

namespace cliphost {

std::string TimecodeText(std::int64_t frame, std::int64_t framesPerSecond, bool isDrop) {
    constexpr std::int64_t kMostPerSecond = 1000;
    if (framesPerSecond < 1 || framesPerSecond > kMostPerSecond) {
        return {};
    }
    // Two of 30 numbers are dropped in each minute but the tenth.
    const std::int64_t dropped = isDrop ? framesPerSecond / 30 * 2 : 0;
    const std::int64_t perMinute = framesPerSecond * 60 - dropped;
    const std::int64_t perTenMinutes = perMinute * 10 + dropped;
    const std::int64_t perDay = perTenMinutes * 6 * 24;
    std::int64_t number = (frame % perDay + perDay) % perDay;
    const std::int64_t tens = number / perTenMinutes;
    const std::int64_t rest = number % perTenMinutes;
    const std::int64_t minutes = rest < framesPerSecond * 60 ? 0 : (rest - dropped) / perMinute;
    number += dropped * (9 * tens + minutes);
    const std::int64_t seconds = number / framesPerSecond;
    return fmt::format("{:02}:{:02}:{:02}{}{:02}", seconds / 3600, seconds / 60 % 60, seconds % 60,
                       isDrop ? ';' : ':', number % framesPerSecond);
}

}  // namespace cliphost
