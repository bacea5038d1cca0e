// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include <algorithm>
#include <set>

#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/FolderClips.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/OptionChecks.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/cliphost/OutputFolder.h"
#include "reference_host/cliphost/Progress.h"
#include "reference_host/cliphost/RouteTaken.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

using host::DisplayPath;

struct DescribeOptions {
    std::vector<std::filesystem::path> paths;
    std::filesystem::path aafFile;
    std::filesystem::path outFolder;
    bool json = false;
    bool quiet = false;
};

// Describes all movies of the command line; a bad one does not stop the rest.
class DescribeRun {
public:
    DescribeRun(Session& session, const DescribeOptions& options)
        : session_(session), options_(options) {}

    int Run();

private:
    void DescribeFolder(const std::filesystem::path& folder);
    void Take(const Description& description);
    // Does a step; what it fails with is told, and the next one goes on.
    template <class Step>
    void GoOnAfterFailure(const std::filesystem::path& path, const Step& step);
    void Refuse(const std::filesystem::path& path, const Problem& problem, int status);
    std::filesystem::path TargetFor(const std::filesystem::path& movie);

    Session& session_;
    const DescribeOptions& options_;
    std::set<std::filesystem::path> targetsTaken_;
    nlohmann::ordered_json json_ = nlohmann::ordered_json::array();
    int described_ = 0;
    int failed_ = 0;
    int status_ = kExitFine;  // the highest of all failures
};

int DescribeRun::Run() {
    std::optional<OutputFolder> folder;
    if (!options_.outFolder.empty()) {
        folder.emplace(options_.outFolder);
    }
    for (const std::filesystem::path& path : options_.paths) {
        std::error_code ignored;
        const bool isFolder = std::filesystem::is_directory(path, ignored);
        GoOnAfterFailure(
            path, [&] { isFolder ? DescribeFolder(path) : Take(DescribeMovie(session_, path)); });
    }
    if (options_.json) {
        PrintJson(json_);
    } else if (described_ + failed_ != 1 && !host::system::IsStandardOutput(options_.aafFile)) {
        fmt::print("{} described, {} not\n", described_, failed_);
    }
    return status_;
}

template <class Step>
void DescribeRun::GoOnAfterFailure(const std::filesystem::path& path, const Step& step) {
    try {
        step();
    } catch (const Failure& failure) {
        Refuse(path, failure.problem(), failure.status());
    } catch (const ReaderGone&) {
        // It has seen enough.
    }
}

void DescribeRun::Refuse(const std::filesystem::path& path, const Problem& problem, int status) {
    ++failed_;
    status_ = std::max(status_, status);
    TellProblem(problem, session_.verbosity());
    nlohmann::ordered_json entry = {{"movie", MachinePath(path)}};
    AddProblem(problem, entry);
    json_.push_back(std::move(entry));
}

void DescribeRun::DescribeFolder(const std::filesystem::path& folder) {
    const auto path = PathForModule(folder);
    if (!IsClaimed(session_, path.get())) {
        throw Failure(kExitFile, NotClaimed(folder));
    }
    const FolderClips clips(session_, folder);
    for (const std::filesystem::path& name : clips.others().withBackslash) {
        Refuse(name, BackslashProblem(name), kExitCaller);
    }
    for (const Problem& problem : clips.others().noFiles) {
        Refuse(problem.subject, problem, kExitCaller);
    }
    if (const Problem leftOut = LeftOut(folder, clips.others())) {
        TellProblem(leftOut, session_.verbosity());
    }
    Progress progress("describing", clips.clips().size());
    for (const FolderClip& clip : clips.clips()) {
        progress.Step(DisplayPath(clip.path.filename()));
        GoOnAfterFailure(clip.path, [&] {
            Take(DescribeFromList(session_, clips.list(), clip.index, clip.path));
        });
    }
}

void DescribeRun::Take(const Description& description) {
    if (!description.file) {
        Refuse(description.movie, description.problem, StatusOf(description.problem));
        return;
    }
    if (description.doubt) {
        TellProblem(description.doubt, session_.verbosity());
    }
    std::filesystem::path saved;
    host::Ref<IAAFFile> shown = description.file;
    if (!options_.aafFile.empty() || !options_.outFolder.empty()) {
        saved = TargetFor(description.movie);
        RefuseOutputOntoMovie(saved, description.movie);
        for (const std::filesystem::path& other : options_.paths) {
            RefuseOutputOntoMovie(saved, other);
        }
        const bool isDevice = OutputFile::IsDevice(saved);
        session_.aaf().Save(description.file.get(), saved);
        // What is shown is what any reader of the saved file finds.
        shown = isDevice ? shown : session_.aaf().Open(saved);
    }
    ++described_;
    TellRoute(description.movie, session_.verbosity());
    if (host::system::IsStandardOutput(saved)) {
        return;  // what is shown would be in the midst of the file
    }
    const TreeNode tree = ReadTree(shown.get());
    if (options_.json) {
        nlohmann::ordered_json entry = {{"movie", MachinePath(description.movie)}};
        if (!saved.empty()) {
            entry["aaf"] = MachinePath(saved);
        }
        if (description.doubt) {
            AddProblem(description.doubt, entry);
        }
        AddRoute(description.movie, entry);
        entry["description"] = nlohmann::ordered_json::parse(ToJson(tree));
        json_.push_back(std::move(entry));
        return;
    }
    fmt::print("{}{}\n", DisplayPath(description.movie),
               saved.empty() ? "" : " -> " + DisplayPath(saved));
    if (!options_.quiet) {
        fmt::print("{}", ToReadableText(tree, 1));
    }
}

std::filesystem::path DescribeRun::TargetFor(const std::filesystem::path& movie) {
    if (!options_.aafFile.empty()) {
        return options_.aafFile;
    }
    // Movies of one name in different folders get numbers.
    for (int number = 1;; ++number) {
        std::filesystem::path name = movie.stem();
        name += number == 1 ? ".aaf" : fmt::format("-{}.aaf", number);
        const std::filesystem::path target = options_.outFolder / name;
        if (targetsTaken_.insert(target).second) {
            return target;
        }
    }
}

}  // namespace

void AddDescribe(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb =
        app.add_subcommand("describe", "Describe movies as AAF: show the mob tree and save it");
    verb->footer("Example: cliphost describe clip.mov --aaf clip.aaf");
    auto options = std::make_shared<DescribeOptions>();
    auto pinned = std::make_shared<std::string>();
    verb->add_option("paths", options->paths, "Movies and folders")->required();
    auto* const aaf = verb->add_option(
        "--aaf", options->aafFile, "Save the file of the only movie here; - for standard output");
    verb->add_option("--out-dir", options->outFolder, "Save every movie's file in this folder")
        ->excludes(aaf);
    verb->add_flag("--json", options->json, kJsonHelp);
    verb->add_flag("-q,--quiet", options->quiet, "Only a line for each movie");
    verb->add_option("--pin-time", *pinned,
                     "Time stamp of the saved files, such as 2026-01-31T12:00:00Z, so that the "
                     "same movie gives the same bytes");
    verb->callback([&session, &status, options, pinned] {
        AnswerFailureToo(options->json, nlohmann::ordered_json::array(), [&] {
            if (!options->aafFile.empty() &&
                (options->paths.size() != 1 || std::filesystem::is_directory(options->paths[0]))) {
                throw Failure(kExitCaller, "--aaf", "it takes one movie",
                              "use --out-dir for several");
            }
            if (options->json && host::system::IsStandardOutput(options->aafFile)) {
                throw Failure(kExitCaller, "--aaf", "standard output takes the JSON",
                              "name a file");
            }
            SessionOptions withTime = session;
            withTime.pinTime = *pinned;
            Session running(withTime);
            status = DescribeRun(running, *options).Run();
        });
    });
}

}  // namespace cliphost
