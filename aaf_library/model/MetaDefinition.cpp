// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/MetaDefinition.h"

#include "aaf_library/model/Model.h"
#include "aaf_library/model/Text.h"

namespace aaf {

const std::wstring& MetaDefinition::name() const {
    if (IsNameInTable()) {
        name_ = Widen(builtInName_);
    }
    return name_;
}

void MetaDefinition::SetBuiltInIdentity(const GUID& id, const char* name) {
    id_ = id;
    builtInName_ = name;
    initialized_ = true;
    builtIn_ = true;
}

HRESULT MetaDefinition::SetIdentity(const GUID& id, const std::wstring& name) {
    if (initialized_) {
        return AAFRESULT_ALREADY_INITIALIZED;
    }
    id_ = id;
    name_ = name;
    initialized_ = true;
    return AAFRESULT_SUCCESS;
}

HRESULT MetaDefinition::Initialize(aafUID_constref id, aafCharacter_constptr name,
                                   aafCharacter_constptr description) {
    if (name == nullptr || description == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!NeedsNameOnly()) {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    const HRESULT result = SetIdentity(id, name);
    return result < 0 ? result : SetDescription(description);
}

HRESULT MetaDefinition::GetAUID(aafUID_t* auid) {
    if (auid == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!initialized_) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    *auid = id_;
    return AAFRESULT_SUCCESS;
}

HRESULT MetaDefinition::SetName(aafCharacter_constptr name) {
    if (name == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    model()->TellChange();
    builtInName_ = nullptr;
    name_ = name;
    renamed_ = true;
    return AAFRESULT_SUCCESS;
}

HRESULT MetaDefinition::GetName(aafCharacter* name, aafUInt32 bufSize) {
    return IsNameInTable() ? CopyAscii(builtInName_, name, bufSize)
                           : CopyText(name_, name, bufSize);
}

HRESULT MetaDefinition::GetNameBufLen(aafUInt32* bufSize) {
    return IsNameInTable() ? AsciiSize(builtInName_, bufSize) : TextSize(name_, bufSize);
}

HRESULT MetaDefinition::SetDescription(aafCharacter_constptr description) {
    if (description == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    description_ = description;
    described_ = true;
    return AAFRESULT_SUCCESS;
}

HRESULT MetaDefinition::GetDescription(aafCharacter* description, aafUInt32 bufSize) {
    if (description == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return described_ ? CopyText(description_, description, bufSize) : AAFRESULT_PROP_NOT_PRESENT;
}

HRESULT MetaDefinition::GetDescriptionBufLen(aafUInt32* bufSize) {
    if (bufSize == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!described_) {
        *bufSize = 0;
        return AAFRESULT_SUCCESS;
    }
    return TextSize(description_, bufSize);
}

}  // namespace aaf
