// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Settings.h"

#include <gtest/gtest.h>

#include "reference_host/framework/Capability.h"
#include "reference_host/util/Ref.h"

using host::MakeRef;
using host::Settings;

namespace {

constexpr ncfUInt32 kUser = NMA::IHostSettings::kUserScope;
const GUID& kIgnoreAlpha = NMA::NMAHostSetting_IgnoreAlpha;

}  // namespace

TEST(Settings, AFlagThatWasNeverSetIsNotAvailable) {
    const auto settings = MakeRef<Settings>();
    ncfBool value = 77;
    EXPECT_EQ(NCF_E_PARAMETERNOTAVAILABLE,
              settings->GetHostSettingBoolean(kIgnoreAlpha, kUser, &value));
    EXPECT_EQ(77, value);
    EXPECT_EQ(NCF_E_POINTER, settings->GetHostSettingBoolean(kIgnoreAlpha, kUser, nullptr));
}

TEST(Settings, AFlagHoldsForItsScope) {
    const auto settings = MakeRef<Settings>();
    ncfBool value = 77;
    settings->SetBoolean(kIgnoreAlpha, kUser, true);
    EXPECT_EQ(NCF_OK, settings->GetHostSettingBoolean(kIgnoreAlpha, kUser, &value));
    EXPECT_EQ(1, value);
    EXPECT_EQ(NCF_E_PARAMETERNOTAVAILABLE,
              settings->GetHostSettingBoolean(kIgnoreAlpha, 1, &value));
    settings->SetBoolean(kIgnoreAlpha, kUser, false);
    EXPECT_EQ(NCF_OK, settings->GetHostSettingBoolean(kIgnoreAlpha, kUser, &value));
    EXPECT_EQ(0, value);
    settings->SetBoolean(kIgnoreAlpha, kUser, std::nullopt);
    EXPECT_EQ(NCF_E_PARAMETERNOTAVAILABLE,
              settings->GetHostSettingBoolean(kIgnoreAlpha, kUser, &value));
}

TEST(Settings, StartWithTheEditorsDefaults) {
    const auto settings = MakeRef<Settings>();
    double rate = 0;
    ncfUInt32 duration = 0;
    ncfUInt32 enabled = 77;
    double forced = 77;
    EXPECT_EQ(NCF_OK, settings->GetEditorFrameRate(&rate, nullptr, nullptr));
    EXPECT_EQ(25.0, rate);
    EXPECT_EQ(NCF_OK, settings->GetSingleFrameDuration(&duration));
    EXPECT_EQ(60u, duration);
    EXPECT_EQ(NCF_OK, settings->GetForcedFrameRate(&enabled, &forced));
    EXPECT_EQ(0u, enabled);
    EXPECT_EQ(0.0, forced);
}

TEST(Settings, TakeNewValues) {
    const auto settings = MakeRef<Settings>();
    settings->SetEditorFrameRate(29.97);
    settings->SetSingleFrameDuration(1);
    settings->SetForcedFrameRate(24.0);
    double rate = 0;
    ncfUInt32 duration = 0;
    ncfUInt32 enabled = 0;
    double forced = 0;
    settings->GetEditorFrameRate(&rate, nullptr, nullptr);
    settings->GetSingleFrameDuration(&duration);
    settings->GetForcedFrameRate(&enabled, &forced);
    EXPECT_EQ(29.97, rate);
    EXPECT_EQ(1u, duration);
    EXPECT_EQ(1u, enabled);
    EXPECT_EQ(24.0, forced);
}

TEST(Settings, AValueThatWasTakenAwayLeavesTheOutput) {
    const auto settings = MakeRef<Settings>();
    settings->SetEditorFrameRate(std::nullopt);
    settings->SetSingleFrameDuration(std::nullopt);
    double rate = 77;
    ncfUInt32 duration = 77;
    EXPECT_EQ(NCF_E_PARAMETERNOTAVAILABLE, settings->GetEditorFrameRate(&rate, nullptr, nullptr));
    EXPECT_EQ(NCF_E_PARAMETERNOTAVAILABLE, settings->GetSingleFrameDuration(&duration));
    EXPECT_EQ(77.0, rate);
    EXPECT_EQ(77u, duration);
}

TEST(Settings, NamedSettingsAreAskedByKey) {
    const auto settings = MakeRef<Settings>();
    ncfUInt32 value = 77;
    ncfUInt64 further = 77;
    EXPECT_EQ(NCF_E_PARAMETERNOTAVAILABLE,
              settings->GetNamedSetting("MovieDurationCalc", &value, &further, nullptr));
    EXPECT_EQ(77u, value);
    settings->SetNamed("MovieDurationCalc", 1);
    EXPECT_EQ(NCF_OK, settings->GetNamedSetting("MovieDurationCalc", &value, nullptr, nullptr));
    EXPECT_EQ(1u, value);
    EXPECT_EQ(NCF_E_PARAMETERNOTAVAILABLE,
              settings->GetNamedSetting("movieDurationCalc", &value, nullptr, nullptr));
    settings->SetNamed("MovieDurationCalc", std::nullopt);
    EXPECT_EQ(NCF_E_PARAMETERNOTAVAILABLE,
              settings->GetNamedSetting("MovieDurationCalc", &value, nullptr, nullptr));
}

TEST(Settings, RefuseNullOutputs) {
    const auto settings = MakeRef<Settings>();
    ncfUInt32 number = 0;
    double rate = 0;
    EXPECT_EQ(NCF_E_POINTER, settings->GetEditorFrameRate(nullptr, nullptr, nullptr));
    EXPECT_EQ(NCF_E_POINTER, settings->GetSingleFrameDuration(nullptr));
    EXPECT_EQ(NCF_E_POINTER, settings->GetForcedFrameRate(nullptr, &rate));
    EXPECT_EQ(NCF_E_POINTER, settings->GetForcedFrameRate(&number, nullptr));
    EXPECT_EQ(NCF_E_POINTER, settings->GetNamedSetting(nullptr, &number, nullptr, nullptr));
    EXPECT_EQ(NCF_E_POINTER, settings->GetNamedSetting("key", nullptr, nullptr, nullptr));
    EXPECT_EQ(NCF_E_NOTIMPL, settings->ReservedEditorSetting());
}

TEST(Capability, GivesItsValue) {
    const auto capability = MakeRef<host::Capability>();
    ncfUInt32 value = 77;
    EXPECT_EQ(NCF_OK, capability->GetValue(&value));
    EXPECT_EQ(0u, value);
    capability->SetValue(3);
    EXPECT_EQ(NCF_OK, capability->GetValue(&value));
    EXPECT_EQ(3u, value);
    EXPECT_EQ(NCF_E_POINTER, capability->GetValue(nullptr));
}
