// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

namespace host::system {

// What a program settles with the system before it does anything else: standard
// streams that the caller closed stay closed, and a file that outgrows its limit or
// a pipe that nobody reads any more fails to be written.
void PrepareProcess();

// The program's name, which may be empty, and its arguments, of which the system may know more than
// main() is told: in UTF-8 where the system has them as characters, otherwise the bytes as they
// are.
std::vector<std::string> CommandLineWords(int argc, char** argv);

// Where a user's settings lie; empty: nothing tells.
std::filesystem::path SettingsFolder();
// The same as people call it.
extern const char* const kSettingsFolderInWords;

// The file that runs. `name` is what the caller called it.
std::filesystem::path ProgramFile(const char* name);

// Whether standard error is read at a terminal.
bool IsWatched();

}  // namespace host::system
