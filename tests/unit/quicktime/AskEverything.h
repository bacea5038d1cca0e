// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

namespace quicktime_tests {

// Opens a file with wrapper and property component and asks every operation of
// both, of the sample table and of both readers. Work and memory of the asking
// are bounded; what comes back is looked at only where it must hold for any
// bytes. Null, or a sentence of what does not hold.
const char* AskEverything(const std::filesystem::path& path);

}  // namespace quicktime_tests
