// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FolderClips.h"
#include "reference_host/cliphost/InputList.h"
#include "reference_host/cliphost/Shard.h"
#include "reference_host/cliphost/Workers.h"
#include "reference_host/system/FileState.h"

namespace cliphost {

struct MoviesOptions {
    std::vector<std::filesystem::path> paths;  // movies and folders
    std::filesystem::path list;                // of further ones; empty: none
    ListForm listForm = ListForm::Lines;
    bool isRecursive = false;          // folders within folders, too
    std::vector<std::string> endings;  // of the movies in folders; none: the module's list
    Shard shard;
    std::filesystem::path file;       // for what is made of the only movie
    std::filesystem::path outFolder;  // for what is made of each
    bool skipDone = false;            // leave out what lies there already
    std::filesystem::path together;   // for what is made of all
    WorkerCall workers;               // without `writeNear`

    bool Saves() const { return !file.empty() || !outFolder.empty(); }
};

// One movie of a command line, or what is told in its place.
struct MovieStep {
    std::filesystem::path::string_type movie;        // as in FolderClip
    std::shared_ptr<const FolderClips> folder = {};  // where it is out of a list
    ncfSInt32 index = 0;                             // in that
    std::shared_ptr<const Failure> refusal = {};     // it can't be asked for
    std::shared_ptr<const Problem> notice = {};      // no movie is meant
    bool isNamed = false;                            // by the caller, not by a folder
    unsigned number = 0;                             // in its output's name; 0: whichever is free
    bool isDone = false;                             // its output is there already
    std::optional<host::system::FileState> state = {};  // before it was read

    bool IsMovie() const { return !refusal && !notice && !isDone; }
};

// The steps for what the command line names, in its order; folders are listed through the module.
// `ending` is that of the outputs. Throws a Failure for a list that can't be read.
std::vector<MovieStep> PlanMovies(Session& session, const MoviesOptions& options,
                                  const char* ending);

// The name of what is made of a movie. Movies of one name in different folders have numbers.
std::filesystem::path OutputName(const std::filesystem::path& movie, unsigned number,
                                 const char* ending);

}  // namespace cliphost
