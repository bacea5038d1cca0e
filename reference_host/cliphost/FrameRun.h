// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/cliphost/FrameSink.h"
#include "reference_host/cliphost/FrameSource.h"
#include "reference_host/cliphost/Progress.h"
#include "reference_host/cliphost/Workers.h"

namespace cliphost {

struct FrameOptions {
    std::filesystem::path movie;
    std::uint64_t frame = 0;
    std::string range;  // empty: the frame alone
    std::filesystem::path output;
    FrameForm form;
    WorkerCall workers;  // without `writeNear`

    WantedFrames Wanted() const;
};

// Writes the frames that the command line names; one that can't be read is reported and skipped.
class FrameRun {
public:
    virtual ~FrameRun() = default;
    int Run();

protected:
    FrameRun(const FrameOptions& options, const WantedFrames& wanted)
        : options_(options), wanted_(wanted) {}

    virtual FramePlan Plan() = 0;
    // What the plan holds, in order.
    virtual void WriteAll(const FramePlan& plan) = 0;
    virtual PictureTurn Turn() const { return {}; }

    const FrameOptions& options() const { return options_; }
    const WantedFrames& wanted() const { return wanted_; }
    std::uint64_t NumberOf(std::uint64_t i) const {
        return wanted_.range.first + i * wanted_.range.step;
    }
    FrameSink& sink() const { return *sink_; }
    void Step(std::uint64_t frame);
    void Count(std::uint64_t written, std::uint64_t failed);

private:
    void OpenSink(const FramePlan& plan);

    const FrameOptions& options_;
    const WantedFrames& wanted_;
    std::unique_ptr<FrameSink> sink_;
    std::optional<Progress> progress_;
    std::uint64_t written_ = 0;
    std::uint64_t failed_ = 0;
};

// In this process. Gives the exit status.
int WriteFramesHere(const SessionOptions& session, const FrameOptions& options,
                    const WantedFrames& wanted);

}  // namespace cliphost
