// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>
#include <tuple>

#include "host_interfaces/framework/Unknown.h"
#include "reference_host/framework/ObjectCount.h"
#include "reference_host/framework/QueryRule.h"

namespace host {

// Base of every object that the host hands out. A class names the interfaces
// that it implements, and each answers to its own id:
//
//   class RecursiveLock final : public Component<INCFLock> { ... };
//   Ref<RecursiveLock> lock = MakeRef<RecursiveLock>();
//
// An object starts with one reference, MakeRef's, and ends with the last. An
// interface that answers to a further id is found by overriding FindInterface.
template <class First, class... Others>
class Component : public First, public Others... {
public:
    Component(const Component&) = delete;
    Component& operator=(const Component&) = delete;

    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        if (out == nullptr) {
            return NCF_E_INVALIDARG;
        }
        *out = nullptr;
        const NCFRESULT allowed = AskQueryRule(iid);
        if (allowed < 0) {
            return allowed;
        }
        *out = FindInterface(iid);
        if (*out == nullptr) {
            return NCF_E_NOINTERFACE;
        }
        AddRef();
        return NCF_OK;
    }

    ncfUInt32 AddRef() override { return references_.fetch_add(1, std::memory_order_relaxed) + 1; }

    ncfUInt32 Release() override {
        const ncfUInt32 left = DropReference();
        if (left == 0) {
            delete this;
        }
        return left;
    }

    // The object's identity: equal for all roads to it.
    INCFUnknown* Identity() { return static_cast<INCFUnknown*>(static_cast<First*>(this)); }

protected:
    Component() = default;
    virtual ~Component() = default;

    // Takes one reference away and ends nothing: for a Release of another kind.
    ncfUInt32 DropReference() { return references_.fetch_sub(1, std::memory_order_acq_rel) - 1; }

    // The interface's address without a new reference, null when there is none.
    virtual void* FindInterface(const GUID& iid) {
        if (iid == IID_INCFUnknown) {
            return Identity();
        }
        void* found = nullptr;
        Match<First>(iid, found);
        (Match<Others>(iid, found), ...);
        return found;
    }

private:
    template <class Interface>
    void Match(const GUID& iid, void*& found) {
        if (found == nullptr && iid == ncfIdOf(static_cast<const Interface*>(nullptr))) {
            found = static_cast<Interface*>(this);
        }
    }

    std::atomic<ncfUInt32> references_{1};
    CountedObject counted_;
};

}  // namespace host
