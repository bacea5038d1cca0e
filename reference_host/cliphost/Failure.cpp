// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Failure.h"

#include "reference_host/system/Access.h"

namespace cliphost {

int StatusOf(const Problem& problem) {
    std::error_code ignored;
    const bool canBeRead =
        std::filesystem::is_regular_file(problem.subject, ignored) &&
        host::system::AccessError(problem.subject, host::system::Right::Read) == 0;
    const bool isOfFile = problem.subject.empty() || canBeRead;
    return isOfFile && !problem.isOfProgram ? kExitFile : kExitCaller;
}

}  // namespace cliphost
