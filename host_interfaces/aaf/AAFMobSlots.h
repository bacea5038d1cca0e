// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Slots: the tracks of a mob, each with a number, a name, an edit rate and one
// segment. A mob owns its slots. The module makes timeline slots; it and the host
// list them.

struct IAAFDataDef;
struct IAAFEventMobSlot;
struct IAAFMobSlot;
struct IAAFSegment;
struct IAAFStaticMobSlot;
struct IAAFTimelineMobSlot;
struct IEnumAAFMobSlots;

// Answered by AAFMobSlot.
struct IAAFMobSlot : IUnknown {
    virtual HRESULT GetSegment(IAAFSegment** result) = 0;                // 3
    virtual HRESULT SetName(aafCharacter_constptr name) = 0;             // 4
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;  // 5
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;               // 6
    virtual HRESULT GetPhysicalNum(aafUInt32* result) = 0;               // 7
    virtual HRESULT GetDataDef(IAAFDataDef** result) = 0;                // 8
    virtual HRESULT GetSlotID(aafSlotID_t* result) = 0;                  // 9
    virtual HRESULT SetSegment(IAAFSegment* segment) = 0;                // 10
    virtual HRESULT SetPhysicalNum(aafUInt32 number) = 0;                // 11
    virtual HRESULT SetSlotID(aafSlotID_t value) = 0;                    // 12

protected:
    ~IAAFMobSlot() = default;
};

inline constexpr GUID IID_IAAFMobSlot = ncfGuid("B1A21376-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFMobSlot*) {
    return IID_IAAFMobSlot;
}

// Answered by AAFTimelineMobSlot.
struct IAAFTimelineMobSlot : IUnknown {
    virtual HRESULT Initialize() = 0;                                // 3
    virtual HRESULT GetEditRate(aafRational_t* editRate) = 0;        // 4
    virtual HRESULT SetEditRate(aafRational_constref editRate) = 0;  // 5
    virtual HRESULT GetOrigin(aafPosition_t* origin) = 0;            // 6
    virtual HRESULT SetOrigin(aafPosition_t origin) = 0;             // 7

protected:
    ~IAAFTimelineMobSlot() = default;
};

inline constexpr GUID IID_IAAFTimelineMobSlot = ncfGuid("B1A21378-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFTimelineMobSlot*) {
    return IID_IAAFTimelineMobSlot;
}

// Answered by AAFTimelineMobSlot.
struct IAAFTimelineMobSlot2 : IUnknown {
    virtual HRESULT Initialize() = 0;                                // 3
    virtual HRESULT GetEditRate(aafRational_t* editRate) = 0;        // 4
    virtual HRESULT SetEditRate(aafRational_constref editRate) = 0;  // 5
    virtual HRESULT GetOrigin(aafPosition_t* origin) = 0;            // 6
    virtual HRESULT SetOrigin(aafPosition_t origin) = 0;             // 7
    virtual HRESULT GetMarkIn(aafPosition_t* result) = 0;            // 8
    virtual HRESULT SetMarkIn(aafPosition_t value) = 0;              // 9
    virtual HRESULT GetMarkOut(aafPosition_t* result) = 0;           // 10
    virtual HRESULT SetMarkOut(aafPosition_t value) = 0;             // 11
    virtual HRESULT GetUserPos(aafPosition_t* result) = 0;           // 12
    virtual HRESULT SetUserPos(aafPosition_t value) = 0;             // 13

protected:
    ~IAAFTimelineMobSlot2() = default;
};

inline constexpr GUID IID_IAAFTimelineMobSlot2 = ncfGuid("DB347978-BA72-4BDF-A188-8172EA5C5F00");
constexpr const GUID& aafIdOf(const IAAFTimelineMobSlot2*) {
    return IID_IAAFTimelineMobSlot2;
}

// Answered by AAFStaticMobSlot.
struct IAAFStaticMobSlot : IUnknown {
protected:
    ~IAAFStaticMobSlot() = default;
};

inline constexpr GUID IID_IAAFStaticMobSlot = ncfGuid("E684D764-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFStaticMobSlot*) {
    return IID_IAAFStaticMobSlot;
}

// Answered by AAFEventMobSlot.
struct IAAFEventMobSlot : IUnknown {
    virtual HRESULT GetEditRate(aafRational_t* editRate) = 0;  // 3
    virtual HRESULT SetEditRate(aafRational_t* editRate) = 0;  // 4

protected:
    ~IAAFEventMobSlot() = default;
};

inline constexpr GUID IID_IAAFEventMobSlot = ncfGuid("E684D766-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFEventMobSlot*) {
    return IID_IAAFEventMobSlot;
}

// Answered by AAFEventMobSlot.
struct IAAFEventMobSlot2 : IUnknown {
    virtual HRESULT GetEditRate(aafRational_t* editRate) = 0;                // 3
    virtual HRESULT SetEditRate(aafRational_t* editRate) = 0;                // 4
    virtual HRESULT GetEventSlotOrigin(aafPosition_t* eventSlotOrigin) = 0;  // 5
    virtual HRESULT SetEventSlotOrigin(aafPosition_t eventSlotOrigin) = 0;   // 6

protected:
    ~IAAFEventMobSlot2() = default;
};

inline constexpr GUID IID_IAAFEventMobSlot2 = ncfGuid("15375122-CE6C-464D-8AC5-228862E61D08");
constexpr const GUID& aafIdOf(const IAAFEventMobSlot2*) {
    return IID_IAAFEventMobSlot2;
}

// Answered by EnumAAFMobSlots.
struct IEnumAAFMobSlots : IUnknown {
    virtual HRESULT NextOne(IAAFMobSlot** mobSlot) = 0;                                        // 3
    virtual HRESULT Next(aafUInt32 count, IAAFMobSlot** mobSlots, aafUInt32* numFetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                                 // 5
    virtual HRESULT Reset() = 0;                                                               // 6
    virtual HRESULT Clone(IEnumAAFMobSlots** enumerator) = 0;                                  // 7

protected:
    ~IEnumAAFMobSlots() = default;
};

inline constexpr GUID IID_IEnumAAFMobSlots = ncfGuid("B1A21388-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFMobSlots*) {
    return IID_IEnumAAFMobSlots;
}
