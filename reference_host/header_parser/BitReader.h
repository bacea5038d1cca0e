// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Types.h"

namespace header_parser {

// Reads fields of bits, the highest bit of a byte first. A field that does not
// fit reads as zero and is remembered.
class BitReader {
public:
    BitReader(const ncfUInt8* begin, const ncfUInt8* end)
        : begin_(begin), bits_(8 * static_cast<ncfUInt64>(end - begin)) {}

    // `count` up to 32.
    ncfUInt32 Take(unsigned count) {
        const ncfUInt32 value = Show(count);
        Skip(count);
        return value;
    }
    bool Flag() { return Take(1) != 0; }
    // The next bits, which stay; zero past the end.
    ncfUInt32 Show(unsigned count) const {
        ncfUInt32 value = 0;
        if (count <= Left()) {
            for (ncfUInt64 i = at_; i < at_ + count; ++i) {
                value = value << 1 | (begin_[i / 8] >> (7 - i % 8) & 1u);
            }
        }
        return value;
    }
    void Skip(ncfUInt64 count) {
        failed_ = failed_ || count > Left();
        at_ = failed_ ? bits_ : at_ + count;
    }
    ncfUInt64 Left() const { return bits_ - at_; }
    bool Failed() const { return failed_; }

private:
    const ncfUInt8* begin_;
    ncfUInt64 bits_;
    ncfUInt64 at_ = 0;
    bool failed_ = false;
};

}  // namespace header_parser
