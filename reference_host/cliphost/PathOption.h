// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>
#include <filesystem>
#include <string>
#include <vector>

namespace cliphost {

// Options and arguments that name files and folders. The parser itself would make a path of the
// text by the C library's locale, which on some systems knows a few letters alone.
CLI::Option* AddPath(CLI::App& app, const std::string& name, std::filesystem::path& path,
                     const std::string& about = {});
CLI::Option* AddPaths(CLI::App& app, const std::string& name,
                      std::vector<std::filesystem::path>& paths, const std::string& about = {});

}  // namespace cliphost
