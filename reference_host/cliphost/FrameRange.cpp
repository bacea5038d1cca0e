// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FrameRange.h"

#include <fmt/format.h>

#include <algorithm>
#include <limits>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/system/Paths.h"
#include "reference_host/util/text/Number.h"

namespace cliphost {
namespace {

using host::text::ReadNumber;

std::vector<std::string> Split(const std::string& text) {
    std::vector<std::string> parts(1);
    for (const char c : text) {
        if (c == ':') {
            parts.emplace_back();
        } else {
            parts.back() += c;
        }
    }
    return parts;
}

}  // namespace

std::uint64_t FrameRange::CountIn(std::uint64_t frames) const {
    const std::uint64_t stop = std::min(end.value_or(frames), frames);
    return first >= stop ? 0 : (stop - first - 1) / step + 1;
}

FrameRange OneFrame(std::uint64_t frame) {
    FrameRange range;
    range.first = frame;
    if (frame < std::numeric_limits<std::uint64_t>::max()) {
        range.end = frame + 1;
    }
    return range;
}

FrameRange ParseFrameRange(const std::string& text) {
    const std::vector<std::string> parts = Split(text);
    FrameRange range;
    std::uint64_t end = 0;
    const bool hasEnd = parts.size() >= 2 && !parts[1].empty();
    const bool isGood = (parts.size() == 2 || parts.size() == 3) &&
                        (parts[0].empty() || ReadNumber(parts[0], range.first)) &&
                        (!hasEnd || ReadNumber(parts[1], end)) &&
                        (parts.size() < 3 || ReadNumber(parts[2], range.step)) && range.step > 0;
    if (!isGood || (hasEnd && end <= range.first)) {
        throw Failure(kExitCaller, host::system::PathOfText("--range " + text),
                      "this is not a range",
                      "write FIRST:END or FIRST:END:STEP, such as 0:25 for frames 0 to 24, or 100: "
                      "for all from 100 on");
    }
    if (hasEnd) {
        range.end = end;
    }
    return range;
}

std::vector<std::uint64_t> SpreadFrames(std::uint64_t frames, std::uint64_t wanted) {
    const std::uint64_t count = std::min(frames, wanted);
    std::vector<std::uint64_t> spread;
    for (std::uint64_t i = 0; i < count; ++i) {
        const double middle = (static_cast<double>(i) + 0.5) / static_cast<double>(count);
        spread.push_back(static_cast<std::uint64_t>(middle * static_cast<double>(frames)));
    }
    return spread;
}

}  // namespace cliphost
