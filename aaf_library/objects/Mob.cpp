// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Mob.h"

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/objects/Annotations.h"
#include "aaf_library/objects/ContentStorage.h"
#include "aaf_library/objects/Fresh.h"
#include "aaf_library/objects/MobId.h"
#include "aaf_library/objects/MobSlot.h"
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFEffects.h"
#include "host_interfaces/aaf/AAFEvents.h"
#include "host_interfaces/aaf/AAFTimecodes.h"

namespace aaf {

void Mob::SetDefaults() {
    Object::SetDefaults();
    const aafTimeStamp_t now = CurrentTime();
    PutStruct(prop::Mob_MobID, NewMobId());
    PutStruct(prop::Mob_CreationTime, now);
    PutStruct(prop::Mob_LastModified, now);
}

aafMobID_t Mob::id() const {
    aafMobID_t found{};
    ReadStruct(prop::Mob_MobID, &found);
    return found;
}

MobSlot* Mob::SlotAt(aafUInt32 index) const {
    return dynamic_cast<MobSlot*>(ObjectAt(prop::Mob_Slots, index));
}

MobSlot* Mob::FindSlot(aafSlotID_t slotId) const {
    const aafUInt32 count = CountObjects(prop::Mob_Slots);
    for (; slotsSeen_ < count; ++slotsSeen_) {
        if (const MobSlot* const slot = SlotAt(slotsSeen_)) {
            slotPlaces_.emplace(slot->id(), slotsSeen_);
        }
    }
    const auto found = slotPlaces_.find(slotId);
    return found == slotPlaces_.end() ? nullptr : SlotAt(found->second);
}

void Mob::ForgetSlotIds() {
    slotPlaces_.clear();
    slotsSeen_ = 0;
}

void Mob::OnValueChange(const PropertyValue& value) {
    if (value.HoldsObjects()) {
        ForgetSlotIds();
    }
}

HRESULT Mob::GetMobID(aafMobID_t* mobID) {
    return ReadStruct(prop::Mob_MobID, mobID);
}

HRESULT Mob::SetMobID(aafMobID_constref mobID) {
    ContentStorage* const storage = dynamic_cast<ContentStorage*>(owner());
    if (storage == nullptr) {
        return PutStruct(prop::Mob_MobID, mobID);
    }
    if (storage->FindMob(mobID) != nullptr) {
        return AAFRESULT_DUPLICATE_MOBID;
    }
    const HRESULT result = PutStruct(prop::Mob_MobID, mobID);
    storage->SortSet(prop::ContentStorage_Mobs);
    return result;
}

HRESULT Mob::SetName(aafCharacter_constptr name) {
    return PutString(prop::Mob_Name, name);
}

HRESULT Mob::GetName(aafCharacter* name, aafUInt32 bufSize) {
    return ReadString(prop::Mob_Name, name, bufSize);
}

HRESULT Mob::GetNameBufLen(aafUInt32* bufSize) {
    return ReadStringLength(prop::Mob_Name, bufSize);
}

HRESULT Mob::GetModTime(aafTimeStamp_t* lastModified) {
    return ReadStruct(prop::Mob_LastModified, lastModified);
}

HRESULT Mob::SetModTime(aafTimeStamp_constref modTime) {
    return PutStruct(prop::Mob_LastModified, modTime);
}

HRESULT Mob::GetCreateTime(aafTimeStamp_t* creationTime) {
    return ReadStruct(prop::Mob_CreationTime, creationTime);
}

HRESULT Mob::SetCreateTime(aafTimeStamp_constref createTime) {
    return PutStruct(prop::Mob_CreationTime, createTime);
}

HRESULT Mob::GetMobInfo(aafTimeStamp_t* lastModified, aafTimeStamp_t* creationTime,
                        aafCharacter* name, aafInt32 bufSize) {
    if (lastModified == nullptr || creationTime == nullptr || name == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = GetName(name, bufSize < 0 ? 0u : static_cast<aafUInt32>(bufSize));
    if (result < 0) {
        return result;
    }
    GetModTime(lastModified);
    return GetCreateTime(creationTime);
}

HRESULT Mob::SetUsageCode(aafUID_constref usageCode) {
    return PutStruct(prop::Mob_UsageCode, usageCode);
}

HRESULT Mob::GetUsageCode(aafUID_t* usageCode) {
    return ReadStruct(prop::Mob_UsageCode, usageCode);
}

HRESULT Mob::CountSlots(aafNumSlots_t* numSlots) {
    return ReadCount(prop::Mob_Slots, numSlots);
}

HRESULT Mob::AppendSlot(IAAFMobSlot* slot) {
    return AppendObject(prop::Mob_Slots, slot);
}

HRESULT Mob::PrependSlot(IAAFMobSlot* slot) {
    return PrependObject(prop::Mob_Slots, slot);
}

HRESULT Mob::InsertSlotAt(aafUInt32 index, IAAFMobSlot* slot) {
    return InsertObjectAt(prop::Mob_Slots, index, slot);
}

HRESULT Mob::RemoveSlotAt(aafUInt32 index) {
    return RemoveObjectAt(prop::Mob_Slots, index);
}

HRESULT Mob::GetSlotAt(aafUInt32 index, IAAFMobSlot** slot) {
    return ReadObjectAt(prop::Mob_Slots, index, slot);
}

HRESULT Mob::GetSlots(IEnumAAFMobSlots** enumerator) {
    return MakeEnumerator<IAAFMobSlot>(this, prop::Mob_Slots, enumerator);
}

HRESULT Mob::LookupSlot(aafSlotID_t slotId, IAAFMobSlot** destSlot) {
    if (destSlot == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *destSlot = nullptr;
    MobSlot* const slot = FindSlot(slotId);
    return slot == nullptr ? AAFRESULT_SLOT_NOT_FOUND : GiveOut(slot, destSlot);
}

HRESULT Mob::AppendComment(aafCharacter* category, aafCharacter_constptr comment) {
    return AppendTaggedText(*this, prop::Mob_UserComments, category, comment);
}

HRESULT Mob::CountComments(aafUInt32* numComments) {
    return ReadCount(prop::Mob_UserComments, numComments);
}

HRESULT Mob::GetComments(IEnumAAFTaggedValues** enumerator) {
    return EnumerateList<IAAFTaggedValue>(this, prop::Mob_UserComments, enumerator);
}

HRESULT Mob::RemoveComment(IAAFTaggedValue* comment) {
    return RemoveFromList(*this, prop::Mob_UserComments, comment);
}

HRESULT Mob::AppendAttribute(aafCharacter_constptr name, aafCharacter_constptr value) {
    return AppendTaggedText(*this, prop::Mob_Attributes, name, value);
}

HRESULT Mob::CountAttributes(aafUInt32* numAttributes) {
    return ReadCount(prop::Mob_Attributes, numAttributes);
}

HRESULT Mob::GetAttributes(IEnumAAFTaggedValues** enumerator) {
    return EnumerateList<IAAFTaggedValue>(this, prop::Mob_Attributes, enumerator);
}

HRESULT Mob::RemoveAttribute(IAAFTaggedValue* attribute) {
    return RemoveFromList(*this, prop::Mob_Attributes, attribute);
}

HRESULT Mob::AppendKLVData(IAAFKLVData* data) {
    return AppendObject(prop::Mob_KLVData, data);
}

HRESULT Mob::CountKLVData(aafUInt32* numData) {
    return ReadCount(prop::Mob_KLVData, numData);
}

HRESULT Mob::GetKLVData(IEnumAAFKLVData** enumerator) {
    return EnumerateList<IAAFKLVData>(this, prop::Mob_KLVData, enumerator);
}

HRESULT Mob::RemoveKLVData(IAAFKLVData* data) {
    return RemoveFromList(*this, prop::Mob_KLVData, data);
}

}  // namespace aaf
