// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// What a source mob says of sound: rate in frames a second, channels, bits of a
// sample, and what its file format adds. The module fills one for each sound track;
// the host reads them when it prints a description.

struct IAAFRIFFChunk;
struct IEnumAAFRIFFChunks;

// Answered by AAFPCMDescriptor.
struct IAAFPCMDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                                   // 3
    virtual HRESULT SetBlockAlign(aafUInt16 blockAlign) = 0;                            // 4
    virtual HRESULT GetBlockAlign(aafUInt16* blockAlign) = 0;                           // 5
    virtual HRESULT SetSequenceOffset(aafUInt8 offset) = 0;                             // 6
    virtual HRESULT GetSequenceOffset(aafUInt8* offset) = 0;                            // 7
    virtual HRESULT SetAverageBPS(aafUInt32 bps) = 0;                                   // 8
    virtual HRESULT GetAverageBPS(aafUInt32* bps) = 0;                                  // 9
    virtual HRESULT SetChannelAssignment(aafUID_constref channelAssignment) = 0;        // 10
    virtual HRESULT GetChannelAssignment(aafUID_t* channelAssignment) = 0;              // 11
    virtual HRESULT AreAllPeakEnvelopePropertiesPresent(aafBoolean_t* arePresent) = 0;  // 12
    virtual HRESULT SetPeakEnvelopeVersion(aafUInt32 version) = 0;                      // 13
    virtual HRESULT GetPeakEnvelopeVersion(aafUInt32* version) = 0;                     // 14
    virtual HRESULT SetPeakEnvelopeFormat(aafUInt32 format) = 0;                        // 15
    virtual HRESULT GetPeakEnvelopeFormat(aafUInt32* format) = 0;                       // 16
    virtual HRESULT SetPointsPerPeakValue(aafUInt32 pointCount) = 0;                    // 17
    virtual HRESULT GetPointsPerPeakValue(aafUInt32* pointCount) = 0;                   // 18
    virtual HRESULT SetPeakEnvelopeBlockSize(aafUInt32 blockSize) = 0;                  // 19
    virtual HRESULT GetPeakEnvelopeBlockSize(aafUInt32* blockSize) = 0;                 // 20
    virtual HRESULT SetPeakChannelCount(aafUInt32 channelCount) = 0;                    // 21
    virtual HRESULT GetPeakChannelCount(aafUInt32* channelCount) = 0;                   // 22
    virtual HRESULT SetPeakFrameCount(aafUInt32 frameCount) = 0;                        // 23
    virtual HRESULT GetPeakFrameCount(aafUInt32* frameCount) = 0;                       // 24
    virtual HRESULT SetPeakOfPeaksPosition(aafPosition_t position) = 0;                 // 25
    virtual HRESULT GetPeakOfPeaksPosition(aafPosition_t* position) = 0;                // 26
    virtual HRESULT SetPeakEnvelopeTimestamp(aafTimeStamp_constref timeStamp) = 0;      // 27
    virtual HRESULT GetPeakEnvelopeTimestamp(aafTimeStamp_t* timeStamp) = 0;            // 28
    virtual HRESULT SetPeakEnvelopeDataPosition(aafPosition_t position) = 0;            // 29
    virtual HRESULT GetPeakEnvelopeDataPosition(aafPosition_t* position) = 0;           // 30
    virtual HRESULT GetPeakEnvelopeDataSize(aafLength_t* size) = 0;                     // 31
    virtual HRESULT WritePeakEnvelopeData(aafUInt32 bytes, aafDataBuffer_t buffer,
                                          aafUInt32* bytesWritten) = 0;  // 32
    virtual HRESULT ReadPeakEnvelopeData(aafUInt32 bytes, aafDataBuffer_t buffer,
                                         aafUInt32* bytesRead) = 0;  // 33

protected:
    ~IAAFPCMDescriptor() = default;
};

inline constexpr GUID IID_IAAFPCMDescriptor = ncfGuid("F17D58D8-5107-47E4-9ABA-8329FC1B2C84");
constexpr const GUID& aafIdOf(const IAAFPCMDescriptor*) {
    return IID_IAAFPCMDescriptor;
}

// Answered by AAFSoundDescriptor.
struct IAAFSoundDescriptor : IUnknown {
    virtual HRESULT SetCompression(aafUID_constref compression) = 0;  // 3
    virtual HRESULT GetCompression(aafUID_t* compression) = 0;        // 4
    virtual HRESULT SetChannelCount(aafUInt32 channelCount) = 0;      // 5
    virtual HRESULT GetChannelCount(aafUInt32* channelCount) = 0;     // 6
    virtual HRESULT SetAudioSamplingRate(aafRational_t rate) = 0;     // 7
    virtual HRESULT GetAudioSamplingRate(aafRational_t* rate) = 0;    // 8
    virtual HRESULT SetIsLocked(aafBoolean_t locked) = 0;             // 9
    virtual HRESULT IsLocked(aafBoolean_t* locked) = 0;               // 10
    virtual HRESULT SetElectroSpatialFormulation(
        aafElectroSpatialFormulation_t formulation) = 0;  // 11
    virtual HRESULT GetElectroSpatialFormulation(
        aafElectroSpatialFormulation_t* formulation) = 0;           // 12
    virtual HRESULT SetAudioRefLevel(aafInt8 level) = 0;            // 13
    virtual HRESULT GetAudioRefLevel(aafInt8* level) = 0;           // 14
    virtual HRESULT SetDialNorm(aafInt8 dialNorm) = 0;              // 15
    virtual HRESULT GetDialNorm(aafInt8* dialNorm) = 0;             // 16
    virtual HRESULT SetQuantizationBits(aafUInt32 bitsCount) = 0;   // 17
    virtual HRESULT GetQuantizationBits(aafUInt32* bitsCount) = 0;  // 18

protected:
    ~IAAFSoundDescriptor() = default;
};

inline constexpr GUID IID_IAAFSoundDescriptor = ncfGuid("DDC8931E-1A32-4362-BD78-450D0D970047");
constexpr const GUID& aafIdOf(const IAAFSoundDescriptor*) {
    return IID_IAAFSoundDescriptor;
}

// Answered by AAFAES3PCMDescriptor.
struct IAAFAES3PCMDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;  // 3

protected:
    ~IAAFAES3PCMDescriptor() = default;
};

inline constexpr GUID IID_IAAFAES3PCMDescriptor = ncfGuid("2EBFFDE0-5997-414D-808B-6BAA4A74F40F");
constexpr const GUID& aafIdOf(const IAAFAES3PCMDescriptor*) {
    return IID_IAAFAES3PCMDescriptor;
}

// Answered by AAFAES3PCMDescriptor.
struct IAAFAES3PCMDescriptor2 : IUnknown {
    virtual HRESULT Initialize() = 0;                                       // 3
    virtual HRESULT GetEmphasis(aafEmphasisType_t* emphasisType) = 0;       // 4
    virtual HRESULT SetEmphasis(aafEmphasisType_t emphasisType) = 0;        // 5
    virtual HRESULT GetBlockStartOffset(aafUInt16* blockStartOffset) = 0;   // 6
    virtual HRESULT SetBlockStartOffset(aafUInt16 blockStartOffset) = 0;    // 7
    virtual HRESULT GetAuxBitsMode(aafAuxBitsModeType_t* auxBitsMode) = 0;  // 8
    virtual HRESULT SetAuxBitsMode(aafAuxBitsModeType_t auxBitsMode) = 0;   // 9
    virtual HRESULT GetChannelStatusModeAt(
        aafUInt32 index,
        aafChannelStatusModeType_t* channelStatusMode) = 0;  // 10
    virtual HRESULT SetChannelStatusModeAt(aafUInt32 index,
                                           aafChannelStatusModeType_t channelStatusMode) = 0;  // 11
    virtual HRESULT GetFixedChannelStatusDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                                aafUInt8* fixedChannelStatusData) = 0;  // 12
    virtual HRESULT SetFixedChannelStatusDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                                aafUInt8* fixedChannelStatusData) = 0;  // 13
    virtual HRESULT GetUserDataModeAt(aafUInt32 index,
                                      aafUserDataModeType_t* userDataMode) = 0;  // 14
    virtual HRESULT SetUserDataModeAt(aafUInt32 index,
                                      aafUserDataModeType_t userDataMode) = 0;  // 15
    virtual HRESULT GetFixedUserDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                       aafUInt8* fixedUserData) = 0;  // 16
    virtual HRESULT SetFixedUserDataAt(aafUInt32 index, aafUInt32 sizeOfBuffer,
                                       aafUInt8* fixedUserData) = 0;  // 17

protected:
    ~IAAFAES3PCMDescriptor2() = default;
};

inline constexpr GUID IID_IAAFAES3PCMDescriptor2 = ncfGuid("5D7D099B-02EB-4DC8-AFE8-01CE131F5663");
constexpr const GUID& aafIdOf(const IAAFAES3PCMDescriptor2*) {
    return IID_IAAFAES3PCMDescriptor2;
}

// Answered by AAFAIFCDescriptor.
struct IAAFAIFCDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                        // 3
    virtual HRESULT GetSummary(aafUInt32 size, aafDataValue_t summary) = 0;  // 4
    virtual HRESULT GetSummaryBufferSize(aafUInt32* size) = 0;               // 5
    virtual HRESULT SetSummary(aafUInt32 size, aafDataValue_t summary) = 0;  // 6

protected:
    ~IAAFAIFCDescriptor() = default;
};

inline constexpr GUID IID_IAAFAIFCDescriptor = ncfGuid("E684D774-B935-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFAIFCDescriptor*) {
    return IID_IAAFAIFCDescriptor;
}

// Answered by AAFBWFImportDescriptor.
struct IAAFBWFImportDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                                      // 3
    virtual HRESULT SetFileSecurityReport(aafUInt32 fileSecurityReport) = 0;               // 4
    virtual HRESULT GetFileSecurityReport(aafUInt32* fileSecurityReport) = 0;              // 5
    virtual HRESULT SetFileSecurityWave(aafUInt32 fileSecurityWave) = 0;                   // 6
    virtual HRESULT GetFileSecurityWave(aafUInt32* fileSecurityWave) = 0;                  // 7
    virtual HRESULT CountUnknownBWFChunks(aafUInt32* numData) = 0;                         // 8
    virtual HRESULT AppendUnknownBWFChunk(IAAFRIFFChunk* data) = 0;                        // 9
    virtual HRESULT PrependUnknownBWFChunk(IAAFRIFFChunk* data) = 0;                       // 10
    virtual HRESULT InsertUnknownBWFChunkAt(aafUInt32 index, IAAFRIFFChunk* data) = 0;     // 11
    virtual HRESULT GetUnknownBWFChunkAt(aafUInt32 index, IAAFRIFFChunk** data) = 0;       // 12
    virtual HRESULT RemoveUnknownBWFChunkAt(aafUInt32 index) = 0;                          // 13
    virtual HRESULT GetUnknownBWFChunks(IEnumAAFRIFFChunks** enumerator) = 0;              // 14
    virtual HRESULT SetCodingHistory(aafCharacter_constptr codingHistory) = 0;             // 15
    virtual HRESULT GetCodingHistory(aafCharacter* codingHistory, aafUInt32 bufSize) = 0;  // 16
    virtual HRESULT GetCodingHistoryBufLen(aafUInt32* bufSize) = 0;                        // 17
    virtual HRESULT SetBasicData(aafCharacter_constptr basicData) = 0;                     // 18
    virtual HRESULT GetBasicData(aafCharacter* basicData, aafUInt32 bufSize) = 0;          // 19
    virtual HRESULT GetBasicDataBufLen(aafUInt32* bufSize) = 0;                            // 20
    virtual HRESULT SetStartOfModulation(aafCharacter_constptr startOfModulation) = 0;     // 21
    virtual HRESULT GetStartOfModulation(aafCharacter* startOfModulation,
                                         aafUInt32 bufSize) = 0;                               // 22
    virtual HRESULT GetStartOfModulationBufLen(aafUInt32* bufSize) = 0;                        // 23
    virtual HRESULT SetQualityEvent(aafCharacter_constptr qualityEvent) = 0;                   // 24
    virtual HRESULT GetQualityEvent(aafCharacter* qualityEvent, aafUInt32 bufSize) = 0;        // 25
    virtual HRESULT GetQualityEventBufLen(aafUInt32* bufSize) = 0;                             // 26
    virtual HRESULT SetEndOfModulation(aafCharacter_constptr endOfModulation) = 0;             // 27
    virtual HRESULT GetEndOfModulation(aafCharacter* endOfModulation, aafUInt32 bufSize) = 0;  // 28
    virtual HRESULT GetEndOfModulationBufLen(aafUInt32* bufSize) = 0;                          // 29
    virtual HRESULT SetQualityParameter(aafCharacter_constptr qualityParameter) = 0;           // 30
    virtual HRESULT GetQualityParameter(aafCharacter* qualityParameter,
                                        aafUInt32 bufSize) = 0;                                // 31
    virtual HRESULT GetQualityParameterBufLen(aafUInt32* bufSize) = 0;                         // 32
    virtual HRESULT SetOperatorComment(aafCharacter_constptr operatorComment) = 0;             // 33
    virtual HRESULT GetOperatorComment(aafCharacter* operatorComment, aafUInt32 bufSize) = 0;  // 34
    virtual HRESULT GetOperatorCommentBufLen(aafUInt32* bufSize) = 0;                          // 35
    virtual HRESULT SetCueSheet(aafCharacter_constptr cueSheet) = 0;                           // 36
    virtual HRESULT GetCueSheet(aafCharacter* cueSheet, aafUInt32 bufSize) = 0;                // 37
    virtual HRESULT GetCueSheetBufLen(aafUInt32* bufSize) = 0;                                 // 38

protected:
    ~IAAFBWFImportDescriptor() = default;
};

inline constexpr GUID IID_IAAFBWFImportDescriptor = ncfGuid("480B4328-DA10-44D4-BB50-1BAFBFBAF86A");
constexpr const GUID& aafIdOf(const IAAFBWFImportDescriptor*) {
    return IID_IAAFBWFImportDescriptor;
}

// Answered by AAFWAVEDescriptor.
struct IAAFWAVEDescriptor : IUnknown {
    virtual HRESULT Initialize() = 0;                                        // 3
    virtual HRESULT GetSummary(aafUInt32 size, aafDataValue_t summary) = 0;  // 4
    virtual HRESULT GetSummaryBufferSize(aafUInt32* size) = 0;               // 5
    virtual HRESULT SetSummary(aafUInt32 size, aafDataValue_t summary) = 0;  // 6

protected:
    ~IAAFWAVEDescriptor() = default;
};

inline constexpr GUID IID_IAAFWAVEDescriptor = ncfGuid("4C2E1692-8AE6-11D2-813C-006097310172");
constexpr const GUID& aafIdOf(const IAAFWAVEDescriptor*) {
    return IID_IAAFWAVEDescriptor;
}
