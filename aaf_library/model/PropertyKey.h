// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <unordered_map>

#include "host_interfaces/aaf/AAFPlainTypes.h"

namespace aaf {

// A property's number inside one file. Built-in ones are below 0x8000 and the
// same everywhere; others are allotted by each model from 0xFFFF downwards.
using PropertyId = aafUInt16;
inline constexpr PropertyId kNoPropertyId = 0;
// From here downwards models allot numbers to properties of their own.
inline constexpr PropertyId kFirstAllottedPid = 0xFFFF;
inline constexpr PropertyId kLastAllottedPid = 0x8000;

// The numbers that stand for others.
using AllottedNumbers = std::unordered_map<PropertyId, PropertyId>;

// Names a built-in property; PropertyKeys.h lists them all. The number is
// kNoPropertyId where each model allots its own.
struct PropertyKey {
    PropertyId pid;
    GUID id;
};

}  // namespace aaf
