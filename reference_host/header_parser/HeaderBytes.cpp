// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/HeaderBytes.h"

#include <algorithm>
#include <cstring>

#include "reference_host/system/LargeBlock.h"

namespace header_parser {

ncfUInt64 HeaderBytes::NextCapacity(ncfUInt64 needed) const {
    return std::max({needed, size_ * 2, std::min(expected_, size_ * 256)});
}

ncfUInt8* HeaderBytes::Room(ncfUInt64 count) {
    if (count > capacity_ - size_) {
        const ncfUInt64 wanted = NextCapacity(size_ + count);
        auto* const larger = static_cast<ncfUInt8*>(std::malloc(static_cast<std::size_t>(wanted)));
        if (larger == nullptr) {
            return nullptr;
        }
        host::system::ExpectLargeBlock(larger, wanted);
        if (size_ > 0) {
            std::memcpy(larger, bytes_.get(), static_cast<std::size_t>(size_));
        }
        bytes_.reset(larger);
        capacity_ = wanted;
    }
    return bytes_.get() + size_;
}

bool HeaderBytes::Append(const ncfUInt8* from, ncfUInt64 count) {
    if (count == 0) {
        return true;
    }
    ncfUInt8* room = Room(count);
    if (room == nullptr) {
        return false;
    }
    std::memcpy(room, from, static_cast<std::size_t>(count));
    size_ += count;
    return true;
}

}  // namespace header_parser
