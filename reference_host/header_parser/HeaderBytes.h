// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdlib>
#include <memory>

#include "host_interfaces/framework/Types.h"

namespace header_parser {

// The bytes of the movie header, gathered piece by piece and kept once. The
// tables are read in place, so nothing is appended any more once they are in
// use. A large header grows in few steps, towards what its atom claims but
// never past 256 times what was really given; memory that is not written to costs
// nothing.
class HeaderBytes {
public:
    const ncfUInt8* begin() const { return bytes_.get(); }
    const ncfUInt8* end() const { return bytes_.get() + size_; }
    ncfUInt64 Size() const { return size_; }

    // How many bytes there will be, as far as the file can be trusted.
    void Expect(ncfUInt64 size) { expected_ = size; }
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

    ncfUInt64 NextCapacity(ncfUInt64 needed) const;

    std::unique_ptr<ncfUInt8, Free> bytes_;
    ncfUInt64 expected_ = 0;
    ncfUInt64 size_ = 0;
    ncfUInt64 capacity_ = 0;
};

}  // namespace header_parser
