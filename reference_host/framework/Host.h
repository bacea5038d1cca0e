// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <optional>

#include "reference_host/framework/Capability.h"
#include "reference_host/framework/ComponentFactory.h"
#include "reference_host/framework/Console.h"
#include "reference_host/framework/HostUnknown.h"
#include "reference_host/framework/PluginModule.h"
#include "reference_host/framework/Settings.h"

namespace host {

// What a program may say when it sets a host up.
struct HostOptions {
    std::optional<double> editorFrameRate = 25.0;
    std::optional<double> forcedFrameRate;
    std::optional<ncfUInt32> singleFrameDuration = 60;
    // Take a movie's length from its header, where else from its tracks.
    bool movieHeaderDuration = false;
    // Not set unless given: the module then keeps its own way.
    std::optional<bool> ignoreAlpha;
    ncfUInt32 capability = 0;
    ncfUInt32 consoleLevel = 1;
};

// A whole host: the framework's services, the components that are registered
// with it, and the modules that are loaded into it. Strings, locks, settings,
// capability and definition objects are there from the start; other services
// plug in with RegisterComponent. Ends by unloading the modules; references to
// its objects may outlive it, but nothing new is made then.
class Host {
public:
    explicit Host(const HostOptions& options = {});
    ~Host();
    Host(const Host&) = delete;
    Host& operator=(const Host&) = delete;

    // The host unknown, as modules get it; borrowed.
    INCFUnknown* unknown() const { return unknown_.get(); }
    ComponentFactory& factory() const { return *factory_; }
    Console& console() const { return *console_; }
    Settings& settings() const { return *settings_; }
    Capability& capability() const { return *capability_; }

    void RegisterComponent(const GUID& component, Maker maker);

    // The loaded module, owned by the host, or null with a reason.
    PluginModule* LoadModule(const std::filesystem::path& file, LoadFailure& failure);
    // The last one loaded; NCF_OK when there is none.
    NCFRESULT UnloadModule();

    template <class Interface>
    NCFRESULT Create(const GUID& component, Ref<Interface>& out) const {
        return host::Create(*factory_, component, out);
    }

    // Objects of the host that were made since it was set up and still live.
    std::int64_t LiveObjects() const { return LiveObjectCount() - ownObjects_; }

private:
    void RegisterOwnComponents();
    void Apply(const HostOptions& options);

    Ref<ComponentFactory> factory_;
    Ref<Console> console_;
    Ref<Settings> settings_;
    Ref<Capability> capability_;
    Ref<HostUnknown> unknown_;
    std::vector<std::unique_ptr<PluginModule>> modules_;
    std::int64_t ownObjects_ = 0;
};

}  // namespace host
