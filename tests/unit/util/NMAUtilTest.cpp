// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMAUtil.h"

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
