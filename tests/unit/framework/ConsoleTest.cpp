// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Console.h"

#include <gtest/gtest.h>

#include <string>
#include <thread>
#include <vector>

#include "reference_host/util/Ref.h"

using host::Console;
using host::MakeRef;

TEST(Console, GivesEveryLineToItsSinkAsWritten) {
    const auto console = MakeRef<Console>();
    std::vector<std::string> lines;
    console->SetSink([&](ncfUInt32 level, const std::string& text) {
        lines.push_back(std::to_string(level) + ":" + text);
    });
    EXPECT_EQ(NCF_OK, console->Write(4, "found %s %d.\n", "it", 709));
    EXPECT_EQ(NCF_OK, console->Write(1, "%s", "100% of %s"));
    EXPECT_EQ((std::vector<std::string>{"4:found it 709.\n", "1:100% of %s"}), lines);
}

TEST(Console, GoesToStandardErrorUpToItsLevel) {
    const auto console = MakeRef<Console>();
    testing::internal::CaptureStderr();
    console->Write(1, "one");
    console->Write(2, "two\n");
    console->SetLevel(2);
    console->Write(2, "three\n");
    console->Write(4, "four\n");
    EXPECT_EQ("one\nthree\n", testing::internal::GetCapturedStderr());
}

TEST(Console, RefusesANullFormatAndReservedOperations) {
    const auto console = MakeRef<Console>();
    const char* nothing = nullptr;
    EXPECT_EQ(NCF_E_POINTER, console->Write(1, nothing));
    EXPECT_EQ(NCF_E_NOTIMPL, console->ReservedConsoleOperationA());
    EXPECT_EQ(NCF_E_NOTIMPL, console->ReservedConsoleOperationB());
}

TEST(Console, LinesOfSeveralThreadsStayWhole) {
    const auto console = MakeRef<Console>();
    int lines = 0;
    console->SetSink([&](ncfUInt32, const std::string& text) {
        EXPECT_EQ("line of a thread", text);
        ++lines;
    });
    std::vector<std::thread> threads;
    for (int i = 0; i < 4; ++i) {
        threads.emplace_back([&] {
            for (int turn = 0; turn < 100; ++turn) {
                console->Write(2, "line of %s", "a thread");
            }
        });
    }
    for (std::thread& thread : threads) {
        thread.join();
    }
    EXPECT_EQ(400, lines);
}
