// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeOfElements.h"
#include "not_implemented/AAFTypeDefinitionsOfMany.h"

namespace aaf {

// A fixed number of plain elements.
class TypeFixedArray : public Implements<TypeOfElements, IAAFTypeDefFixedArray> {
public:
    TypeFixedArray() : Implements(TypeKind::FixedArray) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, TypeDefinition& element,
                  std::size_t count);
    std::size_t count() const { return count_; }

    std::size_t StoredSize() const override;
    std::size_t NativeSize() const override;
    void AppendStored(const std::uint8_t* native, Bytes& out) const override;
    void CopyNative(const std::uint8_t* stored, std::uint8_t* native) const override;
    HRESULT Encode(const void* native, std::size_t bytes, Bytes& out) const override;

    // -- IAAFTypeDefFixedArray
    HRESULT Initialize(aafUID_constref id, IAAFTypeDef* typeDef, aafUInt32 nElements,
                       aafCharacter_constptr typeName) override;
    HRESULT GetType(IAAFTypeDef** typeDef) override;
    HRESULT GetCount(aafUInt32* count) override;
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

private:
    std::size_t count_ = 0;
};

}  // namespace aaf
