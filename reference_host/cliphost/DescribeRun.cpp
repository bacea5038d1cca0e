// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/DescribeRun.h"

#include <fmt/format.h>

#include <algorithm>
#include <nlohmann/json.hpp>

#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputFolder.h"
#include "reference_host/cliphost/PrivateFile.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

using host::DisplayPath;
using nlohmann::ordered_json;

constexpr char kProgress[] = "describing";

// An entry of a list in JSON. `description` is JSON already.
std::string EntryText(const ordered_json& head, const std::string& description) {
    std::string lines = head.dump(2, ' ', false, ordered_json::error_handler_t::replace);
    std::string text = "  ";
    for (const char c : lines) {
        text += c;
        if (c == '\n') {
            text += "  ";
        }
    }
    if (!description.empty()) {
        constexpr std::string_view kEnd = "\n  }";
        text.resize(text.size() - kEnd.size());
        text += ",\n    \"description\": " + description;
        text += kEnd;
    }
    return text;
}

}  // namespace

template <class Work>
void DescribeRun::GoOnAfterFailure(const std::filesystem::path& movie, const Work& work) {
    try {
        work();
    } catch (const Failure& failure) {
        ++failed_;
        status_ = std::max(status_, failure.status());
        TellProblem(failure.problem(), session_.verbosity());
        if (options_.form.json) {
            ordered_json head = {{"movie", MachinePath(movie)}};
            AddProblem(failure.problem(), head);
            entries_.push_back(EntryText(head, ""));
        }
    } catch (const ReaderGone&) {
        // It has seen enough.
    }
}

int DescribeRun::Run() {
    std::optional<OutputFolder> folder;
    if (!options_.outFolder.empty()) {
        folder.emplace(options_.outFolder);
    }
    Plan();
    const auto movies = std::count_if(steps_.begin(), steps_.end(),
                                      [](const Step& step) { return step.IsMovie(); });
    const bool isForWorkers =
        options_.workers.limits.AreSet() || (options_.workers.jobs > 1 && movies > 1);
    if (isForWorkers) {
        DescribeInWorkers();
    } else {
        DescribeHere();
    }
    PrintAll();
    return status_;
}

void DescribeRun::Plan() {
    for (const std::filesystem::path& path : options_.paths) {
        std::error_code ignored;
        if (!std::filesystem::is_directory(path, ignored)) {
            steps_.push_back({path.native(), {}, 0, {}, {}});
            continue;
        }
        try {
            PlanFolder(path);
        } catch (const Failure& failure) {
            Refuse(path, failure.status(), failure.problem());
        }
    }
}

void DescribeRun::PlanFolder(const std::filesystem::path& folder) {
    const auto path = PathForModule(folder);
    if (!IsClaimed(session_, path.get())) {
        throw Failure(kExitFile, NotClaimed(folder));
    }
    const auto clips = std::make_shared<const FolderClips>(session_, folder);
    for (const std::filesystem::path& name : clips->others().withBackslash) {
        Refuse(name, kExitCaller, BackslashProblem(name));
    }
    for (const Problem& problem : clips->others().noFiles) {
        Refuse(problem.subject, kExitCaller, problem);
    }
    if (const Problem leftOut = LeftOut(folder, clips->others())) {
        steps_.push_back({folder.native(), {}, 0, {}, std::make_shared<const Problem>(leftOut)});
    }
    for (const FolderClip& clip : clips->clips()) {
        steps_.push_back({clip.path, clips, clip.index, {}, {}});
    }
}

void DescribeRun::Refuse(const std::filesystem::path& path, int status, const Problem& problem) {
    steps_.push_back({path.native(), {}, 0, std::make_shared<const Failure>(status, problem), {}});
}

void DescribeRun::DescribeHere() {
    progress_.emplace(kProgress, steps_.size());
    for (const Step& step : steps_) {
        progress_->Step(DisplayPath(std::filesystem::path(step.movie).filename()));
        if (!step.IsMovie()) {
            TellInstead(step);
            continue;
        }
        GoOnAfterFailure(step.movie, [&] {
            std::filesystem::path saved;
            const Description description =
                step.folder
                    ? DescribeFromList(session_, step.folder->list(), step.index, step.movie)
                    : DescribeMovie(session_, step.movie);
            const MovieAnswer answer = AnswerOf(session_, description, options_.form, [&] {
                saved = Saves() ? TargetFor(step.movie) : std::filesystem::path();
                return saved;
            });
            Show(step.movie, answer, saved);
        });
    }
    progress_.reset();
}

void DescribeRun::DescribeInWorkers() {
    std::vector<std::string> requests;
    for (std::size_t i = 0; i < steps_.size(); ++i) {
        if (steps_[i].IsMovie()) {
            steps_[i].folder.reset();
            requests.push_back(steps_[i].movie);
            placesOfRequests_.push_back(i);
        }
    }
    WorkerCall call = options_.workers;
    if (Saves()) {
        call.writeNear = options_.outFolder.empty() ? std::filesystem::temp_directory_path()
                                                    : options_.outFolder;
    }
    progress_.emplace(kProgress, requests.size());
    RunInWorkers(call, requests, *this);
    progress_.reset();
    TellThoseBefore(steps_.size());
}

void DescribeRun::TellThoseBefore(std::size_t place) {
    for (; nextPlace_ < place; ++nextPlace_) {
        TellInstead(steps_[nextPlace_]);
    }
}

void DescribeRun::Begin(std::size_t number) {
    progress_->Step(
        DisplayPath(std::filesystem::path(steps_[placesOfRequests_[number]].movie).filename()));
}

bool DescribeRun::Read(std::size_t number, const std::string& answer) {
    return FromBytes(answer, options_.form, answers_[number]);
}

void DescribeRun::Take(std::size_t number, const WorkerResult& result) {
    const std::size_t place = placesOfRequests_[number];
    TellThoseBefore(place);
    ++nextPlace_;
    Notice("{}", result.told);
    GoOnAfterFailure(steps_[place].movie, [&] { Deliver(steps_[place], number, result); });
    answers_.erase(number);
}

void DescribeRun::Deliver(const Step& step, std::size_t number, const WorkerResult& result) {
    if (!result.failure.empty()) {
        throw Failure(kExitFile, step.movie, result.failure);
    }
    MovieAnswer& answer = answers_[number];
    std::filesystem::path saved;
    if (Saves()) {
        const std::filesystem::path file = PrivateFile(result.folder, number);
        const bool isSaved = answer.status == kExitFine;
        const bool isNotSaved = !isSaved && answer.problem.subject == file;
        saved = isSaved || isNotSaved ? TargetFor(step.movie) : saved;
        if (isNotSaved) {
            answer.problem.subject = saved;
        } else if (isSaved) {
            PutIntoPlace(file, saved);
        }
    }
    Show(step.movie, answer, saved);
}

void DescribeRun::TellInstead(const Step& step) {
    if (step.notice) {
        TellProblem(*step.notice, session_.verbosity());
    } else {
        GoOnAfterFailure(step.movie, [&] { throw *step.refusal; });
    }
}

void DescribeRun::Show(const std::filesystem::path& movie, const MovieAnswer& answer,
                       const std::filesystem::path& saved) {
    if (answer.status != kExitFine) {
        throw Failure(answer.status, answer.problem);
    }
    ++described_;
    if (host::system::IsStandardOutput(saved)) {
        return;
    }
    if (!options_.form.json) {
        fmt::print("{}{}\n{}", DisplayPath(movie), saved.empty() ? "" : " -> " + DisplayPath(saved),
                   answer.description);
        return;
    }
    ordered_json head = {{"movie", MachinePath(movie)}};
    if (!saved.empty()) {
        head["aaf"] = MachinePath(saved);
    }
    if (answer.problem) {
        AddProblem(answer.problem, head);
    }
    head["route"] = answer.route;
    if (!answer.routeReason.empty()) {
        head["routeReason"] = answer.routeReason;
    }
    entries_.push_back(EntryText(head, answer.description));
}

std::filesystem::path DescribeRun::TargetFor(const std::filesystem::path& movie) {
    std::filesystem::path target = options_.aafFile;
    // Movies of one name in different folders get numbers.
    for (int number = 1; target.empty(); ++number) {
        std::filesystem::path name = movie.stem();
        name += number == 1 ? ".aaf" : fmt::format("-{}.aaf", number);
        const std::filesystem::path free = options_.outFolder / name;
        if (targetsTaken_.insert(free).second) {
            target = free;
        }
    }
    std::error_code ignored;
    if (!std::filesystem::exists(target, ignored)) {
        return target;  // so it is no movie
    }
    RefuseOutputOntoMovie(target, movie);
    for (const std::filesystem::path& other : options_.paths) {
        RefuseOutputOntoMovie(target, other);
    }
    return target;
}

void DescribeRun::PrintAll() {
    if (!options_.form.json) {
        if (described_ + failed_ != 1 && !host::system::IsStandardOutput(options_.aafFile)) {
            fmt::print("{} described, {} not\n", described_, failed_);
        }
        return;
    }
    fmt::print("[");
    for (std::size_t i = 0; i < entries_.size(); ++i) {
        fmt::print("{}\n{}", i == 0 ? "" : ",", entries_[i]);
    }
    fmt::print("{}]\n", entries_.empty() ? "" : "\n");
}

}  // namespace cliphost
