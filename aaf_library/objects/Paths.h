// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

namespace aaf {

// Wide text as a path of this system. Where paths are bytes they are UTF-8, and
// a byte b that is no UTF-8 is carried as the lone surrogate U+DC00 + b.
std::filesystem::path PathOf(const wchar_t* text);

// UTF-8 as wide text, stray bytes as told above.
std::wstring WideOf(const std::string& utf8);

}  // namespace aaf
