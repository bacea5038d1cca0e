// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"
#include "source/plugin/CNCFUnknown.h"

// One row for each component that the module registers. The index of a row is
// the argument of NCFRegisterComponent. A row without creation function is
// registered, but no class factory serves it.
struct ComponentRow {
    const char* displayName;
    GUID componentId;
    GUID classId;
    ncfUInt32 major;
    ncfUInt32 minor;
    CreationFunction creator;
};

inline constexpr ncfUInt32 kComponentCount = 9;
extern const ComponentRow kComponents[kComponentCount];

// The creation function for a class id, null when no factory serves it.
CreationFunction FindCreator(const GUID& classId);
