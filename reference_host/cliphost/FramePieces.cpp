// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FramePieces.h"

#include <fmt/format.h>

#include <algorithm>
#include <map>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FrameMessages.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/PrivateFile.h"
#include "reference_host/system/DelayedSignals.h"
#include "reference_host/system/Paths.h"
#include "reference_host/system/ScratchFolder.h"

namespace cliphost {
namespace {

using Kind = FrameRequest::Kind;

// Before what a process tells of the frames of a piece, and behind what it tells when it opens the
// movie, which the plan's process has told already.
// A movie's texts are printed without such characters.
constexpr char kEndOfOpening = '\x01';

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
        Ask();
        // Frames are counted by reading the last one. What that does to the process is to cost the
        // piece that has it, not all.
        if (!result_.failure.empty() && !request_.wanted.isOne) {
            request_.wanted.areBelieved = true;
            Ask();
        }
        Notice("{}", result_.told);
        if (!result_.failure.empty()) {
            throw Failure(kExitFile, options_.movie, result_.failure);
        }
        if (answer_.outcome.status != kExitFine) {
            throw Failure(answer_.outcome.status, answer_.outcome.problem);
        }
        return std::move(answer_.plan);
    }

private:
    bool Read(std::size_t, const std::string& answer) override {
        return answer_.Read(answer, request_);
    }
    bool Take(std::size_t, const WorkerResult& result) override {
        result_ = result;
        return true;
    }
    void Ask() { RunInWorkers(options_.workers, {request_.ToBytes()}, *this); }

    const FrameOptions& options_;
    FrameRequest request_;
    FrameAnswer answer_;
    WorkerResult result_;
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
    bool Take(std::size_t number, const WorkerResult& result) override;
    MadeFrame Made(std::size_t number, const std::filesystem::path& folder, std::size_t i) const;
    Problem WhyLost(std::size_t number, const WorkerResult& result) const;
    void TakeFrames(std::size_t number, const std::filesystem::path& folder);
    std::filesystem::path FolderNearOutput() const;
    Problem NotWrittenIn(const std::filesystem::path& folder, std::uint64_t frame,
                         Problem problem) const;

    std::uint64_t frameBytes_ = 0;
    bool leanOnEachOther_ = false;
    std::vector<FrameRequest> requests_;
    std::map<std::size_t, FrameAnswer> answers_;  // that were read and not yet taken
};

void RunInPieces::WriteAll(const FramePlan& plan) {
    frameBytes_ = plan.frameBytes;
    leanOnEachOther_ = plan.leanOnEachOther;
    std::uint64_t longest = 1;
    std::vector<std::string> messages;
    for (std::size_t i = 0; i <= plan.cuts.size(); ++i) {
        const std::uint64_t begin = i == 0 ? 0 : plan.cuts[i - 1];
        const std::uint64_t end = i == plan.cuts.size() ? plan.count : plan.cuts[i];
        FrameRequest piece{sink().IsRaw() ? Kind::Raw : Kind::Pictures, {}, 1};
        piece.wanted.range = {NumberOf(begin), NumberOf(end - 1) + 1, wanted().range.step};
        longest = std::max(longest, end - begin);
        requests_.push_back(piece);
        messages.push_back(piece.ToBytes());
    }
    WorkerCall call = options().workers;
    call.writeNear = FolderNearOutput();
    call.leanOnEachOther = leanOnEachOther_;
    call.mostWaiting = MostPiecesWaiting(longest, plan.frameBytes, call.Processes());
    RunInWorkers(call, messages, *this);
}

std::filesystem::path RunInPieces::FolderNearOutput() const {
    const std::filesystem::path& output = options().output;
    std::error_code ignored;
    if (OutputFile::IsDevice(output)) {
        return host::system::TemporaryFolder();
    }
    const std::filesystem::path place = host::system::WholePath(output);
    return std::filesystem::is_directory(place, ignored) ? place : place.parent_path();
}

bool RunInPieces::Take(std::size_t number, const WorkerResult& result) {
    // A process that ended before has told nothing new.
    if (const std::size_t opening = result.told.find(kEndOfOpening); opening != std::string::npos) {
        Notice("{}", result.told.substr(opening + 1));
    }
    Problem why = WhyLost(number, result);
    if (why) {
        FrameRange lost = requests_[number].wanted.range;
        lost.end = (leanOnEachOther_ ? requests_.back() : requests_[number]).wanted.range.end;
        Count(0, lost.CountIn(*lost.end));
        why.subject = options().movie;
        why.reason = fmt::format("{} left out: {}", FramesInWords(lost), why.reason);
        TellProblem(why, options().workers.verbosity);
        RemovePrivateFiles(result.folder, number);
    } else {
        TakeFrames(number, result.folder);
    }
    answers_.erase(number);
    return !why || !leanOnEachOther_;
}

// Frames of a piece are counted from 0.
MadeFrame RunInPieces::Made(std::size_t number, const std::filesystem::path& folder,
                            std::size_t i) const {
    const FrameAnswer& answer = answers_.at(number);
    const FrameRange& range = requests_[number].wanted.range;
    const std::uint64_t frame = range.first + i * range.step;
    return {frame, FrameFile(folder, number, frame), answer.width, answer.height, frameBytes_};
}

// A file that can't be written ends the run, as in one process.
Problem RunInPieces::WhyLost(std::size_t number, const WorkerResult& result) const {
    if (!result.failure.empty()) {
        return {options().movie, result.failure};
    }
    const FrameAnswer& answer = answers_.at(number);
    const std::optional<std::uint64_t> bytes =
        requests_[number].kind == Kind::Raw ? std::optional(frameBytes_) : std::nullopt;
    for (std::size_t i = 0; i < answer.written.size(); ++i) {
        const MadeFrame made = Made(number, result.folder, i);
        if (answer.written[i] == kWritten && !IsOwnFile(made.file, bytes)) {
            return {
                options().movie,
                fmt::format("the process that read it left no whole file of frame {}", made.frame)};
        }
    }
    const bool isWritten =
        answer.outcome.status == kExitFine ||
        answer.outcome.problem.subject == Made(number, result.folder, answer.written.size()).file;
    return isWritten ? Problem() : answer.outcome.problem;
}

void RunInPieces::TakeFrames(std::size_t number, const std::filesystem::path& folder) {
    const FrameAnswer& answer = answers_[number];
    for (std::size_t i = 0; i < answer.written.size(); ++i) {
        if (host::system::DelayedSignals::HaveCome()) {
            return;
        }
        const MadeFrame made = Made(number, folder, i);
        Step(made.frame);
        const bool isWritten = answer.written[i] == kWritten;
        if (isWritten) {
            sink().TakeMade(made);
        }
        Count(isWritten ? 1 : 0, isWritten ? 0 : 1);
    }
    if (answer.outcome.status != kExitFine) {
        const std::uint64_t frame = Made(number, folder, answer.written.size()).frame;
        throw Failure(answer.outcome.status, NotWrittenIn(folder, frame, answer.outcome.problem));
    }
}

// Files that wait beside the output need the same disk as the output.
Problem RunInPieces::NotWrittenIn(const std::filesystem::path& folder, std::uint64_t frame,
                                  Problem problem) const {
    const std::filesystem::path parent = folder.parent_path().parent_path();
    if (!OutputFile::IsDevice(options().output) && parent == FolderNearOutput()) {
        problem.subject = sink().PlaceOf(frame);
    } else {
        problem.subject = parent;
        problem.hint = "name another folder in TMPDIR";
    }
    return problem;
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
        }
        std::fputc(kEndOfOpening, stderr);
        for (std::uint64_t i = 0, count = range.CountIn(*range.end); i < count; ++i) {
            const std::uint64_t frame = range.first + i * range.step;
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
