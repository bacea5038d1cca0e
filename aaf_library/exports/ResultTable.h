// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

namespace aaf {

// What is known of a result code. The sentence may be empty.
struct ResultText {
    aafUInt32 code;
    const char* name;
    const char* sentence;
};

// Null for a code that is not in the table.
const ResultText* FindResultText(AAFRESULT result);

}  // namespace aaf
