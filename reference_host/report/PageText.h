// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace report {

std::string Base64(const unsigned char* bytes, std::size_t size);

// The bytes of such a text; none of any other.
std::string FromBase64(std::string_view text);

// Whether it is what Base64 gives.
bool IsBase64(std::string_view text);

// A text that HTML shows as it is.
std::string InHtml(std::string_view text);

// JSON as it may stand in a script element: no character in it ends the element, begins a comment,
// or ends a line for a reader of scripts.
std::string InScript(std::string_view json);

// What a page's policy names a script or a style by; from the 64 digits of its SHA-256.
std::string HashSource(std::string_view digest);

}  // namespace report
