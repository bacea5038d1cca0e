// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/StreamAccess.h"

#include <algorithm>

namespace aaf {

HRESULT WriteStream(Object& object, const PropertyKey& key, aafUInt32 bytes, aafDataBuffer_t buffer,
                    aafUInt32* bytesWritten) {
    if (buffer == nullptr || bytesWritten == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyValue* const stream = object.RequireValue(key);
    const auto at = static_cast<std::size_t>(stream->position());
    Bytes& content = stream->BytesToChange();
    if (content.size() < at + bytes) {
        content.resize(at + bytes);
    }
    std::copy_n(buffer, bytes, content.begin() + static_cast<std::ptrdiff_t>(at));
    stream->SetPosition(at + bytes);
    *bytesWritten = bytes;
    return AAFRESULT_SUCCESS;
}

HRESULT ReadStream(const Object& object, const PropertyKey& key, aafUInt32 bytes,
                   aafDataBuffer_t buffer, aafUInt32* bytesRead) {
    if (buffer == nullptr || bytesRead == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyValue* const stream = object.FindValue(key);
    if (stream == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    const Bytes& content = stream->bytes();
    const auto at = static_cast<std::size_t>(stream->position());
    const std::size_t there = std::min<std::size_t>(bytes, content.size() - at);
    std::copy_n(content.begin() + static_cast<std::ptrdiff_t>(at), there, buffer);
    stream->SetPosition(at + there);
    *bytesRead = static_cast<aafUInt32>(there);
    return there == 0 && bytes > 0 ? AAFRESULT_END_OF_DATA : AAFRESULT_SUCCESS;
}

HRESULT SetStreamPosition(const Object& object, const PropertyKey& key, aafPosition_t offset) {
    PropertyValue* const stream = object.FindValue(key);
    if (stream == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    if (offset < 0 || static_cast<std::uint64_t>(offset) > stream->bytes().size()) {
        return AAFRESULT_BADSAMPLEOFFSET;
    }
    stream->SetPosition(static_cast<std::uint64_t>(offset));
    return AAFRESULT_SUCCESS;
}

HRESULT ReadStreamPosition(const Object& object, const PropertyKey& key, aafPosition_t* offset) {
    if (offset == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* const stream = object.FindValue(key);
    if (stream == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    *offset = static_cast<aafPosition_t>(stream->position());
    return AAFRESULT_SUCCESS;
}

HRESULT ReadStreamSize(const Object& object, const PropertyKey& key, aafLength_t* size) {
    if (size == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* const stream = object.FindValue(key);
    if (stream == nullptr) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    *size = static_cast<aafLength_t>(stream->bytes().size());
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
