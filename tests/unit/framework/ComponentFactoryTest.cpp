// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/ComponentFactory.h"

#include <gtest/gtest.h>

#include <new>
#include <thread>
#include <vector>

#include "reference_host/framework/Capability.h"
#include "reference_host/framework/Settings.h"

using host::Capability;
using host::ComponentFactory;
using host::CreationCall;
using host::MakeRef;
using host::Ref;

namespace {

class ComponentFactoryTest : public testing::Test {
protected:
    ComponentFactoryTest() {
        factory_->SetHost(host_->Identity());
        factory_->Register(CompID_Capability,
                           host::MakerOf([](INCFUnknown*) { return MakeRef<Capability>(); }));
    }

    NCFRESULT Create(const GUID& component, const GUID& iid) {
        void* out = this;
        const NCFRESULT result = factory_->CreateComponent(component, nullptr, iid, &out);
        EXPECT_EQ(result < 0, out == nullptr);
        if (out != nullptr) {
            static_cast<INCFUnknown*>(out)->Release();
        }
        return result;
    }

    Ref<ComponentFactory> factory_ = MakeRef<ComponentFactory>();
    Ref<Capability> host_ = MakeRef<Capability>();  // any object will do
};

}  // namespace

TEST_F(ComponentFactoryTest, MakesWhatIsRegistered) {
    EXPECT_EQ(NCF_OK, Create(CompID_Capability, IID_INCFCapability));
    Ref<INCFCapability> one;
    Ref<INCFCapability> two;
    ASSERT_EQ(NCF_OK, host::Create(*factory_, CompID_Capability, one));
    ASSERT_EQ(NCF_OK, host::Create(*factory_, CompID_Capability, two));
    EXPECT_NE(one.get(), two.get());
}

TEST_F(ComponentFactoryTest, RefusesWhatItDoesNotKnow) {
    EXPECT_EQ(NCF_CLASS_E_CLASSNOTAVAILABLE,
              Create(NMA::Impl::CompID_HostSettings, NMA::IID_IHostSettings));
    factory_->Unregister(CompID_Capability);
    EXPECT_EQ(NCF_CLASS_E_CLASSNOTAVAILABLE, Create(CompID_Capability, IID_INCFCapability));
}

TEST_F(ComponentFactoryTest, AnObjectWithoutTheInterfaceIsGoneAgain) {
    const std::int64_t before = host::LiveObjectCount();
    EXPECT_EQ(NCF_E_NOINTERFACE, Create(CompID_Capability, NMA::IID_IHostSettings));
    EXPECT_EQ(before, host::LiveObjectCount());
}

TEST_F(ComponentFactoryTest, OwnComponentsAreNotAggregated) {
    void* out = nullptr;
    EXPECT_EQ(
        NCF_CLASS_E_NOAGGREGATION,
        factory_->CreateComponent(CompID_Capability, host_->Identity(), IID_INCFUnknown, &out));
    EXPECT_EQ(NCF_E_POINTER,
              factory_->CreateComponent(CompID_Capability, nullptr, IID_INCFUnknown, nullptr));
}

TEST_F(ComponentFactoryTest, CreateInstanceIsTheSameCall) {
    void* out = nullptr;
    ASSERT_EQ(NCF_OK,
              factory_->CreateInstance(CompID_Capability, nullptr, IID_INCFCapability, &out));
    static_cast<INCFCapability*>(out)->Release();
}

TEST_F(ComponentFactoryTest, ARuleRefusesByComponentInterfaceAndNumber) {
    std::vector<std::pair<ncfUInt32, ncfUInt32>> seen;
    factory_->SetRule([&](const CreationCall& call) {
        seen.emplace_back(call.number, call.numberOfPair);
        const bool refused = call.component == CompID_Capability &&
                             call.iid == IID_INCFCapability && call.numberOfPair == 2;
        return refused ? NCF_E_ACCESSDENIED : NCF_OK;
    });
    EXPECT_EQ(NCF_OK, Create(CompID_Capability, IID_INCFCapability));
    EXPECT_EQ(NCF_OK, Create(CompID_Capability, IID_INCFUnknown));
    EXPECT_EQ(NCF_E_ACCESSDENIED, Create(CompID_Capability, IID_INCFCapability));
    EXPECT_EQ(NCF_OK, Create(CompID_Capability, IID_INCFCapability));
    EXPECT_EQ((std::vector<std::pair<ncfUInt32, ncfUInt32>>{{1, 1}, {2, 1}, {3, 2}, {4, 3}}), seen);
    factory_->SetRule({});
    EXPECT_EQ(NCF_OK, Create(CompID_Capability, IID_INCFCapability));
    EXPECT_EQ(4u, seen.size());
}

TEST_F(ComponentFactoryTest, AMakerThatThrowsIsAFailure) {
    factory_->Register(CompID_Capability,
                       [](INCFUnknown*, INCFUnknown*, const GUID&, void**) -> NCFRESULT {
                           throw std::bad_alloc();
                       });
    EXPECT_EQ(NCF_E_OUTOFMEMORY, Create(CompID_Capability, IID_INCFCapability));
    factory_->Register(
        CompID_Capability,
        [](INCFUnknown*, INCFUnknown*, const GUID&, void**) -> NCFRESULT { throw NCF_E_HANDLE; });
    EXPECT_EQ(NCF_E_HANDLE, Create(CompID_Capability, IID_INCFCapability));
    factory_->Register(
        CompID_Capability,
        [](INCFUnknown*, INCFUnknown*, const GUID&, void**) -> NCFRESULT { throw "a text"; });
    EXPECT_EQ(NCF_E_UNEXPECTED, Create(CompID_Capability, IID_INCFCapability));
}

TEST_F(ComponentFactoryTest, WhatAMakerHandsOutBeforeItFailsIsGivenBack) {
    const std::int64_t before = host::LiveObjectCount();
    factory_->Register(CompID_Capability,
                       [](INCFUnknown*, INCFUnknown*, const GUID&, void** out) -> NCFRESULT {
                           *out = MakeRef<Capability>().Detach();
                           return NCF_E_FAIL;
                       });
    EXPECT_EQ(NCF_E_FAIL, Create(CompID_Capability, IID_INCFCapability));
    EXPECT_EQ(before, host::LiveObjectCount());
    factory_->Register(CompID_Capability,
                       [](INCFUnknown*, INCFUnknown*, const GUID&, void** out) -> NCFRESULT {
                           *out = MakeRef<Capability>().Detach();
                           throw NCF_E_HANDLE;
                       });
    EXPECT_EQ(NCF_E_HANDLE, Create(CompID_Capability, IID_INCFCapability));
    EXPECT_EQ(before, host::LiveObjectCount());
}

TEST_F(ComponentFactoryTest, AMakerMayCreateOthersAndIsGivenTheHost) {
    constexpr GUID kOuter = ncfGuid("22222222-0000-4000-8000-000000000001");
    factory_->Register(kOuter,
                       [this](INCFUnknown* host, INCFUnknown* outer, const GUID& iid, void** out) {
                           EXPECT_EQ(host_->Identity(), host);
                           return factory_->CreateComponent(CompID_Capability, outer, iid, out);
                       });
    EXPECT_EQ(NCF_OK, Create(kOuter, IID_INCFCapability));
}

TEST_F(ComponentFactoryTest, MakesNothingOnceTheHostIsGone) {
    factory_->SetHost(nullptr);
    EXPECT_EQ(NCF_CLASS_E_CLASSNOTAVAILABLE, Create(CompID_Capability, IID_INCFCapability));
}

TEST_F(ComponentFactoryTest, ServesManyThreads) {
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i) {
        threads.emplace_back([this] {
            for (int turn = 0; turn < 200; ++turn) {
                Ref<INCFCapability> made;
                EXPECT_EQ(NCF_OK, host::Create(*factory_, CompID_Capability, made));
                factory_->Register(CompID_Capability, host::MakerOf([](INCFUnknown*) {
                                       return MakeRef<Capability>();
                                   }));
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
}
