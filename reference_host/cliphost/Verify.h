// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/ClipCheck.h"

namespace cliphost {

struct VerifyOptions {
    std::vector<std::filesystem::path> files;  // AAF
    CheckOptions check;
    bool json = false;
};

// Tells for each clip of AAF files whether its movie is there and the one that was described; gives
// the exit status.
int Verify(Session& session, VerifyOptions& options);

}  // namespace cliphost
