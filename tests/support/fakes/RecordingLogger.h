// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "host_interfaces/util/NMALogger.h"
#include "source/plugin/PluginLogSink.h"
#include "tests/support/fakes/FakeHost.h"

// One record of the stream logger, its pieces joined.
struct LoggedRecord {
    ncfUInt32 kind;
    std::string where;
    std::string text;
    bool flagged;
};

// The record of a failed NCF_RETURN. The code is the result in hexadecimal.
std::string ReturnRecord(const std::string& code, const std::string& expression,
                         const std::string& function);
std::string ReturnRecord(NCFRESULT result, const std::string& expression,
                         const std::string& function);

// While it lives, records of the module are kept instead of discarded: starts
// the sink with a lock of the fake host. One at a time.
class RecordingLog {
public:
    explicit RecordingLog(FakeHost& host, Journal* journal = nullptr);
    ~RecordingLog();

    const std::vector<LoggedRecord>& records() const;
    // Number of records with exactly this text.
    int count(const std::string& text) const;
    // Exactly one record has this text. Where not, the failure tells all records.
    testing::AssertionResult once(const std::string& text) const;
    template <class Result>
    testing::AssertionResult returned(const Result& result, const std::string& expression,
                                      const std::string& function) const {
        return once(ReturnRecord(result, expression, function));
    }
    bool contains(const std::string& piece) const;
    void clear();
};

// While it lives, lines of the process logger are kept.
class RecordingNMALog {
public:
    explicit RecordingNMALog(ncfUInt32 level = 8, Journal* journal = nullptr);
    ~RecordingNMALog();

    struct Line {
        ncfUInt32 level;
        std::string name;
        std::string text;
    };
    const std::vector<Line>& lines() const { return lines_; }
    bool contains(const std::string& piece) const;

private:
    static void Receive(void* context, ncfUInt32 level, const char* name, const char* line);

    Journal* journal_;
    std::vector<Line> lines_;
};
