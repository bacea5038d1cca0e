// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Any bytes as a file of any kind for the movie wrapper, its sample table and
// its readers. They open files by their names, so the bytes go into one.

#include <cstdint>
#include <cstdio>
#include <cstdlib>

#include "fuzz/support/InputFile.h"
#include "fuzz/support/RunLimits.h"
#include "tests/unit/quicktime/AskEverything.h"

extern "C" void av_log_set_level(int level);

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const fuzz::InputFile file("");
    constexpr int kQuiet = -8;
    av_log_set_level(kQuiet);
    const fuzz::TimeLimit limit;
    if (const char* const problem = quicktime_tests::AskEverything(file.Hold(data, size))) {
        std::fprintf(stderr, "%s\n", problem);
        std::abort();
    }
    return 0;
}
