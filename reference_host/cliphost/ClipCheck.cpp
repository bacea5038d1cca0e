// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/ClipCheck.h"

#include <fmt/format.h>

#include <algorithm>
#include <set>
#include <unordered_map>

#include "reference_host/cliphost/FileAccess.h"
#include "reference_host/cliphost/MovieSearch.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

constexpr const char* kStateNames[kClipStates] = {"same", "moved", "unknown", "missing", "changed"};

std::string Quoted(const std::string& url) {
    return url.empty() ? "the locator is empty" : fmt::format("{} is not a file's URL", url);
}

}  // namespace

const char* NameOf(ClipState state) {
    return kStateNames[static_cast<std::size_t>(state)];
}

bool CheckedClip::HasContent() const {
    return std::any_of(places.begin(), places.end(),
                       [](const ClipPlace& place) { return place.hasContent; });
}

const ClipPlace* CheckedClip::Telling() const {
    const auto worst =
        std::max_element(places.begin(), places.end(),
                         [](const ClipPlace& a, const ClipPlace& b) { return a.state < b.state; });
    return worst == places.end() ? nullptr : &*worst;
}

CheckedClip ClipCheck::Place(AafClip clip) {
    CheckedClip placed;
    for (const std::string& url : clip.urls) {
        placed.places.push_back(PlaceOf(url));
    }
    placed.clip = std::move(clip);
    return placed;
}

ClipPlace ClipCheck::PlaceOf(const std::string& url) {
    ClipPlace place;
    place.url = url;
    std::string here = url;
    options_.maps.MapToThis(here);
    UrlPlace named;
    std::error_code error;
    if (!ReadFileUrl(here, named)) {
        place.reason = Quoted(url);
        return place;
    }
    const std::filesystem::path there = host::system::PathOfPlace(named.machine, named.path);
    // Where paths have no drives, a drive's name may still be a folder's.
    const bool isDriveElsewhere =
        named.machine.empty() && !there.has_root_name() && named.IgnoresCase();
    if (there.empty() || (isDriveElsewhere &&
                          !std::filesystem::exists(host::system::PathOfText(named.path), error))) {
        place.reason = "this is a place of another machine; say with --map where it is here";
        return place;
    }
    place.path = there;
    const auto status = std::filesystem::status(place.path, error);
    if (const Problem problem = WhyUnreadable(place.path)) {
        place.state = status.type() == std::filesystem::file_type::not_found ? ClipState::Missing
                                                                             : ClipState::Unknown;
        place.reason = problem.reason;
    }
    return place;
}

void ClipCheck::Check(const std::vector<CheckedClip*>& clips) {
    std::set<std::filesystem::path::string_type> known;
    std::vector<std::filesystem::path> movies;
    for (const CheckedClip* const clip : clips) {
        for (const ClipPlace& place : clip->places) {
            if (place.reason.empty() && known.insert(place.path.native()).second) {
                movies.push_back(place.path);
            }
        }
    }
    ReadMovieFacts(session_, options_.workers, std::move(movies), "verifying", facts_);
    for (CheckedClip* const clip : clips) {
        for (ClipPlace& place : clip->places) {
            Judge(clip->clip, place);
        }
    }
    if (!options_.search.empty()) {
        Search(clips);
    }
    for (CheckedClip* const clip : clips) {
        const auto isSame = [](const ClipPlace& place) { return place.state == ClipState::Same; };
        const auto same = std::count_if(clip->places.begin(), clip->places.end(), isSame);
        const ClipPlace* const worst = clip->Telling();
        if (same == static_cast<std::ptrdiff_t>(clip->places.size()) && same > 0) {
            clip->state = ClipState::Same;
        } else if (same > 0) {
            // A place that can't be checked tells nothing against the one that leads there.
            clip->state = worst->state == ClipState::Unknown ? ClipState::Same : ClipState::Moved;
        } else if (!clip->found.empty()) {
            clip->state = ClipState::Moved;
        } else {
            clip->state = worst               ? worst->state
                          : clip->clip.isOurs ? ClipState::Missing
                                              : ClipState::Unknown;
        }
    }
}

void ClipCheck::Judge(const AafClip& clip, ClipPlace& place) const {
    const auto movie = facts_.find(place.path.native());
    if (!place.reason.empty() || movie == facts_.end()) {
        return;
    }
    const MovieFacts& facts = movie->second;
    if (facts.problem) {
        place.reason = facts.problem.reason;
        return;
    }
    place.hasContent = KeyOf(facts.id) == KeyOf(clip.id);
    if (!place.hasContent) {
        place.state = clip.isOurs ? ClipState::Changed : ClipState::Unknown;
        place.reason = clip.isOurs ? "another movie is there, or its content has changed"
                                   : "another maker's clip does not tell which movie it is";
        return;
    }
    place.reason = DifferencesOf(clip.slots, facts.slots);
    place.state = place.reason.empty() ? ClipState::Same : ClipState::Changed;
}

void ClipCheck::Search(const std::vector<CheckedClip*>& clips) {
    std::unordered_map<std::string, std::vector<CheckedClip*>> sought;
    std::set<std::string> endings;
    for (CheckedClip* const clip : clips) {
        const bool isInPlace = !clip->places.empty() &&
                               std::all_of(clip->places.begin(), clip->places.end(),
                                           [](const ClipPlace& place) { return place.hasContent; });
        if (isInPlace || !clip->clip.isOurs) {
            continue;
        }
        sought[KeyOf(clip->clip.id)].push_back(clip);
        for (const ClipPlace& place : clip->places) {
            UrlPlace named;
            if (ReadFileUrl(place.url, named)) {
                endings.insert(SoughtEnding(host::system::PathOfText(named.path)));
            }
        }
    }
    const std::vector<std::filesystem::path> files = FilesIn(options_.search, endings);
    std::vector<std::filesystem::path> movies;
    for (const std::filesystem::path& file : files) {
        if (facts_.count(file.native()) == 0) {
            movies.push_back(file);
        }
    }
    ReadMovieFacts(session_, options_.workers, std::move(movies), "searching", facts_);
    for (const std::filesystem::path& file : files) {
        const auto facts = facts_.find(file.native());
        if (facts == facts_.end() || facts->second.problem) {
            ++unreadable_;
            continue;
        }
        const auto found = sought.find(KeyOf(facts->second.id));
        if (found != sought.end()) {
            for (CheckedClip* const clip : found->second) {
                const auto isThis = [&](const ClipPlace& place) { return place.path == file; };
                if (std::none_of(clip->places.begin(), clip->places.end(), isThis)) {
                    clip->found.push_back(file);
                }
            }
        }
    }
}

}  // namespace cliphost
