// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

#include "reference_host/cliphost/FrameSource.h"
#include "reference_host/cliphost/MovieAnswer.h"

namespace cliphost {

// What two processes tell each other of a range of frames: first its plan is asked for, then each
// piece of it.
struct FrameRequest {
    enum class Kind : std::uint64_t { Plan, Pictures, Raw };
    Kind kind = Kind::Plan;
    WantedFrames wanted;
    unsigned jobs = 1;  // for the plan

    std::string ToBytes() const;
    static FrameRequest From(std::string_view bytes);  // from the parent, which is trusted
};

struct FrameAnswer {
    MovieAnswer outcome;  // its status and problem
    FramePlan plan;
    std::string written;  // of each frame of a piece up to a failure, whether there is a file
    int width = 0;        // of the last of them
    int height = 0;

    std::string ToBytes() const;
    // False for what can't answer the request. Nothing of what was read before is left.
    bool Read(std::string_view bytes, const FrameRequest& request);
};

inline constexpr char kWritten = 'w';
inline constexpr char kLeftOut = 'o';

}  // namespace cliphost
