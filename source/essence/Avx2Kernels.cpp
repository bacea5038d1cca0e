// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/Avx2Kernels.h"

#ifdef _MSC_VER
#include <intrin.h>
#endif

namespace {

// Asks the system too, which has to keep the wide registers.
bool HasAvx2() {
#ifdef _MSC_VER
    constexpr int kAvxAndItsControl = 1 << 28 | 1 << 27;
    constexpr int kAvx2 = 1 << 5;
    constexpr ncfUInt64 kWideRegisters = 6;
    int answer[4] = {};
    __cpuid(answer, 0);
    if (answer[0] < 7) {
        return false;
    }
    __cpuid(answer, 1);
    if ((answer[2] & kAvxAndItsControl) != kAvxAndItsControl ||
        (_xgetbv(0) & kWideRegisters) != kWideRegisters) {
        return false;
    }
    __cpuidex(answer, 7, 0);
    return (answer[1] & kAvx2) != 0;
#else
    return __builtin_cpu_supports("avx2");
#endif
}

}  // namespace

const Avx2Kernels* FindAvx2Kernels() {
    static constexpr Avx2Kernels kernels = {kLevelKernelsAvx2, &ConvertRowAvx2};
    return HasAvx2() ? &kernels : nullptr;
}
