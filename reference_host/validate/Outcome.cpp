// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Outcome.h"

namespace validate {

const char* WordOf(Verdict verdict) {
    switch (verdict) {
        case Verdict::kPassed:
            return "passed";
        case Verdict::kFailed:
            return "failed";
        case Verdict::kCrashed:
            return "crashed";
        case Verdict::kTimedOut:
            return "timed out";
        case Verdict::kWarning:
            return "warning";
        case Verdict::kSkipped:
            return "skipped";
    }
    return "";
}

bool IsFault(Verdict verdict) {
    return verdict == Verdict::kFailed || verdict == Verdict::kCrashed ||
           verdict == Verdict::kTimedOut;
}

}  // namespace validate
