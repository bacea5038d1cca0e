// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Compiler.h"

// Marks what the utility library exports and the module imports.
#ifdef NMAUTIL_BUILDING
#define NMAUTIL_API NCF_EXPORT
#else
#define NMAUTIL_API NCF_IMPORT
#endif
