// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>
#include <variant>

#include "host_interfaces/framework/String.h"

// Texts of host strings as plain C++ texts. Whoever is handed a string reads
// it here, whatever encoding it holds, and never converts the caller's object.
namespace host::text {

// The text of `string`, which is borrowed; null: empty.
std::u32string Read(INCFString* string);
// The same, left in UTF-8 where the string holds that. Back and forth gives the same bytes.
using AsHeld = std::variant<std::string, std::u32string>;
AsHeld ReadAsHeld(INCFString* string);
// The same as UTF-8, for messages: never fails.
std::string ReadUtf8(INCFString* string);

// Puts `text` into `string` and holds it in the encoding `keepAs`.
NCFRESULT Assign(INCFString* string, std::u32string_view text, ncfUInt32 keepAs);

}  // namespace host::text
