// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FramePieces.h"

#include <fmt/format.h>

#include <map>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FrameMessages.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/PrivateFile.h"
#include "reference_host/system/ScratchFolder.h"

namespace cliphost {
namespace {

using Kind = FrameRequest::Kind;

// Behind what a process tells when it opens the movie, which the plan's process has told already.
// A movie's texts are printed without such characters.
constexpr char kEndOfOpening = '\x01';
// A piece that takes long lets no more than these wait on the disk, for each process.
constexpr std::size_t kMostWaiting = 4;

// The file of one frame, in the folder that is the child's own.
std::filesystem::path FrameFile(const std::filesystem::path& folder, std::uint64_t number,
                                std::uint64_t frame) {
    std::filesystem::path file = PrivateFile(folder, number);
    file += fmt::format("_{}", frame);
    return file;
}

std::string FramesInWords(const FrameRange& range) {
    const std::uint64_t count = range.CountIn(*range.end);
    const std::uint64_t last = range.first + (count - 1) * range.step;
    return count == 1 ? fmt::format("frame {} is", range.first)
                      : fmt::format("frames {} to {}{} are", range.first, last,
                                    range.step == 1 ? std::string()
                                                    : fmt::format(" in steps of {}", range.step));
}

// Asks for the plan.
class PlanCall final : private WorkerClient {
public:
    PlanCall(const FrameOptions& options, const WantedFrames& wanted) : options_(options) {
        request_.wanted = wanted;
        request_.jobs = options.workers.jobs;
    }

    FramePlan Run() {
        RunInWorkers(options_.workers, {request_.ToBytes()}, *this);
        return std::move(answer_.plan);
    }

private:
    bool Read(std::size_t, const std::string& answer) override {
        return answer_.Read(answer, request_);
    }
    void Take(std::size_t, const WorkerResult& result) override {
        Notice("{}", result.told);
        if (!result.failure.empty()) {
            throw Failure(kExitFile, options_.movie, result.failure);
        }
        if (answer_.outcome.status != kExitFine) {
            throw Failure(answer_.outcome.status, answer_.outcome.problem);
        }
    }

    const FrameOptions& options_;
    FrameRequest request_;
    FrameAnswer answer_;
};

class RunInPieces final : public FrameRun, private WorkerClient {
public:
    RunInPieces(const FrameOptions& options, const WantedFrames& wanted)
        : FrameRun(options, wanted) {}

private:
    FramePlan Plan() override { return PlanCall(options(), wanted()).Run(); }
    void WriteAll(const FramePlan& plan) override;
    bool Read(std::size_t number, const std::string& answer) override {
        return answers_[number].Read(answer, requests_[number]);
    }
    void Take(std::size_t number, const WorkerResult& result) override;
    void TakeFrames(std::size_t number, const std::filesystem::path& folder);
    std::filesystem::path FolderNearOutput() const;

    std::vector<FrameRequest> requests_;
    std::map<std::size_t, FrameAnswer> answers_;  // that were read and not yet taken
};

void RunInPieces::WriteAll(const FramePlan& plan) {
    std::vector<std::string> messages;
    for (std::size_t i = 0; i <= plan.cuts.size(); ++i) {
        const std::uint64_t begin = i == 0 ? 0 : plan.cuts[i - 1];
        const std::uint64_t end = i == plan.cuts.size() ? plan.count : plan.cuts[i];
        FrameRequest piece{sink().IsRaw() ? Kind::Raw : Kind::Pictures, {}, 1, 0};
        piece.wanted.range = {NumberOf(begin), NumberOf(end - 1) + 1, wanted().range.step};
        piece.behind = NumberOf(plan.isInOneGo ? 0 : begin);
        requests_.push_back(piece);
        messages.push_back(piece.ToBytes());
    }
    WorkerCall call = options().workers;
    call.writeNear = FolderNearOutput();
    call.jobs = plan.isInOneGo ? 1 : call.jobs;
    call.mostWaiting = kMostWaiting * call.jobs;
    RunInWorkers(call, messages, *this);
}

std::filesystem::path RunInPieces::FolderNearOutput() const {
    const std::filesystem::path& output = options().output;
    std::error_code ignored;
    if (OutputFile::IsDevice(output)) {
        return host::system::TemporaryFolder();
    }
    const std::filesystem::path place = std::filesystem::absolute(output, ignored);
    return std::filesystem::is_directory(place, ignored) ? place : place.parent_path();
}

void RunInPieces::Take(std::size_t number, const WorkerResult& result) {
    const std::size_t opening = result.told.find(kEndOfOpening);
    Notice("{}", result.told.substr(opening == std::string::npos ? 0 : opening + 1));
    const FrameRange& range = requests_[number].wanted.range;
    if (result.failure.empty()) {
        TakeFrames(number, result.folder);
    } else {
        Count(0, range.CountIn(*range.end));
        TellProblem(
            {options().movie, fmt::format("{} left out: {}", FramesInWords(range), result.failure)},
            options().workers.verbosity);
    }
    answers_.erase(number);
}

void RunInPieces::TakeFrames(std::size_t number, const std::filesystem::path& folder) {
    const FrameRange& range = requests_[number].wanted.range;
    const FrameAnswer& answer = answers_[number];
    std::uint64_t frame = range.first;
    for (const char made : answer.written) {
        Step(frame);
        if (made == kWritten) {
            sink().TakeMade({frame, FrameFile(folder, number, frame), answer.width, answer.height});
        }
        Count(made == kWritten ? 1 : 0, made == kWritten ? 0 : 1);
        frame += range.step;
    }
    if (answer.outcome.status != kExitFine) {
        Problem problem = answer.outcome.problem;
        if (problem.subject == FrameFile(folder, number, frame)) {
            problem.subject = sink().PlaceOf(frame);
        }
        throw Failure(answer.outcome.status, problem);
    }
}

// What the child has opened, and keeps for the pieces to come.
class PieceServer {
public:
    PieceServer(Session& session, const WorkerVerb& worker, const std::filesystem::path& movie,
                const FrameForm& form)
        : session_(session), worker_(worker), movie_(movie), form_(form) {}

    std::string Answer(std::uint64_t number, const FrameRequest& request) {
        FrameAnswer answer;
        answer.outcome = AnswerSafely(movie_, [&] {
            if (!source_) {
                source_.emplace(session_, movie_, form_);
            }
            if (request.kind == Kind::Plan) {
                answer.plan = source_->Plan(request.wanted);
                source_->Cut(answer.plan, request.wanted.range, request.jobs);
            } else {
                WritePiece(number, request, answer);
            }
            return MovieAnswer();
        });
        return answer.ToBytes();
    }

private:
    void WritePiece(std::uint64_t number, const FrameRequest& request, FrameAnswer& answer) {
        const FrameRange& range = request.wanted.range;
        const bool isRaw = request.kind == Kind::Raw;
        if (!turn_) {
            turn_ = isRaw ? PictureTurn() : form_.turn.TurnFor(movie_);
            std::fputc(kEndOfOpening, stderr);
        }
        for (std::uint64_t before = request.behind; before < range.first && next_ != range.first;
             before += range.step) {
            source_->Pass(before);
        }
        for (std::uint64_t i = 0, count = range.CountIn(*range.end); i < count; ++i) {
            const std::uint64_t frame = range.first + i * range.step;
            next_ = frame + range.step;
            const bool isRead = source_->Read(frame);
            if (isRead) {
                const MadeFrame made =
                    WriteFrameFile(FrameFile(worker_.folder, number, frame), frame,
                                   source_->reader(), source_->alpha(), *turn_, isRaw);
                answer.width = made.width;
                answer.height = made.height;
            }
            answer.written += isRead ? kWritten : kLeftOut;
        }
    }

    Session& session_;
    const WorkerVerb& worker_;
    const std::filesystem::path& movie_;
    const FrameForm& form_;
    std::optional<FrameSource> source_;
    std::optional<PictureTurn> turn_;
    std::uint64_t next_ = 0;  // behind the frame read last
};

}  // namespace

int WriteFramesInPieces(const FrameOptions& options, const WantedFrames& wanted) {
    return RunInPieces(options, wanted).Run();
}

void ServePieces(const SessionOptions& session, const WorkerVerb& worker,
                 const std::filesystem::path& movie, const FrameForm& form) {
    Session running(form.Of(session));
    PieceServer server(running, worker, movie, form);
    Serve(running, worker, [&](std::uint64_t number, const std::string& request) {
        return server.Answer(number, FrameRequest::From(request));
    });
}

}  // namespace cliphost
