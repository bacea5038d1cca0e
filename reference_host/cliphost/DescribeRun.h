// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

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

namespace cliphost {

struct DescribeOptions {
    std::vector<std::filesystem::path> paths;
    std::filesystem::path aafFile;
    std::filesystem::path outFolder;
    DescriptionForm form;
    WorkerCall workers;  // without `writeNear`
};

// Describes all movies of the command line; a bad one does not stop the rest. Several are
// given to processes of their own where the options say so.
class DescribeRun : private WorkerClient {
public:
    DescribeRun(Session& session, const DescribeOptions& options)
        : session_(session), options_(options) {}

    int Run();

private:
    // One movie, or what is told in its place.
    struct Step {
        std::filesystem::path::string_type movie;   // as in FolderClip
        std::shared_ptr<const FolderClips> folder;  // where it is out of a list
        ncfSInt32 index = 0;                        // in that
        std::shared_ptr<const Failure> refusal;     // it can't be asked for
        std::shared_ptr<const Problem> notice;      // no movie is meant

        bool IsMovie() const { return !refusal && !notice; }
    };

    void Plan();
    void PlanFolder(const std::filesystem::path& folder);
    void Refuse(const std::filesystem::path& path, int status, const Problem& problem);
    void DescribeHere();
    void DescribeInWorkers();
    void TellInstead(const Step& step);
    void TellThoseBefore(std::size_t place);
    void Begin(std::size_t number) override;
    bool Read(std::size_t number, const std::string& answer) override;
    void Take(std::size_t number, const WorkerResult& result) override;
    void Deliver(const Step& step, std::size_t number, const WorkerResult& result);
    // Does one movie; what it fails with is told, and the next one goes on.
    template <class Work>
    void GoOnAfterFailure(const std::filesystem::path& movie, const Work& work);
    void Show(const std::filesystem::path& movie, const MovieAnswer& answer,
              const std::filesystem::path& saved);
    bool Saves() const { return !options_.aafFile.empty() || !options_.outFolder.empty(); }
    std::filesystem::path TargetFor(const std::filesystem::path& movie);
    void PrintAll();

    Session& session_;
    const DescribeOptions& options_;
    std::vector<Step> steps_;
    std::vector<std::size_t> placesOfRequests_;  // among the steps
    std::size_t nextPlace_ = 0;
    std::map<std::size_t, MovieAnswer> answers_;  // that were read and not yet shown
    std::optional<Progress> progress_;
    std::set<std::filesystem::path> targetsTaken_;
    std::vector<std::string> entries_;  // of the JSON list
    int described_ = 0;
    int failed_ = 0;
    int status_ = kExitFine;  // the highest of all failures
};

}  // namespace cliphost
