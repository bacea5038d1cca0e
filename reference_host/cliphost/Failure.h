// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <stdexcept>
#include <string>
#include <utility>

#include "reference_host/cliphost/Problem.h"

namespace cliphost {

// Exit statuses of the program. One kind of failure has one of them, in each verb
// and for one movie as for many; of several failures the highest is given.
inline constexpr int kExitFine = 0;
inline constexpr int kExitFile = 1;    // the file's fault
inline constexpr int kExitCaller = 2;  // the caller's fault

// Whose fault a problem with a file is. The caller's: the system does not open it,
// for instance without permission, it is not a file, or it belongs to the program.
// Otherwise its content is at fault.
int StatusOf(const Problem& problem);

// Ends a verb with what the user and programs are told. what() is the line.
class Failure : public std::runtime_error {
public:
    Failure(int status, Problem problem)
        : std::runtime_error(LineOf(problem)), status_(status), problem_(std::move(problem)) {}
    // Of a file, a folder or an option.
    Failure(int status, std::filesystem::path subject, std::string reason, std::string hint = {})
        : Failure(status, Problem{std::move(subject), std::move(reason), std::move(hint)}) {}
    // Of a file: with the status that goes with it.
    explicit Failure(Problem problem) : Failure(StatusOf(problem), problem) {}
    // Of none of these.
    Failure(int status, std::string reason) : Failure(status, {}, std::move(reason)) {}

    int status() const { return status_; }
    const Problem& problem() const { return problem_; }

private:
    int status_;
    Problem problem_;
};

}  // namespace cliphost
