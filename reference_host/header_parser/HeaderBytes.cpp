// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/HeaderBytes.h"

#include <algorithm>
#include <cstring>

namespace header_parser {

ncfUInt8* HeaderBytes::Room(ncfUInt64 count) {
    if (count > capacity_ - size_) {
        const ncfUInt64 wanted = std::max(size_ + count, size_ * 2);
        void* moved = std::realloc(bytes_.get(), static_cast<std::size_t>(wanted));
        if (moved == nullptr) {
            return nullptr;
        }
        static_cast<void>(bytes_.release());
        bytes_.reset(static_cast<ncfUInt8*>(moved));
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
