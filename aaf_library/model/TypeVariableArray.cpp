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

HRESULT TypeVariableArray::TakeBoth(IAAFPropertyValue* array, IAAFPropertyValue* member,
                                    PropertyValue** value, PropertyValue** element) const {
    if (array == nullptr || member == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(array, value);
    return result < 0 ? result : TakeElement(member, element);
}

HRESULT TypeVariableArray::Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                                      aafCharacter_constptr typeName) {
    TypeDefinition* elementType = nullptr;
    const HRESULT result = CheckElement(typeDef, typeName, &elementType);
    return result < 0 ? result : SetupElement(id, typeName, *elementType);
}

HRESULT TypeVariableArray::GetType(IAAFTypeDef** typeDef) {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return element() == nullptr ? AAFRESULT_NOT_INITIALIZED : GiveOut(element(), typeDef);
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

HRESULT TypeVariableArray::CreateValueFromValues(IAAFPropertyValue** elementValues,
                                                 aafUInt32 numElements,
                                                 IAAFPropertyValue** propVal) {
    if (elementValues == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    RefPtr<PropertyValue> value = NewValue();
    const HRESULT result = FillFromValues(*value, elementValues, numElements);
    return result < 0 ? result : GiveOut(value.get(), propVal);
}

HRESULT TypeVariableArray::CreateValueFromCArray(aafMemPtr_t initData, aafUInt32 initDataSize,
                                                 IAAFPropertyValue** propVal) {
    if (initData == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (form() != ValueForm::Data) {
        return AAFRESULT_BAD_TYPE;
    }
    Bytes stored;
    const HRESULT result = Encode(initData, initDataSize, stored);
    return result < 0 ? result : GiveValue(*this, std::move(stored), propVal);
}

HRESULT TypeVariableArray::GetElementValue(IAAFPropertyValue* inPropVal, aafUInt32 index,
                                           IAAFPropertyValue** outPropVal) {
    PropertyValue* value = nullptr;
    if (outPropVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(inPropVal, &value);
    return result < 0 ? result : GiveElement(*value, index, outPropVal);
}

HRESULT TypeVariableArray::GetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data,
                                     aafUInt32 dataSize) {
    PropertyValue* value = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    if (form() != ValueForm::Data) {
        return AAFRESULT_BAD_TYPE;
    }
    return Decode(value->bytes().data(), value->bytes().size(), data, dataSize);
}

HRESULT TypeVariableArray::SetElementValue(IAAFPropertyValue* propVal, aafUInt32 index,
                                           IAAFPropertyValue* memberPropVal) {
    PropertyValue* value = nullptr;
    PropertyValue* element = nullptr;
    const HRESULT result = TakeBoth(propVal, memberPropVal, &value, &element);
    return result < 0 ? result : ReplaceElement(*value, index, *element);
}

HRESULT TypeVariableArray::SetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data,
                                     aafUInt32 dataSize) {
    PropertyValue* value = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    if (form() != ValueForm::Data) {
        return AAFRESULT_BAD_TYPE;
    }
    Bytes stored;
    const HRESULT result = Encode(data, dataSize, stored);
    if (result >= 0) {
        value->BytesToChange() = std::move(stored);
    }
    return result;
}

HRESULT TypeVariableArray::GetElements(IAAFPropertyValue* setPropVal,
                                       IEnumAAFPropertyValues** enumerator) {
    PropertyValue* value = nullptr;
    if (enumerator == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(setPropVal, &value);
    return result < 0 ? result : GiveElements(*value, enumerator);
}

HRESULT TypeVariableArray::PrependElement(IAAFPropertyValue* inPropVal,
                                          IAAFPropertyValue* memberPropVal) {
    return InsertElement(inPropVal, 0, memberPropVal);
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
