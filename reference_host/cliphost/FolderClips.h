// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <vector>

#include "host_interfaces/media/MediaVolume.h"
#include "reference_host/cliphost/Problem.h"
#include "reference_host/cliphost/Session.h"

namespace cliphost {

// One movie of the module's list.
struct FolderClip {
    ncfSInt32 index;  // in the module's list
    // A path takes five times the memory of its text, and a folder may hold 100,000 movies.
    std::filesystem::path::string_type path;
};

// Movies of a folder that the module's list lacks, each kind by name.
struct OtherMovies {
    // Their ending is that of a movie, but not the ".mov" that the module wants.
    std::vector<std::filesystem::path> otherEnding;
    // They can't be named to the module.
    std::vector<std::filesystem::path> withBackslash;
    // They lead to no file: links that end nowhere, pipes and the like, each with
    // the reason.
    std::vector<Problem> noFiles;
};
// Throws a Failure for a folder that can't be read.
OtherMovies FindOtherMovies(const std::filesystem::path& folder);

// Why the module does not claim a folder, and how its movies are described all
// the same. Throws a Failure for a folder that can't be read.
Problem NotClaimed(const std::filesystem::path& folder);
// That movies of another ending are left out of a list; none where there are
// none.
Problem LeftOut(const std::filesystem::path& folder, const OtherMovies& others);

// Whether the module claims a folder.
bool IsClaimed(Session& session, INCFString* folder);
// What the module says of a folder. Throws a Failure.
host::Ref<NMA::IVolumeInfo> VolumeInfoOf(Session& session, INCFString* folder);

// The module's list of a folder's movies, in the order of their names; the
// module keeps that of the file system. A movie with a backslash in its name
// comes out of the list as another path, so it is none of the clips.
class FolderClips {
public:
    FolderClips(Session& session, const std::filesystem::path& folder);  // throws a Failure

    const std::vector<FolderClip>& clips() const { return clips_; }
    const OtherMovies& others() const { return others_; }
    NMA::IAAFClips* list() const { return list_.get(); }

private:
    OtherMovies others_;
    host::Ref<NMA::IAAFClips> list_;
    std::vector<FolderClip> clips_;
};

}  // namespace cliphost
