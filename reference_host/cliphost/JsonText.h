// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace cliphost {

// Appends a text to JSON, in quotes. What is no UTF-8 becomes U+FFFD.
void AppendJsonText(std::string_view text, std::string& json);

// Whether this is JSON of objects, lists and texts alone, which is all that a tree is made of.
// Quicker than a parser that takes all of JSON.
bool IsJsonOfTexts(std::string_view json);

}  // namespace cliphost
