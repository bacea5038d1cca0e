// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace validate {

enum class Verdict { kPassed, kFailed, kCrashed, kTimedOut, kWarning, kSkipped };
inline constexpr Verdict kAllVerdicts[] = {Verdict::kPassed,  Verdict::kFailed,
                                           Verdict::kCrashed, Verdict::kTimedOut,
                                           Verdict::kWarning, Verdict::kSkipped};

// "timed out"
const char* WordOf(Verdict verdict);
// Whether the module does not keep what the host relies on.
bool IsFault(Verdict verdict);

// What came of a check. Empty texts: nothing to tell.
struct Outcome {
    Verdict verdict = Verdict::kPassed;
    std::string done;      // the last thing that was done
    std::string expected;  // what should have happened
    std::string found;     // what did; of a skipped check, why it is skipped
    std::string cause;     // what is most likely wrong
};

}  // namespace validate
