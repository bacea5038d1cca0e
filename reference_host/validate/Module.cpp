// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Module.h"

#include "reference_host/framework/HostPath.h"

namespace validate {
namespace {

// No module has as many; a count beyond it is a broken definition.
constexpr ncfUInt32 kMostComponents = 4096;

template <class Definition, class Facts, class Interface>
Facts FactsIn(Trial& trial, Interface* handed) {
    // The module may only hand back an object that it had the host make.
    const auto* const definition = dynamic_cast<const Definition*>(handed);
    trial.Expect(handed != nullptr, "a definition object comes out", "success, and null");
    trial.Expect(definition != nullptr,
                 "the definition object that the module had the host's component factory make",
                 "an object of the module's own");
    return definition->facts();
}

}  // namespace

Module::Module(Trial& trial) : trial_(trial), host_(trial.NewHost()) {
    trial.Doing("loading the file");
    std::string reason;
    if (!library_.Open(trial.options().module, reason)) {
        trial.Skip("the system does not load the file: " + reason);
    }
    const auto find = [&](const char* name, auto& function) {
        function = reinterpret_cast<std::decay_t<decltype(function)>>(library_.Find(name));
        if (function == nullptr) {
            trial.Skip(std::string("the file has no function ") + name);
        }
    };
    find("NCFRegisterPlugin", registerPlugin);
    find("NCFRegisterComponent", registerComponent);
    find("NCFGetClassFactory", getClassFactory);
    find("NCFCanUnloadNow", canUnloadNow);
    find("NCFStartup", startup);
    find("NCFShutdown", shutdown);
}

Module::~Module() {
    if (isStarted_) {
        shutdown(unknown());
    }
    // Objects that a failed check has left may still be used by the host's end.
    library_.Abandon();
}

host::PluginFacts Module::Plugin() {
    host::Ref<INCFPluginDefinition> handed;
    const NCFRESULT result = registerPlugin(unknown(), handed.Out());
    if (result < 0) {
        trial_.Skip("NCFRegisterPlugin fails: " + trial_.Text(result));
    }
    return FactsOf(trial_, handed.get());
}

std::vector<host::ComponentFacts> Module::Components() {
    const ncfUInt32 count = Plugin().componentCount;
    if (count > kMostComponents) {
        trial_.Skip("it claims " + std::to_string(count) + " components");
    }
    std::vector<host::ComponentFacts> components;
    for (ncfUInt32 index = 0; index < count; ++index) {
        host::Ref<INCFComponentDefinition> handed;
        const NCFRESULT result = registerComponent(unknown(), index, handed.Out());
        if (result < 0) {
            trial_.Skip("NCFRegisterComponent fails for component " + std::to_string(index) + ": " +
                        trial_.Text(result));
        }
        components.push_back(FactsOf(trial_, handed.get()));
    }
    return components;
}

void Module::Start() {
    const NCFRESULT result = startup(unknown());
    isStarted_ = true;  // a start that failed is taken back, too
    if (result < 0) {
        trial_.Skip("NCFStartup fails: " + trial_.Text(result));
    }
}

void Module::OfferComponents() {
    for (const host::ComponentFacts& component : Components()) {
        host_->RegisterComponent(component.id,
                                 host::MakerOfClass(getClassFactory, component.classId));
    }
}

void Module::Shutdown() {
    isStarted_ = false;
    shutdown(unknown());
}

host::PluginFacts FactsOf(Trial& trial, INCFPluginDefinition* definition) {
    return FactsIn<host::PluginDefinition, host::PluginFacts>(trial, definition);
}

host::ComponentFacts FactsOf(Trial& trial, INCFComponentDefinition* definition) {
    return FactsIn<host::ComponentDefinition, host::ComponentFacts>(trial, definition);
}

std::string NameOf(const host::ComponentFacts& component, std::size_t index) {
    return "component " + std::to_string(index) + ", " + component.name;
}

}  // namespace validate
