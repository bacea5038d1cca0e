// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>

#include "host_interfaces/framework/Unknown.h"

// Number of fakes alive: a test that ends with any has lost a reference.
int LiveFakes();

namespace fake_detail {
void CountFake(int step);
}

// Base of a fake that implements one chain of interfaces: counts references,
// dies with the last, and answers the interfaces in `Answers`.
// Made with `new` and a count of 1.
template <class Interface, class... Answers>
class FakeObject : public Interface {
public:
    FakeObject() { fake_detail::CountFake(1); }
    virtual ~FakeObject() { fake_detail::CountFake(-1); }
    FakeObject(const FakeObject&) = delete;
    FakeObject& operator=(const FakeObject&) = delete;

    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        *out = nullptr;
        const bool known = iid == IID_INCFUnknown ||
                           iid == ncfIdOf(static_cast<Interface*>(nullptr)) ||
                           (... || (iid == ncfIdOf(static_cast<Answers*>(nullptr))));
        if (!known) {
            return NCF_E_NOINTERFACE;
        }
        *out = static_cast<Interface*>(this);
        AddRef();
        return NCF_OK;
    }
    ncfUInt32 AddRef() override { return ++count_; }
    ncfUInt32 Release() override {
        const ncfUInt32 left = --count_;
        if (left == 0) {
            delete this;
        }
        return left;
    }
    ncfUInt32 references() const { return count_; }

private:
    std::atomic<ncfUInt32> count_{1};
};
