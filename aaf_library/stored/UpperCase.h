// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace aaf::stored {

// The capital of a letter, by Unicode's simple mapping; any other unit as it
// is. A compound file orders its directory by it.
char16_t UpperCaseBeyondAscii(char16_t unit);
inline char16_t UpperCase(char16_t unit) {
    if (unit < 0x80) {
        return unit >= u'a' && unit <= u'z' ? static_cast<char16_t>(unit - u'a' + u'A') : unit;
    }
    return UpperCaseBeyondAscii(unit);
}

}  // namespace aaf::stored
