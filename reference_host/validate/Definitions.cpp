// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/validate/Definitions.h"

#include "reference_host/framework/Component.h"

namespace validate {
namespace {

NCFRESULT Count(DefinitionCalls& calls) {
    return ++calls.all == calls.refused ? NCF_E_OUTOFMEMORY : NCF_OK;
}

NCFRESULT CountDefine(DefinitionCalls& calls) {
    ++calls.defines;
    const NCFRESULT result = Count(calls);
    calls.wasDefineRefused = calls.wasDefineRefused || result < 0;
    return result;
}

class CountingPlugin final : public host::Component<INCFPluginDefinition> {
public:
    explicit CountingPlugin(DefinitionCalls& calls) : calls_(calls) {}
    NCFRESULT SetAttribute(const GUID&, const GUID&, const void*, ncfUInt32) override {
        return Count(calls_);
    }
    NCFRESULT Define(const GUID&, ncfUInt32, ncfUInt32, const char*, const GUID&, const char*,
                     ncfUInt32, ncfUInt32) override {
        return CountDefine(calls_);
    }

private:
    DefinitionCalls& calls_;
};

class CountingComponent final : public host::Component<INCFComponentDefinition> {
public:
    explicit CountingComponent(DefinitionCalls& calls) : calls_(calls) {}
    NCFRESULT SetAttribute(const GUID&, const GUID&, const void*, ncfUInt32) override {
        return Count(calls_);
    }
    NCFRESULT Define(const GUID&, const GUID&, ncfUInt32, ncfUInt32, const GUID&,
                     const char*) override {
        return CountDefine(calls_);
    }

private:
    DefinitionCalls& calls_;
};

}  // namespace

void RegisterCountingDefinitions(host::Host& host, DefinitionCalls& calls) {
    host.RegisterComponent(CompID_PluginDefinition, host::MakerOf([&calls](INCFUnknown*) {
                               return host::MakeRef<CountingPlugin>(calls);
                           }));
    host.RegisterComponent(CompID_ComponentDefinition, host::MakerOf([&calls](INCFUnknown*) {
                               return host::MakeRef<CountingComponent>(calls);
                           }));
}

}  // namespace validate
