// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace host {

// A foreign text for a message: on one line, with spaces in place of what a
// terminal would take for a command, and with dots where more than `most`
// characters were cut.
std::string ShownText(std::string_view utf8, std::size_t most);

}  // namespace host
