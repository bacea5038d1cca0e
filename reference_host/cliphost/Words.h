// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace cliphost {

// "no frames", "1 frame", "25 frames"; the thing by its singular.
std::string Counted(std::uint64_t count, const std::string& thing);

// How things numbered from 0 are named: "it has no frames", "it has 1 frame,
// frame 0", "it has 25 frames, 0 to 24".
std::string NumberedFromZero(std::uint64_t count, const std::string& thing);

// What other programs put before a text in UTF-8.
inline constexpr std::string_view kByteOrderMark = "\xEF\xBB\xBF";

// Letters of ASCII alone.
std::string InSmallLetters(std::string text);

}  // namespace cliphost
