// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/ErrorNumber.h"

#include <windows.h>

#include <cerrno>
#include <system_error>

namespace host::system {

int ErrorNumber(unsigned long error) {
    if (error == ERROR_NO_DATA || error == ERROR_BROKEN_PIPE) {
        return EPIPE;
    }
    const std::error_condition plain =
        std::system_category().default_error_condition(static_cast<int>(error));
    return plain.category() == std::generic_category() ? plain.value() : EIO;
}

}  // namespace host::system
