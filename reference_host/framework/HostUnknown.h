// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/framework/ComponentFactory.h"
#include "reference_host/framework/Console.h"

namespace host {

// What modules are given as "the host": the way to the component factory and
// the console, and nothing else.
class HostUnknown final : public Component<INCFUnknown> {
public:
    HostUnknown(Ref<ComponentFactory> factory, Ref<Console> console);

    NCFRESULT QueryInterface(const GUID& iid, void** out) override;

private:
    void* FindInterface(const GUID& iid) override;

    Ref<ComponentFactory> factory_;
    Ref<Console> console_;
};

}  // namespace host
