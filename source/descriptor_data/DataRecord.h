// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include "source/plugin/PluginLogSink.h"

// Severity of what is told about data files, on a scale of its own: it stands
// in the record's kind as it is.
inline constexpr ncfUInt32 kDataNotice = 1;   // something asked for is not there
inline constexpr ncfUInt32 kDataFailure = 2;  // a step failed

// A record about data files, begun with the name of the function that tells.
struct DataRecord : slog::Record {
    DataRecord(ncfUInt32 severity, const char* where) : Record(severity, where) { *this << where; }
};

// A result code in hexadecimal.
struct HexResult {
    NCFRESULT code;
};
inline slog::Record& operator<<(slog::Record& record, HexResult result) {
    return record << std::hex << static_cast<ncfUInt32>(result.code) << std::dec;
}
