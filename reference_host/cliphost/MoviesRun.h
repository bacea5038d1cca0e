// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <cstdint>
#include <filesystem>
#include <map>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "reference_host/cliphost/DoneMovies.h"
#include "reference_host/cliphost/MovieAnswer.h"
#include "reference_host/cliphost/MoviePlan.h"
#include "reference_host/cliphost/Progress.h"
#include "reference_host/cliphost/Workers.h"
#include "reference_host/system/FileNumber.h"

namespace cliphost {

// What a verb does with all movies of the command line; a bad one does not stop the rest. Several
// are given to processes of their own where the options say so. A signal that asks the program to
// end stops it between two movies; it takes its effect when all is told and put away.
class MoviesRun : private WorkerClient {
public:
    virtual ~MoviesRun() = default;
    int Run();
    // Does what the options name now, which may be others each time, and tells no end. What was
    // done is counted over all times.
    void RunOnce();
    int done() const { return done_; }
    int failed() const { return failed_; }
    // How many were left out.
    int doneBefore() const { return doneBefore_; }

protected:
    // `doing` is shown beside the progress; files in the folder get the ending.
    MoviesRun(Session& session, const MoviesOptions& options, const char* doing, const char* ending)
        : session_(session), options_(options), doing_(doing), ending_(ending) {}

    // Before anything is read. A Failure ends the run.
    virtual void Planned(const MoviePlan&) {}
    // Does the work in this process; what it makes is saved where `place` says.
    virtual MovieAnswer Answer(const MovieStep& step, const PlaceOfFile& place) = 0;
    // Reads what a child process answered; false for what is no answer.
    virtual bool ReadAnswer(const std::string& bytes, MovieAnswer& answer) = 0;
    // Both come in the order of the command line.
    virtual void Show(const std::filesystem::path& movie, const MovieAnswer& answer,
                      const std::filesystem::path& saved) = 0;
    virtual void ShowFailure(const std::filesystem::path&, const Problem&) {}
    virtual void ShowDone(const std::filesystem::path& /*movie*/,
                          const std::filesystem::path& /*output*/) {}
    // Whether a failure is told on standard error, too.
    virtual bool TellsFailures() const { return true; }
    // What is made of all takes the file that a child process has made of one.
    virtual bool Collects() const { return !options_.together.empty(); }
    virtual void Collect(const std::filesystem::path& /*movie*/,
                         const std::filesystem::path& /*file*/) {}
    // After all.
    virtual void Finish(int /*done*/, int /*failed*/) {}
    // Whether a movie need not be read, of which all is known; asked of each before the first is
    // read, where LooksFirst says so.
    virtual bool LooksFirst() const { return !options_.outFolder.empty(); }
    virtual bool IsDoneAlready(std::size_t place, const MovieStep& step,
                               const host::system::FileState& state);
    // What is told at a stop of how the work goes on.
    virtual const char* HowToGoOn() const;
    // What the movie that is shown was before it was read; none for what is no file.
    std::optional<host::system::FileState> StateBefore() const {
        return looks_.empty() ? std::nullopt : looks_[shown_].state;
    }
    // For Planned: a movie is not read, but fails so.
    void RefuseMovie(std::size_t place, Failure why) { refused_.emplace(place, std::move(why)); }
    // For what is written when all movies were read: none of them may be there. Throws a Failure.
    void RefuseOntoMovie(const std::filesystem::path& output) const;
    const MoviePlan& plan() const { return *plan_; }
    // For Finish: whether a signal stopped the run.
    bool IsStopped() const { return isStopped_; }

    Session& session() { return session_; }
    // In this process; of a folder's movie out of the module's list.
    Description DescriptionOf(const MovieStep& step);
    // Tells a problem that is not a movie's; it counts for the exit status.
    void TellAlso(const Failure& failure);
    // What counts for it without a problem.
    void CountStatus(int status) { status_ = std::max(status_, status); }

private:
    struct Held;
    void Begin();
    // Reads the record of the runs before, where the options ask for it.
    void LoadDone();
    void DoPlan(Held& held);
    bool IsForWorkers() const;
    // Finds those that are done already, and what all others are before they are read.
    void LookAtMovies();
    void RunHere();
    void RunInChildren();
    std::filesystem::path PlaceToWrite() const;
    bool IsDone(std::size_t place) const { return !looks_.empty() && looks_[place].isDone; }
    // Whether its movie is to be read.
    bool IsToDo(std::size_t place) const {
        return !IsDone(place) && refused_.count(place) == 0 && plan()[place].IsMovie();
    }
    void TellInstead(std::size_t place);
    void TellThoseBefore(std::size_t place);
    bool Read(std::size_t number, const std::string& answer) override;
    bool Take(std::size_t number, const WorkerResult& result) override;
    void Deliver(std::size_t place, const MovieStep& step, std::size_t number,
                 const WorkerResult& result);
    void Settle(std::size_t place, const MovieStep& step, const MovieAnswer& answer,
                const std::filesystem::path& saved);
    void Remember(std::size_t place, const MovieStep& step, const std::filesystem::path& saved);
    void Record(std::size_t place, const MovieStep& step, const std::filesystem::path& output,
                DoneMovies::Known known);
    int Left() const;
    void TellStop();
    // Does one movie; what it fails with is told, and the next one goes on.
    template <class Work>
    void GoOnAfterFailure(const std::filesystem::path& movie, const Work& work);
    using PlacesByFile = std::map<host::system::FileNumber, std::size_t>;
    const PlacesByFile& Guarded();
    std::filesystem::path TargetFor(std::size_t place, const MovieStep& step);

    Session& session_;
    const MoviesOptions& options_;
    const char* doing_;
    const char* ending_;
    std::optional<MoviePlan> plan_;
    struct Look {
        std::optional<host::system::FileState> state;  // before the movie was read
        bool isDone = false;                           // its output is there
    };
    std::vector<Look> looks_;                      // where LooksFirst says so
    std::map<std::size_t, Failure> refused_;       // by their places
    std::size_t shown_ = 0;                        // the place of the movie at hand
    std::vector<std::uint32_t> placesOfRequests_;  // among the steps
    std::size_t nextPlace_ = 0;
    std::map<std::size_t, MovieAnswer> answers_;  // that were read and not yet shown
    std::optional<Progress> progress_;
    std::set<std::filesystem::path::string_type> targetsTaken_;  // names in the folder
    std::optional<PlacesByFile> guarded_;
    std::optional<DoneMovies> doneMovies_;
    bool canRecord_ = true;
    // Of places; for a stop.
    std::vector<std::pair<std::uint32_t, std::filesystem::path::string_type>> outputs_;
    int countedBefore_ = 0;  // of what the options named before
    int doneBefore_ = 0;
    bool isStopped_ = false;
    int done_ = 0;
    int failed_ = 0;
    int status_ = kExitFine;  // the highest of all failures
};

}  // namespace cliphost
