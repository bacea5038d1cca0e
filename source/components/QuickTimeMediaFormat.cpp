// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/components/QuickTimeMediaFormat.h"

#include "host_interfaces/media/PluginComponents.h"
#include "source/components/HostServices.h"
#include "source/components/QuickTimeMasterClips.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {

NCFRESULT QuickTimeMediaFormat::InitializeInstance(INCFUnknown* host) {
    return ResultOf([&] {
        TakeComponentFactory(host, componentFactory_);
        return NCF_OK;
    });
}

NCFRESULT QuickTimeMediaFormat::InternalQueryInterface(const GUID& iid, void** out) {
    return QueryListedInterfaces<IMediaFormat>(this, iid, out);
}

NCFRESULT QuickTimeMediaFormat::GetAAFClips(IAAFClips** clips) {
    return ResultOf([&] {
        if (!clips) {
            return NCF_E_POINTER;
        }
        QuickTimeMasterClips& list = CreateOwnComponent<QuickTimeMasterClips>(
            componentFactory_.inArg(), CompID_QuickTimeMasterClips, IID_IAAFClips, clips);
        list.SetFolder(volumePath_);
        list.Scan();
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
