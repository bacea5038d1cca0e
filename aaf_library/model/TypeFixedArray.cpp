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
    for (std::size_t i = 0; i < count_; ++i) {
        element()->AppendStored(native + i * element()->NativeSize(), out);
    }
}

void TypeFixedArray::CopyNative(const std::uint8_t* stored, std::uint8_t* native) const {
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

HRESULT TypeFixedArray::GetType(IAAFTypeDef** typeDef) {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return element() == nullptr ? AAFRESULT_NOT_INITIALIZED : GiveOut(element(), typeDef);
}

HRESULT TypeFixedArray::GetCount(aafUInt32* count) {
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *count = static_cast<aafUInt32>(count_);
    return IsInitialized() ? AAFRESULT_SUCCESS : AAFRESULT_NOT_INITIALIZED;
}

HRESULT TypeFixedArray::CreateValueFromValues(IAAFPropertyValue** elementValues,
                                              aafUInt32 numElements, IAAFPropertyValue** propVal) {
    if (elementValues == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (numElements != count_) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    RefPtr<PropertyValue> value = NewValue();
    value->BytesToChange().clear();
    const HRESULT result = FillFromValues(*value, elementValues, numElements);
    return result < 0 ? result : GiveOut(value.get(), propVal);
}

HRESULT TypeFixedArray::CreateValueFromCArray(aafMemPtr_t initData, aafUInt32 initDataSize,
                                              IAAFPropertyValue** propVal) {
    if (initData == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    Bytes stored;
    const HRESULT result = Encode(initData, initDataSize, stored);
    return result < 0 ? result : GiveValue(*this, std::move(stored), propVal);
}

HRESULT TypeFixedArray::GetElementValue(IAAFPropertyValue* inPropVal, aafUInt32 index,
                                        IAAFPropertyValue** outPropVal) {
    PropertyValue* value = nullptr;
    if (outPropVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(inPropVal, &value);
    return result < 0 ? result : GiveElement(*value, index, outPropVal);
}

HRESULT TypeFixedArray::GetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data,
                                  aafUInt32 dataSize) {
    PropertyValue* value = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    return Decode(value->bytes().data(), value->bytes().size(), data, dataSize);
}

HRESULT TypeFixedArray::SetElementValue(IAAFPropertyValue* propVal, aafUInt32 index,
                                        IAAFPropertyValue* memberPropVal) {
    PropertyValue* value = nullptr;
    PropertyValue* element = nullptr;
    if (propVal == nullptr || memberPropVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    HRESULT result = Take(propVal, &value);
    if (result >= 0) {
        result = TakeElement(memberPropVal, &element);
    }
    return result < 0 ? result : ReplaceElement(*value, index, *element);
}

HRESULT TypeFixedArray::SetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data,
                                  aafUInt32 dataSize) {
    PropertyValue* value = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    Bytes stored;
    const HRESULT result = Encode(data, dataSize, stored);
    if (result >= 0) {
        value->BytesToChange() = std::move(stored);
    }
    return result;
}

HRESULT TypeFixedArray::GetElements(IAAFPropertyValue* setPropVal,
                                    IEnumAAFPropertyValues** enumerator) {
    PropertyValue* value = nullptr;
    if (enumerator == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = Take(setPropVal, &value);
    return result < 0 ? result : GiveElements(*value, enumerator);
}

}  // namespace aaf
