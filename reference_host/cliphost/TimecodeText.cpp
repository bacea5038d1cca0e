// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/TimecodeText.h"

#include <fmt/format.h>

#include "host_interfaces/util/NMAUtil.h"

namespace cliphost {
namespace {

bool IsDropRate(std::int64_t framesPerSecond) {
    return framesPerSecond != 0 && framesPerSecond % 30 == 0;
}

// Frame numbers that each minute but every tenth begins without.
std::int64_t DroppedPerMinute(std::int64_t framesPerSecond) {
    return IsDropRate(framesPerSecond) ? framesPerSecond / 15 : 0;
}

}  // namespace

std::optional<WrittenTimecode> ReadTimecode(std::string_view text) {
    constexpr std::string_view kForm = "00:00:00:00";
    if (text.size() < kForm.size() || text.size() > kForm.size() + 1) {
        return std::nullopt;
    }
    const char last = text[8];
    for (std::size_t i = 0; i < text.size(); ++i) {
        const bool isDigit = text[i] >= '0' && text[i] <= '9';
        if (i == 8                                ? last != ':' && last != ';' && last != '.'
            : i < kForm.size() && kForm[i] == ':' ? text[i] != ':'
                                                  : !isDigit) {
            return std::nullopt;
        }
    }
    const auto number = [&](std::size_t at, std::size_t size) {
        unsigned value = 0;
        for (const char digit : text.substr(at, size)) {
            value = value * 10 + static_cast<unsigned>(digit - '0');
        }
        return value;
    };
    const WrittenTimecode time{number(0, 2), number(3, 2), number(6, 2), number(9, 3), last != ':'};
    if (time.hours > 23 || time.minutes > 59 || time.seconds > 59) {
        return std::nullopt;
    }
    return time;
}

std::optional<std::int64_t> FramesOf(const WrittenTimecode& time, unsigned fps) {
    const bool isLeftOut = time.drops && time.minutes % 10 != 0 && time.seconds == 0 &&
                           time.frames < DroppedPerMinute(fps);
    ncfUInt32 frames = 0;
    if (time.frames >= fps || (time.drops && !IsDropRate(fps)) || isLeftOut ||
        ConvertTCToFrames(time.hours, time.minutes, time.seconds, time.frames, fps, time.drops,
                          &frames) < 0) {
        return std::nullopt;
    }
    return frames;
}

std::string TimecodeText(std::int64_t frame, std::int64_t framesPerSecond, bool isDrop) {
    constexpr std::int64_t kMostPerSecond = 1000;
    if (framesPerSecond < 1 || framesPerSecond > kMostPerSecond) {
        return {};
    }
    isDrop = isDrop && IsDropRate(framesPerSecond);
    const std::int64_t dropped = isDrop ? DroppedPerMinute(framesPerSecond) : 0;
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
