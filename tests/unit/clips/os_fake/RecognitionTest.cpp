// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The first look at a file over a system that does as it is told.

#include <gtest/gtest.h>

#include <memory>

#include "source/clips/LoadMedia.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/RecordingLogger.h"
#include "tests/unit/clips/os_fake/FakeOs.h"

namespace {

class Recognition : public testing::Test {
protected:
    Recognition() {
        system = FakeOs();
        system.content.assign(3000, 'x');
        path.attach(MakeHostString("C:\\movies\\clip.mov"));
    }
    NCFRESULT Ask() {
        return IsQuickTimeContainer(path, NCFSmartPtr<INCFConsole>(&host.console()), &flag);
    }
    // A file whose bytes 4 to 7 are `type`.
    void SetType(const std::string& type) {
        std::copy(type.begin(), type.end(), system.content.begin() + 4);
    }

    FakeOs& system = FakeOs::Get();
    FakeHost host;
    RecordingLog log{host};
    RecordingNMALog lines{1};
    NCFSmartPtr<INCFString> path;
    ncfBool flag = 7;
};

}  // namespace

TEST_F(Recognition, ReadsTheFirstSectorOnceAndClosesTheFile) {
    SetType("ftyp");
    EXPECT_EQ(Ask(), NCF_OK);
    EXPECT_EQ(flag, 1);
    ASSERT_EQ(system.reads.size(), 1u);
    EXPECT_EQ(system.reads[0].position, 0u);
    EXPECT_EQ(system.reads[0].size, 2048u);
    EXPECT_EQ(system.closes, 1);
}

TEST_F(Recognition, HandsAFailingReadOnWithoutAConsoleLine) {
    SetType("ftyp");
    system.readFails = true;
    EXPECT_EQ(Ask(), NCF_E_HANDLE);
    EXPECT_EQ(flag, 0);
    EXPECT_TRUE(
        log.once("NCF_RETURN(0x80000006): mediaFile.Read(0, buffer, kBufLen, &bytesRead) : "
                 "IsQuickTimeContainer"));
    EXPECT_TRUE(host.console().lines().empty());
}

TEST_F(Recognition, RecordsNothingForAnEmptyFile) {
    system.content.clear();
    EXPECT_EQ(Ask(), NCF_E_FAIL);
    EXPECT_EQ(flag, 0);
    EXPECT_TRUE(log.records().empty());
}

TEST_F(Recognition, TellsTheConsoleOfAForeignException) {
    system.openThrows = true;
    EXPECT_EQ(Ask(), NCF_E_UNEXPECTED);
    EXPECT_EQ(flag, 0);
    EXPECT_EQ(
        host.console().count(1, "Unknown exception in QuickTimeContainer::IsContainerSupported.\n"),
        1);
}
