// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

namespace host::system {

// Gives up, to the end of this process and for all its threads, what reading a movie does
// not need, so that a movie that breaks a decoder gains little by it: the network, starting
// programs and processes, signals to other processes, mapping new code, rights and owners
// of files, the system's settings. Files are written and removed only beneath
// `folder`; where it is empty, not at all. Reading stays. To be called once everything is loaded.
// Where the system does not know how, it goes on with the rights that it has; what is
// missing then, else nothing.
std::string GiveUpRights(const std::filesystem::path& folder);

}  // namespace host::system
