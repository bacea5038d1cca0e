// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace cliphost {

// Frames that a command line names: from the first, included, to the end, excluded,
// in steps.
struct FrameRange {
    std::uint64_t first = 0;
    std::optional<std::uint64_t> end;  // none: to the last frame
    std::uint64_t step = 1;

    // How many they are in a clip of so many frames.
    std::uint64_t CountIn(std::uint64_t frames) const;
};

// The range that holds this frame alone.
FrameRange OneFrame(std::uint64_t frame);

// "A:B" or "A:B:STEP"; A and B may be left out. Throws a Failure that shows how
// to write it.
FrameRange ParseFrameRange(const std::string& text);

// A number of frames spread evenly over a clip: the middle one of each equal part.
std::vector<std::uint64_t> SpreadFrames(std::uint64_t frames, std::uint64_t wanted);

}  // namespace cliphost
