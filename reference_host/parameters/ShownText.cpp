// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/ShownText.h"

#include "reference_host/util/text/Encodings.h"

namespace host {

namespace {

constexpr bool IsControl(char32_t c) {
    return c < 0x20 || (c >= 0x7F && c < 0xA0) || c == 0x2028 || c == 0x2029;
}

}  // namespace

std::string ShownText(std::string_view utf8, std::size_t most) {
    std::u32string characters = text::FromUtf8(utf8);
    const bool isCut = characters.size() > most;
    if (isCut) {
        characters.resize(most);
    }
    for (char32_t& c : characters) {
        c = IsControl(c) ? U' ' : c;
    }
    return text::ToUtf8Lossy(characters) + (isCut ? "..." : "");
}

}  // namespace host
