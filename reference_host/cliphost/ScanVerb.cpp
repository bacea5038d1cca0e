// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include <fmt/format.h>

#include <ctime>

#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/media/PluginComponents.h"
#include "reference_host/cliphost/FolderClips.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/Verbs.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/util/text/HostText.h"

namespace cliphost {
namespace {

std::string DateText(ncfUInt32 seconds) {
    const std::time_t time = seconds;
    char text[32] = {};
    struct tm utc {};
    gmtime_r(&time, &utc);
    std::strftime(text, sizeof text, "%Y-%m-%dT%H:%M:%SZ", &utc);
    return text;
}

struct FolderFacts {
    bool claimed = false;
    std::string name;
    ncfUInt32 newest = 0;
    std::vector<std::filesystem::path> movies;
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
    const FolderClips clips(session, path.get());
    for (const FolderClip& clip : clips.clips()) {
        facts.movies.push_back(clip.path);
    }
    return facts;
}

nlohmann::ordered_json ToJson(const FolderFacts& facts) {
    nlohmann::ordered_json movies = nlohmann::ordered_json::array();
    for (const std::filesystem::path& movie : facts.movies) {
        movies.push_back(MachinePath(movie));
    }
    return {{"claimed", facts.claimed},
            {"name", facts.name},
            {"newest", facts.newest},
            {"movies", std::move(movies)}};
}

}  // namespace

void AddScan(CLI::App& app, const SessionOptions& options, int& status) {
    auto* const verb = app.add_subcommand(
        "scan", "Ask the module whether it claims a folder, and list its movies");
    verb->footer("Example: cliphost scan ~/Videos");
    auto folder = std::make_shared<std::filesystem::path>();
    auto json = std::make_shared<bool>(false);
    verb->add_option("folder", *folder, "The folder")->required();
    verb->add_flag("--json", *json, kJsonHelp);
    verb->callback([&options, &status, folder, json] {
        if (!std::filesystem::is_directory(*folder)) {
            throw Failure(kExitCaller, *folder, "is no folder",
                          "`cliphost describe` takes single movies");
        }
        Session session(options);
        const FolderFacts facts = Scan(session, *folder);
        status = facts.claimed ? kExitFine : kExitFile;
        if (*json) {
            PrintJson(ToJson(facts));
            return;
        }
        if (!facts.claimed) {
            fmt::print("{}: not claimed: no file there is named *.mov\n",
                       host::DisplayPath(*folder));
            return;
        }
        fmt::print("claimed: {}, newest movie of {}\n", facts.name, DateText(facts.newest));
        for (const std::filesystem::path& movie : facts.movies) {
            fmt::print("  {}\n", host::DisplayPath(movie));
        }
        fmt::print("{} movies\n", facts.movies.size());
    });
}

}  // namespace cliphost
