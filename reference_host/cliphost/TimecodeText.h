// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

namespace cliphost {

// A time as people write it, HH:MM:SS:FF; with a semicolon or a point before the frames, numbers
// are dropped.
struct WrittenTimecode {
    unsigned hours = 0, minutes = 0, seconds = 0, frames = 0;
    bool drops = false;
};
std::optional<WrittenTimecode> ReadTimecode(std::string_view text);
// The frames from midnight; none for a time that is not counted at that rate.
std::optional<std::int64_t> FramesOf(const WrittenTimecode& time, unsigned framesPerSecond);

// The address of a frame, "01:00:00:00" or, where numbers are dropped, "01:00:00;00": at rates that
// are multiples of 30. Behind 24 hours it begins again, as on a tape. Empty where no frames are
// counted.
std::string TimecodeText(std::int64_t frame, std::int64_t framesPerSecond, bool isDrop);

}  // namespace cliphost
