// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/Problem.h"

namespace cliphost {

// Why nothing has this path; `hint` is what helps against a name that nothing can have.
Problem WhyNoPath(const std::filesystem::path& path, const char* hint);

// Why a file or folder can't be reached by its path: a part of the way that is
// missing, closed or no folder, and links that lead nowhere or in a circle.
// Nothing when it is there.
Problem WhyUnreachable(const std::filesystem::path& path);

// Why the bytes of a file can't be read: the same, or that it is a folder, a
// device, closed by its permissions, or empty. Nothing when they can.
Problem WhyUnreadable(const std::filesystem::path& file);

// Why the entries of a folder can't be listed or looked at.
Problem WhyUnlistable(const std::filesystem::path& folder);

}  // namespace cliphost
