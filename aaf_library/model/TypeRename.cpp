// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeRename.h"

#include "aaf_library/model/Model.h"

namespace aaf {

HRESULT TypeRename::Setup(const GUID& id, const std::wstring& name, TypeDefinition& base) {
    const HRESULT result = SetIdentity(id, name);
    if (result >= 0) {
        base_ = &base;
        model()->KeepType(base);
    }
    return result;
}

void TypeRename::Redefine(TypeDefinition& base) {
    base_ = &base;
    model()->KeepType(base);
}

void TypeRename::AppendStored(const std::uint8_t* native, Bytes& out) const {
    base_->AppendStored(native, out);
}

void TypeRename::CopyNative(const std::uint8_t* stored, std::uint8_t* native) const {
    base_->CopyNative(stored, native);
}

HRESULT TypeRename::Encode(const void* native, std::size_t bytes, Bytes& out) const {
    return base_->Encode(native, bytes, out);
}

std::size_t TypeRename::DecodedSize(const std::uint8_t* stored, std::size_t size) const {
    return base_->DecodedSize(stored, size);
}

HRESULT TypeRename::Decode(const std::uint8_t* stored, std::size_t size, void* native,
                           std::size_t bytes) const {
    return base_->Decode(stored, size, native, bytes);
}

HRESULT TypeRename::Initialize(aafUID_constref id, IAAFTypeDef* baseType,
                               aafCharacter_constptr typeName) {
    if (baseType == nullptr || typeName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    TypeDefinition* base = TypeOf(baseType, model());
    if (base == nullptr || base == this || !base->IsInitialized()) {
        return AAFRESULT_BAD_TYPE;
    }
    return Setup(id, typeName, *base);
}

HRESULT TypeRename::GetBaseType(IAAFTypeDef** baseType) {
    if (baseType == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return base_ == nullptr ? AAFRESULT_NOT_INITIALIZED : GiveOut(base_, baseType);
}

HRESULT TypeRename::GetBaseValue(IAAFPropertyValue* inPropVal, IAAFPropertyValue** outPropVal) {
    PropertyValue* value = nullptr;
    if (outPropVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(inPropVal, &value); result < 0) {
        return result;
    }
    return GiveValue(*base_, value->bytes(), outPropVal);
}

HRESULT TypeRename::CreateValue(IAAFPropertyValue* inPropVal, IAAFPropertyValue** outPropVal) {
    if (inPropVal == nullptr || outPropVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (base_ == nullptr) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    auto* value = ImplementationAs<PropertyValue>(inPropVal);
    if (value == nullptr || value->model() != model() ||
        value->type().Resolved().kind() != Resolved().kind()) {
        return AAFRESULT_BAD_TYPE;
    }
    return GiveValue(*this, value->bytes(), outPropVal);
}

}  // namespace aaf
