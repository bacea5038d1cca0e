// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

// A recursive lock of the host: one thread may take it several times and gives
// it back as often.
struct INCFLock : INCFUnknown {
    virtual NCFRESULT Lock() = 0;    // 3. Waits without limit.
    virtual NCFRESULT Unlock() = 0;  // 4. Only by the thread that holds it.

protected:
    ~INCFLock() = default;
};

inline constexpr GUID CompID_LockComponent = ncfGuid("A416643C-06F8-4FD3-9D31-D7BDC4D42422");
inline constexpr GUID IID_LockComponent = ncfGuid("39F783E7-5279-4E3E-96B8-C786A4E65DF9");
constexpr const GUID& ncfIdOf(const INCFLock*) {
    return IID_LockComponent;
}
