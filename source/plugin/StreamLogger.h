// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <ios>

#include "host_interfaces/framework/Types.h"

namespace slog {

// What a record tells.
inline constexpr ncfUInt32 kInformation = 0;
inline constexpr ncfUInt32 kError = 1;
inline constexpr ncfUInt32 kWarning = 2;
inline constexpr ncfUInt32 kNoRecord = 0xFFFFFFFFu;

// The channel that the checking macros write to.
inline constexpr ncfUInt64 kMaskChecks = 1;

// Takes records apart into writes of text and numbers. The order of the
// operations is that of their places in the table.
class CLoggerBaseEx {
public:
    virtual ~CLoggerBaseEx() = default;
    virtual void BeginRecord(ncfUInt32 kind, const char* where) = 0;
    virtual void Hook() = 0;
    virtual void SetFlag(ncfUInt32 value) = 0;  // 1 at the start of an error record
    virtual void WriteDouble(double value) = 0;
    virtual void WriteSInt64(ncfSInt64 value) = 0;
    virtual void WriteUInt64(ncfUInt64 value) = 0;
    virtual void WriteUInt32(ncfUInt32 value) = 0;
    virtual void WriteSInt32(ncfSInt32 value) = 0;
    virtual void WriteString(const char* text) = 0;
    virtual void Manipulate(std::ios_base& (*manipulator)(std::ios_base&)) = 0;
    virtual void EndRecord() = 0;
};

// Discards everything; a record then costs a few calls that return at once.
class CNullLoggerEx final : public CLoggerBaseEx {
public:
    void BeginRecord(ncfUInt32, const char*) override {}
    void Hook() override {}
    void SetFlag(ncfUInt32) override {}
    void WriteDouble(double) override {}
    void WriteSInt64(ncfSInt64) override {}
    void WriteUInt64(ncfUInt64) override {}
    void WriteUInt32(ncfUInt32) override {}
    void WriteSInt32(ncfSInt32) override {}
    void WriteString(const char*) override {}
    void Manipulate(std::ios_base& (*)(std::ios_base&)) override {}
    void EndRecord() override {}
};

}  // namespace slog
