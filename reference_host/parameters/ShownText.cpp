// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/parameters/ShownText.h"

#include "reference_host/util/text/Printable.h"
#include "text/Encodings.h"

namespace host {

std::string ShownText(std::string_view utf8, std::size_t most) {
    std::u32string characters = encodings::FromUtf8(utf8);
    const bool isCut = characters.size() > most;
    if (isCut) {
        characters.resize(most);
    }
    for (char32_t& c : characters) {
        c = text::IsControl(c) ? U' ' : c;
    }
    return encodings::ToUtf8Lossy(characters) + (isCut ? "..." : "");
}

}  // namespace host
