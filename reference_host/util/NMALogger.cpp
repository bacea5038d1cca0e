// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMALogger.h"

#include <atomic>
#include <cstdarg>
#include <cstdio>
#include <mutex>
#include <new>
#include <string>

#include "reference_host/util/text/Formatted.h"

namespace {

constexpr ncfUInt32 kFirstLevel = 1;

// Where lines go. Never destroyed: a logger may be a global of a module that
// outlives everything else.
struct Destination {
    // Held while a line is delivered, so that a function taken out is not
    // running any more; recursive, since a function may log itself.
    std::recursive_mutex mutex;
    NMALogFunction function = nullptr;
    void* context = nullptr;
    std::atomic<ncfUInt32> level{kFirstLevel};
};

Destination& TheDestination() {
    static Destination* destination = new Destination;
    return *destination;
}

std::string Line(const char* format, va_list arguments) {
    std::string line = host::text::Formatted(format, arguments);
    while (!line.empty() && line.back() == '\n') {
        line.pop_back();
    }
    return line;
}

void Deliver(ncfUInt32 level, const std::string& name, const std::string& line) {
    Destination& destination = TheDestination();
    const std::lock_guard<std::recursive_mutex> guard(destination.mutex);
    if (destination.function != nullptr) {
        destination.function(destination.context, level, name.c_str(), line.c_str());
        return;
    }
    std::fprintf(stderr, "%s%s%s\n", name.c_str(), name.empty() ? "" : ": ", line.c_str());
}

}  // namespace

struct NMALogger::State {
    std::mutex mutex;
    std::string name;
};

NMALogger::NMALogger() : state_(new (std::nothrow) State) {}

NMALogger::~NMALogger() {
    delete state_;
}

void NMALogger::SetName(const char* name) {
    if (state_ == nullptr) {
        return;
    }
    try {
        std::string copy = name == nullptr ? "" : name;
        const std::lock_guard<std::mutex> guard(state_->mutex);
        state_->name.swap(copy);
    } catch (const std::bad_alloc&) {
        // The former name stays.
    }
}

void NMALogger::Write(ncfUInt32 level, const char* format, ...) {
    if (state_ == nullptr || format == nullptr ||
        level > TheDestination().level.load(std::memory_order_relaxed)) {
        return;
    }
    va_list arguments;
    va_start(arguments, format);
    try {
        const std::string line = Line(format, arguments);
        std::string name;
        {
            const std::lock_guard<std::mutex> guard(state_->mutex);
            name = state_->name;
        }
        Deliver(level, name, line);
    } catch (...) {
        // A line is lost before its writer is.
    }
    va_end(arguments);
}

void NMASetLogFunction(NMALogFunction function, void* context) {
    Destination& destination = TheDestination();
    const std::lock_guard<std::recursive_mutex> guard(destination.mutex);
    destination.function = function;
    destination.context = context;
}

void NMASetLogLevel(ncfUInt32 level) {
    TheDestination().level.store(level, std::memory_order_relaxed);
}
