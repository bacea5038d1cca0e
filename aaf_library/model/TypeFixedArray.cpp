// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeFixedArray.h"

namespace aaf {

HRESULT TypeFixedArray::Setup(const GUID& id, const std::wstring& name, TypeDefinition& element,
                              std::size_t count) {
    const HRESULT result = SetupElement(id, name, element);
    if (result >= 0) {
        count_ = count;
    }
    return result;
}

std::size_t TypeFixedArray::StoredSize() const {
    return count_ * ElementSize();
}

std::size_t TypeFixedArray::NativeSize() const {
    return element() == nullptr ? 0 : count_ * element()->NativeSize();
}

void TypeFixedArray::AppendStored(const std::uint8_t* native, Bytes& out) const {
    if (element()->IsStoredAsNative()) {
        out.insert(out.end(), native, native + StoredSize());
        return;
    }
    for (std::size_t i = 0; i < count_; ++i) {
        element()->AppendStored(native + i * element()->NativeSize(), out);
    }
}

void TypeFixedArray::CopyNative(const std::uint8_t* stored, std::uint8_t* native) const {
    if (element()->IsStoredAsNative()) {
        std::memcpy(native, stored, StoredSize());
        return;
    }
    for (std::size_t i = 0; i < count_; ++i) {
        element()->CopyNative(stored + i * ElementSize(), native + i * element()->NativeSize());
    }
}

HRESULT TypeFixedArray::Encode(const void* native, std::size_t bytes, Bytes& out) const {
    return TypeDefinition::Encode(native, bytes, out);
}

HRESULT TypeFixedArray::Initialize(aafUID_constref id, IAAFTypeDef* typeDef, aafUInt32 nElements,
                                   aafCharacter_constptr typeName) {
    TypeDefinition* elementType = nullptr;
    const HRESULT result = CheckElement(typeDef, typeName, &elementType);
    if (result < 0) {
        return result;
    }
    // A property's value takes at most 65535 bytes.
    if (elementType->form() != ValueForm::Data || nElements == 0 || nElements > 0xFFFF) {
        return AAFRESULT_BAD_TYPE;
    }
    return Setup(id, typeName, *elementType, nElements);
}

HRESULT TypeFixedArray::GetCount(aafUInt32* count) {
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *count = static_cast<aafUInt32>(count_);
    return IsInitialized() ? AAFRESULT_SUCCESS : AAFRESULT_NOT_INITIALIZED;
}

}  // namespace aaf
