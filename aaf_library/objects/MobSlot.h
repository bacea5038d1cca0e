// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Object.h"
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
    HRESULT SetName(aafCharacter_constptr name) override;
    HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) override;
    HRESULT GetNameBufLen(aafUInt32* bufSize) override;
    HRESULT GetPhysicalNum(aafUInt32* result) override;
    HRESULT GetDataDef(IAAFDataDef** result) override;
    HRESULT GetSlotID(aafSlotID_t* result) override;
    HRESULT SetSegment(IAAFSegment* segment) override;
    HRESULT SetPhysicalNum(aafUInt32 number) override;
    HRESULT SetSlotID(aafSlotID_t value) override;

    Segment* segment() const;
    aafSlotID_t id() const;
};

// A slot whose segment runs along a clock.
class TimelineMobSlot : public Implements<MobSlot, IAAFTimelineMobSlot, IAAFTimelineMobSlot2> {
public:
    void SetDefaults() override;

    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT GetEditRate(aafRational_t* editRate) override;
    HRESULT SetEditRate(aafRational_constref editRate) override;
    HRESULT GetOrigin(aafPosition_t* origin) override;
    HRESULT SetOrigin(aafPosition_t origin) override;
    HRESULT GetMarkIn(aafPosition_t* result) override;
    HRESULT SetMarkIn(aafPosition_t value) override;
    HRESULT GetMarkOut(aafPosition_t* result) override;
    HRESULT SetMarkOut(aafPosition_t value) override;
    HRESULT GetUserPos(aafPosition_t* result) override;
    HRESULT SetUserPos(aafPosition_t value) override;
};

// A slot without time.
class StaticMobSlot : public Implements<MobSlot, IAAFStaticMobSlot> {};

// A slot of events.
class EventMobSlot : public Implements<MobSlot, IAAFEventMobSlot, IAAFEventMobSlot2> {
public:
    void SetDefaults() override;

    HRESULT GetEditRate(aafRational_t* editRate) override;
    HRESULT SetEditRate(aafRational_t* editRate) override;
    HRESULT GetEventSlotOrigin(aafPosition_t* eventSlotOrigin) override;
    HRESULT SetEventSlotOrigin(aafPosition_t eventSlotOrigin) override;
};

}  // namespace aaf
