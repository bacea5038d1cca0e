// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Essence that is stored in a file or reached through it, in bytes of a stream. The
// module describes movies where they are and stores none, and the host reads none
// this way; the library has the objects for files of others.

struct IAAFDataDef;
struct IAAFEssenceData;
struct IAAFEssenceFormat;
struct IAAFPlainEssenceData;
struct IAAFPropertyValue;
struct IAAFSourceMob;
struct IAAFTypeDef;
struct IEnumAAFEssenceData;

// Answered by EnumAAFEssenceData.
struct IEnumAAFEssenceData : IUnknown {
    virtual HRESULT NextOne(IAAFEssenceData** essenceData) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFEssenceData** essenceData,
                         aafUInt32* fetched) = 0;                 // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                    // 5
    virtual HRESULT Reset() = 0;                                  // 6
    virtual HRESULT Clone(IEnumAAFEssenceData** enumerator) = 0;  // 7

protected:
    ~IEnumAAFEssenceData() = default;
};

inline constexpr GUID IID_IEnumAAFEssenceData = ncfGuid("B1A21392-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFEssenceData*) {
    return IID_IEnumAAFEssenceData;
}

// Answered by AAFEssenceData.
struct IAAFEssenceData : IUnknown {
    virtual HRESULT Initialize(IAAFSourceMob* fileMob) = 0;  // 3
    virtual HRESULT Write(aafUInt32 bytes, aafDataBuffer_t buffer,
                          aafUInt32* bytesWritten) = 0;                                       // 4
    virtual HRESULT Read(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesRead) = 0;  // 5
    virtual HRESULT SetPosition(aafPosition_t offset) = 0;                                    // 6
    virtual HRESULT GetPosition(aafPosition_t* offset) = 0;                                   // 7
    virtual HRESULT GetSize(aafLength_t* size) = 0;                                           // 8
    virtual HRESULT SetFileMob(IAAFSourceMob* fileMob) = 0;                                   // 9
    virtual HRESULT GetFileMob(IAAFSourceMob** fileMob) = 0;                                  // 10
    virtual HRESULT GetFileMobID(aafMobID_t* fileMobID) = 0;                                  // 11

protected:
    ~IAAFEssenceData() = default;
};

inline constexpr GUID IID_IAAFEssenceData = ncfGuid("6A33F4E2-8ED6-11D2-BF9D-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFEssenceData*) {
    return IID_IAAFEssenceData;
}

// Answered by AAFEssenceData.
struct IAAFEssenceData2 : IUnknown {
    virtual HRESULT Initialize(IAAFSourceMob* fileMob) = 0;  // 3
    virtual HRESULT Write(aafUInt32 bytes, aafDataBuffer_t buffer,
                          aafUInt32* bytesWritten) = 0;                                       // 4
    virtual HRESULT Read(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesRead) = 0;  // 5
    virtual HRESULT SetPosition(aafPosition_t offset) = 0;                                    // 6
    virtual HRESULT GetPosition(aafPosition_t* offset) = 0;                                   // 7
    virtual HRESULT GetSize(aafLength_t* size) = 0;                                           // 8
    virtual HRESULT WriteSampleIndex(aafUInt32 bytes, aafDataBuffer_t buffer,
                                     aafUInt32* bytesWritten) = 0;  // 9
    virtual HRESULT ReadSampleIndex(aafUInt32 bytes, aafDataBuffer_t buffer,
                                    aafUInt32* bytesRead) = 0;          // 10
    virtual HRESULT SetSampleIndexPosition(aafPosition_t offset) = 0;   // 11
    virtual HRESULT GetSampleIndexPosition(aafPosition_t* offset) = 0;  // 12
    virtual HRESULT GetSampleIndexSize(aafLength_t* size) = 0;          // 13
    virtual HRESULT SetFileMob(IAAFSourceMob* fileMob) = 0;             // 14
    virtual HRESULT GetFileMob(IAAFSourceMob** fileMob) = 0;            // 15
    virtual HRESULT GetFileMobID(aafMobID_t* fileMobID) = 0;            // 16
    virtual HRESULT GetPlainEssenceData(aafUInt32 reserved,
                                        IAAFPlainEssenceData** plainEssenceData) = 0;  // 17

protected:
    ~IAAFEssenceData2() = default;
};

inline constexpr GUID IID_IAAFEssenceData2 = ncfGuid("A4B0A376-AF63-4620-8AE7-0DB819AC4B06");
constexpr const GUID& aafIdOf(const IAAFEssenceData2*) {
    return IID_IAAFEssenceData2;
}

// Answered by AAFEssenceAccess.
struct IAAFEssenceAccess : IUnknown {
    virtual HRESULT SetEssenceCodecFlavour(aafUID_constref flavour) = 0;  // 3
    virtual HRESULT WriteSamples(aafUInt32 nSamples, aafUInt32 buflen, aafDataBuffer_t buffer,
                                 aafUInt32* samplesWritten, aafUInt32* bytesWritten) = 0;  // 4
    virtual HRESULT GetLargestSampleSize(IAAFDataDef* dataDef, aafLength_t* maxSize) = 0;  // 5
    virtual HRESULT GetIndexedSampleSize(IAAFDataDef* dataDef, aafPosition_t frameNum,
                                         aafLength_t* frameSize) = 0;             // 6
    virtual HRESULT SetTransformParameters(IAAFEssenceFormat* op) = 0;            // 7
    virtual HRESULT CountSamples(IAAFDataDef* dataDef, aafLength_t* result) = 0;  // 8
    virtual HRESULT ReadSamples(aafUInt32 nSamples, aafUInt32 buflen, aafDataBuffer_t buffer,
                                aafUInt32* samplesRead, aafUInt32* bytesRead) = 0;  // 9
    virtual HRESULT Seek(aafPosition_t sampleFrameNum) = 0;                         // 10
    virtual HRESULT GetFileFormat(IAAFEssenceFormat* opsTemplate,
                                  IAAFEssenceFormat** opsResult) = 0;         // 11
    virtual HRESULT GetFileFormatParameterList(IAAFEssenceFormat** ops) = 0;  // 12
    virtual HRESULT GetEmptyFileFormat(IAAFEssenceFormat** ops) = 0;          // 13
    virtual HRESULT PutFileFormat(IAAFEssenceFormat* ops) = 0;                // 14
    virtual HRESULT GetCodecName(aafUInt32 namelen, aafCharacter* name) = 0;  // 15
    virtual HRESULT GetCodecID(aafCodecID_t* codecID) = 0;                    // 16
    virtual HRESULT CompleteWrite() = 0;                                      // 17

protected:
    ~IAAFEssenceAccess() = default;
};

inline constexpr GUID IID_IAAFEssenceAccess = ncfGuid("AED97EB0-2BC8-11D2-BFAA-006097116212");
constexpr const GUID& aafIdOf(const IAAFEssenceAccess*) {
    return IID_IAAFEssenceAccess;
}

// Answered by AAFEssenceData.
struct IAAFEssenceDataEx : IUnknown {
    virtual HRESULT Initialize(IAAFSourceMob* fileMob) = 0;  // 3
    virtual HRESULT Write(aafUInt32 bytes, aafDataBuffer_t buffer,
                          aafUInt32* bytesWritten) = 0;                                       // 4
    virtual HRESULT Read(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesRead) = 0;  // 5
    virtual HRESULT SetPosition(aafPosition_t offset) = 0;                                    // 6
    virtual HRESULT GetPosition(aafPosition_t* offset) = 0;                                   // 7
    virtual HRESULT GetSize(aafLength_t* size) = 0;                                           // 8
    virtual HRESULT WriteSampleIndex(aafUInt32 bytes, aafDataBuffer_t buffer,
                                     aafUInt32* bytesWritten) = 0;  // 9
    virtual HRESULT ReadSampleIndex(aafUInt32 bytes, aafDataBuffer_t buffer,
                                    aafUInt32* bytesRead) = 0;          // 10
    virtual HRESULT SetSampleIndexPosition(aafPosition_t offset) = 0;   // 11
    virtual HRESULT GetSampleIndexPosition(aafPosition_t* offset) = 0;  // 12
    virtual HRESULT GetSampleIndexSize(aafLength_t* size) = 0;          // 13
    virtual HRESULT SetFileMob(IAAFSourceMob* fileMob) = 0;             // 14
    virtual HRESULT GetFileMob(IAAFSourceMob** fileMob) = 0;            // 15
    virtual HRESULT GetFileMobID(aafMobID_t* fileMobID) = 0;            // 16

protected:
    ~IAAFEssenceDataEx() = default;
};

inline constexpr GUID IID_IAAFEssenceDataEx = ncfGuid("D919D41F-979B-4ABA-9785-8EC319DBA448");
constexpr const GUID& aafIdOf(const IAAFEssenceDataEx*) {
    return IID_IAAFEssenceDataEx;
}

// Answered by AAFEssenceFormat.
struct IAAFEssenceFormat : IUnknown {
    virtual HRESULT AddFormatSpecifier(aafUID_constref essenceFormatCode, aafInt32 valueSize,
                                       aafDataBuffer_t value) = 0;  // 3
    virtual HRESULT GetFormatSpecifier(aafUID_constref essenceFormatCode, aafInt32 valueSize,
                                       aafDataBuffer_t value, aafInt32* bytesRead) = 0;  // 4
    virtual HRESULT NumFormatSpecifiers(aafInt32* numSpecifiers) = 0;                    // 5
    virtual HRESULT GetIndexedFormatSpecifier(aafInt32 index, aafUID_t* essenceFormatCode,
                                              aafInt32 valueSize, aafDataBuffer_t value,
                                              aafInt32* bytesRead) = 0;  // 6

protected:
    ~IAAFEssenceFormat() = default;
};

inline constexpr GUID IID_IAAFEssenceFormat = ncfGuid("34C2DC82-904C-11D2-8088-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFEssenceFormat*) {
    return IID_IAAFEssenceFormat;
}

// Answered by AAFEssenceAccess.
struct IAAFEssenceMultiAccess : IUnknown {
    virtual HRESULT WriteMultiSamples(aafUInt16 arrayElemCount, aafmMultiXfer_t* xferArray,
                                      aafmMultiResult_t* resultArray) = 0;  // 3
    virtual HRESULT ReadMultiSamples(aafUInt16 elemCount, aafmMultiXfer_t* xferArray,
                                     aafmMultiResult_t* resultArray) = 0;  // 4

protected:
    ~IAAFEssenceMultiAccess() = default;
};

inline constexpr GUID IID_IAAFEssenceMultiAccess = ncfGuid("D815E2B4-2425-11D3-80AD-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFEssenceMultiAccess*) {
    return IID_IAAFEssenceMultiAccess;
}

// Answered by AAFPlainEssenceData.
struct IAAFKLVEssenceDataParameters : IUnknown {
    virtual HRESULT GetEssenceElementKey(aafUID_t* essenceElementKey) = 0;  // 3
    virtual HRESULT SetEssenceElementKey(aafUID_constref key) = 0;          // 4

protected:
    ~IAAFKLVEssenceDataParameters() = default;
};

inline constexpr GUID IID_IAAFKLVEssenceDataParameters =
    ncfGuid("CC2AF9AE-EDAD-4B30-9E3E-5BA692380A84");
constexpr const GUID& aafIdOf(const IAAFKLVEssenceDataParameters*) {
    return IID_IAAFKLVEssenceDataParameters;
}

// Answered by AAFPlainStreamData.
struct IAAFKLVStreamParameters : IUnknown {
    virtual HRESULT GetEssenceElementKey(IAAFPropertyValue* streamPropertyValue,
                                         aafUID_t* essenceElementKey) = 0;  // 3
    virtual HRESULT SetEssenceElementKey(IAAFPropertyValue* streamPropertyValue,
                                         aafUID_constref key) = 0;  // 4

protected:
    ~IAAFKLVStreamParameters() = default;
};

inline constexpr GUID IID_IAAFKLVStreamParameters = ncfGuid("379D9D03-4A5F-4399-A105-5AE6E17D9E59");
constexpr const GUID& aafIdOf(const IAAFKLVStreamParameters*) {
    return IID_IAAFKLVStreamParameters;
}

// Answered by AAFPlainEssenceData.
struct IAAFPlainEssenceData : IUnknown {
    virtual HRESULT Initialize(IAAFSourceMob* fileMob) = 0;  // 3
    virtual HRESULT Write(aafUInt32 bytes, aafDataBuffer_t buffer,
                          aafUInt32* bytesWritten) = 0;                                       // 4
    virtual HRESULT Read(aafUInt32 bytes, aafDataBuffer_t buffer, aafUInt32* bytesRead) = 0;  // 5
    virtual HRESULT SetPosition(aafPosition_t offset) = 0;                                    // 6
    virtual HRESULT GetPosition(aafPosition_t* offset) = 0;                                   // 7
    virtual HRESULT GetSize(aafLength_t* size) = 0;                                           // 8
    virtual HRESULT WriteSampleIndex(aafUInt32 bytes, aafDataBuffer_t buffer,
                                     aafUInt32* bytesWritten) = 0;  // 9
    virtual HRESULT ReadSampleIndex(aafUInt32 bytes, aafDataBuffer_t buffer,
                                    aafUInt32* bytesRead) = 0;          // 10
    virtual HRESULT SetSampleIndexPosition(aafPosition_t offset) = 0;   // 11
    virtual HRESULT GetSampleIndexPosition(aafPosition_t* offset) = 0;  // 12
    virtual HRESULT GetSampleIndexSize(aafLength_t* size) = 0;          // 13
    virtual HRESULT SetFileMob(IAAFSourceMob* fileMob) = 0;             // 14
    virtual HRESULT GetFileMob(IAAFSourceMob** fileMob) = 0;            // 15
    virtual HRESULT GetFileMobID(aafMobID_t* fileMobID) = 0;            // 16

protected:
    ~IAAFPlainEssenceData() = default;
};

inline constexpr GUID IID_IAAFPlainEssenceData = ncfGuid("3BDE74FF-7305-4A19-B3B1-B13501404DFF");
constexpr const GUID& aafIdOf(const IAAFPlainEssenceData*) {
    return IID_IAAFPlainEssenceData;
}

// Answered by AAFPlainStreamData.
struct IAAFPlainStreamData : IUnknown {
    virtual HRESULT GetSize(IAAFPropertyValue* streamPropertyValue, aafInt64* size) = 0;    // 3
    virtual HRESULT SetSize(IAAFPropertyValue* streamPropertyValue, aafInt64 newSize) = 0;  // 4
    virtual HRESULT GetPosition(IAAFPropertyValue* streamPropertyValue,
                                aafInt64* position) = 0;  // 5
    virtual HRESULT SetPosition(IAAFPropertyValue* streamPropertyValue,
                                aafInt64 newPosition) = 0;  // 6
    virtual HRESULT Read(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                         aafMemPtr_t data, aafUInt32* bytesRead) = 0;  // 7
    virtual HRESULT Write(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                          aafMemPtr_t data) = 0;  // 8
    virtual HRESULT Append(IAAFPropertyValue* streamPropertyValue, aafUInt32 dataSize,
                           aafMemPtr_t data) = 0;  // 9
    virtual HRESULT HasStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       aafBoolean_t* hasByteOrder) = 0;  // 10
    virtual HRESULT GetStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       eAAFByteOrder_t* byteOrder) = 0;  // 11
    virtual HRESULT SetStoredByteOrder(IAAFPropertyValue* streamPropertyValue,
                                       eAAFByteOrder_t byteOrder) = 0;                 // 12
    virtual HRESULT ClearStoredByteOrder(IAAFPropertyValue* streamPropertyValue) = 0;  // 13
    virtual HRESULT ReadElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                 aafUInt32 dataSize, aafMemPtr_t data,
                                 aafUInt32* bytesRead) = 0;  // 14
    virtual HRESULT WriteElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                  aafUInt32 dataSize,
                                  aafMemPtr_t data) = 0;  // 15
    virtual HRESULT AppendElements(IAAFPropertyValue* streamPropertyValue, IAAFTypeDef* elementType,
                                   aafUInt32 dataSize,
                                   aafMemPtr_t data) = 0;  // 16

protected:
    ~IAAFPlainStreamData() = default;
};

inline constexpr GUID IID_IAAFPlainStreamData = ncfGuid("86F9AAFF-B6AD-4F3E-A71C-F69F1B4C48A5");
constexpr const GUID& aafIdOf(const IAAFPlainStreamData*) {
    return IID_IAAFPlainStreamData;
}

// Answered by none of the SDK (callback that a caller supplies).
struct IAAFStreamAccess : IUnknown {
    virtual HRESULT WriteStream(IAAFPropertyValue* propertyValue, aafMemPtr_t userData) = 0;  // 3

protected:
    ~IAAFStreamAccess() = default;
};

inline constexpr GUID IID_IAAFStreamAccess = ncfGuid("065F5F69-3A64-401E-A1A6-5833268F5236");
constexpr const GUID& aafIdOf(const IAAFStreamAccess*) {
    return IID_IAAFStreamAccess;
}
