// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <new>
#include <utility>
#include <vector>

#include "host_interfaces/framework/Types.h"

// Bytes that are read into. Growing by `resize(n)` leaves the new ones as the memory
// was: zeros would only be written over, at the price of touching all of it twice.
template <class T>
struct UnsetAllocator : std::allocator<T> {
    template <class U>
    struct rebind {
        using other = UnsetAllocator<U>;
    };

    template <class U>
    void construct(U* place) noexcept {
        ::new (static_cast<void*>(place)) U;
    }
    template <class U, class... Values>
    void construct(U* place, Values&&... values) {
        ::new (static_cast<void*>(place)) U(std::forward<Values>(values)...);
    }
};

using ByteVector = std::vector<ncfUInt8, UnsetAllocator<ncfUInt8>>;
