// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/framework/Console.h"

#include <cstdarg>
#include <cstdio>

#include "reference_host/framework/Guard.h"
#include "reference_host/util/text/Formatted.h"

namespace host {

NCFRESULT Console::Write(ncfUInt32 level, const char* format, ...) {
    if (format == nullptr) {
        return NCF_E_POINTER;
    }
    va_list arguments;
    va_start(arguments, format);
    const NCFRESULT result = Guarded([&] {
        Deliver(level, text::Formatted(format, arguments));
        return NCF_OK;
    });
    va_end(arguments);
    return result;
}

void Console::SetSink(Sink sink) {
    const std::lock_guard<std::mutex> guard(mutex_);
    sink_ = std::move(sink);
}

void Console::SetLevel(ncfUInt32 level) {
    const std::lock_guard<std::mutex> guard(mutex_);
    level_ = level;
}

void Console::Deliver(ncfUInt32 level, const std::string& text) {
    const std::lock_guard<std::mutex> guard(mutex_);
    if (sink_) {
        sink_(level, text);
        return;
    }
    if (level > level_) {
        return;
    }
    const bool ended = !text.empty() && text.back() == '\n';
    std::fprintf(stderr, "%s%s", text.c_str(), ended ? "" : "\n");
}

}  // namespace host
