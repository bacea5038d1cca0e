// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/FourCharText.h"

std::string FourCharText(ncfUInt32 code) {
    std::string text;
    for (int shift = 24; shift >= 0; shift -= 8) {
        const auto character = static_cast<unsigned char>(code >> shift);
        text += character >= 0x20 && character < 0x7F ? static_cast<char>(character) : '?';
    }
    return text;
}
