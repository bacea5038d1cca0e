// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdlib>
#include <memory>

#include "host_interfaces/framework/Types.h"

namespace header_parser {

// The bytes of the movie header, gathered piece by piece and kept once. The
// tables are read in place, so nothing is appended any more once they are in
// use. Grows by reallocation, which moves large blocks without a copy, and
// never takes more than twice what was really given.
class HeaderBytes {
public:
    const ncfUInt8* begin() const { return bytes_.get(); }
    const ncfUInt8* end() const { return bytes_.get() + size_; }
    ncfUInt64 Size() const { return size_; }

    // False without memory; the bytes so far stay.
    bool Append(const ncfUInt8* from, ncfUInt64 count);
    void Shorten(ncfUInt64 size) { size_ = size; }
    // Room for writing `count` bytes behind the end, kept by Extend.
    ncfUInt8* Room(ncfUInt64 count);
    void Extend(ncfUInt64 count) { size_ += count; }

private:
    struct Free {
        void operator()(ncfUInt8* bytes) const { std::free(bytes); }
    };

    std::unique_ptr<ncfUInt8, Free> bytes_;
    ncfUInt64 size_ = 0;
    ncfUInt64 capacity_ = 0;
};

}  // namespace header_parser
