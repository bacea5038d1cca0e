// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/chrono.h>

#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/media/PluginComponents.h"
#include "reference_host/cliphost/FolderClips.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/PathOption.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/util/text/HostText.h"
#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

struct FolderFacts {
    bool claimed = false;
    std::string name;
    ncfUInt32 newest = 0;
    std::vector<std::filesystem::path> movies;
    OtherMovies others;
};

FolderFacts Scan(Session& session, const std::filesystem::path& folder) {
    const auto path = PathForModule(folder);
    FolderFacts facts;
    facts.claimed = IsClaimed(session, path.get());
    const auto info = VolumeInfoOf(session, path.get());
    host::Ref<INCFString> name;
    host::Ref<NMA::IVolumeInfo2> info2;
    if (info->QueryInterface(NMA::IID_IVolumeInfo2, reinterpret_cast<void**>(info2.Out())) >= 0 &&
        info2->GetVolumeName(name.Out()) >= 0) {
        facts.name = host::text::ReadUtf8(name.get());
    }
    info->GetModificationDate(&facts.newest);
    const FolderClips clips(session, folder);
    for (const FolderClip& clip : clips.clips()) {
        facts.movies.push_back(clip.path);
    }
    facts.others = clips.others();
    return facts;
}

nlohmann::ordered_json ToJson(const FolderFacts& facts) {
    const auto list = [](const std::vector<std::filesystem::path>& movies) {
        nlohmann::ordered_json paths = nlohmann::ordered_json::array();
        for (const std::filesystem::path& movie : movies) {
            paths.push_back(MachinePath(movie));
        }
        return paths;
    };
    std::vector<std::filesystem::path> noFiles;
    for (const Problem& one : facts.others.noFiles) {
        noFiles.push_back(one.subject);
    }
    return {{"claimed", facts.claimed},
            {"name", facts.name},
            {"newest", facts.newest},
            {"movies", list(facts.movies)},
            {"otherEnding", list(facts.others.otherEnding)},
            {"withBackslash", list(facts.others.withBackslash)},
            {"noFiles", list(noFiles)}};
}

void Print(const FolderFacts& facts) {
    fmt::print("claimed: {}, newest movie from {:%Y-%m-%dT%H:%M:%SZ}\n",
               host::text::Printable(facts.name), fmt::gmtime(std::time_t{facts.newest}));
    for (const std::filesystem::path& movie : facts.movies) {
        fmt::print("  {}\n", host::DisplayPath(movie));
    }
    fmt::print("{}\n", Counted(facts.movies.size(), "movie"));
}

// Whether the module claims a folder, and what it lists; a movie that can't be
// named to it is refused as one on the command line is.
int ShowFolder(Session& session, const std::filesystem::path& folder, bool json) {
    const FolderFacts facts = Scan(session, folder);
    const Problem problem = facts.claimed ? LeftOut(folder, facts.others) : NotClaimed(folder);
    if (json) {
        nlohmann::ordered_json answer = ToJson(facts);
        AddProblem(problem, answer);
        PrintJson(schema::kScan, std::move(answer));
    } else if (facts.claimed) {
        Print(facts);
    }
    if (problem) {
        TellProblem(problem, session.verbosity());
    }
    for (const std::filesystem::path& movie : facts.others.withBackslash) {
        TellProblem(BackslashProblem(movie), session.verbosity());
    }
    for (const Problem& one : facts.others.noFiles) {
        if (facts.claimed) {
            TellProblem(one, session.verbosity());
        }
    }
    const bool allCanBeNamed = facts.others.withBackslash.empty() && facts.others.noFiles.empty();
    return !facts.claimed ? kExitFile : allCanBeNamed ? kExitFine : kExitCaller;
}

}  // namespace

void AddScan(CLI::App& app, const SessionOptions& options, int& status) {
    auto* const verb = app.add_subcommand(
        "scan", "Ask the module whether it claims a folder, and list its movies");
    verb->footer(
        "Examples:\n"
        "  cliphost scan ~/Videos\n"
        "  cliphost scan ~/Videos --json");
    auto folder = std::make_shared<std::filesystem::path>();
    auto json = std::make_shared<bool>(false);
    AddPath(*verb, "folder", *folder, "The folder")->required();
    verb->add_flag("--json", *json, kJsonHelp);
    verb->callback([&options, &status, folder, json] {
        AnswerFailureToo(*json, schema::kScan, {{"folder", MachinePath(*folder)}}, [&] {
            PathForModule(*folder);  // that it is there, and can be named
            std::error_code ignored;
            if (!std::filesystem::is_directory(*folder, ignored)) {
                throw Failure(kExitCaller, *folder, "is not a folder",
                              "`cliphost describe` takes single movies");
            }
            Session session(options);
            status = ShowFolder(session, *folder, *json);
        });
    });
}

}  // namespace cliphost
