// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <map>
#include <string>
#include <vector>

#include "reference_host/cliphost/AafClips.h"
#include "reference_host/cliphost/Session.h"
#include "reference_host/cliphost/Workers.h"

namespace cliphost {

// What a movie's description tells of it, or why there is none.
struct MovieFacts {
    Problem problem;
    aafMobID_t id{};  // of the master mob
    std::vector<SlotFacts> slots;
};

// By path.
using FactsOfMovies = std::map<std::filesystem::path::string_type, MovieFacts>;

// Describes movies, by child processes where the call says so, and adds what is found. `doing` is
// shown beside the progress. A movie that can't be described stops nothing.
void ReadMovieFacts(Session& session, const WorkerCall& workers,
                    std::vector<std::filesystem::path> movies, const char* doing,
                    FactsOfMovies& facts);

}  // namespace cliphost
