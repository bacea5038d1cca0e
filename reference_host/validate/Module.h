// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <set>
#include <string>
#include <vector>

#include "host_interfaces/framework/PluginEntry.h"
#include "reference_host/framework/Definitions.h"
#include "reference_host/system/SharedLibrary.h"
#include "reference_host/util/Ref.h"
#include "reference_host/validate/Trial.h"

namespace validate {

inline constexpr const char* kExports[] = {"NCFRegisterPlugin",  "NCFRegisterComponent",
                                           "NCFGetClassFactory", "NCFCanUnloadNow",
                                           "NCFStartup",         "NCFShutdown"};

// The module in the process, with a host of its own: nothing of it is called but what a check
// calls. What a check counts on beyond its own question, and does not get, ends it as skipped:
// another check tells of that.
class Module {
public:
    explicit Module(Trial& trial);
    ~Module();  // shuts down what was started
    Module(const Module&) = delete;
    Module& operator=(const Module&) = delete;

    // The six functions.
    NCFRegisterPluginFunction registerPlugin = nullptr;
    NCFRegisterComponentFunction registerComponent = nullptr;
    NCFGetClassFactoryFunction getClassFactory = nullptr;
    NCFCanUnloadNowFunction canUnloadNow = nullptr;
    NCFStartupFunction startup = nullptr;
    NCFShutdownFunction shutdown = nullptr;

    Trial& trial() const { return trial_; }
    host::Host& host() const { return *host_; }
    INCFUnknown* unknown() const { return host_->unknown(); }

    // What the module says of itself when it registers.
    host::PluginFacts Plugin();
    std::vector<host::ComponentFacts> Components();

    void Start();
    // Puts the started module's components into the host's table, where it finds them itself.
    void OfferComponents();
    void Shutdown();
    // Gives the library back to the system.
    void Unmap() { library_.Close(); }

    // Whether an object of a component was made before.
    bool HasMade(std::size_t component) const { return made_.count(component) != 0; }
    void NoteMade(std::size_t component) { made_.insert(component); }

private:
    Trial& trial_;
    std::unique_ptr<host::Host> host_;
    host::system::SharedLibrary library_;
    bool isStarted_ = false;
    std::set<std::size_t> made_;
};

// The facts in what a registering function handed out. Ends the check as failed where it is no
// definition object of this host.
host::PluginFacts FactsOf(Trial& trial, INCFPluginDefinition* definition);
host::ComponentFacts FactsOf(Trial& trial, INCFComponentDefinition* definition);

// "component 3, Container"
std::string NameOf(const host::ComponentFacts& component, std::size_t index);

}  // namespace validate
