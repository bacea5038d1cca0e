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

std::string InHex(NCFRESULT code) {
    char text[16];
    std::snprintf(text, sizeof(text), "0x%08X", static_cast<unsigned>(code));
    return text;
}

template <class Function>
bool FindFunction(const system::SharedLibrary& library, const char* name, Function& function,
                  std::string& reason) {
    function = reinterpret_cast<Function>(library.Find(name));
    if (function == nullptr) {
        reason = std::string("it has no function ") + name +
                 "; a plug-in module exports six functions of this framework";
    }
    return function != nullptr;
}

}  // namespace

PluginModule::PluginModule(const std::filesystem::path& file, INCFUnknown& host,
                           ComponentFactory& factory)
    : file_(file), host_(&host), factory_(&factory) {}

std::unique_ptr<PluginModule> PluginModule::Load(const std::filesystem::path& file,
                                                 INCFUnknown& host, ComponentFactory& factory,
                                                 LoadFailure& failure) {
    std::unique_ptr<PluginModule> module(new PluginModule(file, host, factory));
    std::string reason;
    NCFRESULT result = module->Open(reason);
    if (result >= 0) {
        result = module->ReadPlugin(reason);
    }
    if (result >= 0) {
        result = module->ReadComponents(reason);
    }
    if (result >= 0) {
        result = module->Start(reason);
    }
    if (result < 0) {
        failure = {result, DisplayPath(file) + ": can't load this module: " + reason};
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

NCFRESULT PluginModule::Open(std::string& reason) {
    if (!library_.Open(file_, reason)) {
        return NCF_E_NOTFOUND;
    }
    const bool whole =
        FindFunction(library_, "NCFRegisterPlugin", functions_.registerPlugin, reason) &&
        FindFunction(library_, "NCFRegisterComponent", functions_.registerComponent, reason) &&
        FindFunction(library_, "NCFGetClassFactory", functions_.getClassFactory, reason) &&
        FindFunction(library_, "NCFCanUnloadNow", functions_.canUnloadNow, reason) &&
        FindFunction(library_, "NCFStartup", functions_.startup, reason) &&
        FindFunction(library_, "NCFShutdown", functions_.shutdown, reason);
    return whole ? NCF_OK : NCF_E_NOTSUPPORTED;
}

NCFRESULT PluginModule::ReadPlugin(std::string& reason) {
    Ref<INCFPluginDefinition> handed;
    const NCFRESULT result = functions_.registerPlugin(host_.get(), handed.Out());
    if (result < 0) {
        reason = "NCFRegisterPlugin failed with " + InHex(result);
        return result;
    }
    // The module may only hand back an object that it had the host make.
    const auto* definition = dynamic_cast<const PluginDefinition*>(handed.get());
    if (definition == nullptr) {
        reason = "NCFRegisterPlugin gave no definition object of this host";
        return NCF_E_UNEXPECTED;
    }
    plugin_ = definition->facts();
    if (plugin_.componentCount > kMostComponents) {
        reason = "it claims " + std::to_string(plugin_.componentCount) + " components";
        return NCF_E_UNEXPECTED;
    }
    return NCF_OK;
}

NCFRESULT PluginModule::ReadComponents(std::string& reason) {
    for (ncfUInt32 index = 0; index < plugin_.componentCount; ++index) {
        const NCFRESULT result = ReadComponent(index);
        if (result < 0) {
            reason = "NCFRegisterComponent failed for component " + std::to_string(index) +
                     " with " + InHex(result);
            return result;
        }
    }
    return NCF_OK;
}

NCFRESULT PluginModule::ReadComponent(ncfUInt32 index) {
    Ref<INCFComponentDefinition> handed;
    const NCFRESULT result = functions_.registerComponent(host_.get(), index, handed.Out());
    if (result < 0) {
        return result;
    }
    const auto* definition = dynamic_cast<const ComponentDefinition*>(handed.get());
    if (definition == nullptr) {
        return NCF_E_UNEXPECTED;
    }
    components_.push_back(definition->facts());
    return NCF_OK;
}

NCFRESULT PluginModule::Start(std::string& reason) {
    const NCFRESULT result = functions_.startup(host_.get());
    if (result < 0) {
        // A start that failed half-way is taken back by the same call.
        functions_.shutdown(host_.get());
        reason = "NCFStartup failed with " + InHex(result);
        return result;
    }
    started_ = true;
    return NCF_OK;
}

void PluginModule::EnterComponents() {
    for (ComponentFacts& component : components_) {
        void* factory = nullptr;
        const NCFRESULT result = functions_.getClassFactory(host_.get(), component.classId,
                                                            IID_INCFClassFactory, &factory);
        component.hasFactory = result >= 0 && factory != nullptr;
        ReleaseOutput(factory);
        factory_->Register(
            component.id,
            [classId = component.classId, getClassFactory = functions_.getClassFactory](
                INCFUnknown* host, INCFUnknown* outer, const GUID& iid, void** out) -> NCFRESULT {
                void* made = nullptr;
                const NCFRESULT found = getClassFactory(host, classId, IID_INCFClassFactory, &made);
                const auto maker =
                    Ref<INCFClassFactory>::Adopt(static_cast<INCFClassFactory*>(made));
                if (found < 0 || !maker) {
                    return found < 0 ? found : NCF_E_UNEXPECTED;
                }
                return maker->CreateInstance(host, outer, iid, out);
            });
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
