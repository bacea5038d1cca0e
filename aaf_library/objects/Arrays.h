// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"

namespace aaf {

// Copies an array property into a caller's buffer, which may be larger.
inline HRESULT ReadArray(const Object& object, const PropertyKey& key, void* data,
                         std::size_t bytes) {
    const HRESULT result = object.ReadNative(key, data, bytes);
    return result == AAFRESULT_BAD_SIZE ? AAFRESULT_SMALLBUF : result;
}

// How many elements of that size an array property has.
inline HRESULT CountElements(const Object& object, const PropertyKey& key, std::size_t elementSize,
                             aafUInt32* count) {
    const HRESULT result = object.ReadNativeSize(key, count);
    if (result >= 0) {
        *count /= static_cast<aafUInt32>(elementSize);
    }
    return result;
}

}  // namespace aaf
