// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Compiler.h"
#include "host_interfaces/framework/Unknown.h"

// The user's console: lines of text with a level. Levels in use: 1 failures shown
// to the user, 2 notices, 4 details.
//
// Implemented by the host; the module queries the host unknown for it when an
// object is made, and writes at any time. Thread-safe. What goes in is formatted
// during the call, so nothing has to outlive it.
struct INCFConsole : INCFUnknown {
    virtual NCFRESULT ReservedConsoleOperationA() { return NCF_E_NOTIMPL; }  // 3
    virtual NCFRESULT ReservedConsoleOperationB() { return NCF_E_NOTIMPL; }  // 4
    // 5. Writes a formatted line; texts are UTF-8, zero-terminated. Text that comes
    // from a file is an argument, never the format.
    virtual NCFRESULT Write(ncfUInt32 level, const char* format, ...) NCF_PRINTF(3, 4) = 0;

protected:
    ~INCFConsole() = default;
};

inline constexpr GUID IID_INCFConsole = ncfGuid("908C3A6B-F119-11D6-AD24-00039383008C");
constexpr const GUID& ncfIdOf(const INCFConsole*) {
    return IID_INCFConsole;
}
