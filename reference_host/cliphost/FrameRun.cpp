// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FrameRun.h"

#include <fmt/format.h>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Notice.h"

namespace cliphost {
namespace {

class RunHere final : public FrameRun {
public:
    RunHere(Session& session, const FrameOptions& options, const WantedFrames& wanted)
        : FrameRun(options, wanted), source_(session, options.movie, options.form) {}

private:
    FramePlan Plan() override { return source_.Plan(wanted()); }
    PictureTurn Turn() const override { return options().form.turn.TurnFor(options().movie); }
    void WriteAll(const FramePlan& plan) override {
        for (std::uint64_t i = 0; i < plan.count; ++i) {
            const std::uint64_t frame = NumberOf(i);
            Step(frame);
            const bool isRead = source_.Read(frame);
            if (isRead) {
                sink().Take(frame, source_.reader(), source_.alpha());
            }
            Count(isRead ? 1 : 0, isRead ? 0 : 1);
        }
    }

    FrameSource source_;
};

}  // namespace

WantedFrames FrameOptions::Wanted() const {
    return range.empty() ? WantedFrames{OneFrame(frame), true}
                         : WantedFrames{ParseFrameRange(range), false};
}

int FrameRun::Run() {
    const FramePlan plan = Plan();
    OpenSink(plan);
    progress_.emplace("frames", plan.count);
    try {
        WriteAll(plan);
        if (written_ > 0) {
            sink_->Finish();
        }
    } catch (const ReaderGone&) {
        return kExitFine;  // it has seen enough
    }
    progress_.reset();
    if (written_ > 0 && !sink_->Summary().empty()) {
        fmt::print("{}\n", sink_->Summary());
    }
    return failed_ == 0 ? kExitFine : kExitFile;
}

void FrameRun::OpenSink(const FramePlan& plan) {
    sink_ = MakeFrameSink(options_.output, options_.movie, plan.count == 1, Turn());
    if (sink_->IsRaw() && options_.form.withAlpha) {
        throw Failure(kExitCaller, options_.output, "--with-alpha is for PNG files",
                      "for raw frames of the alpha name its own track, see `cliphost formats "
                      "--use-alpha`");
    }
    if (sink_->IsRaw()) {
        Notice("{}\n", plan.rawWords);
    }
}

void FrameRun::Step(std::uint64_t frame) {
    progress_->Step(fmt::format("{}", frame));
}

void FrameRun::Count(std::uint64_t written, std::uint64_t failed) {
    written_ += written;
    failed_ += failed;
}

int WriteFramesHere(const SessionOptions& session, const FrameOptions& options,
                    const WantedFrames& wanted) {
    Session running(options.form.Of(session));
    return RunHere(running, options, wanted).Run();
}

}  // namespace cliphost
