// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <optional>

#include "reference_host/cliphost/Picture.h"
#include "reference_host/cliphost/Session.h"

namespace cliphost {

inline constexpr int kThumbnailWidth = 160;

// A small picture from the middle of a movie, as the movie is shown; none for one without pictures.
// Throws a Failure where it has some and this one can't be read.
std::optional<Picture> ThumbnailOf(Session& session, const std::filesystem::path& movie);

}  // namespace cliphost
