// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/Avx2Kernels.h"

const Avx2Kernels* FindAvx2Kernels() {
    static constexpr Avx2Kernels kernels = {kLevelKernelsAvx2, &ConvertRowAvx2};
    // Asks the system too, which has to keep the wide registers.
    return __builtin_cpu_supports("avx2") ? &kernels : nullptr;
}
