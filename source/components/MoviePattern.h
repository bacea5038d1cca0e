// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace NMA::Impl {

// The names that scans of a folder look for. Case counts as in the file system.
inline constexpr char kMoviePattern[] = "*.mov";

}  // namespace NMA::Impl
