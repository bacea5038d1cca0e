// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/MobSlot.h"

#include "aaf_library/objects/Component.h"
#include "aaf_library/objects/Mob.h"

namespace aaf {

void MobSlot::SetDefaults() {
    Object::SetDefaults();
    PutInteger(prop::MobSlot_SlotID, 0);
}

// Any number may be the id: a value does not know which property it stands for.
void MobSlot::OnValueChange(const PropertyValue& value) {
    if (owner() == nullptr || value.HoldsObjects() || value.type().kind() == TypeKind::String) {
        return;
    }
    if (Mob* const mob = dynamic_cast<Mob*>(owner())) {
        mob->ForgetSlotIds();
    }
}

aafRational_t MobSlot::editRate() const {
    aafRational_t rate{};
    if (ReadStruct(prop::TimelineMobSlot_EditRate, &rate) < 0) {
        ReadStruct(prop::EventMobSlot_EditRate, &rate);
    }
    return rate;
}

Segment* MobSlot::segment() const {
    return dynamic_cast<Segment*>(ObjectAt(prop::MobSlot_Segment));
}

aafSlotID_t MobSlot::id() const {
    return static_cast<aafSlotID_t>(IntegerOr(prop::MobSlot_SlotID, 0));
}

HRESULT MobSlot::GetSegment(IAAFSegment** result) {
    const HRESULT read = ReadObject(prop::MobSlot_Segment, result);
    return read == AAFRESULT_PROP_NOT_PRESENT ? AAFRESULT_NULLOBJECT : read;
}

HRESULT MobSlot::GetDataDef(IAAFDataDef** result) {
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Segment* const held = segment();
    return held == nullptr ? AAFRESULT_NULLOBJECT : held->GetDataDef(result);
}

void TimelineMobSlot::SetDefaults() {
    MobSlot::SetDefaults();
    PutStruct(prop::TimelineMobSlot_EditRate, aafRational_t{0, 0});
    PutInteger(prop::TimelineMobSlot_Origin, 0);
}

HRESULT TimelineMobSlot::SetUserPos(aafPosition_t value) {
    return PutInteger(prop::TimelineMobSlot_UserPos, value);
}

void EventMobSlot::SetDefaults() {
    MobSlot::SetDefaults();
    PutStruct(prop::EventMobSlot_EditRate, aafRational_t{0, 0});
}

HRESULT EventMobSlot::SetEventSlotOrigin(aafPosition_t eventSlotOrigin) {
    return PutInteger(prop::EventMobSlot_EventSlotOrigin, eventSlotOrigin);
}

}  // namespace aaf
