// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <functional>
#include <vector>

#include "reference_host/cliphost/Session.h"
#include "reference_host/cliphost/Workers.h"
#include "reference_host/validate/Check.h"
#include "reference_host/validate/Outcome.h"

namespace cliphost {

// What a call of the verb checks.
struct ValidateCall {
    std::filesystem::path module;
    std::vector<const validate::Check*> checks;
    std::uint64_t seed = 0;
    WorkerCall worker;  // program, arguments, jobs and limits
};

using TakeOutcome =
    std::function<void(const validate::Check& check, const validate::Outcome& outcome)>;

// Each check in a child process of its own, so that a crash costs one check alone. Outcomes come
// in the checks' order. What may end the module's process may also do its user's files harm: a
// module runs with the rights of its user, as in any host. Throws a Failure when no process can
// be started.
void ValidateInChildren(const ValidateCall& call, const TakeOutcome& take);
// All of them in this process, for a debugger.
void ValidateHere(const ValidateCall& call, const TakeOutcome& take);

// The other side, in the child: does one check and tells its parent. False when nobody started
// this process as a child.
bool ValidateForParent(const ValidateCall& call, const std::filesystem::path& folder);

}  // namespace cliphost
