// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/SharedNamedMutex.h"

#include <gtest/gtest.h>

#include <atomic>
#include <chrono>
#include <string>
#include <thread>

#include "tests/unit/plugin/MutexName.h"

namespace {

class NamedMutex : public ::testing::Test {
protected:
    const MutexName name;
};

TEST_F(NamedMutex, IsTakenAgainByItsOwnerAtOnce) {
    SharedNamedMutex mutex(name.c_str());
    mutex.Lock();
    mutex.Lock();
    EXPECT_TRUE(mutex.IsOwned());
    mutex.Unlock();
    EXPECT_FALSE(mutex.IsOwned());
}

TEST_F(NamedMutex, KeepsOtherThreadsOut) {
    SharedNamedMutex mutex(name.c_str());
    SharedNamedMutex other(name.c_str());
    std::atomic<bool> arrived{false};
    std::atomic<bool> entered{false};
    mutex.Lock();
    std::thread waiting([&] {
        arrived = true;
        other.Lock();
        entered = true;
        other.Unlock();
    });
    while (!arrived) {
        std::this_thread::yield();
    }
    std::this_thread::sleep_for(std::chrono::milliseconds(50));
    EXPECT_FALSE(entered);
    mutex.Unlock();
    waiting.join();
    EXPECT_TRUE(entered);
}

TEST_F(NamedMutex, IsGivenBackByItsDestructor) {
    {
        SharedNamedMutex mutex(name.c_str());
        mutex.Lock();
    }
    SharedNamedMutex mutex(name.c_str());
    std::thread([&] {
        mutex.Lock();
        mutex.Unlock();
    }).join();
}

TEST_F(NamedMutex, TellsThatItCouldNotBeMade) {
    ::testing::internal::CaptureStdout();
    SharedNamedMutex mutex("no/such\\place");  // no system has such a name
    const std::string told = ::testing::internal::GetCapturedStdout();
    EXPECT_EQ(told.rfind("Error create shared mutexno/such\\placeerr: ", 0), 0u) << told;
    EXPECT_EQ(told.back(), '\n');

    ::testing::internal::CaptureStdout();
    mutex.Lock();
    EXPECT_EQ(::testing::internal::GetCapturedStdout().rfind("WAIT_FAILED - ", 0), 0u);
}

}  // namespace
