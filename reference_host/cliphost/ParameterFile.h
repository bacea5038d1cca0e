// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

namespace cliphost {

// The text of a parameter document's file, as UTF-8. UTF-16 is known by its
// mark; another encoding is refused, since the text alone reaches the module
// and not what it claims of itself. Throws a Failure for the caller.
std::string ReadParameterFile(const std::filesystem::path& file);

}  // namespace cliphost
