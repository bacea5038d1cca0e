// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <vector>

#include "host_interfaces/media/MediaVolume.h"
#include "reference_host/cliphost/Session.h"

namespace cliphost {

// One movie of the module's list.
struct FolderClip {
    ncfSInt32 index;  // in the module's list
    std::filesystem::path path;
};

// Whether the module claims a folder.
bool IsClaimed(Session& session, INCFString* folder);
// What the module says of a folder. Throws a Failure.
host::Ref<NMA::IVolumeInfo> VolumeInfoOf(Session& session, INCFString* folder);

// The module's list of a folder's movies, in the order of their names; the
// module keeps that of the file system.
class FolderClips {
public:
    FolderClips(Session& session, INCFString* folder);  // throws a Failure

    const std::vector<FolderClip>& clips() const { return clips_; }
    NMA::IAAFClips* list() const { return list_.get(); }

private:
    host::Ref<NMA::IAAFClips> list_;
    std::vector<FolderClip> clips_;
};

}  // namespace cliphost
