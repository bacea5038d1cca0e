// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <atomic>
#include <memory>

#include "host_interfaces/framework/Lock.h"
#include "source/plugin/NCFSmartPtr.h"
#include "source/plugin/StreamLogger.h"

// Where records go: one object for the process, made on first use and never
// destroyed, because globals of the module may still log while the process
// ends. The main logger discards records too; a real sink is put in by
// changing the one step that makes it.
class PluginLogSink {
public:
    using LoggerMaker = slog::CLoggerBaseEx* (*)();

    static PluginLogSink& Instance();

    // Takes the host's lock. Throws the factory's failure, and NCF_E_POINTER for
    // a lock that isn't there. A second start does nothing.
    void Start(INCFComponentFactory* factory);
    void Stop();

    // Chooses the logger of one record and begins it. Not started, a mask
    // without a common bit, kNoRecord, or a main logger that fails: the discard
    // logger.
    slog::CLoggerBaseEx& Begin(ncfUInt64 mask, const char* where, ncfUInt32 kind) noexcept;

    slog::CLoggerBaseEx& CurrentLogger() { return *current_.load(std::memory_order_relaxed); }

    // Replaces the step that makes the main logger and drops the one in use;
    // null brings the discarding one back. Gives the former step.
    LoggerMaker SetLoggerMaker(LoggerMaker maker);

private:
    PluginLogSink();

    slog::CLoggerBaseEx& BeginInMainLogger(ncfUInt32 kind, const char* where);

    std::unique_ptr<slog::CLoggerBaseEx> logger_;
    slog::CNullLoggerEx discard_;
    std::atomic<slog::CLoggerBaseEx*> current_;
    ncfUInt64 mask_ = slog::kMaskChecks;
    NCFSmartPtr<INCFLock> lock_;
    std::atomic<bool> started_{false};
    LoggerMaker maker_;
};

namespace slog {

// One record, ended at the end of its scope. Used as
// `slog::Progress(ncfFunction) << "width x height: " << width;`
class Record {
public:
    Record(ncfUInt32 kind, const char* where);
    ~Record() { logger_.EndRecord(); }
    Record(const Record&) = delete;
    Record& operator=(const Record&) = delete;

    Record& operator<<(const char* text) {
        logger_.WriteString(text);
        return *this;
    }
    Record& operator<<(ncfSInt32 value) {
        logger_.WriteSInt32(value);
        return *this;
    }
    Record& operator<<(ncfUInt32 value) {
        logger_.WriteUInt32(value);
        return *this;
    }
    Record& operator<<(ncfSInt64 value) {
        logger_.WriteSInt64(value);
        return *this;
    }
    Record& operator<<(ncfUInt64 value) {
        logger_.WriteUInt64(value);
        return *this;
    }
    Record& operator<<(double value) {
        logger_.WriteDouble(value);
        return *this;
    }
    Record& operator<<(std::ios_base& (*manipulator)(std::ios_base&)) {
        logger_.Manipulate(manipulator);
        return *this;
    }

private:
    CLoggerBaseEx& logger_;
};

// Records that begin with the function's name.
struct Progress : Record {
    explicit Progress(const char* where) : Record(kInformation, where) { *this << where; }
};
struct Warning : Record {
    explicit Warning(const char* where) : Record(kWarning, where) { *this << where; }
};
struct Error : Record {
    explicit Error(const char* where) : Record(kError, where) { *this << where; }
};

}  // namespace slog
