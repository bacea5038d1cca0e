// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"
#include "not_implemented/AAFTypeDefinitions.h"

namespace aaf {

// Named integers. The caller sees 32 bits unless another size was registered;
// stored values have the size of the element type.
class TypeEnumeration : public Implements<TypeDefinition, IAAFTypeDefEnum> {
public:
    using Member = TypeMember;

    TypeEnumeration() : Implements(TypeKind::Enumeration) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, TypeDefinition& element,
                  TypeMembers members);
    const TypeMembers& members() const { return members_; }
    // Another file says more of it. The element type must be an integer.
    void Redefine(TypeDefinition& element, TypeMembers members);

    TypeDefinition* element() const override { return element_; }
    std::size_t StoredSize() const override;
    std::size_t NativeSize() const override { return nativeSize_; }
    void AppendStored(const std::uint8_t* native, Bytes& out) const override;
    void CopyNative(const std::uint8_t* stored, std::uint8_t* native) const override;

    // -- IAAFTypeDefEnum
    HRESULT Initialize(aafUID_constref id, IAAFTypeDef* type, aafInt64* elementValues,
                       aafString_t* elementNames, aafUInt32 numElems,
                       aafCharacter_constptr typeName) override;
    HRESULT CreateValueFromName(aafCharacter_constptr name, IAAFPropertyValue** propVal) override;
    HRESULT GetElementType(IAAFTypeDef** typeDef) override;
    HRESULT GetElementValue(aafUInt32 index, aafInt64* outValue) override;
    HRESULT GetElementName(aafUInt32 index, aafCharacter* outValue, aafUInt32 bufSize) override;
    HRESULT GetElementNameBufLen(aafUInt32 index, aafUInt32* len) override;
    HRESULT CountElements(aafUInt32* count) override;
    HRESULT GetNameFromValue(IAAFPropertyValue* value, aafCharacter* name,
                             aafUInt32 bufSize) override;
    HRESULT GetNameBufLenFromValue(IAAFPropertyValue* value, aafUInt32* len) override;
    HRESULT GetNameFromInteger(aafInt64 value, aafCharacter* name, aafUInt32 bufSize) override;
    HRESULT GetNameBufLenFromInteger(aafInt64 value, aafUInt32* len) override;
    HRESULT GetIntegerValue(IAAFPropertyValue* propValIn, aafInt64* valueOut) override;
    HRESULT SetIntegerValue(IAAFPropertyValue* propValToSet, aafInt64 valueIn) override;
    HRESULT RegisterSize(aafUInt32 enumSize) override;

private:
    const Member* FindMember(aafInt64 value) const;
    bool IsSignedElement() const;

    TypeDefinition* element_ = nullptr;
    TypeMembers members_;
    std::size_t nativeSize_ = sizeof(aafInt32);
};

}  // namespace aaf
