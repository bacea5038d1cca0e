// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/RecursiveLock.h"

#include <gtest/gtest.h>

#include <thread>
#include <vector>

#include "reference_host/util/Ref.h"

using host::MakeRef;
using host::RecursiveLock;

TEST(RecursiveLock, IsTakenAsOftenAsItIsGivenBack) {
    const auto lock = MakeRef<RecursiveLock>();
    EXPECT_EQ(NCF_OK, lock->Lock());
    EXPECT_EQ(NCF_OK, lock->Lock());
    EXPECT_EQ(NCF_OK, lock->Unlock());
    EXPECT_EQ(NCF_OK, lock->Unlock());
    EXPECT_EQ(NCF_E_FAIL, lock->Unlock());
}

TEST(RecursiveLock, AnotherThreadCannotGiveItBack) {
    const auto lock = MakeRef<RecursiveLock>();
    lock->Lock();
    std::thread([&] { EXPECT_EQ(NCF_E_FAIL, lock->Unlock()); }).join();
    EXPECT_EQ(NCF_OK, lock->Unlock());
}

TEST(RecursiveLock, KeepsThreadsApart) {
    const auto lock = MakeRef<RecursiveLock>();
    int counter = 0;
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i) {
        threads.emplace_back([&] {
            for (int turn = 0; turn < 500; ++turn) {
                lock->Lock();
                lock->Lock();
                ++counter;
                lock->Unlock();
                lock->Unlock();
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    EXPECT_EQ(2000, counter);
}
