// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>

namespace host {

// Quick questions, answered without the multimedia library.

// Codes of samples that nobody reads without a key.
bool IsEncrypted(std::uint32_t code);

// Pictures that a header may claim without being asked for more: 4096 x 4096.
inline constexpr std::int64_t kBelievedPixels = std::int64_t{4096} * 4096;

// Whether the header of a movie file claims larger ones for any of its tracks.
bool TellsLargePictures(const std::filesystem::path& movie);

}  // namespace host
