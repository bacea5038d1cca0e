// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "reference_host/cliphost/AafClips.h"
#include "reference_host/cliphost/MovieFacts.h"
#include "reference_host/cliphost/PathMaps.h"

namespace cliphost {

// What became of a movie that a file describes; the worst comes last.
enum class ClipState {
    Same,     // it is there
    Moved,    // it is elsewhere
    Unknown,  // nobody can tell
    Missing,  // no file is there
    Changed,  // another movie is there, or it is described otherwise now
};
inline constexpr std::size_t kClipStates = 5;
const char* NameOf(ClipState state);

// One place that a clip names.
struct ClipPlace {
    std::string url;
    std::filesystem::path path;  // on this machine; empty where it names none
    ClipState state = ClipState::Unknown;
    std::string reason;       // empty for Same
    bool hasContent = false;  // the movie there is the one that was described
};

struct CheckedClip {
    AafClip clip;
    std::vector<ClipPlace> places;
    std::vector<std::filesystem::path> found;  // movies of its content elsewhere in the folders
    ClipState state = ClipState::Unknown;

    bool HasContent() const;
    // The place that decides the state.
    const ClipPlace* Telling() const;
};

// Where clips are looked for, and how.
struct CheckOptions {
    PathMaps maps;
    std::vector<std::filesystem::path> search;  // folders
    WorkerCall workers;
};

// Compares clips with the movies that they name.
class ClipCheck {
public:
    ClipCheck(Session& session, CheckOptions& options) : session_(session), options_(options) {}

    // Tells where a clip names its media; Check tells more.
    CheckedClip Place(AafClip clip);
    // Describes the movies there, and those in the folders where a clip's is not in its place; each
    // movie once.
    void Check(const std::vector<CheckedClip*>& clips);
    // All that were described, or tried.
    const FactsOfMovies& movies() const { return facts_; }
    // Files in the folders that the module describes as no movie.
    std::size_t unreadable() const { return unreadable_; }

private:
    ClipPlace PlaceOf(const std::string& url);
    void Judge(const AafClip& clip, ClipPlace& place) const;
    void Search(const std::vector<CheckedClip*>& clips);

    Session& session_;
    CheckOptions& options_;
    FactsOfMovies facts_;
    std::size_t unreadable_ = 0;
};

}  // namespace cliphost
