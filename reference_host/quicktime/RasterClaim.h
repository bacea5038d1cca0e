// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>

#include "reference_host/quicktime/AvOwners.h"

namespace host {

// A description of a few bytes can claim pictures of gigabytes. Sizes up to
// kBelievedPixels are believed; larger ones only when the first samples say the same.

bool TellsLargePictures(const AVCodecParameters& form);

// The most pixels that a decoder may give a picture, for a stream whose pictures have
// the size of `form`.
std::int64_t MostPixels(const AVCodecParameters& form);

// Why a stream's pictures can't have the size that the file tells, in a sentence;
// empty when they can. Nothing is decoded.
std::string FindImpossibleRaster(const std::filesystem::path& path, int stream);

}  // namespace host
