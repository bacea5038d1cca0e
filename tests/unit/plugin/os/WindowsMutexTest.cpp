// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The mutex that processes share by name, as Windows makes and gives it.

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "source/plugin/SharedNamedMutex.h"
#include "source/plugin/os/Os.h"
#include "tests/support/windows_calls/WindowsCalls.h"

namespace {

class WindowsMutex : public testing::Test {
protected:
    WindowsMutex() {
        windows.modules[reinterpret_cast<const void*>(&os::OwnModule)] = u"module";
        windows.errorTexts = {{0, "Done.\r\n"}, {5, "Access is denied.\r\n"}};
    }
    template <class Body>
    static std::string Said(Body body) {
        testing::internal::CaptureStdout();
        body();
        return testing::internal::GetCapturedStdout();
    }
    // Calls but those that identify the thread and the module.
    std::vector<std::string> TakeCalls() {
        std::vector<std::string> calls;
        for (std::string& call : windows.TakeCalls()) {
            if (call.rfind("GetModuleHandleExA(", 0) != 0) {
                calls.push_back(std::move(call));
            }
        }
        return calls;
    }

    WindowsCalls& windows = WindowsCalls::Anew();
};

using Calls = std::vector<std::string>;

TEST_F(WindowsMutex, IsWaitedForOnceAndGivenBackWithItsEnd) {
    {
        SharedNamedMutex mutex("log");
        EXPECT_EQ(TakeCalls(), Calls{R"(CreateMutexA(null, 0, "log"))"});
        EXPECT_EQ(Said([&] {
                      mutex.Lock();
                      mutex.Lock();
                  }),
                  "");
        EXPECT_EQ(TakeCalls(), Calls{"WaitForSingleObject(0x104, 0xffffffff)"});
    }
    EXPECT_EQ(TakeCalls(), (Calls{"ReleaseMutex(0x104)", "CloseHandle(0x104)"}));
    EXPECT_EQ(windows.openHandles, 0);
}

TEST_F(WindowsMutex, IsWaitedForByAnotherThread) {
    SharedNamedMutex mutex("log");
    mutex.Lock();
    ++windows.thread;
    mutex.Lock();
    EXPECT_EQ(TakeCalls().size(), 3u) << "made, and two waits";
}

TEST_F(WindowsMutex, TellsWhyItCouldNotBeMade) {
    windows.failures["CreateMutexA"] = 5;
    EXPECT_EQ(Said([] { SharedNamedMutex mutex("log"); }),
              "Error create shared mutexlogerr: Access is denied.\n");
    EXPECT_EQ(TakeCalls()[1], "FormatMessageA(0x1200, null, 5, 0x400, place, 511, null)");
}

TEST_F(WindowsMutex, TellsHowAWaitEnded) {
    SharedNamedMutex mutex("log");
    const struct {
        std::uint32_t wait;
        const char* told;
    } kCases[] = {{0x80, "WAIT_ABANDONED - "},
                  {0x102, "WAIT_TIMEOUT - "},
                  {0xFFFFFFFF, "WAIT_FAILED - "},
                  {0xC0, "UNDEFINED_BEHAVIOUR - "}};
    for (const auto& [wait, told] : kCases) {
        windows.wait = wait;
        EXPECT_EQ(Said([&] { mutex.Lock(); }),
                  std::string(told) + "Lock shared mutex: 0x104; code: Done.\n");
        EXPECT_FALSE(mutex.IsOwned());
    }
    windows.failures["WaitForSingleObject"] = 5;
    EXPECT_EQ(Said([&] { mutex.Lock(); }),
              "WAIT_FAILED - Lock shared mutex: 0x104; code: Access is denied.\n");
}

TEST_F(WindowsMutex, StaysOwnedWhenItCannotBeReleased) {
    SharedNamedMutex mutex("log");
    mutex.Lock();
    windows.failures["ReleaseMutex"] = 288;
    mutex.Unlock();
    EXPECT_TRUE(mutex.IsOwned());
}

}  // namespace
