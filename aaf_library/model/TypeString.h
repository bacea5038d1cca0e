// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"
#include "not_implemented/AAFTypeDefinitions.h"

namespace aaf {

// Text: wide characters for the caller, UTF-16 when stored. Whether a zero ends
// it is up to who makes the value; all texts of the library have one.
class TypeString : public Implements<TypeDefinition, IAAFTypeDefString> {
public:
    TypeString() : Implements(TypeKind::String) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, TypeDefinition& character);

    TypeDefinition* element() const override { return character_; }
    HRESULT Encode(const void* native, std::size_t bytes, Bytes& out) const override;
    std::size_t DecodedSize(const std::uint8_t* stored, std::size_t size) const override;
    HRESULT Decode(const std::uint8_t* stored, std::size_t size, void* native,
                   std::size_t bytes) const override;

    // -- IAAFTypeDefString
    HRESULT Initialize(aafUID_constref id, IAAFTypeDef* typeDef,
                       aafCharacter_constptr typeName) override;
    HRESULT GetType(IAAFTypeDef** typeDef) override;
    HRESULT GetCount(IAAFPropertyValue* propVal, aafUInt32* count) override;
    HRESULT CreateValueFromCString(aafMemPtr_t initData, aafUInt32 initDataSize,
                                   IAAFPropertyValue** propVal) override;
    HRESULT SetCString(IAAFPropertyValue* propVal, aafMemPtr_t data, aafUInt32 dataSize) override;
    HRESULT AppendElements(IAAFPropertyValue* inPropVal, aafMemPtr_t elements) override;
    HRESULT GetElements(IAAFPropertyValue* inPropVal, aafMemPtr_t buffer,
                        aafUInt32 bufferSize) override;

private:
    TypeDefinition* character_ = nullptr;
};

}  // namespace aaf
