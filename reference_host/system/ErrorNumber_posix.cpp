// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/ErrorNumber.h"

namespace host::system {

int ErrorNumber(unsigned long error) {
    return static_cast<int>(error);
}

}  // namespace host::system
