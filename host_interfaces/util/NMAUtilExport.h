// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

// Marks what the utility library exports and the module imports.
#ifdef _WIN32
#ifdef NMAUTIL_BUILDING
#define NMAUTIL_API __declspec(dllexport)
#else
#define NMAUTIL_API __declspec(dllimport)
#endif
#else
#define NMAUTIL_API __attribute__((visibility("default")))
#endif
