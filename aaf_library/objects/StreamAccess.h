// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"

// Properties that hold a stream, read and written at one moving position. It starts at the stream's
// beginning and isn't stored.

namespace aaf {

// For a stream that a class must have: a file leaves it out while it is empty. What is kept as it
// is stored stays until it is written over.
inline const PropertyKey& Required(Object& object, const PropertyKey& key) {
    if (object.values().Find(key.pid) == nullptr) {
        object.RequireValue(key);
    }
    return key;
}

// Writes at the position, over what is there and behind the end.
HRESULT WriteStream(Object& object, const PropertyKey& key, aafUInt32 bytes, aafDataBuffer_t buffer,
                    aafUInt32* bytesWritten);

// Reading or asking for a stream that isn't there: AAFRESULT_PROP_NOT_PRESENT; reading at its end:
// AAFRESULT_END_OF_DATA.
HRESULT ReadStream(const Object& object, const PropertyKey& key, aafUInt32 bytes,
                   aafDataBuffer_t buffer, aafUInt32* bytesRead);
HRESULT SetStreamPosition(const Object& object, const PropertyKey& key, aafPosition_t offset);
HRESULT ReadStreamPosition(const Object& object, const PropertyKey& key, aafPosition_t* offset);
HRESULT ReadStreamSize(const Object& object, const PropertyKey& key, aafLength_t* size);

}  // namespace aaf
