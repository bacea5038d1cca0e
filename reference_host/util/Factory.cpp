// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/Factory.h"

#include <mutex>

namespace host::util {

namespace {

struct Kept {
    std::mutex mutex;
    INCFComponentFactory* factory = nullptr;
};

// Never destroyed: modules that use the library stay mapped to the end of the
// process, when the factory's owner may be gone already.
Kept& TheKept() {
    static Kept* kept = new Kept;
    return *kept;
}

INCFComponentFactory* Borrowed() {
    Kept& kept = TheKept();
    const std::lock_guard<std::mutex> guard(kept.mutex);
    if (kept.factory != nullptr) {
        kept.factory->AddRef();
    }
    return kept.factory;
}

}  // namespace

void KeepFactory(INCFComponentFactory* factory) {
    if (factory != nullptr) {
        factory->AddRef();
    }
    Kept& kept = TheKept();
    INCFComponentFactory* former = nullptr;
    {
        const std::lock_guard<std::mutex> guard(kept.mutex);
        former = kept.factory;
        kept.factory = factory;
    }
    if (former != nullptr) {
        former->Release();
    }
}

NCFRESULT CreateHostString(INCFString** out) {
    if (out == nullptr) {
        return NCF_E_POINTER;
    }
    *out = nullptr;
    INCFComponentFactory* factory = Borrowed();
    if (factory == nullptr) {
        return NMA_E_NOTINITIALIZED;
    }
    void* made = nullptr;
    const NCFRESULT result =
        factory->CreateComponent(NCFCompID_NCFString, nullptr, IID_INCFString, &made);
    factory->Release();
    auto* const string = static_cast<INCFString*>(made);
    if (result >= 0) {
        *out = string;
    } else if (string != nullptr) {
        string->Release();
    }
    return result >= 0 && made == nullptr ? NCF_E_UNEXPECTED : result;
}

}  // namespace host::util
