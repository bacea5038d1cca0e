// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MoviesRun.h"

#include <fmt/format.h>

#include <algorithm>
#include <cerrno>
#include <cstdio>
#include <system_error>

#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputFolder.h"
#include "reference_host/cliphost/PrivateFile.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/cliphost/WorkerVerb.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/DelayedSignals.h"
#include "reference_host/system/FileSystem.h"
#include "reference_host/system/OutputStream.h"
#include "reference_host/system/Paths.h"
#include "reference_host/system/ScratchFolder.h"

namespace cliphost {

using host::DisplayPath;
using host::system::DelayedSignals;
using host::system::FileState;

namespace {

constexpr char kStopsSoon[] =
    "cliphost: stops after the movie at hand; interrupt it again to stop at once\n";

}  // namespace

template <class Work>
void MoviesRun::GoOnAfterFailure(const std::filesystem::path& movie, const Work& work) {
    try {
        work();
    } catch (const Failure& failure) {
        ++failed_;
        status_ = std::max(status_, failure.status());
        if (TellsFailures()) {
            TellProblem(failure.problem(), session_.verbosity());
        }
        ShowFailure(movie, failure.problem());
    } catch (const ReaderGone&) {
        // It has seen enough.
    }
}

void MoviesRun::TellAlso(const Failure& failure) {
    status_ = std::max(status_, failure.status());
    TellProblem(failure.problem(), session_.verbosity());
}

void MoviesRun::Begin() {
    looks_.clear();
    refused_.clear();
    placesOfRequests_.clear();
    nextPlace_ = 0;
    answers_.clear();
    guarded_.reset();
    outputs_.clear();
    countedBefore_ = done_ + doneBefore_ + failed_;
    LoadDone();
    plan_.emplace(session_, options_, ending_, doneMovies_ ? &*doneMovies_ : nullptr);
}

void MoviesRun::LoadDone() {
    if (!options_.skipDone || doneMovies_) {
        return;
    }
    doneMovies_.emplace(options_.outFolder, SettingsText(session_, options_.workers.arguments));
    for (const std::filesystem::path& file : doneMovies_->Load()) {
        Notice("cliphost: {}: can't be read; what it tells of is done again\n", DisplayPath(file));
    }
}

// Signals are noted from the plan on; the folder, if the run made it, goes where nothing lies in
// it.
struct MoviesRun::Held {
    std::optional<DelayedSignals> signals;
    std::optional<OutputFolder> folder;
};

int MoviesRun::Run() {
    Held held;
    DoPlan(held);
    Finish(done_, failed_);
    if (isStopped_) {
        TellStop();
    }
    // Before a signal takes its effect, which may also have come behind the last movie. Who reads
    // what is printed may go away.
    if (std::fflush(stdout) != 0) {
        if (const int error = host::system::StandardOutputError(errno); error != EPIPE) {
            throw std::system_error(error, std::generic_category(), "standard output");
        }
    }
    return status_;
}

void MoviesRun::RunOnce() {
    Held held;
    DoPlan(held);
}

void MoviesRun::DoPlan(Held& held) {
    Begin();
    if (Collects()) {
        RefuseOntoMovie(options_.together);
    }
    Planned(plan());
    const bool isForWorkers = IsForWorkers();
    if (isForWorkers || plan().size() > 1) {
        held.signals.emplace(isForWorkers ? nullptr : kStopsSoon);
    }
    std::error_code ignored;
    if (options_.names != nullptr && !std::filesystem::is_directory(options_.outFolder, ignored)) {
        // What it held, and what was recorded there, is lost: that is no new start.
        throw Failure(kExitCaller, options_.outFolder, "the folder for outputs went away");
    }
    if (!options_.outFolder.empty()) {
        held.folder.emplace(options_.outFolder);
    }
    if (LooksFirst()) {
        LookAtMovies();
    }
    if (isForWorkers) {
        RunInChildren();
    } else {
        RunHere();
    }
    isStopped_ = held.signals && DelayedSignals::HaveCome() && Left() > 0;
}

bool MoviesRun::IsForWorkers() const {
    std::size_t movies = 0;
    bool isOurs = false;  // a descriptor is that of this process
    for (std::size_t i = 0; i < plan().size(); ++i) {
        const MovieStep step = plan()[i];
        movies += step.IsMovie() ? 1 : 0;
        isOurs = isOurs || host::system::NamesDescriptor(step.movie);
        RefuseDescriptor(options_.workers, step.movie);
    }
    return options_.apart || options_.workers.limits.AreSet() ||
           (options_.workers.jobs > 1 && movies > 1 && !isOurs);
}

void MoviesRun::LookAtMovies() {
    looks_.resize(plan().size());
    for (std::size_t i = 0; i < plan().size() && !DelayedSignals::HaveCome(); ++i) {
        const MovieStep step = plan()[i];
        if (!step.IsMovie() || refused_.count(i) > 0) {
            continue;
        }
        Look& look = looks_[i];
        look.state = host::system::StateOf(step.movie);
        look.isDone = look.state && IsDoneAlready(i, step, *look.state);
        doneBefore_ += look.isDone ? 1 : 0;
    }
}

bool MoviesRun::IsDoneAlready(std::size_t place, const MovieStep& step, const FileState& state) {
    return doneMovies_ && doneMovies_->Has(step.movie, state,
                                           OutputName(step.movie, plan().NumberOf(place), ending_));
}

const char* MoviesRun::HowToGoOn() const {
    return !options_.outFolder.empty() && canRecord_ ? "; the same call with --skip-done goes on"
                                                     : "";
}

void MoviesRun::Remember(std::size_t place, const MovieStep& step,
                         const std::filesystem::path& saved) {
    if (options_.outFolder.empty() || !looks_[place].state) {
        return;
    }
    if (options_.skipDone) {
        Record(place, step, saved.filename(), DoneMovies::Known::ByContent);
    } else {
        outputs_.emplace_back(static_cast<std::uint32_t>(place), saved.filename().native());
    }
}

void MoviesRun::Record(std::size_t place, const MovieStep& step,
                       const std::filesystem::path& output, DoneMovies::Known known) {
    if (!canRecord_) {
        return;
    }
    try {
        if (!doneMovies_) {
            doneMovies_.emplace(options_.outFolder,
                                SettingsText(session_, options_.workers.arguments));
        }
        doneMovies_->Add(step.movie, *looks_[place].state, output, known);
    } catch (const Failure& failure) {
        canRecord_ = false;
        TellAlso(failure);
    }
}

// Movies of the plan of which nothing is known yet.
int MoviesRun::Left() const {
    int all = 0;
    for (std::size_t i = 0; i < plan().size(); ++i) {
        all += plan()[i].notice ? 0 : 1;
    }
    return all - (done_ + doneBefore_ + failed_ - countedBefore_);
}

void MoviesRun::TellStop() {
    if (DelayedSignals::ReaderHasGone()) {
        return;  // who reads what is printed has seen enough
    }
    // A run that keeps no record from the start keeps one for the next.
    for (const auto& [place, output] : outputs_) {
        Record(place, plan()[place], output, DoneMovies::Known::ByDate);
    }
    const int done = done_ + doneBefore_;
    const int all = done + failed_ + Left();
    Notice("cliphost: stopped by signal {}: {} of {} done, {} failed, {} left{}\n",
           DelayedSignals::Which(), done, Counted(static_cast<std::uint64_t>(all), "movie"),
           failed_, Left(), HowToGoOn());
}

Description MoviesRun::DescriptionOf(const MovieStep& step) {
    return step.folder ? DescribeFromList(session_, step.folder->list(), step.index, step.movie)
                       : DescribeMovie(session_, step.movie);
}

void MoviesRun::RefuseOntoMovie(const std::filesystem::path& output) const {
    const auto inItsPlace = host::system::NumberOf(output);
    for (std::size_t i = 0; inItsPlace && i < plan().size(); ++i) {
        const MovieStep step = plan()[i];
        if (step.IsMovie() && host::system::NumberOf(step.movie) == inItsPlace) {
            RefuseOutputOntoMovie(output, step.movie);
        }
    }
}

void MoviesRun::RunHere() {
    if (plan().size() > 1) {
        progress_.emplace(doing_, plan().size());
    }
    for (std::size_t i = 0; i < plan().size(); ++i) {
        const MovieStep step = plan()[i];
        shown_ = i;
        if (progress_) {
            progress_->Step(DisplayPath(std::filesystem::path(step.movie).filename()));
        }
        if (!IsToDo(i)) {
            TellInstead(i);
            continue;
        }
        if (DelayedSignals::HaveCome()) {
            break;
        }
        GoOnAfterFailure(step.movie, [&] {
            std::filesystem::path saved;
            const MovieAnswer answer = AnswerOfMovie(step.movie, [&] {
                return Answer(step, [&] {
                    saved = options_.Saves() ? TargetFor(i, step) : std::filesystem::path();
                    return saved;
                });
            });
            Settle(i, step, answer, options_.together.empty() ? saved : options_.together);
        });
    }
    progress_.reset();
}

// Where the file will be, so that it need not be copied there.
std::filesystem::path MoviesRun::PlaceToWrite() const {
    if (!options_.outFolder.empty()) {
        return options_.outFolder;
    }
    if (host::system::IsStandardOutput(options_.file) || OutputFile::IsDevice(options_.file)) {
        return host::system::TemporaryFolder();
    }
    const std::filesystem::path folder = options_.file.parent_path();
    return folder.empty() ? "." : folder;
}

void MoviesRun::RunInChildren() {
    for (std::size_t i = 0; i < plan().size(); ++i) {
        if (IsToDo(i)) {
            placesOfRequests_.push_back(static_cast<std::uint32_t>(i));
        }
    }
    // The children open each movie by its path.
    plan_->EndLists();
    const WorkerRequests requests = {
        placesOfRequests_.size(), [this](std::size_t number) {
            return host::system::PathText(plan()[placesOfRequests_[number]].movie);
        }};
    WorkerCall call = options_.workers;
    if (Collects()) {
        call.writeNear = host::system::TemporaryFolder();
    } else if (options_.Saves()) {
        call.writeNear = PlaceToWrite();
    }
    progress_.emplace(doing_, requests.count);
    RunInWorkers(call, requests, *this);
    progress_.reset();
    // Behind the last movie, whether a signal has come or not.
    while (nextPlace_ < plan().size() && !IsToDo(nextPlace_)) {
        TellInstead(nextPlace_++);
    }
}

void MoviesRun::TellThoseBefore(std::size_t place) {
    for (; nextPlace_ < place; ++nextPlace_) {
        TellInstead(nextPlace_);
    }
}

bool MoviesRun::Read(std::size_t number, const std::string& answer) {
    return ReadAnswer(answer, answers_[number]);
}

bool MoviesRun::Take(std::size_t number, const WorkerResult& result) {
    const std::size_t place = placesOfRequests_[number];
    TellThoseBefore(place);
    ++nextPlace_;
    shown_ = place;
    const MovieStep step = plan()[place];
    progress_->Step(DisplayPath(std::filesystem::path(step.movie).filename()));
    Notice("{}", result.told);
    GoOnAfterFailure(step.movie, [&] { Deliver(place, step, number, result); });
    answers_.erase(number);
    return true;
}

void MoviesRun::Deliver(std::size_t place, const MovieStep& step, std::size_t number,
                        const WorkerResult& result) {
    if (!result.failure.empty()) {
        throw Failure(kExitFile, step.movie, result.failure);
    }
    MovieAnswer& answer = answers_[number];
    std::filesystem::path saved;
    if (Collects() && answer.status == kExitFine) {
        const std::filesystem::path file = PrivateFile(result.folder, number);
        Collect(step.movie, file);
        std::error_code ignored;
        std::filesystem::remove(file, ignored);
        saved = options_.together;
    } else if (options_.Saves()) {
        const std::filesystem::path file = PrivateFile(result.folder, number);
        const bool isSaved = answer.status == kExitFine;
        const bool isNotSaved = !isSaved && answer.problem.subject == file;
        saved = isSaved || isNotSaved ? TargetFor(place, step) : saved;
        if (isNotSaved) {
            answer.problem.subject = saved;
        } else if (isSaved) {
            PutIntoPlace(file, saved);
        }
    }
    Settle(place, step, answer, saved);
}

void MoviesRun::TellInstead(std::size_t place) {
    const MovieStep step = plan()[place];
    shown_ = place;
    if (IsDone(place)) {
        if (session_.verbosity() > 0) {
            Notice("cliphost: {}: is done already\n",
                   DisplayPath(std::filesystem::path(step.movie)));
        }
        ShowDone(step.movie,
                 options_.outFolder / OutputName(step.movie, plan().NumberOf(place), ending_));
    } else if (const auto refused = refused_.find(place); refused != refused_.end()) {
        GoOnAfterFailure(step.movie, [&] { throw Failure(refused->second); });
    } else if (step.notice) {
        TellProblem(*step.notice, session_.verbosity());
    } else {
        GoOnAfterFailure(step.movie, [&] { throw *step.refusal; });
    }
}

void MoviesRun::Settle(std::size_t place, const MovieStep& step, const MovieAnswer& answer,
                       const std::filesystem::path& saved) {
    if (answer.status != kExitFine) {
        throw Failure(answer.status, answer.problem);
    }
    ++done_;
    // What lacks something is made again each time, and told.
    if (!answer.isPartial) {
        Remember(place, step, saved);
    }
    status_ = std::max(status_, answer.isPartial ? kExitFile : kExitFine);
    Show(step.movie, answer, saved);
}

// The movies that an output may meet, by the files that they are.
const MoviesRun::PlacesByFile& MoviesRun::Guarded() {
    if (!guarded_) {
        guarded_.emplace();
        for (std::size_t i = 0; i < plan().size(); ++i) {
            const auto number = plan().MayBeOutput(i, ending_)
                                    ? host::system::NumberOf(plan()[i].movie)
                                    : std::nullopt;
            if (number) {
                guarded_->emplace(*number, i);
            }
        }
    }
    return *guarded_;
}

std::filesystem::path MoviesRun::TargetFor(std::size_t place, const MovieStep& step) {
    std::filesystem::path target = options_.file;
    if (const unsigned number = plan().NumberOf(place)) {
        target = options_.outFolder / OutputName(step.movie, number, ending_);
    }
    for (unsigned number = 1; target.empty(); ++number) {
        const std::filesystem::path name = OutputName(step.movie, number, ending_);
        if (targetsTaken_.insert(host::system::NameKey(name).native()).second) {
            target = options_.outFolder / name;
        }
    }
    const auto inItsPlace = host::system::NumberOf(target);
    if (inItsPlace) {
        RefuseOutputOntoMovie(target, step.movie);
        const PlacesByFile& guarded = Guarded();
        if (const auto other = guarded.find(*inItsPlace); other != guarded.end()) {
            RefuseOutputOntoMovie(target, plan()[other->second].movie);
        }
    }
    return target;
}

}  // namespace cliphost
