// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMAUtil.h"

#include "reference_host/framework/ObjectCount.h"
#include "tests/unit/util/UtilFixture.h"

TEST(NMAUtil, StartNeedsAFactory) {
    EXPECT_EQ(NCF_E_POINTER, NMAInitialize(nullptr));
}

TEST(NMAUtil, StartAndStopAreNotCounted) {
    host::Host host;
    EXPECT_EQ(NCF_OK, NMATerminate());
    EXPECT_EQ(NCF_OK, NMAInitialize(&host.factory()));
    EXPECT_EQ(NCF_OK, NMAInitialize(&host.factory()));
    INCFString* made = nullptr;
    EXPECT_EQ(NCF_OK, NMAString::CreateString(&made));
    made->Release();
    EXPECT_EQ(NCF_OK, NMATerminate());
    EXPECT_EQ(NMA_E_NOTINITIALIZED, NMAString::CreateString(&made));
    EXPECT_EQ(NCF_OK, NMATerminate());
}

TEST(NMAUtil, KeepsAReferenceToTheFactoryFromStartToStop) {
    host::Host host;
    INCFComponentFactory& factory = host.factory();
    factory.AddRef();
    const ncfUInt32 before = factory.Release();
    NMAInitialize(&factory);
    factory.AddRef();
    EXPECT_EQ(before + 1, factory.Release());
    NMATerminate();
    factory.AddRef();
    EXPECT_EQ(before, factory.Release());
}

TEST(NMAUtil, AHostThatIsGoneMakesNothingAnyMore) {
    {
        host::Host host;
        NMAInitialize(&host.factory());
    }
    INCFString* made = nullptr;
    EXPECT_EQ(NCF_CLASS_E_CLASSNOTAVAILABLE, NMAString::CreateString(&made));
    NMATerminate();
}

namespace {

// Refuses every component, but leaves one that belongs to the asker.
class LeavingFactory final : public INCFComponentFactory {
public:
    NCFRESULT QueryInterface(const GUID&, void** out) override {
        *out = nullptr;
        return NCF_E_NOINTERFACE;
    }
    ncfUInt32 AddRef() override { return 2; }
    ncfUInt32 Release() override { return 1; }
    NCFRESULT CreateComponent(const GUID&, INCFUnknown*, const GUID&, void** out) override {
        *out = static_cast<INCFString*>(host::MakeString("left").Detach());
        return NCF_E_ACCESSDENIED;
    }
};

}  // namespace

TEST(NMAUtil, WhatAFailedCreationLeavesIsReleased) {
    const auto before = host::LiveObjectCount();
    LeavingFactory factory;
    NMAInitialize(&factory);
    INCFString* made = nullptr;
    EXPECT_EQ(NCF_E_ACCESSDENIED, NMAString::CreateString(&made));
    EXPECT_EQ(nullptr, made);
    NMATerminate();
    EXPECT_EQ(before, host::LiveObjectCount());
}
