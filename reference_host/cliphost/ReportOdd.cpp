// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ReportOdd.h"

#include <cmath>
#include <map>
#include <nlohmann/json.hpp>
#include <set>
#include <string>

#include "reference_host/cliphost/ReportTraits.h"
#include "reference_host/util/text/Number.h"

namespace cliphost {
namespace {

using Json = nlohmann::ordered_json;
// Numbers of clips by what they have in common.
using Groups = std::map<std::string, Json>;

std::string TextOf(const Json& clip, const char* member) {
    return clip.value(member, std::string());
}

// Text that tells what a clip has; empty for one that does not count.
using Label = std::string (*)(const Json& clip);

bool HasPictures(const Json& clip) {
    return clip.contains("width");
}
// Of sound alone a clip's rate is that of the edit units in which its length is told.
std::string RateOf(const Json& clip) {
    return HasPictures(clip) ? TextOf(clip, "rate") : std::string();
}
// Sound has no colours, and where the header is not understood nobody knows what it tells of them.
std::string ColorsOf(const Json& clip) {
    const bool isHeaderKnown = clip.contains("hasTimecode");
    return !HasPictures(clip) || !isHeaderKnown ? std::string()
           : clip.contains("colors")            ? TextOf(clip, "colors")
                                                : "not told";
}
// Addresses are dropped of some 30 frames a second, or of several times as many. A rate is "30/1".
bool CanDrop(const std::string& rate) {
    const std::string_view text = rate;
    const std::size_t slash = text.find('/');
    double frames = 0;
    double seconds = 0;
    if (slash == std::string_view::npos || !host::text::ReadNumber(text.substr(0, slash), frames) ||
        !host::text::ReadNumber(text.substr(slash + 1), seconds) || seconds <= 0) {
        return false;
    }
    const double rounded = std::round(frames / seconds);
    return rounded > 0 && std::fmod(rounded, 30) == 0;
}
std::string CountingOf(const Json& clip) {
    return !clip.value("hasTimecode", false) || !CanDrop(TextOf(clip, "rate")) ? std::string()
           : clip.value("drop", false)                                         ? "drop-frame"
                                                                               : "non-drop";
}
std::string ContentOf(const Json& clip) {
    return TextOf(clip, "id");
}
std::string FailureOf(const Json& clip) {
    return clip.value("failed", false) ? "not described" : "";
}
std::string DoubtOf(const Json& clip) {
    if (!clip.value("failed", false) && clip.contains("warnings") && !clip["warnings"].empty()) {
        return TextOf(clip["warnings"][0], "kind") == "doubt" ? "the header tells something wrong"
                                                              : "a part can't be read";
    }
    return {};
}

Groups GroupedBy(const Json& clips, Label label) {
    Groups groups;
    for (std::size_t i = 0; i < clips.size(); ++i) {
        if (const std::string text = label(clips[i]); !text.empty()) {
            groups[text].push_back(i);
        }
    }
    return groups;
}

Groups GroupedByTrait(const Json& clips, const char* id) {
    Groups groups;
    for (std::size_t i = 0; i < clips.size(); ++i) {
        for (const Json& trait : clips[i]["traits"]) {
            if (trait["id"] == id) {
                Json& group = groups[TextOf(trait, "words")];
                if (group.empty() || group.back() != i) {
                    group.push_back(i);
                }
            }
        }
    }
    return groups;
}

// What makes groups odd.
enum class Odd {
    Several,  // there are several
    Copies,   // one holds several clips
    Any       // there is one
};
struct Finding {
    const char* id;
    const char* title;
    const char* words;  // what it means, and what helps
    Odd odd;
    Label label;  // null: the clips with the trait of this id
};
constexpr Finding kFindings[] = {
    {"failed", "Not described", "The clip's page says why, and what helps.", Odd::Any, FailureOf},
    {"doubt", "Described with doubts", "The clip's page says what could not be read.", Odd::Any,
     DoubtOf},
    {"copies", "Copies of one movie",
     "Their content is the same, so a bin has one clip for them, with several places.", Odd::Copies,
     ContentOf},
    {"rates", "Mixed rates", "A sequence has one rate; the others are converted in it.",
     Odd::Several, RateOf},
    {"colors", "Mixed colour labels",
     "Pictures of different labels look different beside each other until they are converted.",
     Odd::Several, ColorsOf},
    {"drop", "Drop and non-drop",
     "The same address is another moment in each; lists of edits may mean either.", Odd::Several,
     CountingOf},
    {trait::kNoTimecode, "No timecode", "They count from 00:00:00:00.", Odd::Any, nullptr},
    {trait::kNoSound, "No sound", "The movie has pictures alone.", Odd::Any, nullptr},
    {trait::kSilent, "Silent sound", "There are sound tracks, but nothing is heard.", Odd::Any,
     nullptr},
    {trait::kVariableRate, "Variable rate",
     "Pictures last for different times, as phones and screen recorders make them; programs that "
     "edit want one rate.",
     Odd::Any, nullptr},
    {trait::kRotated, "Rotated or mirrored",
     "Pictures are stored another way up than they are shown, and an AAF file does not tell.",
     Odd::Any, nullptr},
    {trait::kPixelAspect, "Pixels that are not square",
     "A program that passes over the shape shows the picture too wide or too narrow.", Odd::Any,
     nullptr},
    {trait::kEdits, "Edit lists",
     "The movie plays another part of its media than all of it from the beginning.", Odd::Any,
     nullptr},
    {trait::kNotInterleaved, "Poorly interleaved",
     "Playing from slow disks or networks may stutter.", Odd::Any, nullptr},
    {trait::kProvider, "Media that is not read from the file itself",
     "The module decodes it for the host, which takes longer than reading.", Odd::Any, nullptr},
};

// A movie that is named several times is no copy of itself.
Json OncePerPath(const Json& clips, const Json& numbers) {
    std::set<std::string> paths;
    Json once = Json::array();
    for (const Json& number : numbers) {
        if (paths.insert(TextOf(clips[number.get<std::size_t>()], "path")).second) {
            once.push_back(number);
        }
    }
    return once;
}

bool IsOdd(const Json& clips, const Finding& finding, Groups& groups) {
    if (finding.odd == Odd::Copies) {
        for (auto group = groups.begin(); group != groups.end();) {
            group->second = OncePerPath(clips, group->second);
            group = group->second.size() > 1 ? std::next(group) : groups.erase(group);
        }
    }
    return groups.size() >= (finding.odd == Odd::Several ? 2 : 1);
}

}  // namespace

Json OddThings(const Json& clips) {
    Json found = Json::array();
    for (const Finding& finding : kFindings) {
        Groups groups =
            finding.label ? GroupedBy(clips, finding.label) : GroupedByTrait(clips, finding.id);
        if (!IsOdd(clips, finding, groups)) {
            continue;
        }
        Json list = Json::array();
        for (auto& [label, numbers] : groups) {
            list.push_back({{"label", label}, {"clips", std::move(numbers)}});
        }
        found.push_back({{"id", finding.id},
                         {"title", finding.title},
                         {"words", finding.words},
                         {"groups", std::move(list)}});
    }
    return found;
}

}  // namespace cliphost
