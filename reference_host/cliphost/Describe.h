// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "host_interfaces/media/MediaContainer.h"
#include "reference_host/cliphost/Problem.h"
#include "reference_host/cliphost/Session.h"

namespace cliphost {

// One movie's description, or why there is none.
struct Description {
    std::filesystem::path movie;
    host::Ref<IAAFFile> file;  // empty on failure
    NCFRESULT result = NCF_OK;
    Problem problem;                   // names the movie
    Problem doubt;                     // what the header tells wrong; it is described all the same
    std::vector<std::string> notices;  // that the module wrote for the user, where it succeeded
};

// Opens a movie through the module's container and lets it be described.
Description DescribeMovie(Session& session, const std::filesystem::path& movie);
// The module's container for a movie, which is not looked into yet. A failure
// is the module's; one of the path throws.
NCFRESULT OpenContainer(Session& session, const std::filesystem::path& movie,
                        host::Ref<NMA::IMediaContainer3>& container);
Description DescribeContainer(Session& session, NMA::IMediaContainer3* container,
                              const std::filesystem::path& movie);
// The description at an index of the module's list of a folder.
Description DescribeFromList(Session& session, NMA::IAAFClips* list, ncfSInt32 index,
                             const std::filesystem::path& movie);

// Why the module did not describe or open a movie, and what would help. Takes the
// session's notices.
Problem ProblemWith(Session& session, const std::filesystem::path& movie, NCFRESULT result);

}  // namespace cliphost
