// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeOfElements.h"
#include "not_implemented/AAFTypeDefinitionsOfMany.h"

namespace aaf {

// What arrays of a fixed and of a varying number of elements answer alike. The
// interfaces of both have these operations with the same arguments.
template <class... Interfaces>
class TypeArray : public Implements<TypeOfElements, Interfaces...> {
public:
    using Implements<TypeOfElements, Interfaces...>::Implements;

    HRESULT GetType(IAAFTypeDef** typeDef) override { return this->GiveElementType(typeDef); }
    HRESULT CreateValueFromValues(IAAFPropertyValue** elementValues, aafUInt32 numElements,
                                  IAAFPropertyValue** propVal) override {
        return this->ValueFromValues(elementValues, numElements, propVal);
    }
    HRESULT CreateValueFromCArray(aafMemPtr_t initData, aafUInt32 initDataSize,
                                  IAAFPropertyValue** propVal) override {
        return this->ValueFromArray(initData, initDataSize, propVal);
    }
    HRESULT GetElementValue(IAAFPropertyValue* inPropVal, aafUInt32 index,
                            IAAFPropertyValue** outPropVal) override {
        return this->ElementOf(inPropVal, index, outPropVal);
    }
    HRESULT GetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data, aafUInt32 dataSize) override {
        return this->ArrayOf(propVal, data, dataSize);
    }
    HRESULT SetElementValue(IAAFPropertyValue* propVal, aafUInt32 index,
                            IAAFPropertyValue* memberPropVal) override {
        return this->SetElement(propVal, index, memberPropVal);
    }
    HRESULT SetCArray(IAAFPropertyValue* propVal, aafMemPtr_t data, aafUInt32 dataSize) override {
        return this->SetArray(propVal, data, dataSize);
    }
    HRESULT GetElements(IAAFPropertyValue* setPropVal,
                        IEnumAAFPropertyValues** enumerator) override {
        return this->ElementsOf(setPropVal, enumerator);
    }
};

}  // namespace aaf
