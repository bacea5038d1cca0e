// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Host.h"

#include "host_interfaces/framework/Definitions.h"
#include "reference_host/framework/RecursiveLock.h"
#include "reference_host/framework/String.h"

namespace host {

Host::Host(const HostOptions& options)
    : factory_(MakeRef<ComponentFactory>()),
      console_(MakeRef<Console>()),
      settings_(MakeRef<Settings>()),
      capability_(MakeRef<Capability>()),
      unknown_(MakeRef<HostUnknown>(factory_, console_)) {
    factory_->SetHost(unknown_.get());
    Apply(options);
    RegisterOwnComponents();
    ownObjects_ = LiveObjectCount();
}

Host::~Host() {
    while (!modules_.empty()) {
        modules_.pop_back();  // the last one first
    }
    // Who still holds the factory gets nothing from a host that is gone.
    factory_->SetHost(nullptr);
}

void Host::RegisterComponent(const GUID& component, Maker maker) {
    factory_->Register(component, std::move(maker));
}

PluginModule* Host::LoadModule(const std::filesystem::path& file, LoadFailure& failure) {
    auto module = PluginModule::Load(file, *unknown_, *factory_, failure);
    if (module == nullptr) {
        return nullptr;
    }
    modules_.push_back(std::move(module));
    return modules_.back().get();
}

NCFRESULT Host::UnloadModule() {
    if (modules_.empty()) {
        return NCF_OK;
    }
    const NCFRESULT result = modules_.back()->Unload();
    if (result >= 0) {
        modules_.pop_back();
    }
    return result;
}

void Host::RegisterOwnComponents() {
    RegisterComponent(NCFCompID_NCFString, MakerOf([](INCFUnknown*) { return MakeRef<String>(); }));
    RegisterComponent(CompID_LockComponent,
                      MakerOf([](INCFUnknown*) { return MakeRef<RecursiveLock>(); }));
    RegisterComponent(CompID_PluginDefinition,
                      MakerOf([](INCFUnknown*) { return MakeRef<PluginDefinition>(); }));
    RegisterComponent(CompID_ComponentDefinition,
                      MakerOf([](INCFUnknown*) { return MakeRef<ComponentDefinition>(); }));
    // Whoever asks gets the same settings.
    RegisterComponent(NMA::Impl::CompID_HostSettings,
                      MakerOf([settings = settings_](INCFUnknown*) { return settings; }));
    RegisterComponent(CompID_Capability,
                      MakerOf([capability = capability_](INCFUnknown*) { return capability; }));
}

void Host::Apply(const HostOptions& options) {
    settings_->SetEditorFrameRate(options.editorFrameRate);
    settings_->SetForcedFrameRate(options.forcedFrameRate);
    settings_->SetSingleFrameDuration(options.singleFrameDuration);
    settings_->SetNamed("MovieDurationCalc",
                        options.movieHeaderDuration ? std::optional<ncfUInt32>(1) : std::nullopt);
    settings_->SetBoolean(NMA::NMAHostSetting_IgnoreAlpha, NMA::IHostSettings::kUserScope,
                          options.ignoreAlpha);
    capability_->SetValue(options.capability);
    console_->SetLevel(options.consoleLevel);
}

}  // namespace host
