// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Host.h"

#include <gtest/gtest.h>

#include "host_interfaces/framework/Lock.h"
#include "host_interfaces/framework/String.h"

using host::Host;
using host::HostOptions;
using host::Ref;

TEST(Host, OffersWhatModulesAskItFor) {
    Host host;
    for (const GUID& iid :
         {IID_INCFUnknown, IID_INCFHostUnknown, IID_INCFComponentFactory, IID_INCFConsole}) {
        void* out = nullptr;
        EXPECT_EQ(NCF_OK, host.unknown()->QueryInterface(iid, &out));
        ASSERT_NE(nullptr, out);
        static_cast<INCFUnknown*>(out)->Release();
    }
    void* out = &host;
    EXPECT_EQ(NCF_E_NOINTERFACE, host.unknown()->QueryInterface(IID_INCFString, &out));
    EXPECT_EQ(nullptr, out);
}

TEST(Host, MakesTheFrameworksComponents) {
    Host host;
    Ref<INCFString> string;
    Ref<INCFLock> lock;
    Ref<INCFPluginDefinition> plugin;
    Ref<INCFComponentDefinition> component;
    Ref<INCFCapability> capability;
    EXPECT_EQ(NCF_OK, host.Create(NCFCompID_NCFString, string));
    EXPECT_EQ(NCF_OK, host.Create(CompID_LockComponent, lock));
    EXPECT_EQ(NCF_OK, host.Create(CompID_PluginDefinition, plugin));
    EXPECT_EQ(NCF_OK, host.Create(CompID_ComponentDefinition, component));
    EXPECT_EQ(NCF_OK, host.Create(CompID_Capability, capability));
}

TEST(Host, OneComponentAnswersBothKindsOfSettings) {
    Host host;
    Ref<NMA::IHostSettings> settings;
    Ref<INCFNMAEditorSettings> editor;
    EXPECT_EQ(NCF_OK, host.Create(NMA::Impl::CompID_HostSettings, settings));
    EXPECT_EQ(NCF_OK, host.Create(COMPID_INCFNMAEditorSettings, editor));
    host.settings().SetEditorFrameRate(50.0);
    double rate = 0;
    EXPECT_EQ(NCF_OK, editor->GetEditorFrameRate(&rate, nullptr, nullptr));
    EXPECT_EQ(50.0, rate) << "changes reach who holds the component";
}

TEST(Host, ARuleMayRefuseOneKindOfSettingsAlone) {
    Host host;
    host.factory().SetRule([](const host::CreationCall& call) {
        return call.iid == IID_INCFNMAEditorSettings ? NCF_E_FAIL : NCF_OK;
    });
    Ref<NMA::IHostSettings> settings;
    Ref<INCFNMAEditorSettings> editor;
    EXPECT_EQ(NCF_OK, host.Create(NMA::Impl::CompID_HostSettings, settings));
    EXPECT_EQ(NCF_E_FAIL, host.Create(COMPID_INCFNMAEditorSettings, editor));
}

TEST(Host, TakesItsOptions) {
    HostOptions options;
    options.editorFrameRate = 24.0;
    options.forcedFrameRate = 30.0;
    options.singleFrameDuration = 10;
    options.movieHeaderDuration = true;
    options.ignoreAlpha = false;
    options.capability = 5;
    Host host(options);
    double rate = 0;
    ncfUInt32 number = 0;
    ncfBool flag = 77;
    host.settings().GetEditorFrameRate(&rate, nullptr, nullptr);
    EXPECT_EQ(24.0, rate);
    host.settings().GetForcedFrameRate(&number, &rate);
    EXPECT_EQ(1u, number);
    EXPECT_EQ(30.0, rate);
    host.settings().GetSingleFrameDuration(&number);
    EXPECT_EQ(10u, number);
    EXPECT_EQ(NCF_OK,
              host.settings().GetNamedSetting("MovieDurationCalc", &number, nullptr, nullptr));
    EXPECT_EQ(1u, number);
    EXPECT_EQ(NCF_OK,
              host.settings().GetHostSettingBoolean(NMA::NMAHostSetting_IgnoreAlpha, 64, &flag));
    EXPECT_EQ(0, flag);
    host.capability().GetValue(&number);
    EXPECT_EQ(5u, number);
}

TEST(Host, LeavesUnsetWhatWasNotAskedFor) {
    Host host;
    ncfUInt32 number = 0;
    ncfBool flag = 0;
    EXPECT_EQ(NCF_E_PARAMETERNOTAVAILABLE,
              host.settings().GetNamedSetting("MovieDurationCalc", &number, nullptr, nullptr));
    EXPECT_EQ(NCF_E_PARAMETERNOTAVAILABLE,
              host.settings().GetHostSettingBoolean(NMA::NMAHostSetting_IgnoreAlpha, 64, &flag));
}

TEST(Host, CountsTheObjectsThatItMade) {
    Host host;
    EXPECT_EQ(0, host.LiveObjects());
    Ref<INCFString> string;
    host.Create(NCFCompID_NCFString, string);
    EXPECT_EQ(1, host.LiveObjects());
    string.Reset();
    EXPECT_EQ(0, host.LiveObjects());
}

TEST(Host, KeepsNothingAfterItsEnd) {
    const std::int64_t before = host::LiveObjectCount();
    Ref<INCFString> string;
    Ref<INCFComponentFactory> factory;
    {
        Host host;
        host.Create(NCFCompID_NCFString, string);
        ASSERT_EQ(NCF_OK, host::Query(host.unknown(), factory));
    }
    EXPECT_EQ(1, string->IsEmpty()) << "objects may outlive their host";
    Ref<INCFString> another;
    EXPECT_EQ(NCF_CLASS_E_CLASSNOTAVAILABLE, host::Create(*factory, NCFCompID_NCFString, another));
    string.Reset();
    factory.Reset();
    EXPECT_EQ(before, host::LiveObjectCount());
}

TEST(Host, UnloadsNothingWhereNothingIsLoaded) {
    Host host;
    EXPECT_EQ(NCF_OK, host.UnloadModule());
}
