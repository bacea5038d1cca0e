// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>

#include "host_interfaces/media/AAFClips.h"
#include "reference_host/cliphost/Session.h"

namespace cliphost {

// One movie's description, or why there is none.
struct Description {
    std::filesystem::path movie;
    AafRef<IAAFFile> file;  // empty on failure
    NCFRESULT result = NCF_OK;
    std::string problem;  // for the user, names the movie
};

// Opens a movie through the module's container and lets it be described.
Description DescribeMovie(Session& session, const std::filesystem::path& movie);
// The description at an index of the module's list of a folder.
Description DescribeFromList(Session& session, NMA::IAAFClips* list, ncfSInt32 index,
                             const std::filesystem::path& movie);

}  // namespace cliphost
