// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
#include "aaf_library/model/TypeDefinition.h"
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "not_implemented/AAFMobSlots.h"

namespace aaf {

class Segment;

// A track of a mob: an id, a name, and the one segment that it owns.
class MobSlot : public Implements<Object, IAAFMobSlot> {
public:
    void SetDefaults() override;
    void OnValueChange(const PropertyValue& value) override;

    HRESULT GetSegment(IAAFSegment** result) override;
    HRESULT SetName(aafCharacter_constptr name) override {
        return PutString(prop::MobSlot_SlotName, name);
    }
    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override {
        return ReadString(prop::MobSlot_SlotName, name, bufSize);
    }
    HRESULT GetNameBufLen(aafUInt32* bufSize) override {
        return ReadStringLength(prop::MobSlot_SlotName, bufSize);
    }
    HRESULT GetPhysicalNum(aafUInt32* result) override {
        return ReadInteger(prop::MobSlot_PhysicalTrackNumber, result);
    }
    HRESULT GetDataDef(IAAFDataDef** result) override;
    HRESULT GetSlotID(aafSlotID_t* result) override {
        return ReadInteger(prop::MobSlot_SlotID, result);
    }
    HRESULT SetSegment(IAAFSegment* segment) override {
        return PutObject(prop::MobSlot_Segment, segment);
    }
    HRESULT SetPhysicalNum(aafUInt32 number) override {
        return PutInteger(prop::MobSlot_PhysicalTrackNumber, number);
    }
    HRESULT SetSlotID(aafSlotID_t value) override {
        return PutInteger(prop::MobSlot_SlotID, value);
    }

    // Of a slot with a timeline or with events; 0/0 for others.
    aafRational_t editRate() const;
    Segment* segment() const;
    aafSlotID_t id() const;
};

// A slot whose segment runs along a clock.
class TimelineMobSlot : public Implements<MobSlot, IAAFTimelineMobSlot, IAAFTimelineMobSlot2> {
public:
    void SetDefaults() override;

    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT GetEditRate(aafRational_t* editRate) override {
        return ReadStruct(prop::TimelineMobSlot_EditRate, editRate);
    }
    HRESULT SetEditRate(aafRational_constref editRate) override {
        return PutStruct(prop::TimelineMobSlot_EditRate, editRate);
    }
    HRESULT GetOrigin(aafPosition_t* origin) override {
        return ReadInteger(prop::TimelineMobSlot_Origin, origin);
    }
    HRESULT SetOrigin(aafPosition_t origin) override {
        return PutInteger(prop::TimelineMobSlot_Origin, origin);
    }
    HRESULT GetMarkIn(aafPosition_t* result) override {
        return ReadInteger(prop::TimelineMobSlot_MarkIn, result);
    }
    HRESULT SetMarkIn(aafPosition_t value) override {
        return PutInteger(prop::TimelineMobSlot_MarkIn, value);
    }
    HRESULT GetMarkOut(aafPosition_t* result) override {
        return ReadInteger(prop::TimelineMobSlot_MarkOut, result);
    }
    HRESULT SetMarkOut(aafPosition_t value) override {
        return PutInteger(prop::TimelineMobSlot_MarkOut, value);
    }
    HRESULT GetUserPos(aafPosition_t* result) override {
        return ReadInteger(prop::TimelineMobSlot_UserPos, result);
    }
    HRESULT SetUserPos(aafPosition_t value) override;
};

// A slot without time.
class StaticMobSlot : public Implements<MobSlot, IAAFStaticMobSlot> {};

// A slot of events.
class EventMobSlot : public Implements<MobSlot, IAAFEventMobSlot, IAAFEventMobSlot2> {
public:
    void SetDefaults() override;

    HRESULT GetEditRate(aafRational_t* editRate) override {
        return ReadStruct(prop::EventMobSlot_EditRate, editRate);
    }
    HRESULT SetEditRate(aafRational_t* editRate) override {
        return editRate == nullptr ? AAFRESULT_NULL_PARAM
                                   : PutStruct(prop::EventMobSlot_EditRate, *editRate);
    }
    HRESULT GetEventSlotOrigin(aafPosition_t* eventSlotOrigin) override {
        return ReadInteger(prop::EventMobSlot_EventSlotOrigin, eventSlotOrigin);
    }
    HRESULT SetEventSlotOrigin(aafPosition_t eventSlotOrigin) override;
};

}  // namespace aaf
