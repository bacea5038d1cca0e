// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeOfElements.h"
#include "not_implemented/AAFTypeDefinitionsOfMany.h"

namespace aaf {

// Any number of elements; with a reference type the vectors of objects.
class TypeVariableArray
    : public Implements<TypeOfElements, IAAFTypeDefVariableArray, IAAFTypeDefVariableArrayEx> {
public:
    TypeVariableArray() : Implements(TypeKind::VariableArray) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, TypeDefinition& element) {
        return SetupElement(id, name, element);
    }
    ValueForm form() const override;

    // -- IAAFTypeDefVariableArray
    HRESULT Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                       aafCharacter_constptr typeName) override;
    HRESULT GetType(IAAFTypeDef** typeDef) override;
    HRESULT GetCount(IAAFPropertyValue* propVal, aafUInt32* count) override;
    HRESULT AppendElement(IAAFPropertyValue* inPropVal, IAAFPropertyValue* memberPropVal) override;
    HRESULT CreateEmptyValue(IAAFPropertyValue** propVal) override;
    HRESULT CreateValueFromValues(IAAFPropertyValue** elementValues, aafUInt32 numElements,
                                  IAAFPropertyValue** propVal) override;
    HRESULT CreateValueFromCArray(aafMemPtr_t initData, aafUInt32 initDataSize,
                                  IAAFPropertyValue** propVal) override;
    HRESULT GetElementValue(IAAFPropertyValue* inPropVal, aafUInt32 index,
                            IAAFPropertyValue** outPropVal) override;
    HRESULT GetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data, aafUInt32 dataSize) override;
    HRESULT SetElementValue(IAAFPropertyValue* propVal, aafUInt32 index,
                            IAAFPropertyValue* memberPropVal) override;
    HRESULT SetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data, aafUInt32 dataSize) override;
    HRESULT GetElements(IAAFPropertyValue* setPropVal,
                        IEnumAAFPropertyValues** enumerator) override;

    // -- IAAFTypeDefVariableArrayEx
    HRESULT PrependElement(IAAFPropertyValue* inPropVal, IAAFPropertyValue* memberPropVal) override;
    HRESULT RemoveElement(IAAFPropertyValue* inPropVal, aafUInt32 index) override;
    HRESULT InsertElement(IAAFPropertyValue* inPropVal, aafUInt32 index,
                          IAAFPropertyValue* memberPropVal) override;

private:
    // Both arguments of an operation that puts one element into an array.
    HRESULT TakeBoth(IAAFPropertyValue* array, IAAFPropertyValue* member, PropertyValue** value,
                     PropertyValue** element) const;
};

}  // namespace aaf
