// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/util/Factory.h"

#include <mutex>
#include <utility>

namespace host::util {

namespace {

struct Kept {
    std::mutex mutex;
    Ref<INCFComponentFactory> factory;
};

// Never destroyed: modules that use the library stay mapped to the end of the
// process, when the factory's owner may be gone already.
Kept& TheKept() {
    static Kept* kept = new Kept;
    return *kept;
}

// In return for the one kept, which goes when nobody waits for it.
Ref<INCFComponentFactory> Exchange(Ref<INCFComponentFactory> factory) {
    Kept& kept = TheKept();
    const std::lock_guard<std::mutex> guard(kept.mutex);
    return std::exchange(kept.factory, std::move(factory));
}

Ref<INCFComponentFactory> Borrowed() {
    Kept& kept = TheKept();
    const std::lock_guard<std::mutex> guard(kept.mutex);
    return kept.factory;
}

}  // namespace

void KeepFactory(INCFComponentFactory* factory) {
    Exchange(Ref<INCFComponentFactory>(factory));
}

NCFRESULT CreateHostString(Ref<INCFString>& out) {
    out.Reset();
    const Ref<INCFComponentFactory> factory = Borrowed();
    if (!factory) {
        return NMA_E_NOTINITIALIZED;
    }
    const NCFRESULT result = Create(*factory, NCFCompID_NCFString, out);
    return result >= 0 && !out ? NCF_E_UNEXPECTED : result;
}

}  // namespace host::util
