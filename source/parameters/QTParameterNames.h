// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

namespace NMA::Impl {

// Names of sets, as users see them.
inline constexpr char kDefaultSetName[] = "Default Settings";
inline constexpr char kCustomSetName[] = "Custom";

}  // namespace NMA::Impl
