// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What every test program begins with. A row of ctest's may be many tests; so a program that runs
// none fails, and one in which a test calls exit before the others ran.

#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <string>

#include "tests/support/Environment.h"

namespace {

constexpr int kNothingRan = 2;
constexpr int kAllSkipped = 77;  // ctest's SKIP_RETURN_CODE

// Lines of "begun N" and "ended N SKIPPED DISABLED", where the disabled are beside the N, for who
// counts over all programs.
class Tally : public testing::EmptyTestEventListener {
    void OnTestProgramStart(const testing::UnitTest& tests) override {
        Write("begun " + std::to_string(tests.test_to_run_count()));
    }
    void OnTestProgramEnd(const testing::UnitTest& tests) override {
        Write("ended " + std::to_string(tests.test_to_run_count()) + " " +
              std::to_string(tests.skipped_test_count()) + " " +
              std::to_string(tests.reportable_disabled_test_count()));
    }
    static void Write(const std::string& line) {
        if (const char* const file = std::getenv("CLIPHOST_TEST_TALLY")) {
            std::ofstream(file, std::ios::app) << line + "\n" << std::flush;
        }
    }
};

pid_t program = 0;
bool isOver = false;

void FailWhenATestExits() {
    if (!isOver && getpid() == program) {
        std::fputs("a test ended the program before all tests ran\n", stderr);
        std::fflush(nullptr);
        _exit(EXIT_FAILURE);
    }
}

int StatusOf(const testing::UnitTest& tests, int status) {
    const int notRun = tests.skipped_test_count() + tests.reportable_disabled_test_count();
    if (status == EXIT_SUCCESS && tests.test_to_run_count() <= tests.skipped_test_count()) {
        if (notRun > 0) {
            return kAllSkipped;
        }
        std::fputs("no test ran: the filter fits none\n", stderr);
        return kNothingRan;
    }
    return status;
}

}  // namespace

int main(int argc, char** argv) {
    testing::InitGoogleTest(&argc, argv);
    testing::UnitTest& tests = *testing::UnitTest::GetInstance();
    if (GTEST_FLAG_GET(list_tests)) {
        return RUN_ALL_TESTS();
    }
    tests.listeners().Append(new Tally);
    // No program that a test starts may read the settings of who runs the tests.
    for (const char* const place : {"XDG_CONFIG_HOME", "APPDATA"}) {
        SetVariable(place, "/nonexistent");
    }
    program = getpid();
    std::atexit(FailWhenATestExits);
    const int status = RUN_ALL_TESTS();
    isOver = true;
    return StatusOf(tests, status);
}
