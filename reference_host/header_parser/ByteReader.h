// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <cstring>

#include "host_interfaces/framework/Types.h"

namespace header_parser {

inline ncfUInt16 LoadU16(const ncfUInt8* at) {
    return static_cast<ncfUInt16>(at[0] << 8 | at[1]);
}

inline ncfUInt32 LoadU32(const ncfUInt8* at) {
    return static_cast<ncfUInt32>(at[0]) << 24 | static_cast<ncfUInt32>(at[1]) << 16 |
           static_cast<ncfUInt32>(at[2]) << 8 | at[3];
}

inline ncfUInt64 LoadU64(const ncfUInt8* at) {
    return static_cast<ncfUInt64>(LoadU32(at)) << 32 | LoadU32(at + 4);
}

constexpr ncfUInt32 Code(const char (&text)[5]) {
    return static_cast<ncfUInt32>(static_cast<unsigned char>(text[0])) << 24 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[1])) << 16 |
           static_cast<ncfUInt32>(static_cast<unsigned char>(text[2])) << 8 |
           static_cast<unsigned char>(text[3]);
}

// Reads big-endian fields straight down a range of bytes. A field that does
// not fit reads as zero and is remembered, so the outcome is asked once at the
// end.
class ByteReader {
public:
    ByteReader(const ncfUInt8* begin, const ncfUInt8* end) : at_(begin), end_(end) {}

    ncfUInt8 U8() { return Take(1) ? last_[0] : ncfUInt8{0}; }
    ncfUInt16 U16() { return Take(2) ? LoadU16(last_) : ncfUInt16{0}; }
    ncfUInt32 U32() { return Take(4) ? LoadU32(last_) : 0u; }
    ncfUInt64 U64() { return Take(8) ? LoadU64(last_) : 0u; }
    ncfSInt32 S32() { return static_cast<ncfSInt32>(U32()); }
    ncfSInt64 S64() { return static_cast<ncfSInt64>(U64()); }
    double Double() {
        const ncfUInt64 bits = U64();
        double value = 0;
        std::memcpy(&value, &bits, sizeof value);
        return value;
    }
    void Skip(ncfUInt64 count) { Take(count); }

    const ncfUInt8* At() const { return at_; }
    const ncfUInt8* End() const { return end_; }
    ncfUInt64 Left() const { return static_cast<ncfUInt64>(end_ - at_); }
    bool Failed() const { return failed_; }

private:
    bool Take(ncfUInt64 count) {
        if (failed_ || count > Left()) {
            failed_ = true;
            return false;
        }
        last_ = at_;
        at_ += static_cast<std::ptrdiff_t>(count);
        return true;
    }

    const ncfUInt8* at_;
    const ncfUInt8* end_;
    const ncfUInt8* last_ = nullptr;
    bool failed_ = false;
};

}  // namespace header_parser
