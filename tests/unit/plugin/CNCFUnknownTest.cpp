// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/CNCFUnknown.h"

#include <gtest/gtest.h>

#include "source/plugin/CNCFClassFactory.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/FakeLock.h"
#include "tests/unit/plugin/TestComponent.h"

namespace {

class Component : public ::testing::Test {
protected:
    Component() {
        TestComponent::journal = &journal;
        TestComponent::initializeResult = NCF_OK;
        TestComponent::refuseMemory = false;
    }
    ~Component() override {
        TestComponent::journal = nullptr;
        TestComponent::refuseMemory = false;
        EXPECT_EQ(GetObjectCount(), 0u);
    }

    NCFRESULT create(const GUID& iid, void** out, INCFUnknown* outer = nullptr) {
        return CreateInstanceOf<TestComponent>(host.unknown(), outer, iid, out);
    }

    Journal journal;
    FakeHost host;
};

TEST_F(Component, IsMadeInitializedAndAnswersTheInterfaceAskedFor) {
    IFirst* first = nullptr;
    ASSERT_EQ(create(IID_First, reinterpret_cast<void**>(&first)), NCF_OK);
    EXPECT_EQ(first->First(), 1u);
    EXPECT_EQ(GetObjectCount(), 1u);
    EXPECT_EQ(journal.lines(), (std::vector<std::string>{"made", "initialized"}));
    EXPECT_EQ(first->Release(), 0u);
    EXPECT_EQ(journal.lines().back(), "destroyed");
    EXPECT_EQ(journal.count("final release"), 1);
}

TEST_F(Component, CountsReferencesOverAllItsInterfaces) {
    IFirst* first = nullptr;
    ASSERT_EQ(create(IID_First, reinterpret_cast<void**>(&first)), NCF_OK);
    ISecond* second = nullptr;
    ASSERT_EQ(first->QueryInterface(IID_Second, reinterpret_cast<void**>(&second)), NCF_OK);
    EXPECT_EQ(second->Second(), 2u);
    EXPECT_EQ(second->AddRef(), 3u);
    EXPECT_EQ(first->Release(), 2u);
    EXPECT_EQ(first->Release(), 1u);
    EXPECT_EQ(second->Release(), 0u);
}

TEST_F(Component, HasOneIdentityBehindAllItsInterfaces) {
    IFirst* first = nullptr;
    ASSERT_EQ(create(IID_First, reinterpret_cast<void**>(&first)), NCF_OK);
    ISecond* second = nullptr;
    first->QueryInterface(IID_Second, reinterpret_cast<void**>(&second));
    void* one = nullptr;
    void* other = nullptr;
    first->QueryInterface(IID_INCFUnknown, &one);
    second->QueryInterface(IID_INCFUnknown, &other);
    EXPECT_EQ(one, other);
    EXPECT_NE(one, static_cast<void*>(first));
    static_cast<INCFUnknown*>(one)->Release();
    static_cast<INCFUnknown*>(other)->Release();
    second->Release();
    first->Release();
}

TEST_F(Component, RefusesAnUnknownInterfaceAndNullsTheOutput) {
    void* out = reinterpret_cast<void*>(&host);
    EXPECT_EQ(create(IID_LockComponent, &out), NCF_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(journal.lines(),
              (std::vector<std::string>{"made", "initialized", "final release", "destroyed"}));
}

TEST_F(Component, RefusesAQueryWithoutOutput) {
    TestComponent object(nullptr);
    EXPECT_EQ(object.InternalQueryInterface(IID_First, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(object.InternalQueryInterface(IID_LockComponent, nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(object.CNCFUnknown::InternalQueryInterface(IID_INCFUnknown, nullptr),
              NCF_E_INVALIDARG);
}

TEST_F(Component, IsDestroyedWithoutFinalReleaseWhenInitializingFails) {
    TestComponent::initializeResult = NCF_E_HANDLE;
    void* out = reinterpret_cast<void*>(&host);
    EXPECT_EQ(create(IID_First, &out), NCF_E_HANDLE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(journal.lines(), (std::vector<std::string>{"made", "initialized", "destroyed"}));
}

TEST_F(Component, TellsThatMemoryRanOut) {
    TestComponent::refuseMemory = true;
    void* out = reinterpret_cast<void*>(&host);
    EXPECT_EQ(create(IID_First, &out), NCF_E_OUTOFMEMORY);
    EXPECT_EQ(out, nullptr);
    EXPECT_TRUE(journal.lines().empty());
}

TEST_F(Component, SendsItsRootOperationsToTheObjectThatAggregatesIt) {
    auto* const outer = new FakeLock;
    INCFUnknown* inner = nullptr;
    ASSERT_EQ(create(IID_INCFUnknown, reinterpret_cast<void**>(&inner), outer), NCF_OK);
    EXPECT_EQ(outer->references(), 1u) << "the controlling object is never counted";

    void* identity = nullptr;
    inner->QueryInterface(IID_INCFUnknown, &identity);
    EXPECT_EQ(identity, inner) << "the private unknown answers for itself";
    EXPECT_NE(identity, static_cast<void*>(outer));
    static_cast<INCFUnknown*>(identity)->Release();

    // References through any of its interfaces count on the outer object.
    IFirst* first = nullptr;
    ASSERT_EQ(inner->QueryInterface(IID_First, reinterpret_cast<void**>(&first)), NCF_OK);
    EXPECT_EQ(outer->references(), 2u);
    void* lock = nullptr;
    EXPECT_EQ(first->QueryInterface(IID_LockComponent, &lock), NCF_OK);
    EXPECT_EQ(lock, static_cast<INCFLock*>(outer));
    static_cast<INCFLock*>(lock)->Release();
    first->Release();
    EXPECT_EQ(outer->references(), 1u);

    EXPECT_EQ(inner->Release(), 0u);
    outer->Release();
}

// --- class factories ---------------------------------------------------------

TEST_F(Component, ComesFromAClassFactory) {
    INCFClassFactory* factory = nullptr;
    ASSERT_EQ(CNCFClassFactory::Create(&CreateInstanceOf<TestComponent>, IID_INCFClassFactory,
                                       reinterpret_cast<void**>(&factory)),
              NCF_OK);
    EXPECT_EQ(GetObjectCount(), 1u) << "a factory holds the module loaded";
    IFirst* first = nullptr;
    ASSERT_EQ(factory->CreateInstance(host.unknown(), nullptr, IID_First,
                                      reinterpret_cast<void**>(&first)),
              NCF_OK);
    EXPECT_EQ(GetObjectCount(), 2u);
    first->Release();
    EXPECT_EQ(factory->Release(), 0u);
}

TEST_F(Component, ClassFactoryRefusesAnInterfaceAndIsDestroyed) {
    void* out = reinterpret_cast<void*>(&host);
    EXPECT_EQ(CNCFClassFactory::Create(&CreateInstanceOf<TestComponent>, IID_First, &out),
              NCF_E_NOINTERFACE);
    EXPECT_EQ(out, nullptr);
    EXPECT_EQ(GetObjectCount(), 0u);
}

TEST_F(Component, ClassFactoryNeedsACreatorAndAnOutput) {
    void* out = nullptr;
    EXPECT_EQ(CNCFClassFactory::Create(nullptr, IID_INCFClassFactory, &out), NCF_E_INVALIDARG);
    EXPECT_EQ(
        CNCFClassFactory::Create(&CreateInstanceOf<TestComponent>, IID_INCFClassFactory, nullptr),
        NCF_E_INVALIDARG);
}

TEST_F(Component, ClassFactoryRefusesItsQueryWithoutOutput) {
    CNCFClassFactory factory(&CreateInstanceOf<TestComponent>);
    EXPECT_EQ(factory.InternalQueryInterface(IID_INCFClassFactory, nullptr), NCF_E_INVALIDARG);
}

TEST_F(Component, ClassFactoryWithoutCreatorIsUnexpected) {
    CNCFClassFactory factory(nullptr);
    void* out = nullptr;
    EXPECT_EQ(factory.CreateInstance(host.unknown(), nullptr, IID_First, &out), NCF_E_UNEXPECTED);
}

TEST_F(Component, ClassFactoryNeedsAHostAndAnOutputForAnInstance) {
    CNCFClassFactory factory(&CreateInstanceOf<TestComponent>);
    void* out = nullptr;
    EXPECT_EQ(factory.CreateInstance(nullptr, nullptr, IID_First, &out), NCF_E_INVALIDARG);
    EXPECT_EQ(factory.CreateInstance(host.unknown(), nullptr, IID_First, nullptr),
              NCF_E_INVALIDARG);
}

TEST_F(Component, AggregatedCreationAsksForTheIdentityOnly) {
    CNCFClassFactory factory(&CreateInstanceOf<TestComponent>);
    FakeLock* const outer = new FakeLock;
    void* out = reinterpret_cast<void*>(&host);
    EXPECT_EQ(factory.CreateInstance(host.unknown(), outer, IID_First, &out),
              NCF_CLASS_E_NOAGGREGATION);
    EXPECT_EQ(out, nullptr);
    EXPECT_TRUE(journal.lines().empty()) << "no object is made";
    ASSERT_EQ(factory.CreateInstance(host.unknown(), outer, IID_INCFUnknown, &out), NCF_OK);
    static_cast<INCFUnknown*>(out)->Release();
    outer->Release();
}

// Host code counts places in the table; a destructor takes two here.
TEST_F(Component, KeepsTheOrderOfItsVirtualOperations) {
    TestComponent object(nullptr);
    CNCFUnknown* const base = &object;
    using Initialize = NCFRESULT (*)(CNCFUnknown*, INCFUnknown*);
    using Count = ncfUInt32 (*)(CNCFUnknown*);
    using Plain = void (*)(CNCFUnknown*);
    void** const table = *reinterpret_cast<void***>(base);
    journal.clear();
    EXPECT_EQ(reinterpret_cast<Initialize>(table[2])(base, nullptr), NCF_OK);
    EXPECT_EQ(journal.lines().back(), "initialized");
    reinterpret_cast<Plain>(table[3])(base);
    EXPECT_EQ(journal.lines().back(), "final release");
    EXPECT_EQ(reinterpret_cast<Count>(table[6])(base), 1u);
    EXPECT_EQ(reinterpret_cast<Count>(table[6])(base), 2u);
    EXPECT_EQ(reinterpret_cast<Count>(table[7])(base), 1u);

    using Query = NCFRESULT (*)(CNCFUnknown*, const GUID*, void**);
    void* found = nullptr;
    EXPECT_EQ(reinterpret_cast<Query>(table[5])(base, &IID_First, &found), NCF_OK);
    EXPECT_EQ(found, static_cast<IFirst*>(&object));
    EXPECT_EQ(static_cast<IFirst*>(found)->Release(), 1u);

    journal.clear();
    CNCFUnknown* const other = new (std::nothrow) TestComponent(nullptr);
    reinterpret_cast<Plain>(table[4])(other);
    EXPECT_EQ(journal.lines(), (std::vector<std::string>{"made", "destroyed"}));
}

}  // namespace
