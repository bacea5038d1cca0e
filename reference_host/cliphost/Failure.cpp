// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Failure.h"

#include <unistd.h>

namespace cliphost {

int StatusOf(const Problem& problem) {
    std::error_code ignored;
    const bool canBeRead = std::filesystem::is_regular_file(problem.subject, ignored) &&
                           access(problem.subject.c_str(), R_OK) == 0;
    const bool isOfFile = problem.subject.empty() || canBeRead;
    return isOfFile && !problem.isOfProgram ? kExitFile : kExitCaller;
}

}  // namespace cliphost
