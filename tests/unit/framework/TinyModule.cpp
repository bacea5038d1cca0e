// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
// A module with two components, of which the second has no class factory. Built
// several times, each time with one FAULT_ that says what is wrong with it.
#include <atomic>
#include <cstdlib>

#include "host_interfaces/framework/PluginEntry.h"

namespace {

constexpr GUID kThingComponent = ncfGuid("11111111-0000-4000-8000-000000000001");
constexpr GUID kThingClass = ncfGuid("11111111-0000-4000-8000-000000000002");
constexpr GUID kShyComponent = ncfGuid("11111111-0000-4000-8000-000000000003");
constexpr GUID kShyClass = ncfGuid("11111111-0000-4000-8000-000000000004");
constexpr GUID kSomeId = ncfGuid("11111111-0000-4000-8000-000000000005");
// The environment holds the address of the test's journal: the calls come there
// in their order, one letter each.
constexpr char kJournal[] = "CLIPHOST_TINY_MODULE_JOURNAL";

std::atomic<int> liveObjects{0};

void Note(char call) {
    if (const char* address = std::getenv(kJournal)) {
        auto* journal = reinterpret_cast<char*>(std::strtoull(address, nullptr, 16));
        while (*journal != '\0') {
            ++journal;
        }
        *journal = call;
    }
}

class Counted : public INCFClassFactory {
public:
    Counted() { ++liveObjects; }
    virtual ~Counted() { --liveObjects; }
    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        const bool known = iid == IID_INCFUnknown || iid == IID_INCFClassFactory;
        *out = known ? this : nullptr;
        if (known) {
            AddRef();
        }
        return known ? NCF_OK : NCF_E_NOINTERFACE;
    }
    ncfUInt32 AddRef() override { return ++references_; }
    ncfUInt32 Release() override {
        const ncfUInt32 left = --references_;
        if (left == 0) {
            delete this;
        }
        return left;
    }
    // The thing that this factory makes is another of its kind.
    NCFRESULT CreateInstance(INCFUnknown*, INCFUnknown* outer, const GUID& iid,
                             void** out) override {
        if (out == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *out = nullptr;
        if (outer != nullptr) {
            return NCF_CLASS_E_NOAGGREGATION;
        }
        auto* made = new Counted;
        const NCFRESULT result = made->QueryInterface(iid, out);
        made->Release();
        return result;
    }

private:
    std::atomic<ncfUInt32> references_{1};
};

template <class Definition>
NCFRESULT CreateDefinition(INCFUnknown* host, const GUID& component, Definition** out) {
    *out = nullptr;
    void* factory = nullptr;
    NCFRESULT result = host->QueryInterface(IID_INCFComponentFactory, &factory);
    if (result < 0) {
        return result;
    }
    void* made = nullptr;
    auto* creator = static_cast<INCFComponentFactory*>(factory);
    result = creator->CreateComponent(component, nullptr,
                                      ncfIdOf(static_cast<const Definition*>(nullptr)), &made);
    creator->Release();
    *out = static_cast<Definition*>(made);
    return result;
}

// Keeps a definition that was filled in; releases another.
template <class Definition>
NCFRESULT WholeOrNothing(NCFRESULT result, Definition** out) {
    if (result < 0) {
        (*out)->Release();
        *out = nullptr;
    }
    return result;
}

}  // namespace

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterPlugin(INCFUnknown* host, INCFPluginDefinition** out) {
    Note('P');
    if (host == nullptr || out == nullptr) {
        return NCF_E_POINTER;
    }
#ifdef FAULT_plugin_refuses
    return NCF_E_ACCESSDENIED;
#endif
#ifdef FAULT_no_definition
    *out = nullptr;
    return NCF_OK;
#endif
    NCFRESULT result = CreateDefinition(host, CompID_PluginDefinition, out);
    if (result < 0) {
        return result;
    }
#ifdef FAULT_too_many_components
    const ncfUInt32 count = 0xFFFFFFFF;
#else
    const ncfUInt32 count = 2;
#endif
    result = (*out)->SetAttribute(kSomeId, kNCFValueTypeText, "a tiny module", 0xFFFFFFFF);
    if (result >= 0) {
        result = (*out)->Define(kSomeId, 1, 3, "Tiny", kSomeId, "Nobody", count, 1);
    }
    return WholeOrNothing(result, out);
}

NCF_PLUGIN_EXPORT NCFRESULT NCFRegisterComponent(INCFUnknown* host, ncfUInt32 index,
                                                 INCFComponentDefinition** out) {
    Note(static_cast<char>('0' + index));
    if (host == nullptr || out == nullptr) {
        return NCF_E_POINTER;
    }
    *out = nullptr;
    if (index > 1) {
        return NCF_E_INVALIDARG;
    }
#ifdef FAULT_component_refuses
    if (index == 1) {
        return NCF_E_INVALIDARG;
    }
#endif
#ifdef FAULT_no_component_definition
    *out = nullptr;
    return NCF_OK;
#endif
    const NCFRESULT result = CreateDefinition(host, CompID_ComponentDefinition, out);
    if (result < 0) {
        return result;
    }
    return WholeOrNothing(index == 0
                              ? (*out)->Define(kThingComponent, kSomeId, 1, 3, kThingClass, "Thing")
                              : (*out)->Define(kShyComponent, kSomeId, 1, 1, kShyClass, "Shy"),
                          out);
}

#ifndef FAULT_no_class_factory
NCF_PLUGIN_EXPORT NCFRESULT NCFGetClassFactory(INCFUnknown* host, const GUID& classId,
                                               const GUID& interfaceId, void** out) {
    if (host == nullptr || out == nullptr) {
        return NCF_E_INVALIDARG;
    }
    *out = nullptr;
    if (!(classId == kThingClass)) {
        return NCF_CLASS_E_CLASSNOTAVAILABLE;
    }
    auto* made = new Counted;
    const NCFRESULT result = made->QueryInterface(interfaceId, out);
    made->Release();
#ifdef FAULT_hands_out_and_refuses
    return NCF_E_ACCESSDENIED;
#endif
    return result;
}
#endif

NCF_PLUGIN_EXPORT NCFRESULT NCFCanUnloadNow(INCFUnknown* host) {
    Note('U');
    if (host == nullptr) {
        return NCF_E_INVALIDARG;
    }
#ifdef FAULT_never_unloads
    return NCF_E_FAIL;
#endif
    return liveObjects.load() == 0 ? NCF_OK : NCF_E_FAIL;
}

NCF_PLUGIN_EXPORT NCFRESULT NCFStartup(INCFUnknown*) {
    Note('S');
#ifdef FAULT_startup_refuses
    return NCF_E_OUTOFMEMORY;
#endif
    return NCF_OK;
}

#ifdef FAULT_further_export
NCF_PLUGIN_EXPORT int FurtherFunction() {
    return 1;
}
#endif

#ifndef FAULT_no_shutdown
NCF_PLUGIN_EXPORT NCFRESULT NCFShutdown(INCFUnknown*) {
    Note('E');
    return NCF_OK;
}
#endif
