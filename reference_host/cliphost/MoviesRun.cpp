// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MoviesRun.h"

#include <fmt/format.h>

#include <algorithm>

#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputFolder.h"
#include "reference_host/cliphost/PrivateFile.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/OutputStream.h"
#include "reference_host/system/ScratchFolder.h"

namespace cliphost {

using host::DisplayPath;

template <class Work>
void MoviesRun::GoOnAfterFailure(const std::filesystem::path& movie, const Work& work) {
    try {
        work();
    } catch (const Failure& failure) {
        ++failed_;
        status_ = std::max(status_, failure.status());
        TellProblem(failure.problem(), session_.verbosity());
        ShowFailure(movie, failure.problem());
    } catch (const ReaderGone&) {
        // It has seen enough.
    }
}

void MoviesRun::TellAlso(const Failure& failure) {
    status_ = std::max(status_, failure.status());
    TellProblem(failure.problem(), session_.verbosity());
}

int MoviesRun::Run() {
    std::optional<OutputFolder> folder;
    if (!options_.outFolder.empty()) {
        folder.emplace(options_.outFolder);
    }
    Plan();
    RefuseOneForAllOntoMovie();
    std::size_t movies = 0;
    bool isOurs = false;  // a descriptor is that of this process
    for (std::size_t i = 0; i < steps_.size(); ++i) {
        const MovieStep step = StepAt(i);
        movies += step.IsMovie() ? 1 : 0;
        isOurs = isOurs || host::system::NamesDescriptor(step.movie);
    }
    const bool isForWorkers =
        options_.workers.limits.AreSet() || (options_.workers.jobs > 1 && movies > 1 && !isOurs);
    if (isForWorkers) {
        RunInChildren();
    } else {
        RunHere();
    }
    Finish(done_, failed_);
    return status_;
}

void MoviesRun::Add(MovieStep step) {
    steps_.push_back({kNoList, static_cast<std::uint32_t>(others_.size())});
    others_.push_back(std::move(step));
}

MovieStep MoviesRun::StepAt(std::size_t number) const {
    const Planned& planned = steps_[number];
    if (planned.list == kNoList) {
        return others_[planned.place];
    }
    const std::shared_ptr<FolderClips>& folder = folders_[planned.list];
    FolderClip clip = folder->clips()[planned.place];
    return {std::move(clip.path), folder, clip.index, {}, {}};
}

void MoviesRun::Plan() {
    for (const std::filesystem::path& path : options_.paths) {
        std::error_code ignored;
        if (!std::filesystem::is_directory(path, ignored)) {
            Add({path.native(), {}, 0, {}, {}});
            continue;
        }
        try {
            PlanFolder(path);
        } catch (const Failure& failure) {
            Refuse(path, failure.status(), failure.problem());
        }
    }
}

void MoviesRun::PlanFolder(const std::filesystem::path& folder) {
    const auto path = PathForModule(folder);
    if (!IsClaimed(session_, path.get())) {
        throw Failure(kExitFile, NotClaimed(folder));
    }
    const auto clips = std::make_shared<FolderClips>(session_, folder);
    for (const std::filesystem::path& name : clips->others().withBackslash) {
        Refuse(name, kExitCaller, BackslashProblem(name));
    }
    for (const Problem& problem : clips->others().noFiles) {
        Refuse(problem.subject, kExitCaller, problem);
    }
    if (const Problem leftOut = LeftOut(folder, clips->others())) {
        Add({folder.native(), {}, 0, {}, std::make_shared<const Problem>(leftOut)});
    }
    const auto list = static_cast<std::uint32_t>(folders_.size());
    folders_.push_back(clips);
    steps_.reserve(steps_.size() + clips->clips().size());
    for (std::uint32_t place = 0; place < clips->clips().size(); ++place) {
        steps_.push_back({list, place});
    }
}

void MoviesRun::Refuse(const std::filesystem::path& path, int status, const Problem& problem) {
    Add({path.native(), {}, 0, std::make_shared<const Failure>(status, problem), {}});
}

// It is written when all movies were read: none of them may be there.
void MoviesRun::RefuseOneForAllOntoMovie() const {
    if (!options_.together.empty() && host::system::NumberOf(options_.together)) {
        for (std::size_t i = 0; i < steps_.size(); ++i) {
            RefuseOutputOntoMovie(options_.together, StepAt(i).movie);
        }
    }
}

void MoviesRun::RunHere() {
    if (steps_.size() > 1) {
        progress_.emplace(doing_, steps_.size());
    }
    for (std::size_t i = 0; i < steps_.size(); ++i) {
        const MovieStep step = StepAt(i);
        if (progress_) {
            progress_->Step(DisplayPath(std::filesystem::path(step.movie).filename()));
        }
        if (!step.IsMovie()) {
            TellInstead(step);
            continue;
        }
        GoOnAfterFailure(step.movie, [&] {
            std::filesystem::path saved;
            const MovieAnswer answer = Answer(step, [&] {
                saved = options_.Saves() ? TargetFor(step.movie) : std::filesystem::path();
                return saved;
            });
            Settle(step.movie, answer, options_.together.empty() ? saved : options_.together);
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
    for (std::size_t i = 0; i < steps_.size(); ++i) {
        if (StepAt(i).IsMovie()) {
            placesOfRequests_.push_back(static_cast<std::uint32_t>(i));
        }
    }
    // The children open each movie by its path.
    for (const std::shared_ptr<FolderClips>& folder : folders_) {
        folder->EndList();
    }
    const WorkerRequests requests = {placesOfRequests_.size(), [this](std::size_t number) {
                                         return StepAt(placesOfRequests_[number]).movie;
                                     }};
    WorkerCall call = options_.workers;
    if (!options_.together.empty()) {
        call.writeNear = host::system::TemporaryFolder();
    } else if (options_.Saves()) {
        call.writeNear = PlaceToWrite();
    }
    progress_.emplace(doing_, requests.count);
    RunInWorkers(call, requests, *this);
    progress_.reset();
    TellThoseBefore(steps_.size());
}

void MoviesRun::TellThoseBefore(std::size_t place) {
    for (; nextPlace_ < place; ++nextPlace_) {
        TellInstead(StepAt(nextPlace_));
    }
}

bool MoviesRun::Read(std::size_t number, const std::string& answer) {
    return ReadAnswer(answer, answers_[number]);
}

void MoviesRun::Take(std::size_t number, const WorkerResult& result) {
    const std::size_t place = placesOfRequests_[number];
    TellThoseBefore(place);
    ++nextPlace_;
    const MovieStep step = StepAt(place);
    progress_->Step(DisplayPath(std::filesystem::path(step.movie).filename()));
    Notice("{}", result.told);
    GoOnAfterFailure(step.movie, [&] { Deliver(step, number, result); });
    answers_.erase(number);
}

void MoviesRun::Deliver(const MovieStep& step, std::size_t number, const WorkerResult& result) {
    if (!result.failure.empty()) {
        throw Failure(kExitFile, step.movie, result.failure);
    }
    MovieAnswer& answer = answers_[number];
    std::filesystem::path saved;
    if (!options_.together.empty() && answer.status == kExitFine) {
        const std::filesystem::path file = PrivateFile(result.folder, number);
        Collect(step.movie, file);
        std::error_code ignored;
        std::filesystem::remove(file, ignored);
        saved = options_.together;
    } else if (options_.Saves()) {
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
    Settle(step.movie, answer, saved);
}

void MoviesRun::TellInstead(const MovieStep& step) {
    if (step.notice) {
        TellProblem(*step.notice, session_.verbosity());
    } else {
        GoOnAfterFailure(step.movie, [&] { throw *step.refusal; });
    }
}

void MoviesRun::Settle(const std::filesystem::path& movie, const MovieAnswer& answer,
                       const std::filesystem::path& saved) {
    if (answer.status != kExitFine) {
        throw Failure(answer.status, answer.problem);
    }
    ++done_;
    status_ = std::max(status_, answer.isPartial ? kExitFile : kExitFine);
    Show(movie, answer, saved);
}

// The paths of the command line by the files that they name.
const MoviesRun::PathsByFile& MoviesRun::Given() {
    if (given_.empty()) {
        for (const std::filesystem::path& path : options_.paths) {
            if (const auto number = host::system::NumberOf(path)) {
                given_.emplace(*number, &path);
            }
        }
    }
    return given_;
}

std::filesystem::path MoviesRun::TargetFor(const std::filesystem::path& movie) {
    std::filesystem::path target = options_.file;
    // Movies of one name in different folders get numbers.
    for (int number = 1; target.empty(); ++number) {
        std::filesystem::path name = movie.stem();
        name += number == 1 ? ending_ : fmt::format("-{}{}", number, ending_);
        if (targetsTaken_.insert(name.native()).second) {
            target = options_.outFolder / name;
        }
    }
    const auto inItsPlace = host::system::NumberOf(target);
    if (inItsPlace) {
        RefuseOutputOntoMovie(target, movie);
        if (const auto other = Given().find(*inItsPlace); other != Given().end()) {
            RefuseOutputOntoMovie(target, *other->second);
        }
    }
    return target;
}

}  // namespace cliphost
