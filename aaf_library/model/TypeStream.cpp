// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeStream.h"

#include <algorithm>

namespace aaf {

namespace {

constexpr std::uint8_t kUnspecified = 0x55;
constexpr std::uint8_t kLittle = 0x4C;
constexpr std::uint8_t kBig = 0x42;

// Streams live in memory; a size beyond this is a mistake of the caller.
constexpr aafInt64 kLargestStream = aafInt64{1} << 40;

}  // namespace

HRESULT TypeStream::GetSize(IAAFPropertyValue* streamPropertyValue, aafInt64* size) {
    PropertyValue* value = nullptr;
    if (size == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(streamPropertyValue, &value);
    if (result >= 0) {
        *size = static_cast<aafInt64>(value->bytes().size());
    }
    return result;
}

HRESULT TypeStream::SetSize(IAAFPropertyValue* streamPropertyValue, aafInt64 newSize) {
    PropertyValue* value = nullptr;
    if (const HRESULT result = Take(streamPropertyValue, &value); result < 0) {
        return result;
    }
    if (newSize < 0 || newSize > kLargestStream) {
        return AAFRESULT_BAD_SIZE;
    }
    value->BytesToChange().resize(static_cast<std::size_t>(newSize));
    return AAFRESULT_SUCCESS;
}

HRESULT TypeStream::GetPosition(IAAFPropertyValue* streamPropertyValue, aafInt64* position) {
    PropertyValue* value = nullptr;
    if (position == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(streamPropertyValue, &value);
    if (result >= 0) {
        *position = static_cast<aafInt64>(value->position());
    }
    return result;
}

HRESULT TypeStream::SetPosition(IAAFPropertyValue* streamPropertyValue, aafInt64 newPosition) {
    PropertyValue* value = nullptr;
    if (const HRESULT result = Take(streamPropertyValue, &value); result < 0) {
        return result;
    }
    if (newPosition < 0 || static_cast<std::uint64_t>(newPosition) > value->bytes().size()) {
        return AAFRESULT_INVALID_PARAM;
    }
    value->SetPosition(static_cast<std::uint64_t>(newPosition));
    return AAFRESULT_SUCCESS;
}

HRESULT TypeStream::Read(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                         aafMemPtr_t data, aafUInt32* bytesRead) {
    PropertyValue* value = nullptr;
    if (data == nullptr || bytesRead == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(streamPropertyValue, &value); result < 0) {
        return result;
    }
    const auto position = static_cast<std::size_t>(value->position());
    const std::size_t count = std::min<std::size_t>(dataSize, value->bytes().size() - position);
    if (count > 0) {
        std::memcpy(data, value->bytes().data() + position, count);
    }
    value->SetPosition(position + count);
    *bytesRead = static_cast<aafUInt32>(count);
    return count == 0 && dataSize > 0 ? AAFRESULT_END_OF_DATA : AAFRESULT_SUCCESS;
}

HRESULT TypeStream::Write(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                          aafMemPtr_t data) {
    PropertyValue* value = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(streamPropertyValue, &value); result < 0) {
        return result;
    }
    const auto position = static_cast<std::size_t>(value->position());
    value->BytesToChange().resize(
        std::max<std::size_t>(value->bytes().size(), position + dataSize));
    std::copy_n(data, dataSize,
                value->BytesToChange().begin() + static_cast<std::ptrdiff_t>(position));
    value->SetPosition(position + dataSize);
    return AAFRESULT_SUCCESS;
}

HRESULT TypeStream::Append(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                           aafMemPtr_t data) {
    PropertyValue* value = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(streamPropertyValue, &value); result < 0) {
        return result;
    }
    value->SetPosition(value->bytes().size());
    return Write(streamPropertyValue, dataSize, data);
}

HRESULT TypeStream::HasStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       aafBoolean_t* hasByteOrder) {
    PropertyValue* value = nullptr;
    if (hasByteOrder == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(streamPropertyValue, &value);
    if (result >= 0) {
        *hasByteOrder = value->streamByteOrder() == kUnspecified ? kAAFFalse : kAAFTrue;
    }
    return result;
}

HRESULT TypeStream::GetStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       eAAFByteOrder_t* byteOrder) {
    PropertyValue* value = nullptr;
    if (byteOrder == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(streamPropertyValue, &value); result < 0) {
        return result;
    }
    if (value->streamByteOrder() == kUnspecified) {
        return AAFRESULT_NOBYTEORDER;
    }
    *byteOrder = value->streamByteOrder() == kBig ? kAAFByteOrderBig : kAAFByteOrderLittle;
    return AAFRESULT_SUCCESS;
}

HRESULT TypeStream::SetStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       eAAFByteOrder_t byteOrder) {
    PropertyValue* value = nullptr;
    if (byteOrder != kAAFByteOrderLittle && byteOrder != kAAFByteOrderBig) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    const HRESULT result = Take(streamPropertyValue, &value);
    if (result >= 0) {
        value->SetStreamByteOrder(byteOrder == kAAFByteOrderBig ? kBig : kLittle);
    }
    return result;
}

HRESULT TypeStream::ClearStoredByteOrder(IAAFPropertyValue* streamPropertyValue) {
    PropertyValue* value = nullptr;
    const HRESULT result = Take(streamPropertyValue, &value);
    if (result >= 0) {
        value->SetStreamByteOrder(kUnspecified);
    }
    return result;
}

HRESULT TypeStream::TakeElements(IAAFPropertyValue* argument, IAAFTypeDef* elementType,
                                 aafUInt32 dataSize, PropertyValue** value,
                                 const TypeDefinition** element) const {
    if (elementType == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(argument, value); result < 0) {
        return result;
    }
    *element = TypeOf(elementType, model());
    if (*element == nullptr || (*element)->form() != ValueForm::Data ||
        (*element)->NativeSize() == 0) {
        return AAFRESULT_BAD_TYPE;
    }
    if (dataSize % (*element)->NativeSize() != 0) {
        return AAFRESULT_BAD_SIZE;
    }
    return (*value)->streamByteOrder() == kBig ? AAFRESULT_INVALID_BYTEORDER : AAFRESULT_SUCCESS;
}

HRESULT TypeStream::ReadElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                 aafUInt32 dataSize, aafMemPtr_t data, aafUInt32* bytesRead) {
    PropertyValue* value = nullptr;
    const TypeDefinition* element = nullptr;
    if (data == nullptr || bytesRead == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result =
        TakeElements(streamPropertyValue, elementType, dataSize, &value, &element);
    if (result < 0) {
        return result;
    }
    const std::size_t native = element->NativeSize();
    const std::size_t stored = element->StoredSize();
    auto position = static_cast<std::size_t>(value->position());
    const std::size_t count =
        std::min<std::size_t>(dataSize / native, (value->bytes().size() - position) / stored);
    for (std::size_t at = 0; at < count; ++at, position += stored) {
        element->CopyNative(value->bytes().data() + position, data + at * native);
    }
    value->SetPosition(position);
    *bytesRead = static_cast<aafUInt32>(count * native);
    return count == 0 && dataSize > 0 ? AAFRESULT_END_OF_DATA : AAFRESULT_SUCCESS;
}

HRESULT TypeStream::StoreElements(IAAFPropertyValue* argument, IAAFTypeDef* elementType,
                                  aafUInt32 dataSize, const aafUInt8* data, Bytes* stored) const {
    PropertyValue* value = nullptr;
    const TypeDefinition* element = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = TakeElements(argument, elementType, dataSize, &value, &element);
    if (result < 0) {
        return result;
    }
    stored->reserve(1);  // no elements have an address too
    for (std::size_t at = 0; at < dataSize; at += element->NativeSize()) {
        element->AppendStored(data + at, *stored);
    }
    return AAFRESULT_SUCCESS;
}

HRESULT TypeStream::WriteElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                  aafUInt32 dataSize, aafMemPtr_t data) {
    Bytes stored;
    const HRESULT result = StoreElements(streamPropertyValue, elementType, dataSize, data, &stored);
    return result < 0
               ? result
               : Write(streamPropertyValue, static_cast<aafUInt32>(stored.size()), stored.data());
}

HRESULT TypeStream::AppendElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                   aafUInt32 dataSize, aafMemPtr_t data) {
    Bytes stored;
    const HRESULT result = StoreElements(streamPropertyValue, elementType, dataSize, data, &stored);
    return result < 0
               ? result
               : Append(streamPropertyValue, static_cast<aafUInt32>(stored.size()), stored.data());
}

}  // namespace aaf
