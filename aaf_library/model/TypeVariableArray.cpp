// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeVariableArray.h"

namespace aaf {

ValueForm TypeVariableArray::form() const {
    const ValueForm form = element() == nullptr ? ValueForm::Data : element()->form();
    return form == ValueForm::StrongReference ? ValueForm::StrongVector
           : form == ValueForm::WeakReference ? ValueForm::WeakVector
                                              : ValueForm::Data;
}

HRESULT TypeVariableArray::Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                                      aafCharacter_constptr typeName) {
    TypeDefinition* elementType = nullptr;
    const HRESULT result = CheckElement(typeDef, typeName, &elementType);
    return result < 0 ? result : SetupElement(id, typeName, *elementType);
}

HRESULT TypeVariableArray::GetCount(IAAFPropertyValue* propVal, aafUInt32* count) {
    PropertyValue* value = nullptr;
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    *count = static_cast<aafUInt32>(CountOf(*value));
    return AAFRESULT_SUCCESS;
}

HRESULT TypeVariableArray::AppendElement(IAAFPropertyValue* inPropVal,
                                         IAAFPropertyValue* memberPropVal) {
    PropertyValue* value = nullptr;
    PropertyValue* element = nullptr;
    const HRESULT result = TakeBoth(inPropVal, memberPropVal, &value, &element);
    return result < 0 ? result : InsertElementAt(*value, CountOf(*value), *element);
}

HRESULT TypeVariableArray::CreateEmptyValue(IAAFPropertyValue** propVal) {
    if (propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return IsInitialized() ? GiveValue(*this, {}, propVal) : AAFRESULT_NOT_INITIALIZED;
}

HRESULT TypeVariableArray::RemoveElement(IAAFPropertyValue* inPropVal, aafUInt32 index) {
    PropertyValue* value = nullptr;
    const HRESULT result = Take(inPropVal, &value);
    return result < 0 ? result : EraseElement(*value, index);
}

HRESULT TypeVariableArray::InsertElement(IAAFPropertyValue* inPropVal, aafUInt32 index,
                                         IAAFPropertyValue* memberPropVal) {
    PropertyValue* value = nullptr;
    PropertyValue* element = nullptr;
    const HRESULT result = TakeBoth(inPropVal, memberPropVal, &value, &element);
    return result < 0 ? result : InsertElementAt(*value, index, *element);
}

}  // namespace aaf
