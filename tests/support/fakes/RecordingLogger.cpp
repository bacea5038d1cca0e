// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/support/fakes/RecordingLogger.h"

#include <algorithm>
#include <sstream>

#include "tests/support/fakes/FakeLock.h"

namespace {

std::vector<LoggedRecord> records;
Journal* recordJournal = nullptr;

// Joins the pieces of a record as a text sink would print them.
class RecordingLogger final : public slog::CLoggerBaseEx {
public:
    void BeginRecord(ncfUInt32 kind, const char* where) override {
        record_ = {kind, where ? where : "", "", false};
        text_.str("");
        text_.flags(std::ios_base::dec);
    }
    void Hook() override {}
    void SetFlag(ncfUInt32 value) override { record_.flagged = value == 1; }
    void WriteDouble(double value) override { text_ << value; }
    void WriteSInt64(ncfSInt64 value) override { text_ << value; }
    void WriteUInt64(ncfUInt64 value) override { text_ << value; }
    void WriteUInt32(ncfUInt32 value) override { text_ << value; }
    void WriteSInt32(ncfSInt32 value) override { text_ << value; }
    void WriteString(const char* text) override { text_ << (text ? text : "(null)"); }
    void Manipulate(std::ios_base& (*manipulator)(std::ios_base&)) override { manipulator(text_); }
    void EndRecord() override {
        record_.text = text_.str();
        if (recordJournal) {
            recordJournal->add("record " + std::to_string(record_.kind) + ": " + record_.text);
        }
        records.push_back(record_);
    }

private:
    LoggedRecord record_{};
    std::ostringstream text_;
};

}  // namespace

std::string ReturnRecord(const std::string& code, const std::string& expression,
                         const std::string& function) {
    return "NCF_RETURN(0x" + code + "): " + expression + " : " + function;
}

std::string ReturnRecord(NCFRESULT result, const std::string& expression,
                         const std::string& function) {
    std::ostringstream code;
    code << std::hex << static_cast<ncfUInt32>(result);
    return ReturnRecord(code.str(), expression, function);
}

RecordingLog::RecordingLog(FakeHost& host, Journal* journal) {
    ::records.clear();
    recordJournal = journal;
    host.maker(CompID_LockComponent, [](const GUID&, void** out) {
        *out = static_cast<INCFLock*>(new FakeLock);
        return NCF_OK;
    });
    PluginLogSink::Instance().SetLoggerMaker(
        []() -> slog::CLoggerBaseEx* { return new RecordingLogger; });
    PluginLogSink::Instance().Start(host.factory());
}

RecordingLog::~RecordingLog() {
    PluginLogSink::Instance().Stop();
    PluginLogSink::Instance().SetLoggerMaker(nullptr);
    recordJournal = nullptr;
    ::records.clear();
}

const std::vector<LoggedRecord>& RecordingLog::records() const {
    return ::records;
}

int RecordingLog::count(const std::string& text) const {
    return static_cast<int>(
        std::count_if(::records.begin(), ::records.end(),
                      [&](const LoggedRecord& record) { return record.text == text; }));
}

testing::AssertionResult RecordingLog::once(const std::string& text) const {
    const int times = count(text);
    if (times == 1) {
        return testing::AssertionSuccess();
    }
    testing::AssertionResult failure = testing::AssertionFailure();
    failure << "logged " << times << " times: " << text << "\nThe records are:";
    for (const LoggedRecord& record : ::records) {
        failure << "\n  " << record.text;
    }
    return failure;
}

bool RecordingLog::contains(const std::string& piece) const {
    return std::any_of(::records.begin(), ::records.end(), [&](const LoggedRecord& record) {
        return record.text.find(piece) != std::string::npos;
    });
}

void RecordingLog::clear() {
    ::records.clear();
}

RecordingNMALog::RecordingNMALog(ncfUInt32 level, Journal* journal) : journal_(journal) {
    NMASetLogLevel(level);
    NMASetLogFunction(&RecordingNMALog::Receive, this);
}

RecordingNMALog::~RecordingNMALog() {
    NMASetLogFunction(nullptr, nullptr);
    NMASetLogLevel(1);
}

bool RecordingNMALog::contains(const std::string& piece) const {
    return std::any_of(lines_.begin(), lines_.end(), [&](const Line& line) {
        return line.text.find(piece) != std::string::npos;
    });
}

void RecordingNMALog::Receive(void* context, ncfUInt32 level, const char* name, const char* line) {
    auto* const self = static_cast<RecordingNMALog*>(context);
    self->lines_.push_back({level, name ? name : "", line ? line : ""});
    if (self->journal_) {
        self->journal_->add("log " + std::to_string(level) + ": " + self->lines_.back().text);
    }
}
