// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/ResultChecks.h"

#include <gtest/gtest.h>

#include "tests/support/fakes/RecordingLogger.h"

namespace {

int evaluations = 0;

NCFRESULT Answer(NCFRESULT result) {
    ++evaluations;
    return result;
}

NCFRESULT CheckPointer(const void* pointer) {
    NCF_FUNCTION("Checks::CheckPointer");
    CHK_PTR(pointer);
    return NCF_OK;
}
NCFRESULT CheckArgument(const void* argument) {
    NCF_FUNCTION("Checks::CheckArgument");
    CHK_INARG(argument);
    return NCF_OK;
}
NCFRESULT Assert(int left, int right) {
    NCF_FUNCTION("Checks::Assert");
    NCFASSERT(left && right);
    return NCF_OK;
}
NCFRESULT Return(NCFRESULT result) {
    NCF_FUNCTION("Checks::Return");
    NCF_RETURN(Answer(result));
    return 7;
}
NCFRESULT Skip(NCFRESULT result) {
    NCF_FUNCTION("Checks::Skip");
    NCF_SKIP(Answer(result));
    return 7;
}

class Checks : public ::testing::Test {
protected:
    Checks() { evaluations = 0; }

    // The one record that a failing check wrote.
    LoggedRecord only() const {
        EXPECT_EQ(log.records().size(), 1u);
        return log.records().empty() ? LoggedRecord{} : log.records().front();
    }

    FakeHost host;
    RecordingLog log{host};
};

TEST_F(Checks, NullPointerIsRecordedAsAnErrorAndReturned) {
    EXPECT_EQ(CheckPointer(nullptr), NCF_E_POINTER);
    EXPECT_EQ(only().text, "CHK_PTR(pointer)Checks::CheckPointer");
    EXPECT_EQ(only().where, "Checks::CheckPointer");
    EXPECT_EQ(only().kind, slog::kError);
    EXPECT_TRUE(only().flagged);
}

TEST_F(Checks, NullArgumentIsRecordedAsInformationAndReturned) {
    EXPECT_EQ(CheckArgument(nullptr), NCF_E_INVALIDARG);
    EXPECT_EQ(only().text, "CHK_INARG(argument)Checks::CheckArgument");
    EXPECT_EQ(only().kind, slog::kInformation);
    EXPECT_FALSE(only().flagged);
}

TEST_F(Checks, FailedAssertionIsRecordedAndFails) {
    EXPECT_EQ(Assert(1, 0), NCF_E_FAIL);
    EXPECT_EQ(only().text, "NCFASSERT( left && right )Checks::Assert");
    EXPECT_EQ(only().kind, slog::kError);
    EXPECT_TRUE(only().flagged);
}

TEST_F(Checks, FailureIsRecordedInHexadecimalAndReturnedUnchanged) {
    EXPECT_EQ(Return(NMA_E_NODATA), NMA_E_NODATA);
    EXPECT_EQ(only().text, "NCF_RETURN(0xa000006f): Answer(result) : Checks::Return");
    EXPECT_EQ(only().kind, slog::kError);
    EXPECT_TRUE(only().flagged);
    EXPECT_EQ(evaluations, 1);
}

TEST_F(Checks, SkippedFailureIsRecordedAndTheFunctionGoesOn) {
    EXPECT_EQ(Skip(NCF_E_HANDLE), 7);
    EXPECT_EQ(only().text, "NCF_SKIP(0x80000006): Answer(result) : Checks::Skip");
    EXPECT_EQ(only().kind, slog::kError);
    EXPECT_TRUE(only().flagged);
    EXPECT_EQ(evaluations, 1);
}

TEST_F(Checks, SuccessWritesNothing) {
    EXPECT_EQ(CheckPointer(&host), NCF_OK);
    EXPECT_EQ(CheckArgument(&host), NCF_OK);
    EXPECT_EQ(Assert(1, 1), NCF_OK);
    EXPECT_EQ(Return(NCF_OK), 7);
    EXPECT_EQ(Return(1), 7) << "only negative results are failures";
    EXPECT_EQ(Skip(NCF_OK), 7);
    EXPECT_TRUE(log.records().empty());
}

TEST_F(Checks, OnlyRecordsOfErrorsAreFlagged) {
    slog::Progress("Checks::Tell") << " tells";
    slog::Warning("Checks::Warn") << " warns";
    slog::Error("Checks::Fail") << " fails";
    ASSERT_EQ(log.records().size(), 3u);
    const LoggedRecord expected[] = {{0, "Checks::Tell", "Checks::Tell tells", false},
                                     {2, "Checks::Warn", "Checks::Warn warns", false},
                                     {1, "Checks::Fail", "Checks::Fail fails", true}};
    for (int i = 0; i < 3; ++i) {
        EXPECT_EQ(log.records()[i].kind, expected[i].kind);
        EXPECT_EQ(log.records()[i].where, expected[i].where);
        EXPECT_EQ(log.records()[i].text, expected[i].text);
        EXPECT_EQ(log.records()[i].flagged, expected[i].flagged);
    }
}

TEST_F(Checks, ThrowsANegativeResultAsAResult) {
    EXPECT_NO_THROW(ThrowIfFailed(NCF_OK));
    EXPECT_NO_THROW(ThrowIfFailed(1));
    try {
        ThrowIfFailed(NCF_E_ABORT);
        FAIL() << "nothing was thrown";
    } catch (NCFRESULT thrown) {
        EXPECT_EQ(thrown, NCF_E_ABORT);
    }
}

// The numbers that cross to the host.
TEST(ResultCodes, HaveTheirValues) {
    const std::pair<NCFRESULT, ncfUInt32> codes[] = {
        {NCF_OK, 0x00000000},
        {NCF_E_NOTIMPL, 0x80000001},
        {NCF_E_OUTOFMEMORY, 0x80000002},
        {NCF_E_INVALIDARG, 0x80000003},
        {NCF_E_NOINTERFACE, 0x80000004},
        {NCF_E_POINTER, 0x80000005},
        {NCF_E_HANDLE, 0x80000006},
        {NCF_E_ABORT, 0x80000007},
        {NCF_E_FAIL, 0x80000008},
        {NCF_E_ACCESSDENIED, 0x80000009},
        {NCF_E_NOTFOUND, 0x8000000C},
        {NCF_E_NOTSUPPORTED, 0x8000000D},
        {NCF_E_UNEXPECTED, 0x8000FFFF},
        {QT_E_MOREDATA, 0x80028016},
        {NCF_CLASS_E_NOAGGREGATION, 0x80040110},
        {NCF_CLASS_E_CLASSNOTAVAILABLE, 0x80040111},
        {NMA_E_NOTSET, 0xA000000A},
        {NMA_E_ALREADYSET, 0xA0000066},
        {NMA_E_NOTINITIALIZED, 0xA0000068},
        {NMA_E_FIELDS, 0xA0000069},
        {NCF_E_PARAMETERNOTAVAILABLE, 0xA000006A},
        {NMA_E_ROOTEXISTS, 0xA000006C},
        {NMA_E_NODATA, 0xA000006F},
        {NMA_E_AAF_ADD, 0x8AEA0005},
        {NMA_E_AAF_QUERY, 0x8AEA0006},
        {NMA_E_AAF_CREATE, 0x8AEA000A},
    };
    for (const auto& [code, value] : codes) {
        EXPECT_EQ(static_cast<ncfUInt32>(code), value);
    }
}

}  // namespace
