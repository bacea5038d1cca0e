// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/HostUnknown.h"

namespace host {

HostUnknown::HostUnknown(Ref<ComponentFactory> factory, Ref<Console> console)
    : factory_(std::move(factory)), console_(std::move(console)) {}

NCFRESULT HostUnknown::QueryInterface(const GUID& iid, void** out) {
    if (iid == IID_INCFComponentFactory) {
        return factory_->QueryInterface(iid, out);
    }
    if (iid == IID_INCFConsole) {
        return console_->QueryInterface(iid, out);
    }
    return Component::QueryInterface(iid, out);
}

void* HostUnknown::FindInterface(const GUID& iid) {
    // The mark of a host has no operations: the object itself will do.
    return iid == IID_INCFHostUnknown ? Identity() : Component::FindInterface(iid);
}

}  // namespace host
