// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/PluginModule.h"

#include <cstdio>

#include "reference_host/framework/Guard.h"
#include "reference_host/framework/HostPath.h"

namespace host {

namespace {

// No module has as many; a count beyond it is a broken definition.
constexpr ncfUInt32 kMostComponents = 4096;

// Ends the loading where a function of the module failed.
void CheckStep(NCFRESULT result, const std::string& what) {
    if (result < 0) {
        char code[16];
        std::snprintf(code, sizeof(code), "0x%08X", static_cast<unsigned>(result));
        throw LoadFailure{result, what + " with " + code};
    }
}

template <class Function>
void FindFunction(const system::SharedLibrary& library, const char* name, Function& function) {
    function = reinterpret_cast<Function>(library.Find(name));
    if (function == nullptr) {
        throw LoadFailure{NCF_E_NOTSUPPORTED,
                          std::string("it has no function ") + name +
                              "; a plug-in module exports six functions of this framework"};
    }
}

}  // namespace

Maker MakerOfClass(NCFGetClassFactoryFunction getClassFactory, const GUID& classId) {
    return [=](INCFUnknown* host, INCFUnknown* outer, const GUID& iid, void** out) -> NCFRESULT {
        void* made = nullptr;
        const NCFRESULT found = getClassFactory(host, classId, IID_INCFClassFactory, &made);
        const auto maker = Ref<INCFClassFactory>::Adopt(static_cast<INCFClassFactory*>(made));
        if (found < 0 || !maker) {
            return found < 0 ? found : NCF_E_UNEXPECTED;
        }
        return maker->CreateInstance(host, outer, iid, out);
    };
}

PluginModule::PluginModule(const std::filesystem::path& file, INCFUnknown& host,
                           ComponentFactory& factory)
    : file_(file), host_(&host), factory_(&factory) {}

std::unique_ptr<PluginModule> PluginModule::Load(const std::filesystem::path& file,
                                                 INCFUnknown& host, ComponentFactory& factory,
                                                 LoadFailure& failure) {
    std::unique_ptr<PluginModule> module(new PluginModule(file, host, factory));
    try {
        module->Open();
        module->ReadPlugin();
        module->ReadComponents();
        module->Start();
    } catch (const LoadFailure& why) {
        failure = {why.code, DisplayPath(file) + ": can't load this module: " + why.message};
        return nullptr;
    }
    module->EnterComponents();
    return module;
}

PluginModule::~PluginModule() {
    if (started_ && Unload() < 0) {
        RemoveComponents();
        Shutdown();
        library_.Abandon();
    }
}

NCFRESULT PluginModule::CanUnload() const {
    return started_ ? functions_.canUnloadNow(host_.get()) : NCF_OK;
}

NCFRESULT PluginModule::Unload() {
    if (!started_) {
        return NCF_OK;
    }
    const NCFRESULT result = CanUnload();
    if (result < 0) {
        return result;
    }
    RemoveComponents();
    Shutdown();
    library_.Close();
    return NCF_OK;
}

void PluginModule::Open() {
    std::string reason;
    if (!library_.Open(file_, reason)) {
        throw LoadFailure{NCF_E_NOTFOUND, reason};
    }
    FindFunction(library_, "NCFRegisterPlugin", functions_.registerPlugin);
    FindFunction(library_, "NCFRegisterComponent", functions_.registerComponent);
    FindFunction(library_, "NCFGetClassFactory", functions_.getClassFactory);
    FindFunction(library_, "NCFCanUnloadNow", functions_.canUnloadNow);
    FindFunction(library_, "NCFStartup", functions_.startup);
    FindFunction(library_, "NCFShutdown", functions_.shutdown);
}

void PluginModule::ReadPlugin() {
    Ref<INCFPluginDefinition> handed;
    CheckStep(functions_.registerPlugin(host_.get(), handed.Out()), "NCFRegisterPlugin failed");
    // The module may only hand back an object that it had the host make.
    const auto* definition = dynamic_cast<const PluginDefinition*>(handed.get());
    if (definition == nullptr) {
        throw LoadFailure{NCF_E_UNEXPECTED,
                          "NCFRegisterPlugin gave no definition object of this host"};
    }
    plugin_ = definition->facts();
    if (plugin_.componentCount > kMostComponents) {
        throw LoadFailure{NCF_E_UNEXPECTED,
                          "it claims " + std::to_string(plugin_.componentCount) + " components"};
    }
}

void PluginModule::ReadComponents() {
    for (ncfUInt32 index = 0; index < plugin_.componentCount; ++index) {
        Ref<INCFComponentDefinition> handed;
        NCFRESULT result = functions_.registerComponent(host_.get(), index, handed.Out());
        const auto* definition = dynamic_cast<const ComponentDefinition*>(handed.get());
        result = result >= 0 && definition == nullptr ? NCF_E_UNEXPECTED : result;
        CheckStep(result, "NCFRegisterComponent failed for component " + std::to_string(index));
        components_.push_back(definition->facts());
    }
}

void PluginModule::Start() {
    const NCFRESULT result = functions_.startup(host_.get());
    if (result < 0) {
        // A start that failed half-way is taken back by the same call.
        functions_.shutdown(host_.get());
    }
    CheckStep(result, "NCFStartup failed");
    started_ = true;
}

void PluginModule::EnterComponents() {
    for (ComponentFacts& component : components_) {
        void* factory = nullptr;
        const NCFRESULT result = functions_.getClassFactory(host_.get(), component.classId,
                                                            IID_INCFClassFactory, &factory);
        component.hasFactory = result >= 0 && factory != nullptr;
        ReleaseOutput(factory);
        factory_->Register(component.id,
                           MakerOfClass(functions_.getClassFactory, component.classId));
    }
}

void PluginModule::RemoveComponents() {
    for (const ComponentFacts& component : components_) {
        factory_->Unregister(component.id);
    }
}

void PluginModule::Shutdown() {
    functions_.shutdown(host_.get());
    started_ = false;
}

}  // namespace host
