// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include <map>
#include <nlohmann/json.hpp>

#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/FolderClips.h"
#include "reference_host/cliphost/Progress.h"
#include "reference_host/cliphost/ResultText.h"
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

// Describes all that the command line names; one bad movie stops nothing.
class DescribeRun {
public:
    DescribeRun(Session& session, const DescribeOptions& options)
        : session_(session), options_(options) {}

    int Run();

private:
    void DescribeFolder(const std::filesystem::path& folder);
    void Take(const Description& description);
    std::filesystem::path TargetFor(const std::filesystem::path& movie);

    Session& session_;
    const DescribeOptions& options_;
    std::map<std::string, int> namesTaken_;
    nlohmann::ordered_json json_ = nlohmann::ordered_json::array();
    int described_ = 0;
    int failed_ = 0;
};

int DescribeRun::Run() {
    if (!options_.outFolder.empty()) {
        std::filesystem::create_directories(options_.outFolder);
    }
    for (const std::filesystem::path& path : options_.paths) {
        if (std::filesystem::is_directory(path)) {
            DescribeFolder(path);
        } else {
            Take(DescribeMovie(session_, path));
        }
    }
    if (options_.json) {
        fmt::print("{}\n", json_.dump(2, ' ', false, nlohmann::json::error_handler_t::replace));
    } else if (described_ + failed_ != 1) {
        fmt::print("{} described, {} not\n", described_, failed_);
    }
    return failed_ == 0 ? kExitFine : kExitFile;
}

void DescribeRun::DescribeFolder(const std::filesystem::path& folder) {
    const auto path = PathForModule(folder);
    if (!IsClaimed(session_, path.get())) {
        fmt::print(stderr, "cliphost: {}: not claimed: no file there is named *.mov\n",
                   DisplayPath(folder));
        ++failed_;
        return;
    }
    const FolderClips clips(session_, path.get());
    Progress progress("describing", clips.clips().size());
    for (const FolderClip& clip : clips.clips()) {
        progress.Step(DisplayPath(clip.path.filename()));
        Take(DescribeFromList(session_, clips.list(), clip.index, clip.path));
    }
}

void DescribeRun::Take(const Description& description) {
    if (!description.file) {
        ++failed_;
        fmt::print(stderr, "cliphost: {}\n", description.problem);
        if (options_.json) {
            json_.push_back({{"movie", DisplayPath(description.movie)},
                             {"result", ResultName(description.result)},
                             {"problem", description.problem}});
        }
        return;
    }
    std::filesystem::path saved;
    AafRef<IAAFFile> shown = description.file;
    if (!options_.aafFile.empty() || !options_.outFolder.empty()) {
        saved = TargetFor(description.movie);
        session_.aaf().Save(description.file.get(), saved);
        // What is shown is what any reader of the saved file finds.
        shown = session_.aaf().Open(saved);
    }
    ++described_;
    const TreeNode tree = ReadTree(shown.get());
    if (options_.json) {
        nlohmann::ordered_json entry = {{"movie", DisplayPath(description.movie)}};
        if (!saved.empty()) {
            entry["aaf"] = DisplayPath(saved);
        }
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
    std::filesystem::path name = movie.stem();
    const int number = ++namesTaken_[name.string()];
    if (number > 1) {
        name += fmt::format("-{}", number);
    }
    name += ".aaf";
    return options_.outFolder / name;
}

}  // namespace

void AddDescribe(CLI::App& app, const SessionOptions& session, int& status) {
    auto* const verb =
        app.add_subcommand("describe", "Describe movies as AAF: show the mob tree and save it");
    verb->footer("Example: cliphost describe clip.mov --aaf clip.aaf");
    auto options = std::make_shared<DescribeOptions>();
    auto pinned = std::make_shared<std::string>();
    verb->add_option("paths", options->paths, "Movies and folders")->required();
    auto* const aaf = verb->add_option("--aaf", options->aafFile, "Save the one movie's file here");
    verb->add_option("--out-dir", options->outFolder, "Save every movie's file in this folder")
        ->excludes(aaf);
    verb->add_flag("--json", options->json, "As JSON");
    verb->add_flag("-q,--quiet", options->quiet, "Only a line for each movie");
    verb->add_option("--pin-time", *pinned,
                     "Time stamp of the saved files, such as 2026-01-31T12:00:00Z, so that the "
                     "same movie gives the same bytes");
    verb->callback([&session, &status, options, pinned] {
        if (!options->aafFile.empty() &&
            (options->paths.size() != 1 || std::filesystem::is_directory(options->paths[0]))) {
            throw Failure(kExitCaller, "--aaf takes one movie; use --out-dir for several");
        }
        SessionOptions withTime = session;
        withTime.pinTime = *pinned;
        Session running(withTime);
        status = DescribeRun(running, *options).Run();
    });
}

}  // namespace cliphost
