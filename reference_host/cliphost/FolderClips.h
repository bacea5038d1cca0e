// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <vector>

#include "host_interfaces/media/MediaVolume.h"
#include "reference_host/cliphost/PathList.h"
#include "reference_host/cliphost/Problem.h"
#include "reference_host/cliphost/Session.h"

namespace cliphost {

// One movie of the module's list.
struct FolderClip {
    ncfSInt32 index;  // in the module's list
    std::filesystem::path::string_type path;
};

// The movies of a folder in the order of their names; each is put together when it is asked for.
class ClipsByName {
public:
    // `paths` belong to these indices, one for one.
    ClipsByName() = default;
    ClipsByName(PathList paths, std::vector<ncfSInt32> indices);

    std::size_t size() const { return order_.size(); }
    FolderClip operator[](std::size_t place) const {
        const std::size_t row = order_[place];
        return {indices_[row], paths_[row]};
    }

    class Iterator {
    public:
        Iterator(const ClipsByName& clips, std::size_t place) : clips_(&clips), place_(place) {}
        FolderClip operator*() const { return (*clips_)[place_]; }
        Iterator& operator++() {
            ++place_;
            return *this;
        }
        bool operator!=(const Iterator& other) const { return place_ != other.place_; }

    private:
        const ClipsByName* clips_;
        std::size_t place_;
    };
    Iterator begin() const { return {*this, 0}; }
    Iterator end() const { return {*this, size()}; }

private:
    PathList paths_;
    std::vector<ncfSInt32> indices_;
    std::vector<std::uint32_t> order_;  // rows of the two above
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

    const ClipsByName& clips() const { return clips_; }
    const OtherMovies& others() const { return others_; }
    NMA::IAAFClips* list() const { return list_.get(); }
    // The module's list ends; what it said stays.
    void EndList() { list_.Reset(); }

private:
    OtherMovies others_;
    host::Ref<NMA::IAAFClips> list_;
    ClipsByName clips_;
};

}  // namespace cliphost
