// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Listeners.h"

#include <mutex>

#include "aaf_library/model/RefPtr.h"
#include "aaf_library/objects/Paths.h"
#include "host_interfaces/aaf/AAFFile.h"

namespace aaf {

namespace {

// Not destroyed at the end of the process: the listeners' code may be gone by
// then. Whoever sets one takes it back.
template <class Listener>
struct Slot {
    std::mutex lock;
    RefPtr<Listener> listener;
};

template <class Listener>
Slot<Listener>& SlotFor() {
    static Slot<Listener>* const slot = new Slot<Listener>;
    return *slot;
}

template <class Listener>
void Set(Listener* listener) {
    RefPtr<Listener> next(listener);
    {
        Slot<Listener>& slot = SlotFor<Listener>();
        const std::lock_guard<std::mutex> guard(slot.lock);
        std::swap(slot.listener, next);
    }
}

template <class Listener>
RefPtr<Listener> Get() {
    Slot<Listener>& slot = SlotFor<Listener>();
    const std::lock_guard<std::mutex> guard(slot.lock);
    return slot.listener;
}

}  // namespace

void SetProgressListener(IAAFProgress* progress) {
    Set(progress);
}

void SetDiagnosticListener(IAAFDiagnosticOutput* output) {
    Set(output);
}

void TellProgress() {
    if (const RefPtr<IAAFProgress> listener = Get<IAAFProgress>()) {
        listener->ProgressCallback();
    }
}

void TellDiagnostic(const std::string& utf8) {
    if (const RefPtr<IAAFDiagnosticOutput> listener = Get<IAAFDiagnosticOutput>()) {
        listener->PutString(WideOf(utf8).c_str());
    }
}

}  // namespace aaf
