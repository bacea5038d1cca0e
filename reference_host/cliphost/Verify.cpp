// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/Verify.h"

#include <fmt/format.h>

#include <algorithm>
#include <list>

#include "reference_host/cliphost/AafValue.h"
#include "reference_host/cliphost/JsonAnswer.h"
#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/cliphost/MapOption.h"
#include "reference_host/cliphost/Words.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/util/text/Printable.h"

namespace cliphost {
namespace {

using nlohmann::ordered_json;

struct CheckedFile {
    std::filesystem::path aaf;
    Problem problem;  // it can't be read
    std::list<CheckedClip> clips;
};

struct Tally {
    std::size_t clips = 0;
    std::size_t states[kClipStates] = {};
    std::size_t badFiles = 0;
};

// How places are named to people: paths where they are on this machine.
std::string Named(const ClipPlace& place) {
    return place.path.empty() ? host::text::PrintableLines(place.url)
                              : host::DisplayPath(place.path);
}

void PrintClip(const CheckedClip& checked) {
    const auto same =
        std::find_if(checked.places.begin(), checked.places.end(),
                     [](const ClipPlace& one) { return one.state == ClipState::Same; });
    const ClipPlace* const telling = checked.Telling();
    std::string line = fmt::format("{}: {}: ", host::text::PrintableLines(checked.clip.name),
                                   NameOf(checked.state));
    if (checked.state == ClipState::Same && telling != &*same) {
        line += Named(*same) + "; ";
    }
    line += telling ? Named(*telling) : "it names no place";
    if (telling && !telling->reason.empty()) {
        line += ": " + host::text::PrintableLines(telling->reason);
    }
    if (checked.state == ClipState::Moved) {
        line += checked.found.empty() ? "; it is at " + Named(*same)
                                      : " -> " + host::DisplayPath(checked.found.front());
    }
    fmt::print("{}\n", line);
}

ordered_json TextOrNothing(const std::string& text) {
    return text.empty() ? ordered_json() : ordered_json(text);
}

ordered_json JsonOf(const CheckedClip& checked) {
    ordered_json clip = {{"name", checked.clip.name},
                         {"id", ToText(checked.clip.id)},
                         {"state", NameOf(checked.state)},
                         {"places", ordered_json::array()}};
    for (const ClipPlace& place : checked.places) {
        clip["places"].push_back(
            {{"url", place.url},
             {"path", TextOrNothing(place.path.empty() ? "" : MachinePath(place.path))},
             {"state", NameOf(place.state)},
             {"reason", TextOrNothing(place.reason)}});
    }
    clip["found"] = ordered_json::array();
    for (const std::filesystem::path& path : checked.found) {
        clip["found"].push_back(MachinePath(path));
    }
    return clip;
}

ordered_json JsonOf(const CheckedFile& file) {
    ordered_json json = {{"aaf", MachinePath(file.aaf)}};
    if (file.problem) {
        AddProblem(file.problem, json);
    }
    json["clips"] = ordered_json::array();
    for (const CheckedClip& clip : file.clips) {
        json["clips"].push_back(JsonOf(clip));
    }
    return json;
}

std::string Summary(const Tally& tally) {
    std::string text = Counted(tally.clips, "clip");
    const char* before = ": ";
    for (std::size_t state = 0; state < kClipStates; ++state) {
        if (tally.states[state] > 0) {
            text += fmt::format("{}{} {}", before, tally.states[state],
                                NameOf(static_cast<ClipState>(state)));
            before = ", ";
        }
    }
    if (tally.badFiles > 0) {
        text += fmt::format("; {} can't be read", Counted(tally.badFiles, "AAF file"));
    }
    return text;
}

ordered_json JsonOf(const Tally& tally) {
    ordered_json counts = {{"clips", tally.clips}};
    for (std::size_t state = 0; state < kClipStates; ++state) {
        counts[NameOf(static_cast<ClipState>(state))] = tally.states[state];
    }
    counts["unreadableFiles"] = tally.badFiles;
    return counts;
}

// Nobody can tell of another maker's clip whether its movie is the one; of ours, somebody should
// look.
bool IsFinding(const CheckedClip& clip) {
    return clip.state != ClipState::Same && (clip.clip.isOurs || clip.state != ClipState::Unknown);
}

}  // namespace

int Verify(Session& session, VerifyOptions& options) {
    int status = kExitFine;
    const auto tell = [&](const Failure& failure) {
        status = std::max(status, failure.status());
        TellProblem(failure.problem(), session.verbosity());
    };
    ClipCheck check(session, options.check);
    std::list<CheckedFile> files;
    std::vector<CheckedClip*> clips;
    for (const std::filesystem::path& path : options.files) {
        CheckedFile& file = files.emplace_back();
        file.aaf = path;
        try {
            for (AafClip& clip : ClipsOf(session.aaf().Open(path).get())) {
                clips.push_back(&file.clips.emplace_back(check.Place(std::move(clip))));
            }
        } catch (const Failure& failure) {
            file.problem = failure.problem();
            tell(failure);
        }
    }
    check.Check(clips);

    Tally tally;
    ordered_json answer = {{"files", ordered_json::array()}};
    for (const CheckedFile& file : files) {
        tally.badFiles += file.problem ? 1 : 0;
        if (options.json) {
            answer["files"].push_back(JsonOf(file));
        } else if (files.size() > 1 && !file.problem) {
            fmt::print("{}\n", host::DisplayPath(file.aaf));
        }
        for (const CheckedClip& clip : file.clips) {
            ++tally.clips;
            ++tally.states[static_cast<std::size_t>(clip.state)];
            status = std::max(status, IsFinding(clip) ? kExitFile : kExitFine);
            if (!options.json) {
                PrintClip(clip);
            }
        }
    }
    if (!clips.empty()) {
        for (const Failure& unused :
             UnusedMaps(options.check.maps, "give TO as the locators in the file begin")) {
            tell(unused);
        }
    }
    if (options.json) {
        answer["counts"] = JsonOf(tally);
        PrintJson(schema::kVerify, std::move(answer));
    } else {
        fmt::print("{}\n", Summary(tally));
    }
    return status;
}

}  // namespace cliphost
