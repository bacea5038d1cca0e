// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/TaggedValue.h"

#include <cwchar>

#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeIds.h"

namespace aaf {

HRESULT TaggedValue::InitializeText(aafCharacter_constptr name, aafCharacter_constptr text) {
    if (name == nullptr || text == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    RefPtr<IAAFTypeDef> type;
    IAAFTypeDef* found = nullptr;
    const HRESULT result = GiveOut(model()->FindType(kAAFTypeID_String), &found);
    if (result < 0) {
        return result;
    }
    type = RefPtr<IAAFTypeDef>::Adopt(found);
    const std::size_t bytes = (std::wcslen(text) + 1) * sizeof *text;
    const HRESULT put = PutIndirect(prop::TaggedValue_Value, type.get(), text, bytes);
    return put < 0 ? put : PutString(prop::TaggedValue_Name, name);
}

HRESULT TaggedValue::Initialize(aafCharacter_constptr name, IAAFTypeDef* typeDef,
                                aafUInt32 valueSize, aafDataBuffer_t value) {
    if (name == nullptr || typeDef == nullptr || value == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (IsInitialized()) {
        return AAFRESULT_ALREADY_INITIALIZED;
    }
    const HRESULT result = PutIndirect(prop::TaggedValue_Value, typeDef, value, valueSize);
    return result < 0 ? result : PutString(prop::TaggedValue_Name, name);
}

HRESULT TaggedValue::GetName(aafCharacter* name, aafUInt32 bufSize) {
    return ReadString(prop::TaggedValue_Name, name, bufSize);
}

HRESULT TaggedValue::GetNameBufLen(aafUInt32* bufSize) {
    return ReadStringLength(prop::TaggedValue_Name, bufSize);
}

HRESULT TaggedValue::GetTypeDefinition(IAAFTypeDef** typeDef) {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return IsInitialized() ? ReadIndirectType(prop::TaggedValue_Value, typeDef)
                           : AAFRESULT_ILLEGAL_VALUE;
}

HRESULT TaggedValue::GetValue(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) {
    if (value == nullptr || bytesRead == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    const HRESULT result = ReadIndirect(prop::TaggedValue_Value, value, valueSize);
    if (result >= 0) {
        *bytesRead = valueSize;
    }
    return result;
}

HRESULT TaggedValue::GetValueBufLen(aafUInt32* len) {
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return IsInitialized() ? ReadIndirectSize(prop::TaggedValue_Value, len)
                           : AAFRESULT_ILLEGAL_VALUE;
}

HRESULT TaggedValue::SetValue(aafUInt32 valueSize, aafDataBuffer_t value) {
    if (value == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return IsInitialized() ? ReplaceIndirect(prop::TaggedValue_Value, value, valueSize)
                           : AAFRESULT_ILLEGAL_VALUE;
}

}  // namespace aaf
