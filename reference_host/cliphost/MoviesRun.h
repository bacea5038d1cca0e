// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <map>
#include <memory>
#include <optional>
#include <set>
#include <string>
#include <vector>

#include "reference_host/cliphost/FolderClips.h"
#include "reference_host/cliphost/MovieAnswer.h"
#include "reference_host/cliphost/Progress.h"
#include "reference_host/cliphost/Workers.h"
#include "reference_host/system/FileNumber.h"

namespace cliphost {

struct MoviesOptions {
    std::vector<std::filesystem::path> paths;  // movies and folders
    std::filesystem::path file;                // for what is made of the only movie
    std::filesystem::path outFolder;           // for what is made of each
    std::filesystem::path together;            // for what is made of all
    WorkerCall workers;                        // without `writeNear`

    bool Saves() const { return !file.empty() || !outFolder.empty(); }
};

// One movie of a command line, or what is told in its place.
struct MovieStep {
    std::filesystem::path::string_type movie;   // as in FolderClip
    std::shared_ptr<const FolderClips> folder;  // where it is out of a list
    ncfSInt32 index = 0;                        // in that
    std::shared_ptr<const Failure> refusal;     // it can't be asked for
    std::shared_ptr<const Problem> notice;      // no movie is meant

    bool IsMovie() const { return !refusal && !notice; }
};

// What a verb does with all movies of the command line; a bad one does not stop the rest. Several
// are given to processes of their own where the options say so.
class MoviesRun : private WorkerClient {
public:
    virtual ~MoviesRun() = default;
    int Run();

protected:
    // `doing` is shown beside the progress; files in the folder get the ending.
    MoviesRun(Session& session, const MoviesOptions& options, const char* doing, const char* ending)
        : session_(session), options_(options), doing_(doing), ending_(ending) {}

    // Does the work in this process; what it makes is saved where `place` says.
    virtual MovieAnswer Answer(const MovieStep& step, const PlaceOfFile& place) = 0;
    // Reads what a child process answered; false for what is no answer.
    virtual bool ReadAnswer(const std::string& bytes, MovieAnswer& answer) = 0;
    // Both come in the order of the command line.
    virtual void Show(const std::filesystem::path& movie, const MovieAnswer& answer,
                      const std::filesystem::path& saved) = 0;
    virtual void ShowFailure(const std::filesystem::path&, const Problem&) {}
    // What is made of all takes the file that a child process has made of one.
    virtual void Collect(const std::filesystem::path& /*movie*/,
                         const std::filesystem::path& /*file*/) {}
    // After all.
    virtual void Finish(int /*done*/, int /*failed*/) {}

    Session& session() { return session_; }
    // Tells a problem that is not a movie's; it counts for the exit status.
    void TellAlso(const Failure& failure);

private:
    void Plan();
    void PlanFolder(const std::filesystem::path& folder);
    void Refuse(const std::filesystem::path& path, int status, const Problem& problem);
    void RefuseOneForAllOntoMovie() const;
    void RunHere();
    void RunInChildren();
    std::filesystem::path PlaceToWrite() const;
    void TellInstead(const MovieStep& step);
    void TellThoseBefore(std::size_t place);
    bool Read(std::size_t number, const std::string& answer) override;
    void Take(std::size_t number, const WorkerResult& result) override;
    void Deliver(const MovieStep& step, std::size_t number, const WorkerResult& result);
    void Settle(const std::filesystem::path& movie, const MovieAnswer& answer,
                const std::filesystem::path& saved);
    // Does one movie; what it fails with is told, and the next one goes on.
    template <class Work>
    void GoOnAfterFailure(const std::filesystem::path& movie, const Work& work);
    using PathsByFile = std::map<host::system::FileNumber, const std::filesystem::path*>;
    const PathsByFile& Given();
    std::filesystem::path TargetFor(const std::filesystem::path& movie);

    Session& session_;
    const MoviesOptions& options_;
    const char* doing_;
    const char* ending_;
    // Of movies out of lists only which they are: there may be 100,000.
    struct Planned {
        std::uint32_t list;   // among the folders; kNoList: `place` is one among the others
        std::uint32_t place;  // among its movies
    };
    static constexpr std::uint32_t kNoList = 0xFFFFFFFF;
    void Add(MovieStep step);
    MovieStep StepAt(std::size_t number) const;

    std::vector<Planned> steps_;
    std::vector<std::shared_ptr<FolderClips>> folders_;
    std::vector<MovieStep> others_;
    std::vector<std::uint32_t> placesOfRequests_;  // among the steps
    std::size_t nextPlace_ = 0;
    std::map<std::size_t, MovieAnswer> answers_;  // that were read and not yet shown
    std::optional<Progress> progress_;
    std::set<std::string> targetsTaken_;  // names in the folder
    PathsByFile given_;
    int done_ = 0;
    int failed_ = 0;
    int status_ = kExitFine;  // the highest of all failures
};

}  // namespace cliphost
