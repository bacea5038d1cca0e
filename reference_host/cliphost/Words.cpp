// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Words.h"

#include <fmt/format.h>

namespace cliphost {

std::string Counted(std::uint64_t count, const std::string& thing) {
    return (count == 0 ? "no" : fmt::format("{}", count)) + " " + thing + (count == 1 ? "" : "s");
}

std::string NumberedFromZero(std::uint64_t count, const std::string& thing) {
    const std::string text = "it has " + Counted(count, thing);
    if (count == 0) {
        return text;
    }
    return count == 1 ? fmt::format("{}, {} 0", text, thing)
                      : fmt::format("{}, 0 to {}", text, count - 1);
}

std::string InSmallLetters(std::string text) {
    for (char& c : text) {
        c = c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
    }
    return text;
}

}  // namespace cliphost
