// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Workers.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstdio>
#include <deque>
#include <map>
#include <memory>
#include <optional>
#include <set>
#include <thread>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Fields.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/PrivateFile.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/system/ChildProcess.h"
#include "reference_host/system/Confinement.h"
#include "reference_host/system/DelayedSignals.h"
#include "reference_host/system/FileNumber.h"
#include "reference_host/system/Paths.h"
#include "reference_host/system/ScratchFolder.h"

namespace cliphost {
namespace {

using Clock = std::chrono::steady_clock;

// Between what the process writes on standard error for one movie and for the next.
constexpr char kEndOfMovie = '\0';
constexpr std::size_t kMostTold = std::size_t{16} << 20;
// What lies ready for a process is to last so long, and is no more than so many requests.
constexpr Clock::duration kTimeAhead = std::chrono::milliseconds(10);
constexpr int kMostAhead = 32;
constexpr auto kLongestWait = std::chrono::milliseconds(200);
constexpr char kNoAnswer[] = "the process that read it gave an answer that is none";
constexpr std::size_t kMebibyte = std::size_t{1} << 20;

struct Worker {
    host::system::ChildProcess process;
    std::filesystem::path folder;
    MessageStream messages;
    std::string errors;
    bool isReady = false;
    bool isGivenUp = false;            // it can't be started
    std::size_t answered = 0;          // since its process was started
    std::deque<std::size_t> requests;  // the first is being worked on
    Clock::time_point since;
};

std::string EndInWords(const host::system::ProcessEnd& end) {
    return end.signal != 0
               ? fmt::format("the process that read it was ended by signal {}", end.signal)
               : fmt::format("the process that read it ended with status {} and without an answer",
                             end.status);
}

std::string TakeTold(Worker& worker) {
    const std::size_t end = worker.errors.find(kEndOfMovie);
    std::string told = worker.errors.substr(0, end);
    worker.errors.erase(0, end == std::string::npos ? end : end + 1);
    return told;
}

class Run {
public:
    Run(const WorkerCall& call, const WorkerRequests& requests, WorkerClient& client)
        : call_(call), requests_(requests), client_(client) {
        MakeScratchFolder();
        const std::size_t most = std::min<std::size_t>(call.Processes(), requests.count);
        for (std::size_t i = 0; i < most; ++i) {
            workers_.push_back(std::make_unique<Worker>());
        }
    }

    void GoOn();

private:
    void MakeScratchFolder();
    void HandOut();
    void HandTo(Worker& worker, std::size_t request);
    // Gives 0, or the system's error number.
    int Start(Worker& worker);
    void GiveUp(Worker& worker, const std::string& why);
    std::optional<std::size_t> NextRequest();
    bool IsAtRetried(const Worker& worker) const;
    std::size_t RequestsAhead() const;
    bool AllHaveEnough() const;
    void Wait();
    void Listen(Worker& worker);
    void Hear(Worker& worker, const std::string& message);
    void HoldToLimits(Worker& worker);
    void LeaveOut(Clock::duration time);
    // Ends the process; what it was at has failed, what it has not begun goes to another.
    void Lose(Worker& worker, const std::string& why);
    void Settle(Worker& worker, const std::string& failure);

    const WorkerCall& call_;
    const WorkerRequests& requests_;
    WorkerClient& client_;
    std::optional<host::system::ScratchFolder> scratch_;
    std::size_t foldersMade_ = 0;
    std::vector<std::unique_ptr<Worker>> workers_;
    std::size_t next_ = 0;
    std::deque<std::size_t> again_;
    std::map<std::size_t, WorkerResult> waiting_;
    std::size_t taken_ = 0;
    Clock::time_point heard_ = Clock::now();
    // Of the last requests. Until there were some, nothing is handed out ahead.
    Clock::duration usualTime_ = kTimeAhead;
    std::set<std::size_t> retried_;
};

void Run::MakeScratchFolder() {
    if (call_.writeNear.empty()) {
        return;
    }
    std::error_code error;
    scratch_.emplace(call_.writeNear, error);
    if (error) {
        error.clear();
        scratch_.emplace(error);
    }
    if (error) {
        throw Failure(kExitCaller, host::system::TemporaryFolder(),
                      "no folder can be made there: " + error.default_error_condition().message(),
                      "name another one in TMPDIR");
    }
}

void Run::GoOn() {
    while (taken_ < requests_.count) {
        HandOut();
        const Clock::time_point idle = Clock::now();
        LeaveOut(idle - heard_);
        Wait();
        heard_ = Clock::now();
        LeaveOut(heard_ - idle - kLongestWait);
        if (host::system::DelayedSignals::HaveCome()) {
            return;  // it may have ended the processes, too
        }
        for (const auto& worker : workers_) {
            Listen(*worker);
        }
        for (auto first = waiting_.find(taken_);
             first != waiting_.end() && !host::system::DelayedSignals::HaveCome();
             first = waiting_.find(taken_)) {
            if (!client_.Take(first->first, first->second)) {
                return;
            }
            waiting_.erase(first);
            ++taken_;
        }
    }
}

void Run::HandOut() {
    for (std::size_t depth = 1, most = RequestsAhead(); depth <= most; ++depth) {
        for (const auto& held : workers_) {
            Worker& worker = *held;
            if (worker.isGivenUp || worker.requests.size() >= depth || IsAtRetried(worker)) {
                continue;
            }
            const std::optional<std::size_t> request = NextRequest();
            if (!request) {
                return;
            }
            const bool isUsed = worker.answered > 0 || !worker.requests.empty();
            if (isUsed && retried_.count(*request) > 0) {
                if (!worker.requests.empty()) {
                    again_.push_front(*request);
                    continue;
                }
                worker.process.End();  // what others left there is not to count again
            }
            if (const int error = worker.process.IsRunning() ? 0 : Start(worker)) {
                again_.push_front(*request);
                GiveUp(worker, "no further process can be started: " +
                                   std::generic_category().message(error));
                return;
            }
            HandTo(worker, *request);
        }
    }
}

bool Run::IsAtRetried(const Worker& worker) const {
    return !worker.requests.empty() && retried_.count(worker.requests.front()) > 0;
}

// The next requests lie ready where a process ends one. Where each takes long, others may
// have nothing to do in the end while they wait here.
std::size_t Run::RequestsAhead() const {
    if (call_.limits.mebibytes != 0) {
        return 1;  // what each needs is measured
    }
    const auto inTime = kTimeAhead / std::max<Clock::duration>(usualTime_, kTimeAhead / kMostAhead);
    return std::max<std::size_t>(1, static_cast<std::size_t>(inTime));
}

bool Run::AllHaveEnough() const {
    const std::size_t ahead = RequestsAhead();
    return ahead > 2 && std::all_of(workers_.begin(), workers_.end(), [=](const auto& worker) {
               return worker->isReady && worker->requests.size() > ahead / 2;
           });
}

void Run::HandTo(Worker& worker, std::size_t request) {
    if (worker.requests.empty()) {
        worker.since = Clock::now();
    }
    worker.requests.push_back(request);
    // A process that takes nothing has ended; Listen finds that.
    worker.process.Send(
        FieldWriter().Add(std::uint64_t{request}).Add(requests_.text(request)).Message());
}

std::optional<std::size_t> Run::NextRequest() {
    if (!again_.empty()) {
        const std::size_t request = again_.front();
        again_.pop_front();
        return request;
    }
    if (next_ == requests_.count || next_ - taken_ >= call_.mostWaiting) {
        return std::nullopt;
    }
    return next_++;
}

int Run::Start(Worker& worker) {
    worker.messages = {};
    worker.errors.clear();
    worker.isReady = false;
    worker.answered = 0;
    std::vector<std::string> arguments = call_.arguments;
    std::error_code folderError;
    if (scratch_) {
        worker.folder = scratch_->path() / fmt::format("{}", foldersMade_++);
        std::filesystem::create_directory(worker.folder, folderError);
        arguments.push_back("--folder=" + host::system::PathText(worker.folder));
    }
    return folderError ? folderError.default_error_condition().value()
                       : worker.process.Start(call_.program, arguments);
}

// The others have to do.
void Run::GiveUp(Worker& worker, const std::string& why) {
    worker.isGivenUp = true;
    if (std::all_of(workers_.begin(), workers_.end(),
                    [](const auto& one) { return one->isGivenUp; })) {
        throw Failure(kExitCaller, call_.program, why, call_.jobs > 1 ? "try --jobs 1" : "");
    }
}

void Run::Wait() {
    if (AllHaveEnough()) {
        // To be woken by each answer would take longer than the answer.
        std::this_thread::sleep_for(kTimeAhead / 4);
        return;
    }
    std::vector<const host::system::ChildProcess*> running;
    for (const auto& worker : workers_) {
        if (worker->process.IsRunning()) {
            running.push_back(&worker->process);
        }
    }
    host::system::ChildProcess::WaitForAny(
        running, call_.limits.AreSet() ? std::chrono::milliseconds(20) : kLongestWait);
}

void Run::Listen(Worker& worker) {
    if (!worker.process.IsRunning()) {
        return;
    }
    worker.process.SendRest();
    const bool isOpen = worker.process.Receive(worker.messages.arrived());
    const bool isBehind = worker.process.HasMore();
    worker.process.ReceiveErrors(worker.errors, kMostTold);
    while (std::optional<std::string> message = worker.messages.Next()) {
        Hear(worker, *message);
        if (!worker.process.IsRunning()) {
            return;
        }
    }
    if (worker.messages.IsBroken()) {
        Lose(worker, kNoAnswer);
    } else if (!isOpen) {
        Lose(worker, EndInWords(worker.process.End()));
    } else if (!isBehind) {
        HoldToLimits(worker);
    }
}

void Run::Hear(Worker& worker, const std::string& message) {
    if (!worker.isReady) {
        worker.isReady = true;
        worker.since = Clock::now();
        TakeTold(worker);  // this process has told the same when it began
        FieldReader fields(message);
        const std::string missing = fields.Text();
        if (!missing.empty() && call_.verbosity > 0) {
            Notice("cliphost: a process that reads movies keeps rights that it does not need: {}\n",
                   missing);
        }
        return;
    }
    if (worker.requests.empty()) {
        worker.process.End();  // nobody asked
        return;
    }
    const std::size_t most = call_.limits.mebibytes * kMebibyte;
    const std::size_t needed = most != 0 ? worker.process.PeakMemory() : 0;
    if (needed > most) {
        HoldToLimits(worker);
        return;
    }
    if (!client_.Read(worker.requests.front(), message)) {
        Lose(worker, kNoAnswer);
        return;
    }
    ++worker.answered;
    Settle(worker, "");
    // What it holds would be laid to the movies after this one.
    if (needed > most / 2 && !call_.leanOnEachOther) {
        worker.process.End();
    }
}

void Run::HoldToLimits(Worker& worker) {
    const WorkerLimits& limits = call_.limits;
    if (worker.requests.empty() || !worker.isReady) {
        return;
    }
    if (limits.seconds != 0 && Clock::now() - worker.since > std::chrono::seconds(limits.seconds)) {
        Lose(worker, fmt::format("took longer than {}", Counted(limits.seconds, "second")));
    } else if (limits.mebibytes != 0 &&
               worker.process.PeakMemory() > limits.mebibytes * kMebibyte) {
        Lose(worker, fmt::format("needed more than {} MiB", limits.mebibytes));
    }
}

// Time in which nobody listened is not theirs.
void Run::LeaveOut(Clock::duration time) {
    for (const auto& worker : workers_) {
        worker->since += std::max(time, Clock::duration::zero());
    }
}

void Run::Lose(Worker& worker, const std::string& why) {
    worker.process.End();
    if (worker.isReady && worker.requests.empty()) {
        return;
    }
    if (!worker.requests.empty()) {
        RemovePrivateFiles(worker.folder, worker.requests.front());
    }
    if (!worker.isReady) {
        Notice("{}", TakeTold(worker));
        GiveUp(worker, "a process that reads movies did not start");
    } else if (worker.answered > 0 && !call_.leanOnEachOther &&
               retried_.insert(worker.requests.front()).second) {
        TakeTold(worker);  // it may have come to harm by a movie before: a process of its own tells
    } else {
        Settle(worker, why);
    }
    again_.insert(again_.end(), worker.requests.begin(), worker.requests.end());
    worker.requests.clear();
}

void Run::Settle(Worker& worker, const std::string& failure) {
    waiting_.emplace(worker.requests.front(),
                     WorkerResult{TakeTold(worker), failure, worker.folder});
    worker.requests.pop_front();
    const Clock::time_point now = Clock::now();
    usualTime_ += (now - worker.since - usualTime_) / 8;
    worker.since = now;
}

}  // namespace

void RefuseDescriptor(const WorkerCall& call, const std::filesystem::path& movie) {
    if (call.limits.AreSet() && host::system::NamesDescriptor(movie)) {
        throw Failure(kExitCaller, movie, "limits can't be kept for a descriptor", "name the file");
    }
}

void RunInWorkers(const WorkerCall& call, const std::vector<std::string>& requests,
                  WorkerClient& client) {
    RunInWorkers(call, {requests.size(), [&](std::size_t number) { return requests[number]; }},
                 client);
}

void RunInWorkers(const WorkerCall& call, const WorkerRequests& requests, WorkerClient& client) {
    // Takes effect once processes and folders are gone.
    const host::system::DelayedSignals signals;
    Run(call, requests, client).GoOn();
}

bool ServeAsWorker(const std::filesystem::path& folder,
                   const std::function<std::string(std::uint64_t, const std::string&)>& answer) {
    using host::system::ParentChannel;
    if (!ParentChannel::Join()) {
        return false;
    }
    const std::string missing = host::system::GiveUpRights(folder);
    std::fputc(kEndOfMovie, stderr);
    bool goesOn = ParentChannel::Write(FieldWriter().Add(missing).Message());
    MessageStream requests;
    while (goesOn && ParentChannel::Receive(requests.arrived())) {
        while (const std::optional<std::string> request = goesOn ? requests.Next() : std::nullopt) {
            FieldReader fields(*request);
            const std::uint64_t number = fields.Number();
            const std::string answered = answer(number, fields.Text());
            std::fputc(kEndOfMovie, stderr);
            goesOn = ParentChannel::Write(FieldWriter().Add(answered).bytes());
        }
    }
    return true;
}

}  // namespace cliphost
