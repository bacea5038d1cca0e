// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What both kinds of clip read from the picture while they load.

#include <cstring>

#include "host_interfaces/framework/HostSettings.h"
#include "source/clips/BaseClip.h"
#include "source/plugin/PluginLogSink.h"
#include "source/plugin/ResultChecks.h"

NCFRESULT BaseClip::LoadClipBase() {
    NCF_FUNCTION("BaseClip::LoadClipBase");
    ncfUInt32 dummyW = 0;
    ncfUInt32 dummyH = 0;
    NCF_RETURN(GetEncodedWidthAndHeight(&dummyW, &dummyH));
    NCF_RETURN(GetImageAspectRatio(&dummyW, &dummyH));
    NCF_RETURN(SetColorSpaceImpl());
    slog::Progress(ncfFunction) << "color_space: " << ColorSpaceToString(colorSpace_);
    NCF_RETURN(SetGeometryImpl());
    NCF_RETURN(SetFieldLayoutDetails());

    ncfUInt32 fourCC = 0;
    NCF_RETURN(GetDataFormat(&fourCC));
    std::memset(fourCC_, 0, sizeof fourCC_);
    std::memcpy(fourCC_, &fourCC, sizeof fourCC);

    // A host without settings leaves the default in force.
    NCFSmartPtr<NMA::IHostSettings> hostSettings;
    // clang-format off
    NCF_SKIP_TEXT(
        "componentFactory_->CreateComponent(NMA::Impl::CompID_HostSettings, NULL, NMA::IID_IHostSettings, (void**)&hostSettings)",
        ncfCreate(componentFactory_.inArg(), NMA::Impl::CompID_HostSettings, NMA::IID_IHostSettings, hostSettings));
    if (hostSettings) {
        NCF_SKIP(hostSettings->GetHostSettingBoolean(NMA::NMAHostSetting_IgnoreAlpha, NMA::IHostSettings::kUserScope, &ignoreAlpha_));
    }
    // clang-format on
    loaded_ = 1;
    return NCF_OK;
}
