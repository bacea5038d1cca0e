// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/FolderClips.h"

#include <algorithm>

#include "host_interfaces/media/PluginComponents.h"
#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/ResultText.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

void Check(NCFRESULT result, const char* what) {
    if (result < 0) {
        throw Failure(kExitFile, Problem{{}, what, {}, result});
    }
}

host::Ref<NMA::IMediaVolume> Volume(Session& session) {
    host::Ref<NMA::IMediaVolume> volume;
    Check(session.host().Create(NMA::CompID_QuickTimeMediaVolume, volume),
          "the module makes no media volume");
    return volume;
}

}  // namespace

bool IsClaimed(Session& session, INCFString* folder) {
    return Volume(session)->IsMediaVolume(folder) == 1;
}

host::Ref<NMA::IVolumeInfo> VolumeInfoOf(Session& session, INCFString* folder) {
    host::Ref<NMA::IVolumeInfo> info;
    Check(Volume(session)->GetVolumeInfo(folder, info.Out()), "no information on the volume");
    return info;
}

FolderClips::FolderClips(Session& session, INCFString* folder) {
    host::Ref<NMA::IMediaFormat> format;
    Check(Volume(session)->GetMediaFormat(folder, format.Out()), "no media format");
    Check(format->GetAAFClips(list_.Out()), "no list of movies");
    const ncfSInt32 count = list_->GetCount();
    for (ncfSInt32 i = 0; i < count; ++i) {
        const auto path = host::MakeString(std::string_view());
        FolderClip clip{i, {}};
        Check(list_->GetClipPath(i, path.get()), "no path of a movie");
        Check(host::PathFrom(path.get(), clip.path), "a path that no file can have");
        clips_.push_back(clip);
    }
    std::sort(clips_.begin(), clips_.end(),
              [](const FolderClip& a, const FolderClip& b) { return a.path < b.path; });
}

}  // namespace cliphost
