// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
// The operations of a mob that make slots, with or without the clip in them.
#include "aaf_library/model/Model.h"
#include "aaf_library/objects/Definitions.h"
#include "aaf_library/objects/Mob.h"
#include "aaf_library/objects/MobSlot.h"
#include "aaf_library/objects/Sequence.h"
#include "aaf_library/objects/SourceClip.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"

namespace aaf {

namespace {

// Gives a new slot its id, name and segment and puts it at the end of the mob.
// A segment that is owned elsewhere leaves the mob as it was.
HRESULT FillAndAppend(Mob& mob, MobSlot& slot, IUnknown* segment, aafSlotID_t slotId,
                      aafCharacter_constptr name) {
    HRESULT result = slot.PutObject(prop::MobSlot_Segment, segment);
    if (result < 0) {
        return result;
    }
    slot.SetSlotID(slotId);
    slot.SetName(name);
    result = mob.AppendObject(prop::Mob_Slots, slot.Identity());
    return result;
}

}  // namespace

HRESULT Mob::AppendNewTimelineSlot(aafRational_t editRate, IAAFSegment* segment, aafSlotID_t slotID,
                                   aafCharacter_constptr slotName, aafPosition_t origin,
                                   IAAFTimelineMobSlot** newSlot) {
    if (segment == nullptr || slotName == nullptr || newSlot == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const RefPtr<TimelineMobSlot> slot =
        model()->NewObject<TimelineMobSlot>(AUID_AAFTimelineMobSlot);
    slot->SetEditRate(editRate);
    slot->SetOrigin(origin);
    const HRESULT result = FillAndAppend(*this, *slot, segment, slotID, slotName);
    return result < 0 ? result : GiveOut(slot.get(), newSlot);
}

HRESULT Mob::AppendNewStaticSlot(IAAFSegment* segment, aafSlotID_t slotID,
                                 aafCharacter_constptr slotName, IAAFStaticMobSlot** newSlot) {
    if (segment == nullptr || slotName == nullptr || newSlot == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const RefPtr<StaticMobSlot> slot = model()->NewObject<StaticMobSlot>(AUID_AAFStaticMobSlot);
    const HRESULT result = FillAndAppend(*this, *slot, segment, slotID, slotName);
    return result < 0 ? result : GiveOut(slot.get(), newSlot);
}

HRESULT Mob::AppendNewEventSlot(aafRational_t editRate, IAAFSegment* segment, aafSlotID_t slotID,
                                aafCharacter_constptr slotName, aafPosition_t origin,
                                IAAFEventMobSlot** newSlot) {
    if (segment == nullptr || slotName == nullptr || newSlot == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const RefPtr<EventMobSlot> slot = model()->NewObject<EventMobSlot>(AUID_AAFEventMobSlot);
    slot->SetEditRate(&editRate);
    slot->SetEventSlotOrigin(origin);
    const HRESULT result = FillAndAppend(*this, *slot, segment, slotID, slotName);
    return result < 0 ? result : GiveOut(slot.get(), newSlot);
}

HRESULT Mob::AppendTimelineSlot(aafRational_t editRate, Object& segment, aafSlotID_t slotId,
                                const wchar_t* name) {
    const RefPtr<TimelineMobSlot> slot =
        model()->NewObject<TimelineMobSlot>(AUID_AAFTimelineMobSlot);
    slot->SetEditRate(editRate);
    return FillAndAppend(*this, *slot, segment.Identity(), slotId, name);
}

HRESULT Mob::MakeSourceClip(IAAFDataDef* essenceKind, const aafSourceRef_t& reference,
                            aafLength_t length, RefPtr<Object>& clip) {
    const RefPtr<SourceClip> made = model()->NewObject<SourceClip>(AUID_AAFSourceClip);
    const HRESULT result = PutDefinition(*made, prop::Component_DataDefinition, AUID_AAFDataDef,
                                         essenceKind, AAFRESULT_NO_MORE_OBJECTS);
    if (result < 0) {
        return result;
    }
    clip = made;
    return made->SetSource(length, reference);
}

HRESULT Mob::PutSourceClip(aafRational_t editRate, aafSlotID_t slotId, IAAFDataDef* essenceKind,
                           const aafSourceRef_t& reference, aafLength_t length) {
    RefPtr<Object> clip;
    const HRESULT result = MakeSourceClip(essenceKind, reference, length, clip);
    if (result < 0) {
        return result;
    }
    // Into a slot that is there already: its name and rate stay.
    if (MobSlot* const slot = FindSlot(slotId)) {
        return slot->PutObject(prop::MobSlot_Segment, clip->Identity());
    }
    return AppendTimelineSlot(editRate, *clip, slotId, L"ASlot");
}

HRESULT Mob::MakeSequence(Component& component, RefPtr<Object>& sequence) {
    const RefPtr<Sequence> made = model()->NewObject<Sequence>(AUID_AAFSequence);
    Unknown* const kind = component.WeakTarget(prop::Component_DataDefinition);
    const HRESULT result = kind == nullptr
                               ? AAFRESULT_OBJECT_NOT_FOUND
                               : made->PutWeak(prop::Component_DataDefinition, kind->Identity());
    sequence = made;
    return result < 0 ? result : made->InsertComponentAt(0, &component);
}

HRESULT Mob::AppendToSequence(aafRational_t editRate, aafSlotID_t slotId, Component& component,
                              const wchar_t* name) {
    MobSlot* const slot = FindSlot(slotId);
    if (slot != nullptr && slot->segment() != nullptr) {
        Sequence* const present = dynamic_cast<Sequence*>(slot->segment());
        return present == nullptr ? AAFRESULT_OBJECT_ALREADY_ATTACHED
                                  : present->AppendComponent(&component);
    }
    RefPtr<Object> sequence;
    const HRESULT result = MakeSequence(component, sequence);
    if (result < 0) {
        return result;
    }
    return slot != nullptr ? slot->PutObject(prop::MobSlot_Segment, sequence->Identity())
                           : AppendTimelineSlot(editRate, *sequence, slotId, name);
}

HRESULT Mob::AppendSourceClip(aafRational_t editRate, aafSlotID_t slotId, IAAFDataDef* essenceKind,
                              const aafSourceRef_t& reference, aafLength_t length) {
    MobSlot* const slot = FindSlot(slotId);
    if (slot == nullptr || slot->segment() == nullptr) {
        return PutSourceClip(editRate, slotId, essenceKind, reference, length);
    }
    RefPtr<Object> clip;
    const HRESULT result = MakeSourceClip(essenceKind, reference, length, clip);
    if (result < 0) {
        return result;
    }
    Sequence* const sequence = dynamic_cast<Sequence*>(slot->segment());
    if (sequence == nullptr) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    IAAFComponent* component = nullptr;
    GiveOut(clip.get(), &component);
    const RefPtr<IAAFComponent> holder = RefPtr<IAAFComponent>::Adopt(component);
    return sequence->AppendComponent(component);
}

}  // namespace aaf
