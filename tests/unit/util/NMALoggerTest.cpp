// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMALogger.h"

#include <gtest/gtest.h>

#include <atomic>
#include <string>
#include <thread>
#include <vector>

#include "host_interfaces/util/NMAUtil.h"

namespace {

class NMALoggerTest : public testing::Test {
protected:
    void SetUp() override {
        NMASetLogFunction(&Record, this);
        NMASetLogLevel(8);
    }
    void TearDown() override {
        NMASetLogFunction(nullptr, nullptr);
        NMASetLogLevel(1);
    }

    static void Record(void* context, ncfUInt32 level, const char* name, const char* line) {
        static_cast<NMALoggerTest*>(context)->lines_.push_back(std::to_string(level) + "|" + name +
                                                               "|" + line);
    }

    std::vector<std::string> lines_;
};

}  // namespace

TEST_F(NMALoggerTest, WritesNameLevelAndFormattedLine) {
    NMALogger logger;
    logger.SetName("Name");
    logger.Write(4, "%s %d 0x%x", "text", 5, 255);
    EXPECT_EQ(std::vector<std::string>{"4|Name|text 5 0xff"}, lines_);
}

TEST_F(NMALoggerTest, LeavesOutTheLineEnd) {
    NMALogger logger;
    logger.Write(1, "line\n");
    EXPECT_EQ(std::vector<std::string>{"1||line"}, lines_);
}

TEST_F(NMALoggerTest, DropsLinesAboveTheLevel) {
    NMASetLogLevel(4);
    NMALogger logger;
    logger.Write(1, "one");
    logger.Write(4, "four");
    logger.Write(8, "eight");
    EXPECT_EQ((std::vector<std::string>{"1||one", "4||four"}), lines_);
}

TEST_F(NMALoggerTest, WritesLongLinesWhole) {
    NMALogger logger;
    const std::string text(100000, 'x');
    logger.Write(1, "%s", text.c_str());
    ASSERT_EQ(1u, lines_.size());
    EXPECT_EQ("1||" + text, lines_[0]);
}

TEST_F(NMALoggerTest, WorksBeforeTheStartAndAfterTheEndOfTheLibrary) {
    NMATerminate();
    NMALogger logger;
    logger.Write(1, "still here");
    EXPECT_EQ(std::vector<std::string>{"1||still here"}, lines_);
}

TEST_F(NMALoggerTest, TakesANullNameAndANullFormat) {
    NMALogger logger;
    logger.SetName(nullptr);
    const char* nothing = nullptr;
    logger.Write(1, nothing, 0);
    EXPECT_TRUE(lines_.empty());
}

TEST_F(NMALoggerTest, LinesOfSeveralThreadsStayWhole) {
    NMALogger logger;
    std::vector<std::thread> writers;
    for (int i = 0; i < 4; ++i) {
        writers.emplace_back([&logger, i] {
            logger.SetName("n");
            for (int turn = 0; turn < 100; ++turn) {
                logger.Write(1, "thread %d", i);
            }
        });
    }
    for (std::thread& writer : writers) {
        writer.join();
    }
    EXPECT_EQ(400u, lines_.size());
}

TEST_F(NMALoggerTest, GoesToStandardErrorWithoutAFunction) {
    NMASetLogFunction(nullptr, nullptr);
    testing::internal::CaptureStderr();
    NMALogger logger;
    logger.SetName("Name");
    logger.Write(1, "%s", "100%");
    EXPECT_EQ("Name: 100%\n", testing::internal::GetCapturedStderr());
}

TEST_F(NMALoggerTest, VersionLineNamesModuleAndPlaceAtLevelEight) {
    NMALogger logger;
    logger.SetName("Logger");
    LogVersionInfo(&logger, "Module", NMAString("/plugins/Module.nvx"));
    EXPECT_EQ(std::vector<std::string>{"8|Logger|Module, loaded from /plugins/Module.nvx"}, lines_);
    LogVersionInfo(nullptr, "Module", NMAString());
    EXPECT_EQ(1u, lines_.size());
}
