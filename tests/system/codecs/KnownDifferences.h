// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

// Where the system differs from FFmpeg on purpose, and why; null elsewhere. A
// difference that is told here has to be there.
const char* WhyItDiffers(const std::string& name, const std::string& aspect);
