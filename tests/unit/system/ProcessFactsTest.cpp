// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/ProcessFacts.h"

#include <gtest/gtest.h>

#include <fstream>
#include <future>
#include <thread>
#include <vector>

namespace {

using host::system::OwnFacts;

TEST(ProcessFacts, CountAFileThatIsOpen) {
    const std::size_t before = OwnFacts().handles;
    {
        const std::ifstream file("/dev/null");
        EXPECT_EQ(OwnFacts().handles, before + 1);
    }
    EXPECT_EQ(OwnFacts().handles, before);
}

TEST(ProcessFacts, CountAThreadThatRuns) {
    const std::size_t before = OwnFacts().threads;
    std::promise<void> end;
    std::thread thread([&] { end.get_future().wait(); });
    EXPECT_EQ(OwnFacts().threads, before + 1);
    end.set_value();
    thread.join();
}

TEST(ProcessFacts, CountMemoryThatIsHeld) {
    constexpr std::size_t kBytes = 10 << 20;
    const std::size_t before = OwnFacts().memory;
    {
        const std::vector<char> held(kBytes, 'x');
        EXPECT_GE(OwnFacts().memory, before + kBytes) << held[0];
    }
    EXPECT_LT(OwnFacts().memory, before + kBytes);
}

}  // namespace
