// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/EditorSettingsReader.h"

#include <cstring>

#include "host_interfaces/framework/EditorSettings.h"
#include "source/plugin/NCFSmartPtr.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::Impl {
namespace {

constexpr char kDurationKey[] = "MovieDurationCalc";

bool ReadRates(INCFNMAEditorSettings& host, EditorSettings& settings) {
    return host.GetEditorFrameRate(&settings._editorFrameRate, &settings._reservedSettingA,
                                   &settings._reservedSettingB) == NCF_OK &&
           host.GetForcedFrameRate(&settings._forcedFrameRateEnabled, &settings._forcedFrameRate) ==
               NCF_OK &&
           host.GetSingleFrameDuration(&settings._singleFrameDuration) == NCF_OK;
}

bool IsMovieHeaderWanted(INCFNMAEditorSettings& host) {
    ncfUTF8 key[256] = {};
    std::memcpy(key, kDurationKey, sizeof(kDurationKey));
    ncfUInt32 value = 0;
    ncfUInt64 out2 = 0;
    ncfUInt64 out3 = 0;
    return host.GetNamedSetting(key, &value, &out2, &out3) == NCF_OK && value == 1;
}

}  // namespace

EditorSettings ReadEditorSettings(INCFComponentFactory* pComponentFactory) {
    NCF_FUNCTION("NMA::Impl::NewAAFFromMovie");
    EditorSettings settings;
    NCFSmartPtr<INCFNMAEditorSettings> pEditorSettings;
    NCF_SKIP_TEXT(
        "pComponentFactory->CreateComponent(COMPID_INCFNMAEditorSettings,NULL, "
        "IID_INCFNMAEditorSettings, (void**)&pEditorSettings)",
        ncfCreate(pComponentFactory, COMPID_INCFNMAEditorSettings, IID_INCFNMAEditorSettings,
                  pEditorSettings));
    if (!pEditorSettings) {
        return settings;
    }
    if (ReadRates(*pEditorSettings.inArg(), settings)) {
        settings._areSettingsValid = 1;
    }
    if (IsMovieHeaderWanted(*pEditorSettings.inArg())) {
        settings._movieDurationCalculationToUse = EditorSettings::kUseMovieHeader;
    }
    return settings;
}

}  // namespace NMA::Impl
