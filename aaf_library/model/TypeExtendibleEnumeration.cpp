// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/TypeExtendibleEnumeration.h"

#include "aaf_library/model/Model.h"

namespace aaf {

HRESULT TypeExtendibleEnumeration::Setup(const GUID& id, const std::wstring& name,
                                         TypeMembers members) {
    const HRESULT result = SetIdentity(id, name);
    if (result >= 0) {
        members_ = std::move(members);
    }
    return result;
}

void TypeExtendibleEnumeration::AppendStored(const std::uint8_t* native, Bytes& out) const {
    GUID value{};
    std::memcpy(&value, native, sizeof value);
    AppendGuid(value, out);
}

void TypeExtendibleEnumeration::CopyNative(const std::uint8_t* stored, std::uint8_t* native) const {
    const GUID value = GuidAt(stored);
    std::memcpy(native, &value, sizeof value);
}

const TypeExtendibleEnumeration::Member* TypeExtendibleEnumeration::FindMember(
    const GUID& value) const {
    for (const Member& member : members_) {
        if (member.id == value) {
            return &member;
        }
    }
    return nullptr;
}

HRESULT TypeExtendibleEnumeration::CreateValueFromName(aafCharacter_constptr name,
                                                       IAAFPropertyValue** propVal) {
    if (name == nullptr || propVal == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    for (const Member& member : members_) {
        if (IsSameElementName(member.name, name)) {
            Bytes stored;
            AppendGuid(member.id, stored);
            return GiveValue(*this, std::move(stored), propVal);
        }
    }
    return IsInitialized() ? AAFRESULT_ILLEGAL_VALUE : AAFRESULT_NOT_INITIALIZED;
}

HRESULT TypeExtendibleEnumeration::CountElements(aafUInt32* count) {
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *count = static_cast<aafUInt32>(members_.size());
    return IsInitialized() ? AAFRESULT_SUCCESS : AAFRESULT_NOT_INITIALIZED;
}

HRESULT TypeExtendibleEnumeration::GetElementValue(aafUInt32 index, aafUID_t* outValue) {
    if (outValue == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (index >= members_.size()) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    *outValue = members_[index].id;
    return AAFRESULT_SUCCESS;
}

HRESULT TypeExtendibleEnumeration::GetElementName(aafUInt32 index, aafCharacter* outValue,
                                                  aafUInt32 bufSize) {
    if (outValue == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return index < members_.size() ? CopyText(members_[index].name, outValue, bufSize)
                                   : AAFRESULT_ILLEGAL_VALUE;
}

HRESULT TypeExtendibleEnumeration::GetElementNameBufLen(aafUInt32 index, aafUInt32* len) {
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return index < members_.size() ? TextSize(members_[index].name, len) : AAFRESULT_ILLEGAL_VALUE;
}

HRESULT TypeExtendibleEnumeration::GetNameFromValue(IAAFPropertyValue* value, aafCharacter* name,
                                                    aafUInt32 bufSize) {
    aafUID_t id{};
    if (name == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = GetAUIDValue(value, &id);
    return result < 0 ? result : GetNameFromAUID(id, name, bufSize);
}

HRESULT TypeExtendibleEnumeration::GetNameBufLenFromValue(IAAFPropertyValue* value,
                                                          aafUInt32* len) {
    aafUID_t id{};
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = GetAUIDValue(value, &id);
    return result < 0 ? result : GetNameBufLenFromAUID(id, len);
}

HRESULT TypeExtendibleEnumeration::GetNameFromAUID(aafUID_constref value, aafCharacter* name,
                                                   aafUInt32 bufSize) {
    if (name == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const Member* member = FindMember(value);
    return member == nullptr ? AAFRESULT_ILLEGAL_VALUE : CopyText(member->name, name, bufSize);
}

HRESULT TypeExtendibleEnumeration::GetNameBufLenFromAUID(aafUID_constref value, aafUInt32* len) {
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const Member* member = FindMember(value);
    return member == nullptr ? AAFRESULT_ILLEGAL_VALUE : TextSize(member->name, len);
}

HRESULT TypeExtendibleEnumeration::GetAUIDValue(IAAFPropertyValue* propValIn, aafUID_t* valueOut) {
    PropertyValue* value = nullptr;
    if (valueOut == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (const HRESULT result = Take(propValIn, &value); result < 0) {
        return result;
    }
    return Decode(value->bytes().data(), value->bytes().size(), valueOut, sizeof *valueOut);
}

HRESULT TypeExtendibleEnumeration::SetAUIDValue(IAAFPropertyValue* propValToSet,
                                                aafUID_constref valueIn) {
    PropertyValue* value = nullptr;
    if (const HRESULT result = Take(propValToSet, &value); result < 0) {
        return result;
    }
    if (FindMember(valueIn) == nullptr) {
        return AAFRESULT_ILLEGAL_VALUE;
    }
    value->BytesToChange().clear();
    AppendGuid(valueIn, value->BytesToChange());
    return AAFRESULT_SUCCESS;
}

HRESULT TypeExtendibleEnumeration::AppendElement(aafUID_constref value,
                                                 aafCharacter_constptr name) {
    if (name == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!IsInitialized()) {
        return AAFRESULT_NOT_INITIALIZED;
    }
    if (FindMember(value) != nullptr) {
        return AAFRESULT_INVALID_PARAM;
    }
    model()->TellChange();
    members_.push_back({name, value, 0});
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
