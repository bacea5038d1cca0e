// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

// The version of module and host; CMake reads it here.
#define PRODUCT_VERSION_NUMBERS 1, 3, 2

// "1.3.2"; with an L"" before it, the wide form.
#define PRODUCT_VERSION_TEXT PRODUCT_VERSION_TEXT_OF(PRODUCT_VERSION_NUMBERS)
#define PRODUCT_VERSION_TEXT_OF(...) PRODUCT_VERSION_JOINED(__VA_ARGS__)
#define PRODUCT_VERSION_JOINED(major, minor, patch) #major "." #minor "." #patch
