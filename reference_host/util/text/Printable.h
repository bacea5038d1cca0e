// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace host::text {

// What steers a terminal or ends a line in place of being shown: the control
// characters, the ends of lines and paragraphs, and the marks that turn the
// direction of writing.
bool IsControl(char32_t c);

// A foreign text for people, on one line. Controls, and bytes that are no UTF-8,
// are shown as a shell's $'...' takes them: "\n", "\t", "\r", else "\x1B" for
// each byte.
std::string Printable(std::string_view utf8);
// The same for a text of several lines, which it stays.
std::string PrintableLines(std::string_view utf8);

}  // namespace host::text
