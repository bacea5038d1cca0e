// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace NMA::Impl {

// What the scans of a folder look for. Its case follows the file system.
inline constexpr char kMoviePattern[] = "*.mov";

}  // namespace NMA::Impl
