// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The input as a movie file: the built module in the reference host opens and
// describes it. Whatever it is, afterwards no object of the module is alive.

#include <cstdio>
#include <cstdlib>

#include "fuzz/support/InputFile.h"
#include "fuzz/support/ModuleSession.h"
#include "fuzz/support/RunLimits.h"
#include "reference_host/cliphost/Describe.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const fuzz::InputFile file(".mov");
    cliphost::Session& session = fuzz::TheSession();
    const fuzz::TimeLimit limit;
    {
        const auto description = cliphost::DescribeMovie(session, file.Hold(data, size));
        if (!description.file && !description.problem) {
            std::fputs("a movie was refused without a word\n", stderr);
            std::abort();
        }
    }
    fuzz::RequireNothingLeft(session);
    return 0;
}
