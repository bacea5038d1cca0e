// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/KLVData.h"

#include <algorithm>
#include <cstring>

#include "aaf_library/model/StoredNumbers.h"

// An opaque value is stored as one byte that tells the byte order, sixteen of
// the key, and then the bytes themselves.

namespace aaf {

namespace {

constexpr std::size_t kKeyAt = 1;
constexpr std::size_t kBytesAt = kKeyAt + sizeof(aafUID_t);

}  // namespace

PropertyValue* KLVData::Stored() const {
    PropertyValue* value = FindValue(prop::KLVData_Value);
    return value != nullptr && value->bytes().size() >= kBytesAt ? value : nullptr;
}

HRESULT KLVData::Initialize(aafUID_t key, aafUInt32 length, aafDataBuffer_t value) {
    if (value == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (Stored() != nullptr) {
        return AAFRESULT_ALREADY_INITIALIZED;
    }
    Bytes bytes(kBytesAt + length);
    bytes[0] = kLittleEndianMark;
    std::memcpy(&bytes[kKeyAt], &key, sizeof key);
    std::copy_n(value, length, bytes.begin() + kBytesAt);
    RequireValue(prop::KLVData_Value)->BytesToChange() = std::move(bytes);
    return AAFRESULT_SUCCESS;
}

HRESULT KLVData::GetKey(aafUID_t* key) {
    if (key == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* stored = Stored();
    if (stored == nullptr) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    std::memcpy(key, &stored->bytes()[kKeyAt], sizeof *key);
    return AAFRESULT_SUCCESS;
}

HRESULT KLVData::GetValue(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) {
    if (value == nullptr || bytesRead == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafUInt32 size = 0;
    const HRESULT result = GetValueBufLen(&size);
    if (result < 0) {
        return result;
    }
    if (valueSize < size) {
        return AAFRESULT_SMALLBUF;
    }
    const Bytes& bytes = Stored()->bytes();
    std::copy(bytes.begin() + kBytesAt, bytes.end(), value);
    *bytesRead = size;
    return AAFRESULT_SUCCESS;
}

HRESULT KLVData::GetValueBufLen(aafUInt32* len) {
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const PropertyValue* stored = Stored();
    if (stored == nullptr) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    *len = static_cast<aafUInt32>(stored->bytes().size() - kBytesAt);
    return AAFRESULT_SUCCESS;
}

HRESULT KLVData::SetValue(aafUInt32 valueSize, aafDataBuffer_t value) {
    if (value == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    PropertyValue* stored = Stored();
    if (stored == nullptr) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    stored->BytesToChange().resize(kBytesAt);
    stored->BytesToChange().insert(stored->bytes().end(), value, value + valueSize);
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
