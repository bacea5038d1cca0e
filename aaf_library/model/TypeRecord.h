// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"
#include "not_implemented/AAFTypeDefinitions.h"

namespace aaf {

// Members of fixed size, one after the other when stored. The layout of the
// caller's structure is registered apart; until then only values go in and out.
class TypeRecord : public Implements<TypeDefinition, IAAFTypeDefRecord> {
public:
    TypeRecord() : Implements(TypeKind::Record) {}

    // As many types as members.
    HRESULT Setup(const GUID& id, const std::wstring& name, TypeMembers members,
                  std::vector<TypeDefinition*> types);
    // The layout that a C structure with these members has.
    void UseNaturalLayout();
    // That of another record with the same members.
    void UseLayoutOf(const TypeRecord& other);
    const TypeMembers& members() const { return members_; }
    const std::vector<TypeDefinition*>& types() const { return types_; }

    // Of the members as they are now: a file may say more of an enumeration or a rename.
    std::size_t StoredSize() const override;
    std::size_t NativeSize() const override { return LayoutFits() ? nativeSize_ : 0; }
    bool IsStoredAsNative() const override { return isStoredAsNative_; }
    void AppendStored(const std::uint8_t* native, Bytes& out) const override;
    void CopyNative(const std::uint8_t* stored, std::uint8_t* native) const override;

    // -- IAAFTypeDefRecord
    HRESULT Initialize(aafUID_constref id, IAAFTypeDef** memberTypes, aafString_t* memberNames,
                       aafUInt32 numMembers, aafCharacter_constptr typeName) override;
    HRESULT GetMemberType(aafUInt32 index, IAAFTypeDef** typeDef) override;
    HRESULT GetMemberName(aafUInt32 index, aafCharacter* name, aafUInt32 bufSize) override;
    HRESULT GetMemberNameBufLen(aafUInt32 index, aafUInt32* len) override;
    HRESULT CreateValueFromValues(IAAFPropertyValue** memberValues, aafUInt32 numMembers,
                                  IAAFPropertyValue** propVal) override;
    HRESULT CreateValueFromStruct(aafMemPtr_t initData, aafUInt32 initDataSize,
                                  IAAFPropertyValue** propVal) override;
    HRESULT GetValue(IAAFPropertyValue* inPropVal, aafUInt32 index,
                     IAAFPropertyValue** outPropVal) override;
    HRESULT GetStruct(IAAFPropertyValue* propVal, aafMemPtr_t data, aafUInt32 dataSize) override;
    HRESULT SetValue(IAAFPropertyValue* propVal, aafUInt32 index,
                     IAAFPropertyValue* memberPropVal) override;
    HRESULT SetStruct(IAAFPropertyValue* propVal, aafMemPtr_t data, aafUInt32 dataSize) override;
    HRESULT GetCount(aafUInt32* count) override;
    HRESULT RegisterMembers(aafUInt32* offsets, aafUInt32 numMembers,
                            aafUInt32 structSize) override;

private:
    // Whether the caller's structure of that size can be read or written.
    HRESULT CheckStruct(aafUInt32 dataSize) const;
    bool LayoutFits() const;
    HRESULT CheckMember(aafUInt32 index) const;
    bool AreMembersStoredAsNative() const;
    void UseOffsets(std::vector<std::size_t> offsets, std::size_t nativeSize);
    std::size_t StoredOffset(aafUInt32 index) const;

    TypeMembers members_;
    std::vector<TypeDefinition*> types_;  // of the members
    std::vector<std::size_t> offsets_;    // in the caller's structure
    std::size_t nativeSize_ = 0;          // 0: no layout yet
    bool isStoredAsNative_ = false;       // numbers alone, one behind the other
};

}  // namespace aaf
