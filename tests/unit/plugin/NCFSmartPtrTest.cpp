// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/NCFSmartPtr.h"

#include <gtest/gtest.h>

#include "host_interfaces/framework/Lock.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/FakeLock.h"

namespace {

// An object with one reference that the test holds.
class SmartPointer : public ::testing::Test {
protected:
    ~SmartPointer() override {
        EXPECT_EQ(object->references(), 1u);
        object->Release();
        EXPECT_EQ(LiveFakes(), 0);
    }
    FakeLock* object = new FakeLock;
};

TEST_F(SmartPointer, IsNullByDefault) {
    EXPECT_TRUE(NCFSmartPtr<INCFLock>().isNull());
    EXPECT_EQ(NCFSmartPtr<INCFLock>().inArg(), nullptr);
}

TEST_F(SmartPointer, TakesAReferenceOfItsOwnFromARawPointer) {
    NCFSmartPtr<INCFLock> pointer(object);
    EXPECT_EQ(object->references(), 2u);
}

TEST_F(SmartPointer, TakesAReferenceOfItsOwnFromASmartPointer) {
    NCFSmartPtr<INCFLock> first(object);
    NCFSmartPtr<INCFLock> second(first);
    NCFSmartPtr<INCFLock> third;
    third = second;
    EXPECT_EQ(object->references(), 4u);
    third = nullptr;
    EXPECT_EQ(object->references(), 3u);
}

TEST_F(SmartPointer, AssignmentToItselfKeepsTheReference) {
    NCFSmartPtr<INCFLock> pointer(object);
    NCFSmartPtr<INCFLock>& same = pointer;
    pointer = same;
    EXPECT_EQ(object->references(), 2u);
    EXPECT_EQ(pointer.inArg(), object);
}

TEST_F(SmartPointer, ThrowsPointerWhenANullOneIsFollowed) {
    NCFSmartPtr<INCFLock> pointer;
    try {
        pointer->Lock();
        FAIL() << "nothing was thrown";
    } catch (NCFRESULT thrown) {
        EXPECT_EQ(thrown, NCF_E_POINTER);
    }
}

TEST_F(SmartPointer, PassesThePointerOnWithoutAReference) {
    NCFSmartPtr<INCFLock> pointer(object);
    EXPECT_EQ(pointer.inArg(), object);
    EXPECT_EQ(object->references(), 2u);
}

TEST_F(SmartPointer, ReleasesAndNullsBeforeACalleeFillsIt) {
    NCFSmartPtr<INCFLock> pointer(object);
    INCFLock** const place = pointer.outArg();
    EXPECT_EQ(object->references(), 1u);
    EXPECT_EQ(*place, nullptr);
}

TEST_F(SmartPointer, KeepsWhatItHoldsWhenACalleeMayReplaceIt) {
    NCFSmartPtr<INCFLock> pointer(object);
    EXPECT_EQ(*pointer.inOutArg(), object);
    EXPECT_EQ(object->references(), 2u);
}

TEST_F(SmartPointer, GivesItsReferenceUp) {
    NCFSmartPtr<INCFLock> pointer(object);
    INCFLock* const detached = pointer.detach();
    EXPECT_TRUE(pointer.isNull());
    EXPECT_EQ(object->references(), 2u);
    detached->Release();
}

TEST_F(SmartPointer, ThrowsPointerWhenANullOneIsToGiveItsReferenceUp) {
    NCFSmartPtr<INCFLock> pointer;
    EXPECT_THROW(pointer.detach(), NCFRESULT);
}

TEST_F(SmartPointer, ReleasesAtTheEndOfItsScope) {
    { NCFSmartPtr<INCFLock> pointer(object); }
    EXPECT_EQ(object->references(), 1u);
}

TEST_F(SmartPointer, CreatesAComponentAndLetsGoOfTheFormerOne) {
    FakeHost host;
    host.maker(CompID_LockComponent, [&](const GUID&, void** out) {
        object->AddRef();
        *out = static_cast<INCFLock*>(object);
        return NCF_OK;
    });
    FakeLock* const former = new FakeLock;
    NCFSmartPtr<INCFLock> pointer(former);
    former->Release();
    EXPECT_EQ(ncfCreate(host.factory(), CompID_LockComponent, IID_LockComponent, pointer), NCF_OK);
    EXPECT_EQ(pointer.inArg(), object);
}

TEST_F(SmartPointer, IsNullAfterARefusedCreation) {
    FakeHost host;
    NCFSmartPtr<INCFLock> pointer(object);
    EXPECT_EQ(ncfCreate(host.factory(), CompID_LockComponent, IID_LockComponent, pointer),
              NCF_CLASS_E_CLASSNOTAVAILABLE);
    EXPECT_TRUE(pointer.isNull());
}

TEST_F(SmartPointer, AsksForAnInterfaceByItsType) {
    NCFSmartPtr<INCFLock> pointer;
    EXPECT_EQ(ncfQuery(object, pointer), NCF_OK);
    EXPECT_EQ(pointer.inArg(), object);
    NCFSmartPtr<INCFConsole> console;
    EXPECT_EQ(ncfQuery(object, console), NCF_E_NOINTERFACE);
    EXPECT_TRUE(console.isNull());
    EXPECT_EQ(ncfQuery<INCFLock>(nullptr, IID_LockComponent, pointer), NCF_E_POINTER);
}

}  // namespace
