// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A module with one component, Greeter, which says hello on the host's console when it is made.
// docs/writing_a_module.md goes through it. Begin with new ids of your own.
#include <atomic>
#include <new>

#include "host_interfaces/framework/Console.h"
#include "host_interfaces/framework/PluginEntry.h"

namespace {

constexpr GUID kPluginId = ncfGuid("6D1A5E70-3C4B-4F0A-9E57-2B8C10D4F6A1");
constexpr GUID kComponentType = ncfGuid("6D1A5E70-3C4B-4F0A-9E57-2B8C10D4F6A2");
constexpr GUID kGreeterComponent = ncfGuid("6D1A5E70-3C4B-4F0A-9E57-2B8C10D4F6A3");
constexpr GUID kGreeterClass = ncfGuid("6D1A5E70-3C4B-4F0A-9E57-2B8C10D4F6A4");
constexpr ncfUInt32 kComponentCount = 1;

// Everything that is alive and made by this module; NCFCanUnloadNow reads it.
std::atomic<int> liveObjects{0};

// One reference to an interface, given back at the end.
template <class Interface>
class Held {
public:
    Held() = default;
    Held(const Held&) = delete;
    Held& operator=(const Held&) = delete;
    ~Held() {
        if (held_ != nullptr) {
            held_->Release();
        }
    }
    Interface* operator->() const { return held_; }
    Interface* Detach() {
        Interface* const detached = held_;
        held_ = nullptr;
        return detached;
    }
    void** Out() { return reinterpret_cast<void**>(&held_); }

private:
    Interface* held_ = nullptr;
};

// Counts references and answers IID_INCFUnknown and one interface more. It can't be part of
// another object (see CreateInstance), so its root is the interface itself.
template <class Interface>
class Object : public Interface {
public:
    Object(const Object&) = delete;
    Object& operator=(const Object&) = delete;

    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        const bool isKnown =
            iid == IID_INCFUnknown || iid == ncfIdOf(static_cast<const Interface*>(nullptr));
        *out = isKnown ? this : nullptr;
        if (isKnown) {
            AddRef();
        }
        return isKnown ? NCF_OK : NCF_E_NOINTERFACE;
    }
    ncfUInt32 AddRef() override { return ++references_; }
    ncfUInt32 Release() override {
        const ncfUInt32 left = --references_;
        if (left == 0) {
            delete this;
        }
        return left;
    }

protected:
    Object() { ++liveObjects; }
    virtual ~Object() { --liveObjects; }

private:
    std::atomic<ncfUInt32> references_{1};  // its maker's
};

class Greeter final : public Object<INCFUnknown> {
public:
    // What needs the host, and may fail, is done here and not in a constructor.
    NCFRESULT Begin(INCFUnknown* host) {
        Held<INCFConsole> console;
        const NCFRESULT result = host->QueryInterface(IID_INCFConsole, console.Out());
        return result < 0 ? result : console->Write(4, "%s", "Hello from the minimal module");
    }
};

class GreeterFactory final : public Object<INCFClassFactory> {
public:
    NCFRESULT CreateInstance(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                             void** out) override {
        if (host == nullptr || out == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *out = nullptr;
        if (outer != nullptr) {
            return NCF_CLASS_E_NOAGGREGATION;
        }
        auto* const greeter = new (std::nothrow) Greeter;
        if (greeter == nullptr) {
            return NCF_E_OUTOFMEMORY;
        }
        NCFRESULT result = greeter->Begin(host);
        if (result >= 0) {
            result = greeter->QueryInterface(iid, out);
        }
        greeter->Release();  // ends it unless the caller has a reference now
        return result;
    }
};

// Has the host make a definition object.
template <class Definition>
NCFRESULT NewDefinition(INCFUnknown* host, const GUID& component, Held<Definition>& made) {
    Held<INCFComponentFactory> factory;
    const NCFRESULT result = host->QueryInterface(IID_INCFComponentFactory, factory.Out());
    return result < 0 ? result
                      : factory->CreateComponent(component, nullptr,
                                                 ncfIdOf(static_cast<const Definition*>(nullptr)),
                                                 made.Out());
}

}  // namespace

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterPlugin(INCFUnknown* host, INCFPluginDefinition** out) {
    if (host == nullptr || out == nullptr) {
        return NCF_E_POINTER;
    }
    *out = nullptr;
    Held<INCFPluginDefinition> definition;
    NCFRESULT result = NewDefinition(host, CompID_PluginDefinition, definition);
    if (result >= 0) {
        result = definition->Define(kPluginId, 1, 0, "Minimal Module", kPluginId, "Example",
                                    kComponentCount, 1);
    }
    if (result >= 0) {
        *out = definition.Detach();
    }
    return result;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterComponent(INCFUnknown* host, ncfUInt32 index,
                                                 INCFComponentDefinition** out) {
    if (host == nullptr || out == nullptr) {
        return NCF_E_POINTER;
    }
    *out = nullptr;
    if (index >= kComponentCount) {
        return NCF_E_INVALIDARG;
    }
    Held<INCFComponentDefinition> definition;
    NCFRESULT result = NewDefinition(host, CompID_ComponentDefinition, definition);
    if (result >= 0) {
        result =
            definition->Define(kGreeterComponent, kComponentType, 1, 0, kGreeterClass, "Greeter");
    }
    if (result >= 0) {
        *out = definition.Detach();
    }
    return result;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFGetClassFactory(INCFUnknown* host, const GUID& classId,
                                               const GUID& interfaceId, void** out) {
    if (host == nullptr || out == nullptr) {
        return NCF_E_INVALIDARG;
    }
    *out = nullptr;
    if (classId != kGreeterClass) {
        return NCF_CLASS_E_CLASSNOTAVAILABLE;
    }
    auto* const factory = new (std::nothrow) GreeterFactory;
    if (factory == nullptr) {
        return NCF_E_OUTOFMEMORY;
    }
    const NCFRESULT result = factory->QueryInterface(interfaceId, out);
    factory->Release();
    return result;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFCanUnloadNow(INCFUnknown* host) {
    return host == nullptr ? NCF_E_INVALIDARG : liveObjects == 0 ? NCF_OK : NCF_E_FAIL;
}

// This module needs nothing beside its objects, so there is nothing to start.
NCF_PLUGIN_EXPORT NCFRESULT NCFStartup(INCFUnknown*) {
    return NCF_OK;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFShutdown(INCFUnknown*) {
    return NCF_OK;
}
