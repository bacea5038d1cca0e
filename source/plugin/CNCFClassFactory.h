// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/ComponentFactory.h"
#include "source/plugin/CNCFUnknown.h"

// Makes objects of one class. The host gets a new one with each request, and
// as long as it keeps one the module counts as in use.
class CNCFClassFactory final : public INCFClassFactory, public CNCFUnknown {
public:
    // A factory around `creator`, asked for `iid`; a refused query destroys it.
    static NCFRESULT Create(CreationFunction creator, const GUID& iid, void** out);

    NCFRESULT QueryInterface(const GUID& iid, void** out) override;
    ncfUInt32 AddRef() override;
    ncfUInt32 Release() override;

    NCFRESULT CreateInstance(INCFUnknown* host, INCFUnknown* outer, const GUID& iid,
                             void** out) override;

    NCFRESULT InternalQueryInterface(const GUID& iid, void** out) override;

    // For tests of a factory without creation function.
    explicit CNCFClassFactory(CreationFunction creator) : creator_(creator) {}

private:
    CreationFunction creator_;
};
