// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeEnumeration.h"

#include "aaf_library/model/Model.h"
#include "aaf_library/model/StoredNumbers.h"
#include "aaf_library/model/Text.h"
#include "aaf_library/model/TypeInteger.h"

namespace aaf {

HRESULT TypeEnumeration::Setup(const GUID& id, const std::wstring& name, TypeDefinition& element,
                               TypeMembers members) {
    const HRESULT result = SetIdentity(id, name);
    if (result >= 0) {
        element_ = &element;
        model()->KeepType(element);
        members_ = std::move(members);
    }
    return result;
}

void TypeEnumeration::Redefine(TypeDefinition& element, TypeMembers members) {
    element_ = &element;
    model()->KeepType(element);
    members_ = std::move(members);
}

bool TypeEnumeration::IsSignedElement() const {
    return static_cast<const TypeInteger&>(element_->Resolved()).IsSignedType();
}

std::size_t TypeEnumeration::StoredSize() const {
    return element_ == nullptr ? 0 : element_->StoredSize();
}

void TypeEnumeration::AppendStored(const std::uint8_t* native, Bytes& out) const {
    AppendNumber(static_cast<std::uint64_t>(NativeSigned(native, nativeSize_)), StoredSize(), out);
}

void TypeEnumeration::CopyNative(const std::uint8_t* stored, std::uint8_t* native) const {
    const std::size_t size = StoredSize();
    const std::uint64_t value = IsSignedElement()
                                    ? static_cast<std::uint64_t>(SignedAt(stored, size))
                                    : UnsignedAt(stored, size);
    PutNativeNumber(value, native, nativeSize_);
}

HRESULT TypeEnumeration::Initialize(aafUID_constref id, IAAFTypeDef* type, aafInt64* elementValues,
                                    aafString_t* elementNames, aafUInt32 numElems,
                                    aafCharacter_constptr typeName) {
    if (type == nullptr || elementValues == nullptr || elementNames == nullptr ||
        typeName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    TypeDefinition* element = TypeOf(type, model());
    if (element == nullptr || element->Resolved().kind() != TypeKind::Integer) {
        return AAFRESULT_BAD_TYPE;
    }
    std::vector<Member> members;
    for (aafUInt32 i = 0; i < numElems; ++i) {
        if (elementNames[i] == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        members.push_back({elementNames[i], {}, elementValues[i]});
    }
    return Setup(id, typeName, *element, std::move(members));
}

const TypeEnumeration::Member* TypeEnumeration::FindMember(aafInt64 value) const {
    for (const Member& member : members_) {
        if (member.value == value) {
            return &member;
        }
    }
    return nullptr;
}

HRESULT TypeEnumeration::CreateValueFromName(aafCharacter_constptr name,
                                             IAAFPropertyValue** propVal) {
    if (name == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    for (const Member& member : members_) {
        if (IsSameElementName(member.name, name)) {
            Bytes stored;
            AppendNumber(static_cast<std::uint64_t>(member.value), StoredSize(), stored);
            return GiveValue(*this, std::move(stored), propVal);
        }
    }
    return AAFRESULT_ILLEGAL_VALUE;
}

HRESULT TypeEnumeration::GetElementType(IAAFTypeDef** typeDef) {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return element_ == nullptr ? AAFRESULT_NOT_INITIALIZED : GiveOut(element_, typeDef);
}

HRESULT TypeEnumeration::GetElementValue(aafUInt32 index, aafInt64* outValue) {
    if (outValue == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (index >= members_.size()) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    *outValue = members_[index].value;
    return AAFRESULT_SUCCESS;
}

HRESULT TypeEnumeration::GetElementName(aafUInt32 index, aafCharacter* outValue,
                                        aafUInt32 bufSize) {
    if (outValue == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return index < members_.size() ? CopyText(members_[index].name, outValue, bufSize)
                                   : AAFRESULT_ILLEGAL_VALUE;
}

HRESULT TypeEnumeration::GetElementNameBufLen(aafUInt32 index, aafUInt32* len) {
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return index < members_.size() ? TextSize(members_[index].name, len) : AAFRESULT_ILLEGAL_VALUE;
}

HRESULT TypeEnumeration::CountElements(aafUInt32* count) {
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *count = static_cast<aafUInt32>(members_.size());
    return IsInitialized() ? AAFRESULT_SUCCESS : AAFRESULT_NOT_INITIALIZED;
}

HRESULT TypeEnumeration::GetNameFromValue(IAAFPropertyValue* value, aafCharacter* name,
                                          aafUInt32 bufSize) {
    aafInt64 number = 0;
    if (name == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = GetIntegerValue(value, &number);
    return result < 0 ? result : GetNameFromInteger(number, name, bufSize);
}

HRESULT TypeEnumeration::GetNameBufLenFromValue(IAAFPropertyValue* value, aafUInt32* len) {
    aafInt64 number = 0;
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = GetIntegerValue(value, &number);
    return result < 0 ? result : GetNameBufLenFromInteger(number, len);
}

HRESULT TypeEnumeration::GetNameFromInteger(aafInt64 value, aafCharacter* name, aafUInt32 bufSize) {
    if (name == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const Member* member = FindMember(value);
    return member == nullptr ? AAFRESULT_ILLEGAL_VALUE : CopyText(member->name, name, bufSize);
}

HRESULT TypeEnumeration::GetNameBufLenFromInteger(aafInt64 value, aafUInt32* len) {
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const Member* member = FindMember(value);
    return member == nullptr ? AAFRESULT_ILLEGAL_VALUE : TextSize(member->name, len);
}

HRESULT TypeEnumeration::GetIntegerValue(IAAFPropertyValue* propValIn, aafInt64* valueOut) {
    PropertyValue* value = nullptr;
    if (valueOut == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propValIn, &value); result < 0) {
        return result;
    }
    const std::size_t size = value->bytes().size();
    if (size == 0 || size != StoredSize()) {
        return AAFRESULT_BAD_SIZE;
    }
    const std::uint8_t* stored = value->bytes().data();
    *valueOut = IsSignedElement() ? SignedAt(stored, size)
                                  : static_cast<aafInt64>(UnsignedAt(stored, size));
    return AAFRESULT_SUCCESS;
}

HRESULT TypeEnumeration::SetIntegerValue(IAAFPropertyValue* propValToSet, aafInt64 valueIn) {
    PropertyValue* value = nullptr;
    if (const HRESULT result = Take(propValToSet, &value); result < 0) {
        return result;
    }
    if (FindMember(valueIn) == nullptr) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    value->BytesToChange().clear();
    AppendNumber(static_cast<std::uint64_t>(valueIn), StoredSize(), value->BytesToChange());
    return AAFRESULT_SUCCESS;
}

HRESULT TypeEnumeration::RegisterSize(aafUInt32 enumSize) {
    if (enumSize != 1 && enumSize != 2 && enumSize != 4 && enumSize != 8) {
        return AAFRESULT_BAD_SIZE;
    }
    nativeSize_ = enumSize;
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
