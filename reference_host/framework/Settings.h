// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <mutex>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "host_interfaces/framework/EditorSettings.h"
#include "host_interfaces/framework/HostSettings.h"
#include "reference_host/framework/Component.h"

namespace host {

// Settings of the host and of the editor's project: one component with both
// interfaces. A value that was taken away is answered with
// NCF_E_PARAMETERNOTAVAILABLE, outputs untouched; a forced rate that isn't there
// is answered as not enabled.
class Settings final : public Component<NMA::IHostSettings, INCFNMAEditorSettings> {
public:
    NCFRESULT GetHostSettingBoolean(const GUID& setting, ncfUInt32 scope, ncfBool* value) override;

    NCFRESULT GetEditorFrameRate(double* rate, ncfUInt32* reservedA, ncfUInt32* reservedB) override;
    NCFRESULT GetSingleFrameDuration(ncfUInt32* duration) override;
    NCFRESULT GetForcedFrameRate(ncfUInt32* enabled, double* rate) override;
    NCFRESULT GetNamedSetting(const ncfUTF8* key, ncfUInt32* value, ncfUInt64* out2,
                              void* out3) override;

    // Starts at 25 frames per second: clips of sound alone need a rate.
    void SetEditorFrameRate(std::optional<double> rate);
    // Starts at 60 edit units.
    void SetSingleFrameDuration(std::optional<ncfUInt32> duration);
    // Without a value, clips keep their own rates.
    void SetForcedFrameRate(std::optional<double> rate);
    void SetNamed(const std::string& key, std::optional<ncfUInt32> value);
    void SetBoolean(const GUID& setting, ncfUInt32 scope, std::optional<bool> value);

private:
    template <class Value>
    NCFRESULT GiveKnown(const std::optional<Value>& value, Value* out);

    struct Flag {
        GUID setting;
        ncfUInt32 scope;
        bool value;
    };

    std::mutex mutex_;
    std::optional<double> editorFrameRate_ = 25.0;
    std::optional<ncfUInt32> singleFrameDuration_ = 60;
    std::optional<double> forcedFrameRate_;
    std::map<std::string, ncfUInt32> named_;
    std::vector<Flag> flags_;
};

}  // namespace host
