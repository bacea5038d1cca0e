// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

#include "reference_host/framework/String.h"

namespace host {

// Paths that come from and go to a module: inside it every separator is a
// backslash, and bytes that are no UTF-8 are carried as lone surrogates. Every
// component of the host that is given a path reads it here.

// The system's path. NCF_E_POINTER for null, NCF_E_INVALIDARG for an empty text
// and for one that no file name can hold.
NCFRESULT PathFrom(INCFString* text, std::filesystem::path& out);

// The path as the module wants it. A name that holds a backslash itself has no
// such form: see host::system::HoldsBackslash.
Ref<String> ModulePath(const std::filesystem::path& path);

// The path for people, on one line: controls and bytes that are no UTF-8 are
// escaped.
std::string DisplayPath(const std::filesystem::path& path);

}  // namespace host
