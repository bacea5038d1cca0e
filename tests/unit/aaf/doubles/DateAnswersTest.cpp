// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// What becomes of a file's date that the system doesn't tell, or can't convert.

#include "source/aaf/Timecode.h"
#include "tests/unit/aaf/doubles/DateDouble.h"
#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

class DateAnswersTest : public AAFTest {
protected:
    DateAnswersTest() {
        dateDouble = DateDouble();
        clip->setTiming();
    }
    ~DateAnswersTest() override { dateDouble = DateDouble(); }

    NCFRESULT Add() {
        return AddSyntheticTimeCode(Media(), &slots, Console(), Dictionary(),
                                    Make<IAAFMob>("SourceMob"));
    }
    int Told(const std::string& date) {
        return host.console().count(4, "Modification Date is " + date + "\n\n");
    }

    ncfUInt32 slots = 0;
};

TEST_F(DateAnswersTest, TheDateIsTold) {
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(Told("day 9, hour 1, minute 2, second 3"), 1);
    EXPECT_FALSE(log.contains("FileTimeToSystemTime"));
}

TEST_F(DateAnswersTest, ADateThatCannotBeQueriedIsMidnightWithALine) {
    dateDouble.isQueried = false;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(Told("day 0, hour 0, minute 0, second 0"), 1);
    EXPECT_TRUE(log.contains("FileTimeToSystemTime"));
}

TEST_F(DateAnswersTest, ADateThatCannotBeConvertedIsMidnightWithoutALine) {
    dateDouble.isConverted = false;
    ASSERT_EQ(Add(), NCF_OK);
    EXPECT_EQ(slots, 2u);
    EXPECT_EQ(Told("day 0, hour 0, minute 0, second 0"), 1);
    EXPECT_FALSE(log.contains("FileTimeToSystemTime"));
}

}  // namespace
}  // namespace NMA::Impl
