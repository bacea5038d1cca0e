// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ValidateRun.h"

#include <fmt/format.h>

#include <algorithm>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <iterator>
#include <memory>
#include <optional>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/Fields.h"
#include "reference_host/cliphost/ResultText.h"
#include "reference_host/system/ChildProcess.h"
#include "reference_host/system/DelayedSignals.h"
#include "reference_host/system/Paths.h"
#include "reference_host/system/ScratchFolder.h"
#include "reference_host/util/text/Printable.h"
#include "reference_host/validate/Trial.h"

namespace cliphost {
namespace {

using validate::Check;
using validate::Outcome;
using validate::Verdict;
using Clock = std::chrono::steady_clock;

constexpr auto kLongestWait = std::chrono::milliseconds(50);
constexpr std::size_t kMostTold = std::size_t{1} << 16;
constexpr std::size_t kMebibyte = std::size_t{1} << 20;

// What a child tells: the step that it begins, or what came of the check.
enum Message : std::uint64_t { kStep, kOutcome };

std::string OutcomeMessage(const Outcome& outcome) {
    return FieldWriter()
        .Add(std::uint64_t{kOutcome})
        .Add(static_cast<std::uint64_t>(outcome.verdict))
        .Add(outcome.done)
        .Add(outcome.expected)
        .Add(outcome.found)
        .Add(outcome.cause)
        .Message();
}

std::optional<Outcome> OutcomeIn(FieldReader& fields) {
    const std::uint64_t verdict = fields.Number();
    Outcome outcome;
    outcome.done = fields.Text();
    outcome.expected = fields.Text();
    outcome.found = fields.Text();
    outcome.cause = fields.Text();
    if (!fields.IsWhole() || verdict > static_cast<std::uint64_t>(Verdict::kSkipped)) {
        return std::nullopt;
    }
    outcome.verdict = static_cast<Verdict>(verdict);
    return outcome;
}

Failure NoFolder(const std::filesystem::path& parent, const std::error_code& error) {
    return {kExitCaller, parent,
            "no folder can be made there: " + error.default_error_condition().message(),
            "name another one in TMPDIR"};
}

// What most likely ends a process so. Windows counts its ends by these numbers, too, and lacks some
// names.
struct CauseOfEnd {
    int signal;
    const char* words;
};
constexpr CauseOfEnd kCausesOfEnd[] = {
    {SIGSEGV, "a pointer is used that is null, or that leads to something that is gone"},
#ifdef SIGBUS
    {SIGBUS, "a pointer is used that leads nowhere, or a mapped file has become shorter"},
#endif
    {SIGABRT,
     "an exception that nobody catches, an assertion, or memory that was written beyond its end "
     "or freed twice"},
    {SIGFPE, "a whole number is divided by zero"},
    {SIGILL, "an instruction that this processor does not have, or a trap of the compiler's"},
#ifdef SIGKILL
    {SIGKILL, "the system ended it, for want of memory perhaps"},
#endif
};

std::string WhyItEnded(const host::system::ProcessEnd& end) {
    if (end.signal == 0) {
        return "the module, or a library that it uses, ends the whole process (exit)";
    }
    const auto* const found =
        std::find_if(std::begin(kCausesOfEnd), std::end(kCausesOfEnd),
                     [&](const CauseOfEnd& cause) { return cause.signal == end.signal; });
    return found == std::end(kCausesOfEnd) ? "something sends the process this signal"
                                           : found->words;
}

// A folder that is there for one check.
class CheckFolder {
public:
    CheckFolder(const std::filesystem::path& parent, std::size_t number)
        : path_(parent / fmt::format("{}", number)) {
        std::error_code error;
        if (!std::filesystem::create_directory(path_, error)) {
            throw NoFolder(parent, error);
        }
    }
    ~CheckFolder() {
        std::error_code ignored;
        std::filesystem::remove_all(path_, ignored);
    }
    CheckFolder(const CheckFolder&) = delete;
    CheckFolder& operator=(const CheckFolder&) = delete;
    const std::filesystem::path& path() const { return path_; }

private:
    std::filesystem::path path_;
};

std::filesystem::path PathOf(const std::optional<host::system::ScratchFolder>& scratch,
                             const std::error_code& error) {
    if (error) {
        throw NoFolder(host::system::TemporaryFolder(), error);
    }
    return scratch->path();
}

// A check at its work in a child process, and what came of it.
class RunningCheck {
public:
    RunningCheck(const ValidateCall& call, std::size_t number, const std::filesystem::path& scratch)
        : call_(call), check_(*call.checks[number]), folder_(scratch, number) {
        std::vector<std::string> arguments = call.worker.arguments;
        arguments.insert(arguments.end(), {"--of-module=" + host::system::PathText(call.module),
                                           std::string("--check=") + check_.id,
                                           fmt::format("--use-seed={}", call.seed),
                                           "--folder=" + host::system::PathText(folder_.path())});
        if (const int error = process_.Start(call.worker.program, arguments)) {
            throw Failure(kExitCaller, call.worker.program,
                          "no process can be started: " + std::generic_category().message(error));
        }
    }

    const Check& check() const { return check_; }
    const host::system::ChildProcess& process() const { return process_; }
    // Whether nothing more comes of it.
    bool IsDone() const { return isDone_; }
    const Outcome& outcome() const { return outcome_; }

    void Listen() {
        const bool isOpen = process_.Receive(messages_.arrived());
        process_.ReceiveErrors(errors_, kMostTold);
        while (const std::optional<std::string> message = messages_.Next()) {
            Hear(*message);
        }
        if (!isOpen) {
            Finish();
        } else if (messages_.IsBroken()) {
            End(Verdict::kCrashed, "an answer", "bytes that are no answer",
                "the module writes where it does not belong, in memory or to a descriptor of the "
                "process");
        } else {
            HoldToLimits();
        }
    }

private:
    void Hear(const std::string& message) {
        FieldReader fields(message);
        switch (fields.Number()) {
            case kStep:
                outcome_.done = fields.Text();
                break;
            case kOutcome:
                if (const std::optional<Outcome> told = OutcomeIn(fields)) {
                    outcome_ = *told;
                    hasOutcome_ = true;
                }
                break;
            default:
                break;
        }
    }

    void Finish() {
        const host::system::ProcessEnd end = process_.End();
        // A fault that the check has found explains more than what came after it.
        const bool isBadEnd = end.signal != 0 || end.status != 0;
        if (!hasOutcome_ || (isBadEnd && !IsFault(outcome_.verdict))) {
            // What the check looks for often is what has come to this.
            const std::string cause =
                WhyItEnded(end) + "; " +
                (hasOutcome_
                     ? "a global object's destructor does it, or memory was damaged before"
                     : fmt::format("behind it may be what this check looks for: {}", check_.cause));
            outcome_.done = hasOutcome_ ? "ending the process after the check" : outcome_.done;
            End(Verdict::kCrashed, "the module comes back",
                (end.signal != 0 ? fmt::format("its process was ended by signal {}", end.signal)
                                 : fmt::format("its process ended with status {}", end.status)) +
                    LastWords(),
                cause);
        }
        isDone_ = true;
    }

    void HoldToLimits() {
        const WorkerLimits& limits = call_.worker.limits;
        const auto ran = Clock::now() - since_;
        if (limits.seconds != 0 && ran > std::chrono::seconds(limits.seconds)) {
            End(Verdict::kTimedOut, fmt::format("an answer within {} s", limits.seconds),
                "it was still at this",
                "a loop or a wait does not end; where the machine is merely slow, a larger "
                "--limit-seconds helps");
        } else if (limits.mebibytes != 0 && process_.PeakMemory() > limits.mebibytes * kMebibyte) {
            End(Verdict::kFailed, fmt::format("no more than {} MiB of memory", limits.mebibytes),
                "it took more",
                "memory is claimed by a size that stands in a file, or is never given back");
        }
    }

    void End(Verdict verdict, std::string expected, std::string found, std::string cause) {
        process_.End();
        outcome_.verdict = verdict;
        outcome_.expected = std::move(expected);
        outcome_.found = std::move(found);
        outcome_.cause = std::move(cause);
        isDone_ = true;
    }

    // The first line that the process wrote on standard error.
    std::string LastWords() const {
        const std::size_t begin = errors_.find_first_not_of("=\n");
        const std::string line = begin == std::string::npos
                                     ? ""
                                     : errors_.substr(begin, errors_.find('\n', begin) - begin);
        return line.empty() ? "" : ", and wrote: " + line;
    }

    const ValidateCall& call_;
    const Check& check_;
    CheckFolder folder_;
    host::system::ChildProcess process_;
    MessageStream messages_;
    std::string errors_;
    Outcome outcome_;
    bool hasOutcome_ = false;
    bool isDone_ = false;
    Clock::time_point since_ = Clock::now();
};

validate::TrialOptions OptionsOf(const ValidateCall& call, const std::filesystem::path& folder) {
    validate::TrialOptions options;
    options.module = call.module;
    options.folder = folder;
    options.seed = call.seed;
    options.addServices = RegisterServices;
    options.resultText = ResultText;
    return options;
}

}  // namespace

void ValidateInChildren(const ValidateCall& call, const TakeOutcome& take) {
    const host::system::DelayedSignals signals;
    std::error_code error;
    const std::optional<host::system::ScratchFolder> scratch(std::in_place, error);
    const std::filesystem::path folder = PathOf(scratch, error);
    std::vector<std::unique_ptr<RunningCheck>> checks(call.checks.size());
    std::size_t begun = 0;
    std::size_t taken = 0;
    while (taken < checks.size() && !host::system::DelayedSignals::HaveCome()) {
        std::vector<const host::system::ChildProcess*> running;
        for (std::size_t i = taken; i < begun; ++i) {
            if (!checks[i]->IsDone()) {
                running.push_back(&checks[i]->process());
            }
        }
        while (begun < checks.size() && running.size() < call.worker.jobs) {
            checks[begun] = std::make_unique<RunningCheck>(call, begun, folder);
            running.push_back(&checks[begun]->process());
            ++begun;
        }
        host::system::ChildProcess::WaitForAny(running, kLongestWait);
        for (std::size_t i = taken; i < begun; ++i) {
            if (!checks[i]->IsDone()) {
                checks[i]->Listen();
            }
        }
        for (; taken < begun && checks[taken]->IsDone(); ++taken) {
            take(checks[taken]->check(), checks[taken]->outcome());
            checks[taken].reset();
        }
    }
}

void ValidateHere(const ValidateCall& call, const TakeOutcome& take) {
    std::error_code error;
    const std::optional<host::system::ScratchFolder> scratch(std::in_place, error);
    const std::filesystem::path parent = PathOf(scratch, error);
    for (std::size_t i = 0; i < call.checks.size(); ++i) {
        const CheckFolder folder(parent, i);
        const validate::TrialOptions options = OptionsOf(call, folder.path());
        const Check& check = *call.checks[i];
        take(check, validate::Run(check, options, [&check](const std::string& step) {
                 // Standard error is not buffered: the last line stays when the module crashes.
                 const std::string line = fmt::format("{}: {}", check.id, step);
                 std::fputs((host::text::Printable(line) + "\n").c_str(), stderr);
             }));
    }
}

bool ValidateForParent(const ValidateCall& call, const std::filesystem::path& folder) {
    using host::system::ParentChannel;
    if (!ParentChannel::Join()) {
        return false;
    }
    const validate::TrialOptions options = OptionsOf(call, folder);
    const Outcome outcome = validate::Run(*call.checks.at(0), options, [](const std::string& step) {
        ParentChannel::Write(FieldWriter().Add(std::uint64_t{kStep}).Add(step).Message());
    });
    ParentChannel::Write(OutcomeMessage(outcome));
    return true;
}

}  // namespace cliphost
