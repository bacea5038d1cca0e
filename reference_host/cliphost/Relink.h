// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/ClipCheck.h"

namespace cliphost {

struct RelinkOptions {
    std::filesystem::path file;    // AAF
    std::filesystem::path output;  // may be the same
    CheckOptions check;
    bool json = false;
};

// Finds the movies of an AAF file's clips that are not in their places, and writes the file anew
// with the places where they are; gives the exit status.
int Relink(Session& session, RelinkOptions& options);

}  // namespace cliphost
