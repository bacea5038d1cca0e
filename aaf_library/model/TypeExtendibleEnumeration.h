// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/StoredNumbers.h"
#include "aaf_library/model/Text.h"
#include "aaf_library/model/TypeDefinition.h"
#include "not_implemented/AAFTypeDefinitions.h"

namespace aaf {

// Named ids; more may be added to one that a caller made.
class TypeExtendibleEnumeration : public Implements<TypeDefinition, IAAFTypeDefExtEnum> {
public:
    using Member = TypeMember;

    TypeExtendibleEnumeration() : Implements(TypeKind::ExtendibleEnumeration) {}

    HRESULT Setup(const GUID& id, const std::wstring& name, TypeMembers members);
    const TypeMembers& members() const { return members_; }
    void Redefine(TypeMembers members) { members_ = std::move(members); }

    std::size_t StoredSize() const override { return sizeof(GUID); }
    std::size_t NativeSize() const override { return sizeof(GUID); }
    void AppendStored(const std::uint8_t* native, Bytes& out) const override;
    void CopyNative(const std::uint8_t* stored, std::uint8_t* native) const override;

    // -- IAAFTypeDefExtEnum
    HRESULT Initialize(aafUID_constref id, aafCharacter_constptr typeName) override {
        return typeName == nullptr ? AAFRESULT_NULL_PARAM : Setup(id, typeName, {});
    }
    HRESULT CreateValueFromName(aafCharacter_constptr name, IAAFPropertyValue** propVal) override;
    HRESULT CountElements(aafUInt32* count) override;
    HRESULT GetElementValue(aafUInt32 index, aafUID_t* outValue) override;
    HRESULT GetElementName(aafUInt32 index, aafCharacter* outValue, aafUInt32 bufSize) override;
    HRESULT GetElementNameBufLen(aafUInt32 index, aafUInt32* len) override;
    HRESULT GetNameFromValue(IAAFPropertyValue* value, aafCharacter* name,
                             aafUInt32 bufSize) override;
    HRESULT GetNameBufLenFromValue(IAAFPropertyValue* value, aafUInt32* len) override;
    HRESULT GetNameFromAUID(aafUID_constref value, aafCharacter* name, aafUInt32 bufSize) override;
    HRESULT GetNameBufLenFromAUID(aafUID_constref value, aafUInt32* len) override;
    HRESULT GetAUIDValue(IAAFPropertyValue* propValIn, aafUID_t* valueOut) override;
    HRESULT SetAUIDValue(IAAFPropertyValue* propValToSet, aafUID_constref valueIn) override;
    HRESULT AppendElement(aafUID_constref value, aafCharacter_constptr name) override;

private:
    const Member* FindMember(const GUID& value) const;

    TypeMembers members_;
};

}  // namespace aaf
