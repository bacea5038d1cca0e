// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Segments that mark a place in time: events, markers, triggers. Neither module nor
// host makes them; the library has them for files of others.

struct IAAFDataDef;
struct IAAFDescriptiveFramework;
struct IAAFSourceReference;

// Answered by AAFCommentMarker.
struct IAAFCommentMarker : IUnknown {
    virtual HRESULT GetAnnotation(IAAFSourceReference** result) = 0;     // 3
    virtual HRESULT SetAnnotation(IAAFSourceReference* annotation) = 0;  // 4

protected:
    ~IAAFCommentMarker() = default;
};

inline constexpr GUID IID_IAAFCommentMarker = ncfGuid("E684D78A-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFCommentMarker*) {
    return IID_IAAFCommentMarker;
}

// Answered by AAFDescriptiveClip.
struct IAAFDescriptiveClip : IUnknown {
    virtual HRESULT Initialize(IAAFDataDef* dataDef, aafLength_constref length,
                               aafSourceRef_t sourceRef) = 0;     // 3
    virtual HRESULT CountDescribedSlotIDs(aafUInt32* count) = 0;  // 4
    virtual HRESULT GetDescribedSlotIDs(aafUInt32 maxDescribedSlotIDCount,
                                        aafUInt32* describedSlotIDs) = 0;  // 5
    virtual HRESULT IsDescribedSlotIDPresent(aafUInt32 describedSlotID,
                                             aafBoolean_t* isPresent) = 0;  // 6
    virtual HRESULT AddDescribedSlotID(aafUInt32 describedSlotID) = 0;      // 7
    virtual HRESULT RemoveDescribedSlotID(aafUInt32 describedSlotID) = 0;   // 8

protected:
    ~IAAFDescriptiveClip() = default;
};

inline constexpr GUID IID_IAAFDescriptiveClip = ncfGuid("2E777356-B7E4-43BA-BFD4-F964D90BC5E3");
constexpr const GUID& aafIdOf(const IAAFDescriptiveClip*) {
    return IID_IAAFDescriptiveClip;
}

// Answered by AAFDescriptiveMarker.
struct IAAFDescriptiveMarker : IUnknown {
    virtual HRESULT Initialize() = 0;  // 3
    virtual HRESULT SetDescribedSlotIDs(aafUInt32 numberElements,
                                        aafUInt32* describedSlotIDs) = 0;  // 4
    virtual HRESULT GetDescribedSlotIDs(aafUInt32 numberElements,
                                        aafUInt32* describedSlotIDs) = 0;    // 5
    virtual HRESULT GetDescribedSlotIDsSize(aafUInt32* numberElements) = 0;  // 6
    virtual HRESULT SetDescriptiveFramework(
        IAAFDescriptiveFramework* descriptiveFramework) = 0;  // 7
    virtual HRESULT GetDescriptiveFramework(
        IAAFDescriptiveFramework** descriptiveFramework) = 0;  // 8

protected:
    ~IAAFDescriptiveMarker() = default;
};

inline constexpr GUID IID_IAAFDescriptiveMarker = ncfGuid("C377B78E-591F-4BA9-A069-18438C626E34");
constexpr const GUID& aafIdOf(const IAAFDescriptiveMarker*) {
    return IID_IAAFDescriptiveMarker;
}

// Answered by AAFEvent.
struct IAAFEvent : IUnknown {
    virtual HRESULT GetPosition(aafPosition_t* position) = 0;                  // 3
    virtual HRESULT SetPosition(aafPosition_t position) = 0;                   // 4
    virtual HRESULT SetComment(aafCharacter_constptr comment) = 0;             // 5
    virtual HRESULT GetComment(aafCharacter* comment, aafUInt32 bufSize) = 0;  // 6
    virtual HRESULT GetCommentBufLen(aafUInt32* bufSize) = 0;                  // 7

protected:
    ~IAAFEvent() = default;
};

inline constexpr GUID IID_IAAFEvent = ncfGuid("E684D790-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFEvent*) {
    return IID_IAAFEvent;
}

// Answered by AAFGPITrigger.
struct IAAFGPITrigger : IUnknown {
    virtual HRESULT GetActiveState(aafBoolean_t* activeState) = 0;  // 3
    virtual HRESULT SetActiveState(aafBoolean_t activeState) = 0;   // 4

protected:
    ~IAAFGPITrigger() = default;
};

inline constexpr GUID IID_IAAFGPITrigger = ncfGuid("E684D78C-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFGPITrigger*) {
    return IID_IAAFGPITrigger;
}
