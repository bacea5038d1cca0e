// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <nlohmann/json_fwd.hpp>
#include <string>

#include "host_interfaces/framework/ResultCodes.h"

namespace cliphost {

// The two ways in which a movie is read, as programs are told of them.
namespace route {
inline constexpr const char* kHeader = "header";    // by the header parser
inline constexpr const char* kLibrary = "library";  // by the multimedia library
inline constexpr const char* kNone = "none";        // neither of them opens it
}  // namespace route

// Why something could not be done, for people and for programs.
struct Problem {
    std::filesystem::path subject = {};  // the file, folder or option; may be empty
    std::string reason = {};             // what is wrong, with its numbers and its place
    std::string hint = {};               // what helps; empty where nothing does
    NCFRESULT code = NCF_OK;             // the module's answer; fine where it was not asked
    std::string route = {};              // empty where no movie was read
    bool isOfProgram = false;            // of what belongs to the program, not of the movie

    explicit operator bool() const { return !reason.empty(); }
};

// "FILE: what is wrong; what helps"
std::string LineOf(const Problem& problem);
// What stands behind that line: the module's answer and the route, in lines that
// begin with spaces. Empty where there is neither.
std::string DetailsOf(const Problem& problem);
// Sets "reason", "hint", "code" and "route"; what is not known is null.
void AddProblem(const Problem& problem, nlohmann::ordered_json& json);

// Tells the user on standard error; the details from verbosity 1 on.
void TellProblem(const Problem& problem, int verbosity);

}  // namespace cliphost
