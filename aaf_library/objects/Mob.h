// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Object.h"
#include "aaf_library/objects/Annotations.h"
#include "aaf_library/objects/Fresh.h"
#include "aaf_library/objects/MobId.h"
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFEffects.h"
#include "host_interfaces/aaf/AAFEvents.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "not_implemented/AAFMobSlots.h"
#include "not_implemented/AAFMobs.h"

#include <unordered_map>

namespace aaf {

class MobSlot;

class Component;

// A piece of material under an id of its own, with its slots and comments.
// Owned by the content storage of a file, or free.
class Mob : public Implements<Object, IAAFMob, IAAFMob2> {
public:
    void SetDefaults() override;

    aafMobID_t id() const;
    // What the mob counts as; below zero when it counts as none.
    virtual aafMobKind_t MobKind() const { return -1; }
    MobSlot* SlotAt(aafUInt32 index) const;
    // The first one with that id.
    MobSlot* FindSlot(aafSlotID_t slotId) const;
    // A slot of this mob has, or may have, another id from now on.
    void ForgetSlotIds();
    void OnValueChange(const PropertyValue& value) override;

    // -- IAAFMob: identity
    HRESULT GetMobID(aafMobID_t* mobID) override { return ReadStruct(prop::Mob_MobID, mobID); }
    HRESULT SetMobID(aafMobID_constref mobID) override;
    HRESULT SetName(aafCharacter_constptr name) override { return PutString(prop::Mob_Name, name); }
    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override {
        return ReadString(prop::Mob_Name, name, bufSize);
    }
    HRESULT GetNameBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::Mob_Name, bufSize);
    }
    HRESULT GetModTime(aafTimeStamp_t* lastModified) override {
        return ReadStruct(prop::Mob_LastModified, lastModified);
    }
    HRESULT SetModTime(aafTimeStamp_constref modTime) override {
        return PutStruct(prop::Mob_LastModified, modTime);
    }
    HRESULT GetCreateTime(aafTimeStamp_t* creationTime) override {
        return ReadStruct(prop::Mob_CreationTime, creationTime);
    }
    HRESULT SetCreateTime(aafTimeStamp_constref createTime) override {
        return PutStruct(prop::Mob_CreationTime, createTime);
    }
    HRESULT GetMobInfo(aafTimeStamp_t* lastModified, aafTimeStamp_t* creationTime,
                       aafCharacter* name, aafInt32 bufSize) override;
    HRESULT SetUsageCode(aafUID_constref usageCode) override {
        return PutStruct(prop::Mob_UsageCode, usageCode);
    }
    HRESULT GetUsageCode(aafUID_t* usageCode) override {
        return ReadStruct(prop::Mob_UsageCode, usageCode);
    }

    // -- Slots. Their ids are never checked.
    HRESULT CountSlots(aafNumSlots_t* numSlots) override {
        return ReadCount(prop::Mob_Slots, numSlots);
    }
    HRESULT AppendSlot(IAAFMobSlot* slot) override { return AppendObject(prop::Mob_Slots, slot); }
    HRESULT PrependSlot(IAAFMobSlot* slot) override { return PrependObject(prop::Mob_Slots, slot); }
    HRESULT InsertSlotAt(aafUInt32 index, IAAFMobSlot* slot) override {
        return InsertObjectAt(prop::Mob_Slots, index, slot);
    }
    HRESULT RemoveSlotAt(aafUInt32 index) override {
        return RemoveObjectAt(prop::Mob_Slots, index);
    }
    HRESULT GetSlotAt(aafUInt32 index, IAAFMobSlot** slot) override {
        return ReadObjectAt(prop::Mob_Slots, index, slot);
    }
    HRESULT GetSlots(IEnumAAFMobSlots** enumerator) override;
    HRESULT LookupSlot(aafSlotID_t slotId, IAAFMobSlot** destSlot) override;
    HRESULT AppendNewTimelineSlot(aafRational_t editRate, IAAFSegment* segment, aafSlotID_t slotID,
                                  aafCharacter_constptr slotName, aafPosition_t origin,
                                  IAAFTimelineMobSlot** newSlot) override;
    HRESULT AppendNewStaticSlot(IAAFSegment* segment, aafSlotID_t slotID,
                                aafCharacter_constptr slotName,
                                IAAFStaticMobSlot** newSlot) override;
    HRESULT AppendNewEventSlot(aafRational_t editRate, IAAFSegment* segment, aafSlotID_t slotID,
                               aafCharacter_constptr slotName, aafPosition_t origin,
                               IAAFEventMobSlot** newSlot) override;

    // -- Comments, attributes, raw data
    HRESULT AppendComment(aafCharacter* category, aafCharacter_constptr comment) override {
        return AppendTaggedText(*this, prop::Mob_UserComments, category, comment);
    }
    HRESULT CountComments(aafUInt32* numComments) override {
        return ReadCount(prop::Mob_UserComments, numComments);
    }
    HRESULT GetComments(IEnumAAFTaggedValues** enumerator) override {
        return EnumerateList<IAAFTaggedValue>(this, prop::Mob_UserComments, enumerator);
    }
    HRESULT RemoveComment(IAAFTaggedValue* comment) override {
        return RemoveFromList(*this, prop::Mob_UserComments, comment);
    }
    HRESULT AppendAttribute(aafCharacter_constptr name, aafCharacter_constptr value) override {
        return AppendTaggedText(*this, prop::Mob_Attributes, name, value);
    }
    HRESULT CountAttributes(aafUInt32* numAttributes) override {
        return ReadCount(prop::Mob_Attributes, numAttributes);
    }
    HRESULT GetAttributes(IEnumAAFTaggedValues** enumerator) override {
        return EnumerateList<IAAFTaggedValue>(this, prop::Mob_Attributes, enumerator);
    }
    HRESULT RemoveAttribute(IAAFTaggedValue* attribute) override {
        return RemoveFromList(*this, prop::Mob_Attributes, attribute);
    }
    HRESULT AppendKLVData(IAAFKLVData* data) override {
        return AppendObject(prop::Mob_KLVData, data);
    }
    HRESULT CountKLVData(aafUInt32* numData) override {
        return ReadCount(prop::Mob_KLVData, numData);
    }
    HRESULT GetKLVData(IEnumAAFKLVData** enumerator) override {
        return EnumerateList<IAAFKLVData>(this, prop::Mob_KLVData, enumerator);
    }
    HRESULT RemoveKLVData(IAAFKLVData* data) override {
        return RemoveFromList(*this, prop::Mob_KLVData, data);
    }

    // The timecode at an offset of that segment, or of the first slot that has timecode.
    HRESULT OffsetToMobTimecode(IAAFSegment* tcSeg, aafPosition_t* offset,
                                aafTimecode_t* result) override;

    // -- Other mobs and files
    HRESULT ChangeRef(aafMobID_constref oldMobID, aafMobID_constref newMobID) override;
    HRESULT CloneExternal(aafDepend_t resolveDependencies, aafIncMedia_t includeMedia,
                          IAAFFile* destFile, IAAFMob** destMob) override;
    HRESULT Copy(aafCharacter_constptr destMobName, IAAFMob** destMob) override;

protected:
    // What master and source mobs answer to NewPhysSourceRef and, when the slot
    // is free or holds a sequence, to AppendPhysSourceRef.
    HRESULT PutSourceClip(aafRational_t editRate, aafSlotID_t slotId, IAAFDataDef* essenceKind,
                          const aafSourceRef_t& reference, aafLength_t length);
    HRESULT AppendSourceClip(aafRational_t editRate, aafSlotID_t slotId, IAAFDataDef* essenceKind,
                             const aafSourceRef_t& reference, aafLength_t length);
    // A free source clip.
    HRESULT MakeSourceClip(IAAFDataDef* essenceKind, const aafSourceRef_t& reference,
                           aafLength_t length, RefPtr<Object>& clip);
    // Puts a component at the end of the sequence in the slot with that id; both come into being
    // where they are missing.
    HRESULT AppendToSequence(aafRational_t editRate, aafSlotID_t slotId, Component& component,
                             const wchar_t* name);
    // A timeline slot at the end with a segment that nobody owns yet.
    HRESULT AppendTimelineSlot(aafRational_t editRate, Object& segment, aafSlotID_t slotId,
                               const wchar_t* name);

private:
    HRESULT MakeSequence(Component& component, RefPtr<Object>& sequence);

    // Where the first slot of each id stands, for the slots that were looked at so far. A mob may
    // have tens of thousands, one for each channel of a sound track.
    mutable std::unordered_map<aafSlotID_t, aafUInt32> slotPlaces_;
    mutable aafUInt32 slotsSeen_ = 0;
};

}  // namespace aaf
