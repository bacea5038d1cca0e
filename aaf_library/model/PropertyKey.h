// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

namespace aaf {

// A property's number inside one file. Built-in ones are below 0x8000 and the
// same everywhere; others are allotted by each model from 0xFFFF downwards.
using PropertyId = aafUInt16;
inline constexpr PropertyId kNoPropertyId = 0;

// Names a built-in property; PropertyKeys.h lists them all. The number is
// kNoPropertyId where each model allots its own.
struct PropertyKey {
    PropertyId pid;
    GUID id;
};

}  // namespace aaf
