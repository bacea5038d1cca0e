// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <string_view>

// Paths between the form that the module keeps, with backslashes, and the form
// that the system's calls take. The one place where either is turned; every
// part of the host that is given a path passes here.
namespace host::system {

bool IsSeparator(char32_t c);

// The path for a system call. Both kinds of slash separate, and carried bytes
// become bytes again. False when the text holds a zero or a character that no
// file name can hold.
bool ToSystemPath(std::u32string_view text, std::filesystem::path& out);

// The text of a system's path, its separators as they stand.
std::u32string FromSystemPath(const std::filesystem::path& path);

// The form that the module expects: every separator a backslash.
std::u32string ToModulePath(const std::filesystem::path& path);

// Whether a component holds a backslash of its own, so that the module's form
// can't name it. Never on Windows.
bool HoldsBackslash(const std::filesystem::path& path);

}  // namespace host::system
