// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/PluginLogSink.h"

#include <cstddef>
#include <new>

#include "source/plugin/ResultChecks.h"

namespace {

slog::CLoggerBaseEx* MakeDiscardingLogger() {
    return new slog::CNullLoggerEx;
}

// Holds the host's lock for a scope.
class Locked {
public:
    explicit Locked(INCFLock& lock) : lock_(lock) { lock_.Lock(); }
    ~Locked() { lock_.Unlock(); }
    Locked(const Locked&) = delete;
    Locked& operator=(const Locked&) = delete;

private:
    INCFLock& lock_;
};

}  // namespace

PluginLogSink& PluginLogSink::Instance() {
    // Built in place: a record asks for the sink, and none may fail for memory.
    alignas(PluginLogSink) static std::byte place[sizeof(PluginLogSink)];
    static PluginLogSink* const sink = new (place) PluginLogSink;
    return *sink;
}

PluginLogSink::PluginLogSink() : current_(&discard_), maker_(MakeDiscardingLogger) {}

void PluginLogSink::Start(INCFComponentFactory* factory) {
    if (started_.load(std::memory_order_relaxed)) {
        return;
    }
    ThrowIfFailed(ncfCreate(factory, CompID_LockComponent, IID_LockComponent, lock_));
    if (lock_.isNull()) {
        ThrowIfFailed(NCF_E_POINTER);
    }
    started_.store(true, std::memory_order_relaxed);
}

void PluginLogSink::Stop() {
    lock_ = nullptr;
    started_.store(false, std::memory_order_relaxed);
}

slog::CLoggerBaseEx& PluginLogSink::Begin(ncfUInt64 mask, const char* where,
                                          ncfUInt32 kind) noexcept {
    if (started_.load(std::memory_order_relaxed) && (mask & mask_) != 0 &&
        kind != slog::kNoRecord) {
        try {
            return BeginInMainLogger(kind, where);
        } catch (...) {
            // A record that can't be begun is lost; what it tells of goes on.
        }
    }
    current_.store(&discard_, std::memory_order_relaxed);
    return discard_;
}

slog::CLoggerBaseEx& PluginLogSink::BeginInMainLogger(ncfUInt32 kind, const char* where) {
    const Locked locked(*lock_.inArg());
    if (!logger_) {
        logger_.reset(maker_());
    }
    slog::CLoggerBaseEx& chosen = *logger_;
    current_.store(&chosen, std::memory_order_relaxed);
    chosen.BeginRecord(kind, where);
    return chosen;
}

PluginLogSink::LoggerMaker PluginLogSink::SetLoggerMaker(LoggerMaker maker) {
    current_.store(&discard_, std::memory_order_relaxed);
    logger_.reset();
    return std::exchange(maker_, maker ? maker : MakeDiscardingLogger);
}

slog::Record::Record(ncfUInt32 kind, const char* where)
    : logger_(PluginLogSink::Instance().Begin(kMaskChecks, where, kind)) {
    if (kind == kError) {
        logger_.SetFlag(1);
    }
}
