// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "reference_host/cliphost/Session.h"

// Loads, describes and saves one file of a user's media and compares what the
// saved description says of size, rate, length, tracks and timecode with what
// ffprobe says of the file. A refusal is right only for a file that is
// recognisably of a kind that has to be refused.
struct MediaVerdict {
    bool isRight = false;
    std::string summary;                   // one line
    std::vector<std::string> differences;  // empty when all is right
};

MediaVerdict CheckMedia(cliphost::Session& session, const std::filesystem::path& file,
                        const std::filesystem::path& saveAs);
