// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/media/MediaVolume.h"
#include "host_interfaces/util/NMAString.h"
#include "source/plugin/CNCFUnknown.h"
#include "source/plugin/NCFSmartPtr.h"

namespace NMA::Impl {

// What a claimed folder offers: the list of its movies. The path is set by the
// volume that made it; one that was never set scans the empty path.
class QuickTimeMediaFormat final : public CNCFComponent<IMediaFormat> {
public:
    explicit QuickTimeMediaFormat(INCFUnknown* outer) : CNCFComponent(outer) {}

    NCFRESULT InitializeInstance(INCFUnknown* host) override;
    NCFRESULT InternalQueryInterface(const GUID& iid, void** out) override;

    ncfBool FormatFlagA() override { return 1; }
    ncfBool FormatFlagB() override { return 0; }
    ncfBool FormatFlagC() override { return 0; }
    ncfBool FormatFlagD() override { return 1; }
    NCFRESULT FormatUnsupportedA(void*) override { return NCF_E_FAIL; }
    NCFRESULT FormatUnsupportedB(void*) override { return NCF_E_FAIL; }
    NCFRESULT GetAAFClips(IAAFClips** clips) override;

    void SetVolumePath(INCFString* path) { volumePath_ = NMAString(path, kNCFUTF16); }

private:
    NCFSmartPtr<INCFComponentFactory> componentFactory_;
    NMAString volumePath_;
};

}  // namespace NMA::Impl
