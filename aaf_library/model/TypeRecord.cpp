// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeRecord.h"

#include <algorithm>
#include <cstring>

#include "aaf_library/model/Model.h"
#include "aaf_library/model/Text.h"

namespace aaf {

namespace {

// Natural alignment of one native value: that of its largest member.
std::size_t AlignmentOf(const TypeDefinition& type) {
    const TypeDefinition& plain = type.Resolved();
    if (plain.kind() == TypeKind::Record) {
        std::size_t largest = 1;
        for (const TypeDefinition* member : static_cast<const TypeRecord&>(plain).types()) {
            largest = std::max(largest, AlignmentOf(*member));
        }
        return largest;
    }
    if (plain.kind() == TypeKind::FixedArray) {
        return AlignmentOf(*plain.element());
    }
    if (plain.kind() == TypeKind::ExtendibleEnumeration) {
        return alignof(GUID);
    }
    return plain.NativeSize();
}

std::size_t AlignUp(std::size_t offset, std::size_t alignment) {
    return alignment == 0 ? offset : (offset + alignment - 1) / alignment * alignment;
}

bool MayBeMember(const TypeDefinition& type) {
    switch (type.Resolved().kind()) {
        case TypeKind::Integer:
        case TypeKind::Character:
        case TypeKind::Enumeration:
        case TypeKind::ExtendibleEnumeration:
        case TypeKind::Record:
        case TypeKind::FixedArray:
            return type.StoredSize() > 0;
        default:
            return false;
    }
}

}  // namespace

HRESULT TypeRecord::Setup(const GUID& id, const std::wstring& name, TypeMembers members,
                          std::vector<TypeDefinition*> types) {
    const HRESULT result = SetIdentity(id, name);
    if (result < 0) {
        return result;
    }
    members_ = std::move(members);
    types_ = std::move(types);
    for (TypeDefinition* type : types_) {
        model()->KeepType(*type);
    }
    return AAFRESULT_SUCCESS;
}

std::size_t TypeRecord::StoredSize() const {
    return isStoredAsNative_ ? nativeSize_ : StoredOffset(static_cast<aafUInt32>(members_.size()));
}

void TypeRecord::UseNaturalLayout() {
    std::size_t offset = 0;
    std::vector<std::size_t> offsets;
    for (const TypeDefinition* type : types_) {
        offset = AlignUp(offset, AlignmentOf(*type));
        offsets.push_back(offset);
        offset += type->NativeSize();
    }
    UseOffsets(std::move(offsets), AlignUp(offset, AlignmentOf(*this)));
}

void TypeRecord::UseLayoutOf(const TypeRecord& other) {
    UseOffsets(other.offsets_, other.nativeSize_);
}

void TypeRecord::UseOffsets(std::vector<std::size_t> offsets, std::size_t nativeSize) {
    offsets_ = std::move(offsets);
    nativeSize_ = nativeSize;
    isStoredAsNative_ = AreMembersStoredAsNative();
}

// Numbers and arrays of them: the layout of any other member may be registered anew.
bool TypeRecord::AreMembersStoredAsNative() const {
    std::size_t end = 0;
    for (std::size_t i = 0; i < offsets_.size(); ++i) {
        const TypeDefinition& type = *types_[i];
        const TypeDefinition* const number =
            type.kind() == TypeKind::FixedArray ? type.element() : &type;
        if (number == nullptr || number->kind() != TypeKind::Integer ||
            !number->IsStoredAsNative() || offsets_[i] != end) {
            return false;
        }
        end += type.StoredSize();
    }
    return end != 0 && end == nativeSize_;
}

void TypeRecord::AppendStored(const std::uint8_t* native, Bytes& out) const {
    if (isStoredAsNative_) {
        out.insert(out.end(), native, native + nativeSize_);
        return;
    }
    for (std::size_t i = 0; i < members_.size(); ++i) {
        types_[i]->AppendStored(native + offsets_[i], out);
    }
}

void TypeRecord::CopyNative(const std::uint8_t* stored, std::uint8_t* native) const {
    if (isStoredAsNative_) {
        std::memcpy(native, stored, nativeSize_);
        return;
    }
    for (std::size_t i = 0; i < members_.size(); ++i) {
        types_[i]->CopyNative(stored, native + offsets_[i]);
        stored += types_[i]->StoredSize();
    }
}

HRESULT TypeRecord::Initialize(aafUID_constref id, IAAFTypeDef** memberTypes,
                               aafString_t* memberNames, aafUInt32 numMembers,
                               aafCharacter_constptr typeName) {
    if (memberTypes == nullptr || memberNames == nullptr || typeName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (IsInitialized()) {
        return AAFRESULT_ALREADY_INITIALIZED;
    }
    std::vector<TypeMember> members;
    std::vector<TypeDefinition*> types;
    for (aafUInt32 i = 0; i < numMembers; ++i) {
        if (memberTypes[i] == nullptr || memberNames[i] == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        TypeDefinition* type = TypeOf(memberTypes[i], model());
        if (type == nullptr || model()->FindType(type->id()) == nullptr) {
            return AAFRESULT_TYPE_NOT_FOUND;
        }
        if (!MayBeMember(*type)) {
            return AAFRESULT_BAD_TYPE;
        }
        members.push_back({memberNames[i], type->id()});
        types.push_back(type);
    }
    return Setup(id, typeName, std::move(members), std::move(types));
}

HRESULT TypeRecord::CheckMember(aafUInt32 index) const {
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    return index < members_.size() ? AAFRESULT_SUCCESS : AAFRESULT_ILLEGAL_VALUE;
}

HRESULT TypeRecord::GetMemberType(aafUInt32 index, IAAFTypeDef** typeDef) {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = CheckMember(index);
    return result < 0 ? result : GiveOut(types_[index], typeDef);
}

HRESULT TypeRecord::GetMemberName(aafUInt32 index, aafCharacter* name, aafUInt32 bufSize) {
    if (name == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = CheckMember(index);
    return result < 0 ? result : CopyText(members_[index].name, name, bufSize);
}

HRESULT TypeRecord::GetMemberNameBufLen(aafUInt32 index, aafUInt32* len) {
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = CheckMember(index);
    return result < 0 ? result : TextSize(members_[index].name, len);
}

HRESULT TypeRecord::CreateValueFromValues(IAAFPropertyValue** memberValues, aafUInt32 numMembers,
                                          IAAFPropertyValue** propVal) {
    if (memberValues == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (numMembers != members_.size()) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    Bytes stored;
    for (std::size_t i = 0; i < members_.size(); ++i) {
        auto* value = ImplementationAs<PropertyValue>(memberValues[i]);
        if (memberValues[i] == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        if (value == nullptr || value->bytes().size() != types_[i]->StoredSize()) {
            return AAFRESULT_BAD_TYPE;
        }
        stored.insert(stored.end(), value->bytes().begin(), value->bytes().end());
    }
    return GiveValue(*this, std::move(stored), propVal);
}

HRESULT TypeRecord::CheckStruct(aafUInt32 dataSize) const {
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (nativeSize_ == 0) {
        return AAFRESULT_NOT_REGISTERED;
    }
    return dataSize == nativeSize_ && LayoutFits() ? AAFRESULT_SUCCESS : AAFRESULT_ILLEGAL_VALUE;
}

bool TypeRecord::LayoutFits() const {
    // A member's own layout may have been registered anew and grown.
    for (std::size_t i = 0; !isStoredAsNative_ && i < members_.size(); ++i) {
        const std::size_t size = types_[i]->NativeSize();
        if (size == 0 || size > nativeSize_ || offsets_[i] > nativeSize_ - size) {
            return false;
        }
    }
    return true;
}

HRESULT TypeRecord::CreateValueFromStruct(aafMemPtr_t initData, aafUInt32 initDataSize,
                                          IAAFPropertyValue** propVal) {
    if (initData == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = CheckStruct(initDataSize); result < 0) {
        return result;
    }
    Bytes stored;
    AppendStored(initData, stored);
    return GiveValue(*this, std::move(stored), propVal);
}

std::size_t TypeRecord::StoredOffset(aafUInt32 index) const {
    std::size_t offset = 0;
    for (aafUInt32 i = 0; i < index; ++i) {
        offset += types_[i]->StoredSize();
    }
    return offset;
}

HRESULT TypeRecord::GetValue(IAAFPropertyValue* inPropVal, aafUInt32 index,
                             IAAFPropertyValue** outPropVal) {
    PropertyValue* value = nullptr;
    if (outPropVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(inPropVal, &value); result < 0) {
        return result;
    }
    if (const HRESULT result = CheckMember(index); result < 0) {
        return result;
    }
    if (value->bytes().size() != StoredSize()) {
        return AAFRESULT_BAD_SIZE;
    }
    const auto first = value->bytes().begin() + static_cast<std::ptrdiff_t>(StoredOffset(index));
    const auto size = static_cast<std::ptrdiff_t>(types_[index]->StoredSize());
    return GiveValue(*types_[index], Bytes(first, first + size), outPropVal);
}

HRESULT TypeRecord::GetStruct(IAAFPropertyValue* propVal, aafMemPtr_t data, aafUInt32 dataSize) {
    PropertyValue* value = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    if (const HRESULT result = CheckStruct(dataSize); result < 0) {
        return result;
    }
    if (value->bytes().size() != StoredSize()) {
        return AAFRESULT_BAD_SIZE;
    }
    CopyNative(value->bytes().data(), data);
    return AAFRESULT_SUCCESS;
}

HRESULT TypeRecord::SetValue(IAAFPropertyValue* propVal, aafUInt32 index,
                             IAAFPropertyValue* memberPropVal) {
    PropertyValue* value = nullptr;
    if (memberPropVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    if (const HRESULT result = CheckMember(index); result < 0) {
        return result;
    }
    auto* member = ImplementationAs<PropertyValue>(memberPropVal);
    if (member == nullptr || member->bytes().size() != types_[index]->StoredSize()) {
        return AAFRESULT_BAD_TYPE;
    }
    value->BytesToChange().resize(StoredSize());
    std::copy(member->bytes().begin(), member->bytes().end(),
              value->BytesToChange().begin() + static_cast<std::ptrdiff_t>(StoredOffset(index)));
    return AAFRESULT_SUCCESS;
}

HRESULT TypeRecord::SetStruct(IAAFPropertyValue* propVal, aafMemPtr_t data, aafUInt32 dataSize) {
    PropertyValue* value = nullptr;
    if (data == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propVal, &value); result < 0) {
        return result;
    }
    if (const HRESULT result = CheckStruct(dataSize); result < 0) {
        return result;
    }
    value->BytesToChange().clear();
    AppendStored(data, value->BytesToChange());
    return AAFRESULT_SUCCESS;
}

HRESULT TypeRecord::GetCount(aafUInt32* count) {
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *count = static_cast<aafUInt32>(members_.size());
    return IsInitialized() ? AAFRESULT_SUCCESS : AAFRESULT_NOT_INITIALIZED;
}

HRESULT TypeRecord::RegisterMembers(aafUInt32* offsets, aafUInt32 numMembers,
                                    aafUInt32 structSize) {
    if (offsets == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (numMembers != members_.size()) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    // What a member takes has to be known first.
    for (const TypeDefinition* type : types_) {
        if (type->NativeSize() == 0) {
            return AAFRESULT_NOT_REGISTERED;
        }
    }
    // A member that reaches beyond the structure would touch memory of others.
    for (std::size_t i = 0; i < members_.size(); ++i) {
        const std::size_t size = types_[i]->NativeSize();
        if (size > structSize || offsets[i] > structSize - size) {
            return AAFRESULT_ILLEGAL_VALUE;
        }
    }
    UseOffsets({offsets, offsets + numMembers}, structSize);
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
