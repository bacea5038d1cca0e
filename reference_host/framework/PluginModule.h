// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

#include "host_interfaces/framework/PluginEntry.h"
#include "reference_host/framework/ComponentFactory.h"
#include "reference_host/framework/Definitions.h"
#include "reference_host/system/SharedLibrary.h"

namespace host {

// Why a module could not be loaded: a code, and a sentence that names the file.
struct LoadFailure {
    NCFRESULT code = NCF_OK;
    std::string message;
};

// Makes objects of a class by the class factories of a started module.
Maker MakerOfClass(NCFGetClassFactoryFunction getClassFactory, const GUID& classId);

// A plug-in module in the process. Loading goes the way that modules count on:
//
//   open, six functions    NCFRegisterPlugin    NCFRegisterComponent 0, 1, ...
//   NCFStartup             its components enter the factory's table
//
// and unloading back: NCFCanUnloadNow, out of the table, NCFShutdown, close.
class PluginModule {
public:
    // Null on failure, with everything undone that was done.
    static std::unique_ptr<PluginModule> Load(const std::filesystem::path& file, INCFUnknown& host,
                                              ComponentFactory& factory, LoadFailure& failure);
    // Unloads. A module that refuses, since objects of it are alive, is shut
    // down but stays mapped.
    ~PluginModule();
    PluginModule(const PluginModule&) = delete;
    PluginModule& operator=(const PluginModule&) = delete;

    const std::filesystem::path& file() const { return file_; }
    const PluginFacts& plugin() const { return plugin_; }
    const std::vector<ComponentFacts>& components() const { return components_; }

    // What NCFCanUnloadNow says: NCF_OK when no object of the module is alive.
    NCFRESULT CanUnload() const;
    // A refusal is the result, and the module goes on as before.
    NCFRESULT Unload();

private:
    struct Functions {
        NCFRegisterPluginFunction registerPlugin = nullptr;
        NCFRegisterComponentFunction registerComponent = nullptr;
        NCFGetClassFactoryFunction getClassFactory = nullptr;
        NCFCanUnloadNowFunction canUnloadNow = nullptr;
        NCFStartupFunction startup = nullptr;
        NCFShutdownFunction shutdown = nullptr;
    };

    PluginModule(const std::filesystem::path& file, INCFUnknown& host, ComponentFactory& factory);

    // The steps of loading; each throws a LoadFailure.
    void Open();
    void ReadPlugin();
    void ReadComponents();
    void Start();
    void EnterComponents();
    void RemoveComponents();
    void Shutdown();

    std::filesystem::path file_;
    Ref<INCFUnknown> host_;
    Ref<ComponentFactory> factory_;
    host::system::SharedLibrary library_;
    Functions functions_;
    PluginFacts plugin_;
    std::vector<ComponentFacts> components_;
    bool started_ = false;
};

}  // namespace host
