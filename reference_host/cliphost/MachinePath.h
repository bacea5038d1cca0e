// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

namespace cliphost {

// A path as programs read it from --json: the path itself, or its file URL when
// it holds bytes that are not UTF-8, which JSON can't contain. Every verb accepts
// both forms.
std::string MachinePath(const std::filesystem::path& path);

// As the system has it.
std::filesystem::path AbsolutePath(const std::filesystem::path& path);

// The machine path of the absolute path: equal for all runs, wherever they are started.
std::string AbsoluteMachinePath(const std::filesystem::path& path);
// The path that a machine path stands for.
std::filesystem::path PathOfMachinePath(const std::string& text);

// What to say of it where --json is explained.
inline constexpr char kJsonHelp[] =
    "As JSON; a path that is not UTF-8 is given as a file URL (file:///a%FF.mov), which every "
    "verb accepts as a path";

}  // namespace cliphost
