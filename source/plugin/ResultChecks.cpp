// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/plugin/ResultChecks.h"

#include "source/plugin/PluginLogSink.h"

namespace ncf_detail {

void RecordCheckPtr(const char* text, const char* function) {
    slog::Record(slog::kError, function) << "CHK_PTR(" << text << ")" << function;
}

void RecordCheckInArg(const char* text, const char* function) {
    slog::Record(slog::kInformation, function) << "CHK_INARG(" << text << ")" << function;
}

void RecordAssert(const char* text, const char* function) {
    slog::Record(slog::kError, function) << "NCFASSERT( " << text << " )" << function;
}

void RecordResult(const char* macro, const char* text, NCFRESULT result, const char* function) {
    slog::Record(slog::kError, function)
        << macro << "0x" << std::hex << static_cast<ncfUInt32>(result) << ")"
        << ": " << text << " : " << function;
}

}  // namespace ncf_detail
