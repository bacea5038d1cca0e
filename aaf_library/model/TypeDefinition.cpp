// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeDefinition.h"

#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeFacts.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

namespace aaf {

const TypeDefinition& TypeDefinition::Resolved() const {
    const TypeDefinition* at = this;
    while (at->kind_ == TypeKind::Rename && at->element() != nullptr) {
        at = at->element();
    }
    return *at;
}

void TypeDefinition::AppendStored(const std::uint8_t* native, Bytes& out) const {
    out.insert(out.end(), native, native + StoredSize());
}

void TypeDefinition::CopyNative(const std::uint8_t* stored, std::uint8_t* native) const {
    std::memcpy(native, stored, StoredSize());
}

HRESULT TypeDefinition::Encode(const void* native, std::size_t bytes, Bytes& out) const {
    if (NativeSize() == 0 || bytes != NativeSize()) {
        return AAFRESULT_BAD_SIZE;
    }
    AppendStored(static_cast<const std::uint8_t*>(native), out);
    return AAFRESULT_SUCCESS;
}

std::size_t TypeDefinition::DecodedSize(const std::uint8_t*, std::size_t) const {
    return NativeSize();
}

HRESULT TypeDefinition::Decode(const std::uint8_t* stored, std::size_t size, void* native,
                               std::size_t bytes) const {
    if (NativeSize() == 0 || size < StoredSize() || bytes < NativeSize()) {
        return AAFRESULT_BAD_SIZE;
    }
    CopyNative(stored, static_cast<std::uint8_t*>(native));
    return AAFRESULT_SUCCESS;
}

Bytes TypeDefinition::EmptyBytes() const {
    return Bytes(form() == ValueForm::Data ? StoredSize() : 0);
}

RefPtr<PropertyValue> TypeDefinition::NewValue() {
    return model()->NewValue(*this);
}

HRESULT TypeDefinition::GetTypeCategory(eAAFTypeCategory_t* tid) {
    if (tid == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *tid = CategoryOf(kind_);
    return AAFRESULT_SUCCESS;
}

HRESULT TypeDefinition::RawAccessType(IAAFTypeDef** rawTypeDef) {
    if (rawTypeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return GiveOut(model()->FindType(kAAFTypeID_UInt8Array), rawTypeDef);
}

HRESULT TypeDefinition::Take(IAAFPropertyValue* argument, PropertyValue** value) const {
    if (argument == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    *value = ImplementationAs<PropertyValue>(argument);
    // Two definitions of one type serve each other's values, so the kind decides. A rename takes
    // values of its own kind only, everything else looks through renames.
    const bool fits = *value != nullptr && (*value)->model() == model() &&
                      (kind_ == TypeKind::Rename ? (*value)->type().kind() == kind_
                                                 : (*value)->type().Resolved().kind() == kind_);
    return fits ? AAFRESULT_SUCCESS : AAFRESULT_BAD_TYPE;
}

HRESULT TypeDefinition::GiveValue(TypeDefinition& type, Bytes stored,
                                  IAAFPropertyValue** out) const {
    return GiveOut(type.model()->NewValue(type, std::move(stored)).get(), out);
}

TypeDefinition* TypeOf(IAAFTypeDef* argument, const Model* model) {
    auto* type = ImplementationAs<TypeDefinition>(argument);
    return type != nullptr && type->model() == model ? type : nullptr;
}

}  // namespace aaf
