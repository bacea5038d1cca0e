// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <unordered_map>

#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "not_implemented/AAFMobSlots.h"
#include "not_implemented/AAFMobs.h"

namespace aaf {

class MobSlot;

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
    HRESULT GetMobID(aafMobID_t* mobID) override;
    HRESULT SetMobID(aafMobID_constref mobID) override;
    HRESULT SetName(aafCharacter_constptr name) override;
    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override;
    HRESULT GetNameBufLen(aafUInt32* bufSize) override;
    HRESULT GetModTime(aafTimeStamp_t* lastModified) override;
    HRESULT SetModTime(aafTimeStamp_constref modTime) override;
    HRESULT GetCreateTime(aafTimeStamp_t* creationTime) override;
    HRESULT SetCreateTime(aafTimeStamp_constref createTime) override;
    HRESULT GetMobInfo(aafTimeStamp_t* lastModified, aafTimeStamp_t* creationTime,
                       aafCharacter* name, aafInt32 bufSize) override;
    HRESULT SetUsageCode(aafUID_constref usageCode) override;
    HRESULT GetUsageCode(aafUID_t* usageCode) override;

    // -- Slots. Their ids are never checked.
    HRESULT CountSlots(aafNumSlots_t* numSlots) override;
    HRESULT AppendSlot(IAAFMobSlot* slot) override;
    HRESULT PrependSlot(IAAFMobSlot* slot) override;
    HRESULT InsertSlotAt(aafUInt32 index, IAAFMobSlot* slot) override;
    HRESULT RemoveSlotAt(aafUInt32 index) override;
    HRESULT GetSlotAt(aafUInt32 index, IAAFMobSlot** slot) override;
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
    HRESULT AppendComment(aafCharacter* category, aafCharacter_constptr comment) override;
    HRESULT CountComments(aafUInt32* numComments) override;
    HRESULT GetComments(IEnumAAFTaggedValues** enumerator) override;
    HRESULT RemoveComment(IAAFTaggedValue* comment) override;
    HRESULT AppendAttribute(aafCharacter_constptr name, aafCharacter_constptr value) override;
    HRESULT CountAttributes(aafUInt32* numAttributes) override;
    HRESULT GetAttributes(IEnumAAFTaggedValues** enumerator) override;
    HRESULT RemoveAttribute(IAAFTaggedValue* attribute) override;
    HRESULT AppendKLVData(IAAFKLVData* data) override;
    HRESULT CountKLVData(aafUInt32* numData) override;
    HRESULT GetKLVData(IEnumAAFKLVData** enumerator) override;
    HRESULT RemoveKLVData(IAAFKLVData* data) override;

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
    // A timeline slot at the end with a segment that nobody owns yet.
    HRESULT AppendTimelineSlot(aafRational_t editRate, Object& segment, aafSlotID_t slotId,
                               const wchar_t* name);

private:
    // Where the first slot of each id stands, for the slots that were looked at so far. A mob may
    // have tens of thousands, one for each channel of a sound track.
    mutable std::unordered_map<aafSlotID_t, aafUInt32> slotPlaces_;
    mutable aafUInt32 slotsSeen_ = 0;
};

}  // namespace aaf
