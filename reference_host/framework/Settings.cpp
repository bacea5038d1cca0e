// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Settings.h"

#include <algorithm>

#include "reference_host/framework/Guard.h"

namespace host {

NCFRESULT Settings::GetHostSettingBoolean(const GUID& setting, ncfUInt32 scope, ncfBool* value) {
    if (value == nullptr) {
        return NCF_E_POINTER;
    }
    const std::lock_guard<std::mutex> guard(mutex_);
    for (const Flag& flag : flags_) {
        if (flag.setting == setting && flag.scope == scope) {
            *value = flag.value ? 1 : 0;
            return NCF_OK;
        }
    }
    return NCF_E_PARAMETERNOTAVAILABLE;
}

template <class Value>
NCFRESULT Settings::GiveKnown(const std::optional<Value>& value, Value* out) {
    const std::lock_guard<std::mutex> guard(mutex_);
    return out != nullptr && !value ? NCF_E_PARAMETERNOTAVAILABLE : Give(value.value_or(0), out);
}

NCFRESULT Settings::GetEditorFrameRate(double* rate, ncfUInt32*, ncfUInt32*) {
    return GiveKnown(editorFrameRate_, rate);
}

NCFRESULT Settings::GetSingleFrameDuration(ncfUInt32* duration) {
    return GiveKnown(singleFrameDuration_, duration);
}

NCFRESULT Settings::GetForcedFrameRate(ncfUInt32* enabled, double* rate) {
    if (enabled == nullptr || rate == nullptr) {
        return NCF_E_POINTER;
    }
    const std::lock_guard<std::mutex> guard(mutex_);
    *enabled = forcedFrameRate_ ? 1 : 0;
    *rate = forcedFrameRate_.value_or(0.0);
    return NCF_OK;
}

NCFRESULT Settings::GetNamedSetting(const ncfUTF8* key, ncfUInt32* value, ncfUInt64*, void*) {
    return Guarded([&] {
        Need(key && value);
        const std::lock_guard<std::mutex> guard(mutex_);
        const auto found = named_.find(key);
        if (found == named_.end()) {
            return NCF_E_PARAMETERNOTAVAILABLE;
        }
        *value = found->second;
        return NCF_OK;
    });
}

void Settings::SetEditorFrameRate(std::optional<double> rate) {
    const std::lock_guard<std::mutex> guard(mutex_);
    editorFrameRate_ = rate;
}

void Settings::SetSingleFrameDuration(std::optional<ncfUInt32> duration) {
    const std::lock_guard<std::mutex> guard(mutex_);
    singleFrameDuration_ = duration;
}

void Settings::SetForcedFrameRate(std::optional<double> rate) {
    const std::lock_guard<std::mutex> guard(mutex_);
    forcedFrameRate_ = rate;
}

void Settings::SetNamed(const std::string& key, std::optional<ncfUInt32> value) {
    const std::lock_guard<std::mutex> guard(mutex_);
    if (value) {
        named_[key] = *value;
    } else {
        named_.erase(key);
    }
}

void Settings::SetBoolean(const GUID& setting, ncfUInt32 scope, std::optional<bool> value) {
    const std::lock_guard<std::mutex> guard(mutex_);
    flags_.erase(std::remove_if(flags_.begin(), flags_.end(),
                                [&](const Flag& flag) {
                                    return flag.setting == setting && flag.scope == scope;
                                }),
                 flags_.end());
    if (value) {
        flags_.push_back({setting, scope, *value});
    }
}

}  // namespace host
