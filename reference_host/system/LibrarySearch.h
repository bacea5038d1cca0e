// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

namespace host::system {

// Sees to it that whoever asks the system for a library by `name` alone gets this file, even if
// the file calls itself otherwise: where nothing else serves, the program starts anew, with the
// same arguments and a folder on the search path that holds a link of that name. To be called
// before the program does anything. Where it can't be done the program goes on as it is.
void MakeFoundAs(const std::filesystem::path& file, const char* name);

}  // namespace host::system
