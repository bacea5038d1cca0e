// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <mutex>

#include "host_interfaces/aaf/AAFExports.h"

namespace NMA::Impl {

// How a run-time library is found and asked for what it exports.
struct LibraryAccess {
    void* (*load)(const char* name);
    void* (*find)(void* library, const char* symbol);
};

// The AAF run-time library, loaded by its bare name on the first call of one
// of its functions and never unloaded. The name alone is what the published
// loader uses too, so the system's own search decides which build answers:
// run path, search-path variables, library cache. A host that wants a certain
// file loads it before the first description; on ELF systems a library that is
// in the process already is found by the name that it carries inside (its
// "soname"), and on Windows by the name of its file, whatever folder either
// came from.
class AAFRunTimeLibrary {
public:
    explicit AAFRunTimeLibrary(LibraryAccess access);

    // The one of the process.
    static AAFRunTimeLibrary& Instance();

    // Opens a file in memory. AAFRESULT_DLL_LOAD_FAILED without a library,
    // AAFRESULT_DLL_SYMBOL_NOT_FOUND when it lacks one of the functions that
    // every build exports; the next call tries again.
    AAFRESULT OpenTransient(aafProductIdentification_t* ident, IAAFFile** file);

    // Drops what was found and looks through `access` from now on; gives what
    // was used before. For tests.
    LibraryAccess SetAccess(LibraryAccess access);

private:
    AAFRESULT Load();

    std::mutex mutex_;  // several clips may be described at once
    LibraryAccess access_;
    AAFFileOpenTransientFunction openTransient_ = nullptr;
};

// The library's function of that name.
AAFRESULT AAFFileOpenTransient(aafProductIdentification_t* ident, IAAFFile** file);

}  // namespace NMA::Impl
