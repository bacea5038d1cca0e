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

    // Has a process of its own take the mutex and end.
    void LetAnOwnerDie() const {
        const pid_t child = fork();
        ASSERT_GE(child, 0);
        if (child == 0) {
            SharedNamedMutex owned(name.c_str());
            owned.Lock();
            _exit(0);
        }
        int status = 0;
        waitpid(child, &status, 0);
    }
    // What a call says on standard output.
    template <class Body>
    static std::string Said(Body body) {
        ::testing::internal::CaptureStdout();
        body();
        return ::testing::internal::GetCapturedStdout();
    }

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
    LetAnOwnerDie();
    const std::string told = Said([&] { mutex.Lock(); });
    EXPECT_EQ(told.rfind("WAIT_ABANDONED - Lock shared mutex: ", 0), 0u) << told;
    EXPECT_NE(told.find("; code: "), std::string::npos);
    EXPECT_FALSE(mutex.IsOwned()) << "an abandoned mutex is not recorded as owned";
}

TEST_F(NamedMutex, ServesAgainAfterAnOwnerThatDied) {
    SharedNamedMutex mutex(name.c_str());
    LetAnOwnerDie();
    EXPECT_NE(Said([&] { mutex.Lock(); }), "");
    mutex.Unlock();
    EXPECT_EQ(Said([&] {
                  std::thread([&] {
                      SharedNamedMutex other(name.c_str());
                      other.Lock();
                      EXPECT_TRUE(other.IsOwned());
                  }).join();
              }),
              "");
    EXPECT_EQ(Said([&] { mutex.Lock(); }), "");
    EXPECT_TRUE(mutex.IsOwned());
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
