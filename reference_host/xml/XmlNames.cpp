// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/XmlNames.h"

#include <algorithm>
#include <array>

namespace host {

namespace {

struct Range {
    char32_t first;
    char32_t last;
};

// Characters that may start a name, as XML 1.0, fifth edition, lists them.
constexpr std::array<Range, 16> kNameStart = {{{U':', U':'},
                                               {U'A', U'Z'},
                                               {U'_', U'_'},
                                               {U'a', U'z'},
                                               {0xC0, 0xD6},
                                               {0xD8, 0xF6},
                                               {0xF8, 0x2FF},
                                               {0x370, 0x37D},
                                               {0x37F, 0x1FFF},
                                               {0x200C, 0x200D},
                                               {0x2070, 0x218F},
                                               {0x2C00, 0x2FEF},
                                               {0x3001, 0xD7FF},
                                               {0xF900, 0xFDCF},
                                               {0xFDF0, 0xFFFD},
                                               {0x10000, 0xEFFFF}}};
// And those that may follow besides.
constexpr std::array<Range, 5> kNameFurther = {
    {{U'-', U'.'}, {U'0', U'9'}, {0xB7, 0xB7}, {0x300, 0x36F}, {0x203F, 0x2040}}};
constexpr std::array<Range, 5> kContent = {
    {{0x9, 0xA}, {0xD, 0xD}, {0x20, 0xD7FF}, {0xE000, 0xFFFD}, {0x10000, 0x10FFFF}}};

template <std::size_t Size>
bool IsIn(const std::array<Range, Size>& ranges, char32_t c) {
    return std::any_of(ranges.begin(), ranges.end(),
                       [c](const Range& range) { return c >= range.first && c <= range.last; });
}

}  // namespace

bool IsXmlName(std::u32string_view text) {
    if (text.empty() || !IsIn(kNameStart, text.front())) {
        return false;
    }
    return std::all_of(text.begin() + 1, text.end(),
                       [](char32_t c) { return IsIn(kNameStart, c) || IsIn(kNameFurther, c); });
}

bool IsXmlContent(std::u32string_view text) {
    return std::all_of(text.begin(), text.end(), [](char32_t c) { return IsIn(kContent, c); });
}

}  // namespace host
