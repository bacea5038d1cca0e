// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/WatchRun.h"

#include <fmt/format.h>

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <cstdio>
#include <map>
#include <optional>
#include <set>
#include <system_error>

#include "reference_host/cliphost/Arrivals.h"
#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/FolderTree.h"
#include "reference_host/cliphost/Notice.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputFolder.h"
#include "reference_host/cliphost/OutputProblem.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/DelayedSignals.h"
#include "reference_host/system/FileNumber.h"
#include "reference_host/system/FolderWatch.h"
#include "reference_host/system/OutputStream.h"

namespace cliphost {
namespace {

using host::DisplayPath;
using host::system::DelayedSignals;
using host::system::FolderChange;
using Clock = Arrivals::Clock;
using namespace std::chrono_literals;

constexpr unsigned kPollWhereNothingTells = 10;  // seconds
constexpr auto kLookForGone = 5s;
// A signal that comes just before a wait is noticed after it.
constexpr std::chrono::milliseconds kLongestRest = 1s;

std::optional<host::system::FileState> StateOfFile(const std::filesystem::path& file) {
    std::error_code ignored;
    return std::filesystem::is_regular_file(file, ignored) ? host::system::StateOf(file)
                                                           : std::nullopt;
}

class Watch {
public:
    Watch(Session& session, const DescribeOptions& describe, const WatchOptions& watch)
        : describe_(describe),
          roots_(std::move(describe_.movies.paths)),
          poll_(watch.poll),
          arrivals_(std::chrono::seconds(watch.rest), StateOfFile),
          folder_(describe_.movies.outFolder),
          run_(session, describe_) {
        MoviesOptions& movies = describe_.movies;
        movies.paths.clear();
        movies.names = &names_;
        movies.apart = true;
        if (movies.endings.empty()) {
            movies.endings = {"mov"};
        }
        for (const std::filesystem::path& root : roots_) {
            if (Problem problem = WhyUnlistable(root)) {
                throw Failure(kExitCaller, std::move(problem));
            }
        }
    }

    void Run() {
        LookAtAll();
        while (!DelayedSignals::HaveCome()) {
            describe_.movies.paths = arrivals_.Take(Clock::now());
            if (!describe_.movies.paths.empty()) {
                RunOnceAndPrint();
            } else {
                WaitAndLook();
            }
        }
        Notice("cliphost: the watch ends by signal {}: {} described, {} not, {} done already\n",
               DelayedSignals::Which(), run_.done(), run_.failed(), run_.doneBefore());
        std::fflush(stdout);
    }

private:
    // Who reads what is printed may go away, and nobody would know what comes.
    void RunOnceAndPrint() {
        int error = 0;
        try {
            run_.RunOnce();
        } catch (const std::system_error& failed) {
            if (std::ferror(stdout) == 0) {
                throw;
            }
            error = failed.code().value();
        }
        if (error == 0 && std::fflush(stdout) != 0) {
            error = host::system::StandardOutputError(errno);
        } else if (error == 0 && std::ferror(stdout) != 0) {
            error = EIO;
        }
        if (error != 0) {
            TellProblem(NotWritten("standard output", error), 0);
            Notice("cliphost: the watch ends: {} described, {} not, {} done already\n", run_.done(),
                   run_.failed(), run_.doneBefore());
            throw ReaderGone();
        }
    }

    void WaitAndLook() {
        auto time = kLongestRest;
        if (const auto next = arrivals_.Next()) {
            const auto left =
                std::chrono::duration_cast<std::chrono::milliseconds>(*next - Clock::now()) + 1ms;
            time = std::clamp<std::chrono::milliseconds>(left, 0ms, time);
        }
        for (const FolderChange& change : system_.Wait(time)) {
            Take(change);
        }
        const auto now = Clock::now();
        if (poll_ != 0 && now - looked_ >= std::chrono::seconds(poll_)) {
            LookAtAll();
        } else if (now - lookedForGone_ >= kLookForGone) {
            LookForGone();
        }
    }

    void Take(const FolderChange& change) {
        switch (change.what) {
            case FolderChange::What::File:
                if (IsFolderToLookAt(change.path)) {  // behind a link
                    LookAtTree(change.path);
                } else if (HasEnding(change.path.filename(), describe_.movies.endings)) {
                    arrivals_.See(change.path, Clock::now());
                }
                break;
            case FolderChange::What::Folder:
                if (describe_.movies.isRecursive) {
                    LookAtTree(change.path);
                }
                break;
            case FolderChange::What::Gone:
                if (std::find(roots_.begin(), roots_.end(), change.path) != roots_.end()) {
                    TellGone(change.path, "it went away");
                } else if (IsFolderToLookAt(change.path)) {
                    // It was moved, is known by its new path, and lost its watch.
                    LookAtTree(change.path);
                }
                break;
            case FolderChange::What::Missed:
                Notice("cliphost: more happened than the system tells; looks at all again\n");
                LookAtAll();
                break;
        }
    }

    bool IsFolderToLookAt(const std::filesystem::path& path) const {
        std::error_code ignored;
        return describe_.movies.isRecursive && std::filesystem::is_directory(path, ignored);
    }

    void LookAtAll() {
        looked_ = Clock::now();
        for (const std::filesystem::path& root : roots_) {
            LookAtRoot(root);
        }
        // Nobody tells of those that were removed when all is looked at.
        arrivals_.LookForRemoved();
    }

    void LookForGone() {
        lookedForGone_ = Clock::now();
        for (const std::filesystem::path& root : roots_) {
            const bool isGone = gone_.count(root) > 0;
            // Nothing is told of a folder above it that is moved.
            if (!isGone && host::system::NumberOf(root) != numbers_[root]) {
                TellGone(root, "it went away");
                LookAtRoot(root);
            } else if (isGone) {
                LookAtRoot(root);
            }
        }
    }

    void LookAtRoot(const std::filesystem::path& root) {
        if (const Problem problem = WhyUnlistable(root)) {
            TellGone(root, problem.reason);
            return;
        }
        numbers_[root] = host::system::NumberOf(root);
        if (gone_.erase(root) > 0) {
            Notice("cliphost: {}: is there again\n", DisplayPath(root));
        }
        if (describe_.movies.isRecursive) {
            LookAtTree(root);
        } else {
            LookAtFolder(root);
        }
    }

    void TellGone(const std::filesystem::path& root, const std::string& reason) {
        if (gone_.insert(root).second) {
            lookedForGone_ = Clock::now();
            Notice("cliphost: {}: is not watched: {}; it is looked for again and again\n",
                   DisplayPath(root), reason);
        }
    }

    void LookAtTree(const std::filesystem::path& top) {
        for (const std::filesystem::path& folder : FoldersIn(top)) {
            LookAtFolder(folder);
        }
    }

    // A folder keeps its first path while that leads to it: by another one, such as through a link
    // upwards, its movies would all arrive again.
    bool IsKnownByOtherPath(const std::filesystem::path& folder) {
        const auto number = host::system::NumberOf(folder);
        if (!number) {
            return false;
        }
        const auto [known, isNew] = pathOf_.emplace(*number, folder);
        if (!isNew && known->second != folder && host::system::NumberOf(known->second) != number) {
            known->second = folder;
        }
        return known->second != folder;
    }

    // Watched first, so that nothing comes in between.
    void LookAtFolder(const std::filesystem::path& folder) {
        if (IsKnownByOtherPath(folder)) {
            return;
        }
        if (poll_ == 0) {
            const int error = system_.Add(folder);
            std::error_code ignored;
            // One that is closed can't be listed either, which is told below.
            if (error != 0 && error != EACCES && std::filesystem::is_directory(folder, ignored)) {
                poll_ = kPollWhereNothingTells;
                Notice(
                    "cliphost: {}: the system does not tell what happens there: {}; all is "
                    "looked at every {} seconds\n",
                    DisplayPath(folder), std::generic_category().message(error), poll_);
            }
        }
        try {
            ForEachByEnding(
                folder, describe_.movies.endings,
                [&](const std::filesystem::path& file) { arrivals_.See(file, Clock::now()); });
        } catch (const Failure& failure) {
            if (toldOnce_.insert(folder).second) {
                TellProblem(failure.problem(), 0);
            }
        }
    }

    DescribeOptions describe_;
    const std::vector<std::filesystem::path> roots_;
    unsigned poll_;  // seconds; 0: the system tells
    Arrivals arrivals_;
    OutputNames names_;
    OutputFolder folder_;
    DescribeRun run_;
    host::system::FolderWatch system_;
    std::set<std::filesystem::path> gone_;                                              // roots
    std::map<std::filesystem::path, std::optional<host::system::FileNumber>> numbers_;  // of roots
    std::map<host::system::FileNumber, std::filesystem::path> pathOf_;  // of folders
    std::set<std::filesystem::path> toldOnce_;  // folders that can't be listed
    Clock::time_point looked_;
    Clock::time_point lookedForGone_;
};

}  // namespace

void WatchFolders(Session& session, const DescribeOptions& describe, const WatchOptions& watch) {
    const DelayedSignals signals("cliphost: stops after the movies at hand\n");
    Watch(session, describe, watch).Run();
}

}  // namespace cliphost
