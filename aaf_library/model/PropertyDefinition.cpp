// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/PropertyDefinition.h"

#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"

namespace aaf {

namespace {

HRESULT GiveBoolean(bool value, aafBoolean_t* out) {
    if (out == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *out = value ? kAAFTrue : kAAFFalse;
    return AAFRESULT_SUCCESS;
}

}  // namespace

PropertyDefinition::PropertyDefinition(ClassDefinition& owner, PropertyId pid, const GUID& typeId,
                                       bool optional, bool unique)
    : owner_(owner), pid_(pid), typeId_(typeId), optional_(optional), unique_(unique) {}

TypeDefinition* PropertyDefinition::type() const {
    if (type_ == nullptr) {
        type_ = model()->FindType(typeId_);
    }
    return type_;
}

HRESULT PropertyDefinition::GetTypeDef(IAAFTypeDef** typeDef) {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return type() == nullptr ? AAFRESULT_TYPE_NOT_FOUND : GiveOut(type(), typeDef);
}

HRESULT PropertyDefinition::GetName(aafCharacter* name, aafUInt32 bufSize) {
    return MetaDefinition::GetName(name, bufSize);
}

HRESULT PropertyDefinition::GetNameBufLen(aafUInt32* bufSize) {
    return MetaDefinition::GetNameBufLen(bufSize);
}

HRESULT PropertyDefinition::GetIsOptional(aafBoolean_t* isOptional) {
    return GiveBoolean(optional_, isOptional);
}

HRESULT PropertyDefinition::GetIsUniqueIdentifier(aafBoolean_t* isUniqueIdentifier) {
    return GiveBoolean(unique_, isUniqueIdentifier);
}

HRESULT PropertyDefinition::SetDescription(aafCharacter_constptr description) {
    return MetaDefinition::SetDescription(description);
}

HRESULT PropertyDefinition::GetDescription(aafCharacter* description, aafUInt32 bufSize) {
    return MetaDefinition::GetDescription(description, bufSize);
}

HRESULT PropertyDefinition::GetDescriptionBufLen(aafUInt32* bufSize) {
    return MetaDefinition::GetDescriptionBufLen(bufSize);
}

}  // namespace aaf
