// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Segments that count: timecode, edge code, pulldown. Starts and lengths are in
// frames. The module makes timecodes, for slots of their own; neither it nor the host
// makes the others.

struct IAAFSegment;

// Answered by AAFTimecode.
struct IAAFTimecode : IUnknown {
    virtual HRESULT Initialize(aafLength_t length, aafTimecode_t* timecode) = 0;  // 3
    virtual HRESULT GetTimecode(aafTimecode_t* timecode) = 0;                     // 4
    virtual HRESULT SetTimecode(aafTimecode_t* timecode) = 0;                     // 5

protected:
    ~IAAFTimecode() = default;
};

inline constexpr GUID IID_IAAFTimecode = ncfGuid("92B88035-2B2B-11D2-BF7E-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFTimecode*) {
    return IID_IAAFTimecode;
}

// Answered by AAFEdgecode.
struct IAAFEdgecode : IUnknown {
    virtual HRESULT Initialize(aafLength_t length, aafEdgecode_t edgecode) = 0;  // 3
    virtual HRESULT GetEdgecode(aafEdgecode_t* edgecode) = 0;                    // 4

protected:
    ~IAAFEdgecode() = default;
};

inline constexpr GUID IID_IAAFEdgecode = ncfGuid("38E6F8A4-2A2C-11D2-8411-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFEdgecode*) {
    return IID_IAAFEdgecode;
}

// Answered by AAFPulldown.
struct IAAFPulldown : IUnknown {
    virtual HRESULT GetInputSegment(IAAFSegment** inputSegment) = 0;                // 3
    virtual HRESULT SetInputSegment(IAAFSegment* inputSegment) = 0;                 // 4
    virtual HRESULT GetPulldownKind(aafPulldownKind_t* pulldownKind) = 0;           // 5
    virtual HRESULT SetPulldownKind(aafPulldownKind_t pulldownKind) = 0;            // 6
    virtual HRESULT GetPulldownDirection(aafPulldownDir_t* pulldownDirection) = 0;  // 7
    virtual HRESULT SetPulldownDirection(aafPulldownDir_t pulldownDirection) = 0;   // 8
    virtual HRESULT GetPhaseFrame(aafPhaseFrame_t* phaseFrame) = 0;                 // 9
    virtual HRESULT SetPhaseFrame(aafPhaseFrame_t phaseFrame) = 0;                  // 10

protected:
    ~IAAFPulldown() = default;
};

inline constexpr GUID IID_IAAFPulldown = ncfGuid("92B88031-2B2B-11D2-BF7E-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFPulldown*) {
    return IID_IAAFPulldown;
}

// Answered by AAFTimecodeStream.
struct IAAFTimecodeStream : IUnknown {
    virtual HRESULT GetPositionTimecode(aafPosition_t position, aafTimecode_t* timecode) = 0;  // 3
    virtual HRESULT SetPositionTimecode(aafPosition_t position, aafTimecode_t timecode) = 0;   // 4
    virtual HRESULT GetUserDataLength(aafInt32* length) = 0;                                   // 5
    virtual HRESULT GetUserDataAtPosition(aafPosition_t position, aafInt32 buflen,
                                          aafDataBuffer_t buffer) = 0;  // 6
    virtual HRESULT SetUserDataAtPosition(aafPosition_t position, aafInt32 buflen,
                                          aafDataBuffer_t buffer) = 0;       // 7
    virtual HRESULT SetSampleRate(aafRational_t sampleRate) = 0;             // 8
    virtual HRESULT GetSampleRate(aafRational_t* sampleRate) = 0;            // 9
    virtual HRESULT SetSourceType(aafTimecodeSourceType_t sourceType) = 0;   // 10
    virtual HRESULT GetSourceType(aafTimecodeSourceType_t* sourceType) = 0;  // 11
    virtual HRESULT GetSampleSize(aafUInt32* sampleSize) = 0;                // 12
    virtual HRESULT GetSource(aafUInt32 valueSize, aafDataBuffer_t value,
                              aafUInt32* bytesRead) = 0;                        // 13
    virtual HRESULT GetSourceBufLen(aafUInt32* len) = 0;                        // 14
    virtual HRESULT SetSource(aafUInt32 valueSize, aafDataBuffer_t value) = 0;  // 15

protected:
    ~IAAFTimecodeStream() = default;
};

inline constexpr GUID IID_IAAFTimecodeStream = ncfGuid("7B007BF2-2D39-11D2-8043-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFTimecodeStream*) {
    return IID_IAAFTimecodeStream;
}

// Answered by AAFTimecodeStream12M.
struct IAAFTimecodeStream12M : IUnknown {
protected:
    ~IAAFTimecodeStream12M() = default;
};

inline constexpr GUID IID_IAAFTimecodeStream12M = ncfGuid("EBF5EDB2-2D3A-11D2-8043-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFTimecodeStream12M*) {
    return IID_IAAFTimecodeStream12M;
}
