// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/SharedNamedMutex.h"

#include <gtest/gtest.h>
#include <sys/mman.h>
#include <sys/wait.h>
#include <unistd.h>

#include <atomic>
#include <chrono>
#include <string>
#include <thread>

namespace {

// A mutex name of this process alone, gone at the end of the test.
class NamedMutex : public ::testing::Test {
protected:
    ~NamedMutex() override { shm_unlink(("/" + name).c_str()); }
    const std::string name = "cliphost-test-" + std::to_string(getpid());
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

TEST_F(NamedMutex, TellsOfAnOwnerThatDied) {
    SharedNamedMutex mutex(name.c_str());
    const pid_t child = fork();
    ASSERT_GE(child, 0);
    if (child == 0) {
        SharedNamedMutex owned(name.c_str());
        owned.Lock();
        _exit(0);
    }
    int status = 0;
    waitpid(child, &status, 0);
    ::testing::internal::CaptureStdout();
    mutex.Lock();
    const std::string told = ::testing::internal::GetCapturedStdout();
    EXPECT_EQ(told.rfind("WAIT_ABANDONED - Lock shared mutex: ", 0), 0u) << told;
    EXPECT_NE(told.find("; code: "), std::string::npos);
    EXPECT_FALSE(mutex.IsOwned()) << "an abandoned mutex is not recorded as owned";
}

TEST_F(NamedMutex, TellsThatItCouldNotBeMade) {
    ::testing::internal::CaptureStdout();
    SharedNamedMutex mutex("no/such/place");
    const std::string told = ::testing::internal::GetCapturedStdout();
    EXPECT_EQ(told.rfind("Error create shared mutexno/such/placeerr: ", 0), 0u) << told;
    EXPECT_EQ(told.back(), '\n');

    ::testing::internal::CaptureStdout();
    mutex.Lock();
    EXPECT_EQ(::testing::internal::GetCapturedStdout().rfind("WAIT_FAILED - ", 0), 0u);
}

}  // namespace
