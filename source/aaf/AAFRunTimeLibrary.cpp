// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/AAFRunTimeLibrary.h"

#include <utility>

#include "host_interfaces/aaf/AAFResultCodes.h"
#include "source/plugin/os/Os.h"

namespace NMA::Impl {
namespace {

// A library that lacks one of these is none of this kind.
constexpr const char* kRequiredFunctions[] = {
    "AAFFileOpenExistingRead", "AAFFileOpenExistingModify", "AAFFileOpenNewModify",
    "AAFFileOpenTransient",    "AAFFileIsAAFFile",          "AAFGetPluginManager",
};

// A library with memory storage has all three.
constexpr const char* kMemoryStorageFunctions[] = {
    "AAFCreateRawStorageMemory",
    "AAFCreateRawStorageDisk",
    "AAFCreateAAFFileOnRawStorage",
};

}  // namespace

AAFRunTimeLibrary::AAFRunTimeLibrary(LibraryAccess access) : access_(access) {}

AAFRunTimeLibrary& AAFRunTimeLibrary::Instance() {
    // Never destroyed: a description may still run while the process ends.
    static auto* const library = new AAFRunTimeLibrary({os::LoadLibraryByName, os::FindSymbol});
    return *library;
}

AAFRESULT AAFRunTimeLibrary::Load() {
    void* const library = access_.load(kAAFLibraryName);
    if (!library) {
        return AAFRESULT_DLL_LOAD_FAILED;
    }
    for (const char* name : kRequiredFunctions) {
        if (!access_.find(library, name)) {
            return AAFRESULT_DLL_SYMBOL_NOT_FOUND;
        }
    }
    if (access_.find(library, kMemoryStorageFunctions[0])) {
        for (const char* name : kMemoryStorageFunctions) {
            if (!access_.find(library, name)) {
                return AAFRESULT_DLL_SYMBOL_NOT_FOUND;
            }
        }
    }
    openTransient_ = reinterpret_cast<AAFFileOpenTransientFunction>(
        access_.find(library, "AAFFileOpenTransient"));
    return AAFRESULT_SUCCESS;
}

AAFRESULT AAFRunTimeLibrary::OpenTransient(aafProductIdentification_t* ident, IAAFFile** file) {
    AAFFileOpenTransientFunction open = nullptr;
    {
        const std::lock_guard<std::mutex> lock(mutex_);
        if (!openTransient_) {
            const AAFRESULT loaded = Load();
            if (loaded < 0) {
                return loaded;
            }
        }
        open = openTransient_;
    }
    return open(ident, file);
}

LibraryAccess AAFRunTimeLibrary::SetAccess(LibraryAccess access) {
    const std::lock_guard<std::mutex> lock(mutex_);
    openTransient_ = nullptr;
    return std::exchange(access_, access);
}

AAFRESULT AAFFileOpenTransient(aafProductIdentification_t* ident, IAAFFile** file) {
    return AAFRunTimeLibrary::Instance().OpenTransient(ident, file);
}

}  // namespace NMA::Impl
