// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Component.h"

#include <gtest/gtest.h>

#include <thread>
#include <vector>

#include "reference_host/framework/Settings.h"
#include "reference_host/util/Ref.h"

using host::MakeRef;
using host::Ref;
using host::Settings;

TEST(Component, AnswersEveryInterfaceWithOneIdentity) {
    const Ref<Settings> settings = MakeRef<Settings>();
    Ref<NMA::IHostSettings> first;
    Ref<INCFNMAEditorSettings> second;
    ASSERT_EQ(NCF_OK, host::Query(settings->Identity(), first));
    ASSERT_EQ(NCF_OK, host::Query(settings->Identity(), second));
    Ref<INCFUnknown> one;
    Ref<INCFUnknown> other;
    ASSERT_EQ(NCF_OK, host::Query(first.get(), one));
    ASSERT_EQ(NCF_OK, host::Query(second.get(), other));
    EXPECT_EQ(one.get(), other.get());
    double rate = 0;
    EXPECT_EQ(NCF_OK, second->GetEditorFrameRate(&rate, nullptr, nullptr));
    EXPECT_EQ(25.0, rate);
}

TEST(Component, RefusesOtherInterfacesAndNullsTheOutput) {
    const Ref<Settings> settings = MakeRef<Settings>();
    void* out = settings.get();
    EXPECT_EQ(NCF_E_NOINTERFACE, settings->QueryInterface(IID_INCFComponentFactory, &out));
    EXPECT_EQ(nullptr, out);
    EXPECT_EQ(NCF_E_INVALIDARG, settings->QueryInterface(IID_INCFUnknown, nullptr));
}

TEST(Component, CountsReferencesFromManyThreads) {
    const std::int64_t before = host::LiveObjectCount();
    Ref<Settings> settings = MakeRef<Settings>();
    EXPECT_EQ(before + 1, host::LiveObjectCount());
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i) {
        threads.emplace_back([&settings] {
            for (int turn = 0; turn < 1000; ++turn) {
                const Ref<Settings> mine(settings);
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    settings->AddRef();
    EXPECT_EQ(1u, settings->Release());
    settings.Reset();
    EXPECT_EQ(before, host::LiveObjectCount());
}

TEST(Component, AsksTheRuleBeforeItAnswersAQuestion) {
    const Ref<Settings> settings = MakeRef<Settings>();
    std::vector<ncfUInt32> numbers;
    host::SetQueryRule([&numbers](const GUID& iid, ncfUInt32 number) {
        numbers.push_back(number);
        return iid == NMA::IID_IHostSettings ? NCF_E_ACCESSDENIED : NCF_OK;
    });
    void* out = settings.get();
    EXPECT_EQ(NCF_E_ACCESSDENIED, settings->QueryInterface(NMA::IID_IHostSettings, &out));
    EXPECT_EQ(nullptr, out);
    Ref<INCFUnknown> root;
    EXPECT_EQ(NCF_OK, host::Query(settings->Identity(), root));
    EXPECT_EQ((std::vector<ncfUInt32>{1, 2}), numbers);
    host::SetQueryRule({});
    Ref<NMA::IHostSettings> again;
    EXPECT_EQ(NCF_OK, host::Query(settings->Identity(), again));
    EXPECT_EQ(2u, numbers.size());
}
