// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/UpperCase.h"

#include <gtest/gtest.h>
#include <locale.h>
#include <wctype.h>

using namespace aaf::stored;

TEST(UpperCase, IsWhatTheSystemSaysOfEveryUnit) {
    const locale_t unicode = newlocale(LC_CTYPE_MASK, "C.UTF-8", nullptr);
    ASSERT_NE(unicode, nullptr);
    for (char32_t unit = 0; unit <= 0xFFFF; ++unit) {
        const bool isHalf = unit >= 0xD800 && unit < 0xE000;
        const auto capital =
            isHalf ? unit : char32_t(towupper_l(static_cast<wint_t>(unit), unicode));
        ASSERT_EQ(UpperCase(static_cast<char16_t>(unit)), capital <= 0xFFFF ? capital : unit)
            << std::hex << static_cast<unsigned>(unit);
    }
    freelocale(unicode);
}
