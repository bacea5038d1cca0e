// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// A mutex whose owner was a process that has died.

#include "source/plugin/SharedNamedMutex.h"

#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <string>
#include <thread>

#include "tests/unit/plugin/MutexName.h"

namespace {

class NamedMutexOwner : public ::testing::Test {
protected:
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

    const MutexName name;
};

TEST_F(NamedMutexOwner, TellsOfAnOwnerThatDied) {
    SharedNamedMutex mutex(name.c_str());
    LetAnOwnerDie();
    const std::string told = Said([&] { mutex.Lock(); });
    EXPECT_EQ(told.rfind("WAIT_ABANDONED - Lock shared mutex: ", 0), 0u) << told;
    EXPECT_NE(told.find("; code: "), std::string::npos);
    EXPECT_FALSE(mutex.IsOwned()) << "an abandoned mutex is not recorded as owned";
}

TEST_F(NamedMutexOwner, ServesAgainAfterAnOwnerThatDied) {
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

}  // namespace
