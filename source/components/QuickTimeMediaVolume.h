// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/media/MediaVolume.h"
#include "source/plugin/CNCFUnknown.h"
#include "source/plugin/NCFSmartPtr.h"

namespace NMA::Impl {

// Claims the folders that hold a movie and hands out the objects that describe
// them. Keeps no state of a folder.
class QuickTimeMediaVolume final : public CNCFComponent<IMediaVolume> {
public:
    explicit QuickTimeMediaVolume(INCFUnknown* outer) : CNCFComponent(outer) {}

    NCFRESULT InitializeInstance(INCFUnknown* host) override;
    NCFRESULT InternalQueryInterface(const GUID& iid, void** out) override;

    NCFRESULT IsMediaVolume(INCFString* path) override;
    NCFRESULT GetVolumeInfo(INCFString* path, IVolumeInfo** info) override;
    NCFRESULT GetMediaFormat(INCFString* path, IMediaFormat** format) override;
    NCFRESULT GetContainerComponentId(GUID* id) override;

private:
    NCFSmartPtr<INCFComponentFactory> componentFactory_;
};

}  // namespace NMA::Impl
