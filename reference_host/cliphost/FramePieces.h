// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/FrameRun.h"
#include "reference_host/cliphost/WorkerVerb.h"

namespace cliphost {

// The same as WriteFramesHere, by child processes: one opens the movie for a plan, then each reads
// pieces of the range into files of its own.
int WriteFramesInPieces(const FrameOptions& options, const WantedFrames& wanted);

// The other side, in the child.
void ServePieces(const SessionOptions& session, const WorkerVerb& worker,
                 const std::filesystem::path& movie, const FrameForm& form);

}  // namespace cliphost
