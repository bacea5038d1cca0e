// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeArray.h"

namespace aaf {

// Any number of elements; with a reference type the vectors of objects.
class TypeVariableArray : public TypeArray<IAAFTypeDefVariableArray, IAAFTypeDefVariableArrayEx> {
public:
    TypeVariableArray() : TypeArray(TypeKind::VariableArray) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, TypeDefinition& element) {
        return SetupElement(id, name, element);
    }
    ValueForm form() const override;

    // -- IAAFTypeDefVariableArray
    HRESULT Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                       aafCharacter_constptr typeName) override;
    HRESULT GetCount(IAAFPropertyValue* propVal, aafUInt32* count) override;
    HRESULT AppendElement(IAAFPropertyValue* inPropVal, IAAFPropertyValue* memberPropVal) override;
    HRESULT CreateEmptyValue(IAAFPropertyValue** propVal) override;

    // -- IAAFTypeDefVariableArrayEx
    HRESULT PrependElement(IAAFPropertyValue* inPropVal,
                           IAAFPropertyValue* memberPropVal) override {
        return InsertElement(inPropVal, 0, memberPropVal);
    }
    HRESULT RemoveElement(IAAFPropertyValue* inPropVal, aafUInt32 index) override;
    HRESULT InsertElement(IAAFPropertyValue* inPropVal, aafUInt32 index,
                          IAAFPropertyValue* memberPropVal) override;
};

}  // namespace aaf
