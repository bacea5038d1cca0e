// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Console.h"
#include "host_interfaces/util/NMAUtilExport.h"

// Line logger of the process. Levels in use: 1 errors, 4 unload, 8 details.
//
// Implemented by the utility library, as everything in this folder; the module keeps
// one for its life. Works before NMAInitialize and after NMATerminate. Thread-safe.
class NMAUTIL_API NMALogger {
public:
    NMALogger();
    ~NMALogger();
    NMALogger(const NMALogger&) = delete;
    NMALogger& operator=(const NMALogger&) = delete;

    // Name that starts each line; UTF-8, copied.
    void SetName(const char* name);
    // Writes one formatted line; texts are UTF-8, zero-terminated.
    void Write(ncfUInt32 level, const char* format, ...) NCF_PRINTF(3, 4);

private:
    struct State;
    State* state_;
};

// Receives every line of every logger instead of standard error; null brings
// standard error back. For hosts and tests. `line` has no line end.
using NMALogFunction = void (*)(void* context, ncfUInt32 level, const char* name, const char* line);
NMAUTIL_API void NMASetLogFunction(NMALogFunction function, void* context);
// Lines above this level are dropped; starts at 1.
NMAUTIL_API void NMASetLogLevel(ncfUInt32 level);
