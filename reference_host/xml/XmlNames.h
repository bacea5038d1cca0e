// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string_view>

namespace host {

// Whether a text may stand as a name, or as content, in an XML document.
bool IsXmlName(std::u32string_view text);
bool IsXmlContent(std::u32string_view text);

}  // namespace host
