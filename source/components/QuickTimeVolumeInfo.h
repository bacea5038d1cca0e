// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/util/NMAString.h"
#include "source/plugin/CNCFUnknown.h"

namespace NMA::Impl {

// Identity and modification date of a claimed folder. The path is set by the
// volume that made it.
class QuickTimeVolumeInfo final : public CNCFComponent<IVolumeInfo2> {
public:
    explicit QuickTimeVolumeInfo(INCFUnknown* outer) : CNCFComponent(outer) {}

    NCFRESULT InternalQueryInterface(const GUID& iid, void** out) override;

    NCFRESULT GetSerialNumber(ncfUInt32* serial) override;
    NCFRESULT GetLabel(INCFString** label) override;
    NCFRESULT GetType(ncfUInt32* type) override;
    NCFRESULT GetModificationDate(ncfUInt32* date) override;
    NCFRESULT VolumeQueryA(void* out) override;
    NCFRESULT VolumeQueryB() override;
    NCFRESULT VolumeQueryC() override;
    NCFRESULT VolumeQueryD() override;
    NCFRESULT GetVolumeName(INCFString** name) override;

    void SetVolumePath(INCFString* path) { volumePath_ = NMAString(path, kNCFUTF16); }

private:
    NMAString volumePath_;
};

}  // namespace NMA::Impl
