// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <stdexcept>
#include <string>

namespace cliphost {

// Exit statuses of the program.
inline constexpr int kExitFine = 0;
inline constexpr int kExitFile = 1;    // the file's fault
inline constexpr int kExitCaller = 2;  // the caller's fault

// Ends a verb with a message for the user: what was tried, on what, what was
// wrong and what would help.
class Failure : public std::runtime_error {
public:
    Failure(int status, const std::string& message)
        : std::runtime_error(message), status_(status) {}
    int status() const { return status_; }

private:
    int status_;
};

}  // namespace cliphost
