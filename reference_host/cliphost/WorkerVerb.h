// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <CLI/CLI.hpp>

#include "reference_host/cliphost/MovieAnswer.h"
#include "reference_host/cliphost/Session.h"

namespace cliphost {

// The verb that the child processes of another verb are started as.
struct WorkerVerb {
    std::string name;
    std::string users;                  // the verb that users call
    std::filesystem::path folder = {};  // that it may write, empty: none
};

// Adds it, with its folder as an option and hidden from users; both share `worker`.
CLI::App* AddWorkerVerb(CLI::App& app, const std::shared_ptr<WorkerVerb>& worker);

// Answers the parent's requests, which come with their number. Throws a Failure when no parent
// started this process.
void Serve(Session& session, const WorkerVerb& worker,
           const std::function<std::string(std::uint64_t, const std::string&)>& answer);

// One movie's answer, whatever the movie does. Throws what is nobody's movie's fault: ReaderGone
// and MovieLibraryMissing.
MovieAnswer AnswerOfMovie(const std::filesystem::path& movie,
                          const std::function<MovieAnswer()>& answer);
// The same of a child process, which has no other way to tell of its library. Throws ReaderGone.
MovieAnswer AnswerSafely(const std::filesystem::path& movie,
                         const std::function<MovieAnswer()>& answer);

// Makes of one movie what the verb makes, and saves it where the place says.
using AnswerToMovie =
    std::function<MovieAnswer(const std::filesystem::path& movie, const PlaceOfFile& place)>;

// Serves requests that are each a movie's path.
void ServeMovies(Session& session, const WorkerVerb& worker, const AnswerToMovie& answer);

}  // namespace cliphost
