// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeInteger.h"

#include "aaf_library/model/StoredNumbers.h"

namespace aaf {

namespace {

bool IsIntegerSize(aafUInt32 size) {
    return size == 1 || size == 2 || size == 4 || size == 8;
}

template <class Number>
Number Load(const std::uint8_t* native) {
    Number value;
    std::memcpy(&value, native, sizeof value);
    return value;
}

}  // namespace

std::uint64_t NativeUnsigned(const std::uint8_t* native, std::size_t size) {
    switch (size) {
        case 1:
            return Load<std::uint8_t>(native);
        case 2:
            return Load<std::uint16_t>(native);
        case 4:
            return Load<std::uint32_t>(native);
        default:
            return Load<std::uint64_t>(native);
    }
}

aafInt64 NativeSigned(const std::uint8_t* native, std::size_t size) {
    switch (size) {
        case 1:
            return Load<std::int8_t>(native);
        case 2:
            return Load<std::int16_t>(native);
        case 4:
            return Load<std::int32_t>(native);
        default:
            return Load<std::int64_t>(native);
    }
}

void PutNativeNumber(std::uint64_t value, std::uint8_t* native, std::size_t size) {
    const auto one = static_cast<std::uint8_t>(value);
    const auto two = static_cast<std::uint16_t>(value);
    const auto four = static_cast<std::uint32_t>(value);
    const void* source = size == 1   ? static_cast<const void*>(&one)
                         : size == 2 ? static_cast<const void*>(&two)
                         : size == 4 ? static_cast<const void*>(&four)
                                     : static_cast<const void*>(&value);
    std::memcpy(native, source, size);
}

HRESULT TypeInteger::Setup(const GUID& id, const std::wstring& name, unsigned size, bool isSigned) {
    if (!IsIntegerSize(size)) {
        return AAFRESULT_BAD_SIZE;
    }
    const HRESULT result = SetIdentity(id, name);
    if (result >= 0) {
        size_ = size;
        signed_ = isSigned;
    }
    return result;
}

void TypeInteger::AppendStored(const std::uint8_t* native, Bytes& out) const {
    AppendNumber(NativeUnsigned(native, size_), size_, out);
}

void TypeInteger::CopyNative(const std::uint8_t* stored, std::uint8_t* native) const {
    if (IsStoredAsNative()) {
        std::memcpy(native, stored, size_);
    } else {
        PutNativeNumber(UnsignedAt(stored, size_), native, size_);
    }
}

HRESULT TypeInteger::Initialize(aafUID_constref id, aafUInt8 intSize, aafBoolean_t isSigned,
                                aafCharacter_constptr typeName) {
    if (!IsBoolean(isSigned)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    if (typeName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return Setup(id, typeName, intSize, isSigned == kAAFTrue);
}

HRESULT TypeInteger::Widen(const std::uint8_t* native, aafUInt32 bytes, Bytes& out) const {
    if (!IsIntegerSize(bytes) || bytes > size_) {
        return AAFRESULT_BAD_SIZE;
    }
    const std::uint64_t value = signed_ ? static_cast<std::uint64_t>(NativeSigned(native, bytes))
                                        : NativeUnsigned(native, bytes);
    out.clear();
    AppendNumber(value, size_, out);
    return AAFRESULT_SUCCESS;
}

HRESULT TypeInteger::CreateValue(aafMemPtr_t val, aafUInt32 valSize, IAAFPropertyValue** propVal) {
    if (val == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    Bytes stored;
    const HRESULT result = Widen(val, valSize, stored);
    return result < 0 ? result : GiveValue(*this, std::move(stored), propVal);
}

HRESULT TypeInteger::GetInteger(IAAFPropertyValue* propVal, aafMemPtr_t val, aafUInt32 valSize) {
    PropertyValue* value = nullptr;
    if (val == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    const std::size_t size = value->bytes().size();
    if (!IsIntegerSize(valSize) || valSize < size_ || size > size_ || size == 0) {
        return AAFRESULT_BAD_SIZE;
    }
    const std::uint8_t* stored = value->bytes().data();
    const std::uint64_t number =
        signed_ ? static_cast<std::uint64_t>(SignedAt(stored, size)) : UnsignedAt(stored, size);
    PutNativeNumber(number, val, valSize);
    return AAFRESULT_SUCCESS;
}

HRESULT TypeInteger::SetInteger(IAAFPropertyValue* propVal, aafMemPtr_t val, aafUInt32 valSize) {
    PropertyValue* value = nullptr;
    if (val == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    return Widen(val, valSize, value->BytesToChange());
}

HRESULT TypeInteger::GetSize(aafUInt32* size) {
    if (size == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *size = size_;
    return IsInitialized() ? AAFRESULT_SUCCESS : AAFRESULT_NOT_INITIALIZED;
}

HRESULT TypeInteger::IsSigned(aafBoolean_t* isSigned) {
    if (isSigned == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *isSigned = signed_ ? kAAFTrue : kAAFFalse;
    return IsInitialized() ? AAFRESULT_SUCCESS : AAFRESULT_NOT_INITIALIZED;
}

}  // namespace aaf
