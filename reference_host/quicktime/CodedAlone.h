// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>

struct AVCodecParameters;

namespace host {

// Whether every picture of a movie's first picture track stands alone by the way it is coded,
// whatever the container tells of it. False where the codec has other pictures, too.
bool AreCodedAlone(const std::filesystem::path& movie);
// The same of a stream.
bool IsCodedAlone(const AVCodecParameters& form);

}  // namespace host
