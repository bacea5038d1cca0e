// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

// What a module that harms its process asks of the system.

// A function of the real module, which is loaded when the first one is asked for.
void* RealFunction(const char* name);

// The folder that this process may write; empty: none.
std::filesystem::path OwnFolder();

// Does nothing where no harm is called so.
void DoHarm(const std::string& harm, const std::filesystem::path& movie);
