// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The mutex over an operating system whose waits end as they are told.

#include <gtest/gtest.h>

#include <iostream>
#include <sstream>
#include <string>

#include "source/plugin/SharedNamedMutex.h"
#include "source/plugin/os/Os.h"

namespace {

struct ToldOs {
    os::Wait outcome = os::Wait::kAcquired;
    bool releaseFails = false;
    ncfUInt64 thread = 1;
    const void* module = nullptr;
    ncfUInt32 error = 17;
    int waits = 0;
    int releases = 0;
    int closes = 0;
};
ToldOs told;

}  // namespace

namespace os {

ncfUInt32 LastError() {
    return told.error;
}
std::string ErrorText(ncfUInt32 error) {
    return "error " + std::to_string(error);
}
void* CreateNamedMutex(const char* name) {
    return name ? &told : nullptr;
}
Wait WaitForMutex(void*) {
    ++told.waits;
    return told.outcome;
}
bool ReleaseMutex(void*) {
    ++told.releases;
    return !told.releaseFails;
}
void CloseMutex(void*) {
    ++told.closes;
}
ncfUInt64 CurrentThreadId() {
    return told.thread;
}
const void* OwnModule() {
    return told.module;
}

}  // namespace os

namespace {

class MutexOutcomes : public ::testing::Test {
protected:
    MutexOutcomes() { told = {}; }

    template <class Body>
    std::string Said(Body body) {
        ::testing::internal::CaptureStdout();
        body();
        return ::testing::internal::GetCapturedStdout();
    }
};

TEST_F(MutexOutcomes, WaitsOnceForItsOwner) {
    SharedNamedMutex mutex("name");
    EXPECT_EQ(Said([&] {
                  mutex.Lock();
                  mutex.Lock();
              }),
              "");
    EXPECT_EQ(told.waits, 1);
    told.thread = 2;
    mutex.Lock();
    EXPECT_EQ(told.waits, 2) << "another thread";
    told.module = &told;
    mutex.Lock();
    EXPECT_EQ(told.waits, 3) << "another module";
}

TEST_F(MutexOutcomes, AreToldWhenTheyAreNoPossession) {
    const std::pair<os::Wait, const char*> rows[] = {
        {os::Wait::kAbandoned, "WAIT_ABANDONED - "},
        {os::Wait::kTimeout, "WAIT_TIMEOUT - "},
        {os::Wait::kFailed, "WAIT_FAILED - "},
        {os::Wait::kUndefined, "UNDEFINED_BEHAVIOUR - "},
    };
    for (const auto& [outcome, start] : rows) {
        told.outcome = outcome;
        SharedNamedMutex mutex("name");
        const std::string said = Said([&] { mutex.Lock(); });
        EXPECT_EQ(said.rfind(std::string(start) + "Lock shared mutex: ", 0), 0u) << said;
        EXPECT_NE(said.find("; code: error 17"), std::string::npos) << said;
        EXPECT_FALSE(mutex.IsOwned());
    }
}

TEST_F(MutexOutcomes, KeepTheOwnerWhereTheReleaseFails) {
    SharedNamedMutex mutex("name");
    mutex.Lock();
    told.releaseFails = true;
    mutex.Unlock();
    EXPECT_TRUE(mutex.IsOwned());
    told.releaseFails = false;
    mutex.Unlock();
    EXPECT_FALSE(mutex.IsOwned());
}

TEST_F(MutexOutcomes, EndWithAReleaseAndAClose) {
    { SharedNamedMutex mutex("name"); }
    EXPECT_EQ(told.releases, 1);
    EXPECT_EQ(told.closes, 1);
}

TEST_F(MutexOutcomes, TellThatItCouldNotBeMade) {
    EXPECT_EQ(Said([] { SharedNamedMutex mutex(nullptr); }),
              "Error create shared mutexerr: error 17\n");
}

// Standard output that leaves an error number of its own with each write.
class FailingOutput : public std::stringbuf {
protected:
    std::streamsize xsputn(const char* text, std::streamsize size) override {
        told.error = 25;
        return std::stringbuf::xsputn(text, size);
    }
};

TEST_F(MutexOutcomes, TellTheErrorOfTheFailedCallNotOfTheOutput) {
    FailingOutput output;
    std::streambuf* const former = std::cout.rdbuf(&output);
    { SharedNamedMutex mutex(nullptr); }
    told.error = 17;
    told.outcome = os::Wait::kFailed;
    SharedNamedMutex mutex("name");
    mutex.Lock();
    std::cout.rdbuf(former);
    const std::string said = output.str();
    EXPECT_EQ(said.rfind("Error create shared mutexerr: error 17\n", 0), 0u) << said;
    EXPECT_NE(said.find("; code: error 17"), std::string::npos) << said;
}

}  // namespace
