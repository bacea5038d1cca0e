// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace host::text {

// Characters that control a terminal or end a line instead of being shown: control
// characters, line and paragraph separators, and marks that change the direction of
// writing.
bool IsControl(char32_t c);

// A foreign text for people, on one line. Controls, and bytes that are no UTF-8,
// are shown as a shell's $'...' takes them: "\n", "\t", "\r", else "\x1B" for
// each byte.
std::string Printable(std::string_view utf8);
// The same for a text of several lines, which it stays.
std::string PrintableLines(std::string_view utf8);

}  // namespace host::text
