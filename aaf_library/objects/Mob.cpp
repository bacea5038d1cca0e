// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Mob.h"

#include "aaf_library/objects/Component.h"
#include "aaf_library/objects/ContentStorage.h"
#include "aaf_library/objects/MobSlot.h"

#include "aaf_library/objects/SourceMob.h"

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

HRESULT Mob::OffsetToMobTimecode(IAAFSegment* tcSeg, aafPosition_t* offset, aafTimecode_t* result) {
    if (offset == nullptr || result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (tcSeg != nullptr) {
        return tcSeg->SegmentOffsetToTC(offset, result);
    }
    const aafUInt32 count = CountObjects(prop::Mob_Slots);
    for (aafUInt32 at = 0; at < count; ++at) {
        const MobSlot* const slot = SlotAt(at);
        Segment* const segment = slot == nullptr ? nullptr : slot->segment();
        if (segment == nullptr) {
            continue;
        }
        const HRESULT found = segment->SegmentOffsetToTC(offset, result);
        if (found != AAFRESULT_TIMECODE_NOT_FOUND) {
            return found;
        }
    }
    return AAFRESULT_TIMECODE_NOT_FOUND;
}

}  // namespace aaf
