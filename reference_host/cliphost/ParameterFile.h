// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

namespace cliphost {

// The text of a parameter document's file, as UTF-8. UTF-16 is recognised by its
// byte order mark; other encodings are refused, because the module gets the text
// alone and never its declared encoding. Throws a Failure for the caller.
std::string ReadParameterFile(const std::filesystem::path& file);

}  // namespace cliphost
