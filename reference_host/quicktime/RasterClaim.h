// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>

#include "reference_host/quicktime/AvOwners.h"

namespace host {

// A description of a few bytes can claim pictures of gigabytes. Those of 4096 x 4096
// and below are taken as they are told; of larger ones the first samples must tell
// the same.

bool TellsLargePictures(const AVCodecParameters& form);
// Whether a movie file tells them of any of its tracks, by a look at its header.
bool TellsLargePictures(const std::filesystem::path& path);

// The most pixels that a decoder may make a picture of, for a stream whose pictures
// have the size that `form` tells.
std::int64_t MostPixels(const AVCodecParameters& form);

// Why a stream's pictures can't have the size that the file tells, in a sentence;
// empty when they can. Nothing is decoded.
std::string FindImpossibleRaster(const std::filesystem::path& path, int stream);

}  // namespace host
