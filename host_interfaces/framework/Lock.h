// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// A recursive lock: one thread may take it several times and gives it back as
// often.
//
// Implemented by the host as a component, so that module and host wait in the same
// way. The module creates one for its log at NCFStartup and one for each sample
// mapping, and holds it for as long as a frame takes. Both operations may be called
// on any thread, at once.
struct INCFLock : INCFUnknown {
    virtual NCFRESULT Lock() = 0;  // 3. Waits without limit.
    // 4. By the thread that holds it; by another, NCF_E_FAIL.
    virtual NCFRESULT Unlock() = 0;

protected:
    ~INCFLock() = default;
};

inline constexpr GUID CompID_LockComponent = ncfGuid("A416643C-06F8-4FD3-9D31-D7BDC4D42422");
inline constexpr GUID IID_LockComponent = ncfGuid("39F783E7-5279-4E3E-96B8-C786A4E65DF9");
constexpr const GUID& ncfIdOf(const INCFLock*) {
    return IID_LockComponent;
}
