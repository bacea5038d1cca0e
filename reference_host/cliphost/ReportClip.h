// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <nlohmann/json_fwd.hpp>

#include "reference_host/catalog/Catalog.h"
#include "reference_host/cliphost/MovieAnswer.h"
#include "reference_host/cliphost/MovieCodecs.h"
#include "reference_host/cliphost/PathMaps.h"

namespace cliphost {

// What a catalog has of a movie, as a report's clip: "facts", which a table shows, and "details".
nlohmann::ordered_json ClipOf(const catalog::Entry& entry);

// What is told of a problem; `kind` is the part of the clip that has it.
nlohmann::ordered_json WarningOf(const Problem& problem, const char* kind);

// All that a report tells of a movie but for what it is as a file; the answer's description is the
// clip, as JSON. What can't be read of one that is described, such as its pictures, is told in the
// clip.
MovieAnswer ReportAnswer(Session& session, CodecReader& codecs, const PathMaps& maps,
                         const std::filesystem::path& movie);

}  // namespace cliphost
