// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

// What the module uses of this header of Windows' C library.
extern "C" {
void* _aligned_malloc(std::size_t size, std::size_t alignment);
void _aligned_free(void* memory);
}
