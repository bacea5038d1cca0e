// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "aaf_library/stored/StoredError.h"

// What the call's refusal says; empty when it refuses nothing.
template <typename Call>
std::string RefusalOf(const Call& call) {
    try {
        call();
        return "";
    } catch (const aaf::stored::StoredError& problem) {
        return problem.what();
    }
}
