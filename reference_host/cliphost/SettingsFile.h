// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <string_view>
#include <vector>

#include <CLI/CLI.hpp>

namespace cliphost {

// A file with options that a user gives always: those before the first section are the program's,
// and each verb's stand in a section by its name. The command line wins over it.

// $XDG_CONFIG_HOME/cliphost.toml, or that of ~/.config; empty where neither folder is known.
std::filesystem::path DefaultSettingsFile();

// Adds --config and --no-config. The file is read when the command line was, before any option
// takes effect. What it says of a verb that does not run has to exist, and no more. An option that
// the command line excludes, or that needs one which neither gives, is passed over.
void AddSettingsFile(CLI::App& app);

// The parser passes over a default file that can't be read; this throws a Failure for it. For
// afterwards.
void RefuseUnreadSettings(CLI::App& app);

// Throws a Failure that says why the file of --config, which the parser refused, can't be read.
[[noreturn]] void RefuseGivenSettings(const CLI::App& app);

inline constexpr char kNoSettingsFile[] = "--no-config";

}  // namespace cliphost
