// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/MobSlot.h"

#include "aaf_library/model/TypeDefinition.h"
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

HRESULT MobSlot::SetName(aafCharacter_constptr name) {
    return PutString(prop::MobSlot_SlotName, name);
}

HRESULT MobSlot::GetName(aafCharacter* name, aafUInt32 bufSize) {
    return ReadString(prop::MobSlot_SlotName, name, bufSize);
}

HRESULT MobSlot::GetNameBufLen(aafUInt32* bufSize) {
    return ReadStringLength(prop::MobSlot_SlotName, bufSize);
}

HRESULT MobSlot::GetPhysicalNum(aafUInt32* result) {
    return ReadInteger(prop::MobSlot_PhysicalTrackNumber, result);
}

HRESULT MobSlot::GetDataDef(IAAFDataDef** result) {
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Segment* const held = segment();
    return held == nullptr ? AAFRESULT_NULLOBJECT : held->GetDataDef(result);
}

HRESULT MobSlot::GetSlotID(aafSlotID_t* result) {
    return ReadInteger(prop::MobSlot_SlotID, result);
}

HRESULT MobSlot::SetSegment(IAAFSegment* segment) {
    return PutObject(prop::MobSlot_Segment, segment);
}

HRESULT MobSlot::SetPhysicalNum(aafUInt32 number) {
    return PutInteger(prop::MobSlot_PhysicalTrackNumber, number);
}

HRESULT MobSlot::SetSlotID(aafSlotID_t value) {
    return PutInteger(prop::MobSlot_SlotID, value);
}

void TimelineMobSlot::SetDefaults() {
    MobSlot::SetDefaults();
    PutStruct(prop::TimelineMobSlot_EditRate, aafRational_t{0, 0});
    PutInteger(prop::TimelineMobSlot_Origin, 0);
}

HRESULT TimelineMobSlot::GetEditRate(aafRational_t* editRate) {
    return ReadStruct(prop::TimelineMobSlot_EditRate, editRate);
}

HRESULT TimelineMobSlot::SetEditRate(aafRational_constref editRate) {
    return PutStruct(prop::TimelineMobSlot_EditRate, editRate);
}

HRESULT TimelineMobSlot::GetOrigin(aafPosition_t* origin) {
    return ReadInteger(prop::TimelineMobSlot_Origin, origin);
}

HRESULT TimelineMobSlot::SetOrigin(aafPosition_t origin) {
    return PutInteger(prop::TimelineMobSlot_Origin, origin);
}

HRESULT TimelineMobSlot::GetMarkIn(aafPosition_t* result) {
    return ReadInteger(prop::TimelineMobSlot_MarkIn, result);
}

HRESULT TimelineMobSlot::SetMarkIn(aafPosition_t value) {
    return PutInteger(prop::TimelineMobSlot_MarkIn, value);
}

HRESULT TimelineMobSlot::GetMarkOut(aafPosition_t* result) {
    return ReadInteger(prop::TimelineMobSlot_MarkOut, result);
}

HRESULT TimelineMobSlot::SetMarkOut(aafPosition_t value) {
    return PutInteger(prop::TimelineMobSlot_MarkOut, value);
}

HRESULT TimelineMobSlot::GetUserPos(aafPosition_t* result) {
    return ReadInteger(prop::TimelineMobSlot_UserPos, result);
}

HRESULT TimelineMobSlot::SetUserPos(aafPosition_t value) {
    return PutInteger(prop::TimelineMobSlot_UserPos, value);
}

void EventMobSlot::SetDefaults() {
    MobSlot::SetDefaults();
    PutStruct(prop::EventMobSlot_EditRate, aafRational_t{0, 0});
}

HRESULT EventMobSlot::GetEditRate(aafRational_t* editRate) {
    return ReadStruct(prop::EventMobSlot_EditRate, editRate);
}

HRESULT EventMobSlot::SetEditRate(aafRational_t* editRate) {
    return editRate == nullptr ? AAFRESULT_NULL_PARAM
                               : PutStruct(prop::EventMobSlot_EditRate, *editRate);
}

HRESULT EventMobSlot::GetEventSlotOrigin(aafPosition_t* eventSlotOrigin) {
    return ReadInteger(prop::EventMobSlot_EventSlotOrigin, eventSlotOrigin);
}

HRESULT EventMobSlot::SetEventSlotOrigin(aafPosition_t eventSlotOrigin) {
    return PutInteger(prop::EventMobSlot_EventSlotOrigin, eventSlotOrigin);
}

}  // namespace aaf
