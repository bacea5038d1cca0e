// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/QuickTimeMediaVolume.h"

#include "host_interfaces/media/PluginComponents.h"
#include "host_interfaces/util/NMAVolume.h"
#include "source/components/HostServices.h"
#include "source/components/MoviePattern.h"
#include "source/components/QuickTimeMediaFormat.h"
#include "source/components/QuickTimeVolumeInfo.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

// A path that the host has to give.
INCFString* Needed(INCFString* path) {
    if (!path) {
        ThrowIfFailed(NCF_E_POINTER);
    }
    return path;
}

}  // namespace

NCFRESULT QuickTimeMediaVolume::InitializeInstance(INCFUnknown* host) {
    return ResultOf([&] {
        TakeComponentFactory(host, componentFactory_);
        return NCF_OK;
    });
}

NCFRESULT QuickTimeMediaVolume::InternalQueryInterface(const GUID& iid, void** out) {
    return QueryListedInterfaces<IMediaVolume>(this, iid, out);
}

// The first match claims the folder, whatever is in it.
NCFRESULT QuickTimeMediaVolume::IsMediaVolume(INCFString* path) {
    try {
        NMAVolume volume(path);
        void* handle = nullptr;
        INCFString* const file = volume.GetFirstFile(kMoviePattern, handle);
        if (!file) {
            return 0;
        }
        file->Release();
        return 1;
    } catch (...) {
        return 0;
    }
}

NCFRESULT QuickTimeMediaVolume::GetVolumeInfo(INCFString* path, IVolumeInfo** info) {
    if (!info) {
        return NCF_E_INVALIDARG;
    }
    return ResultOf([&] {
        CreateOwnComponent<QuickTimeVolumeInfo>(componentFactory_.inArg(),
                                                CompID_QuickTimeVolumeInfo, IID_IVolumeInfo, info)
            .SetVolumePath(Needed(path));
        return NCF_OK;
    });
}

NCFRESULT QuickTimeMediaVolume::GetMediaFormat(INCFString* path, IMediaFormat** format) {
    if (!format) {
        return NCF_E_INVALIDARG;
    }
    return ResultOf([&] {
        CreateOwnComponent<QuickTimeMediaFormat>(
            componentFactory_.inArg(), CompID_QuickTimeMediaFormat, IID_IMediaFormat, format)
            .SetVolumePath(Needed(path));
        return NCF_OK;
    });
}

NCFRESULT QuickTimeMediaVolume::GetContainerComponentId(GUID* id) {
    if (!id) {
        return NCF_E_INVALIDARG;
    }
    *id = CompID_QuickTimeContainer;
    return NCF_OK;
}

}  // namespace NMA::Impl
