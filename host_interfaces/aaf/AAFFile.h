// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// The file: its header, the mobs that it contains, who wrote it, and what holds its
// bytes. A file comes from an exported function (AAFExports.h) and lives as long as
// anyone holds it. The module makes a transient one for each clip and hands it to the
// host; the host opens, copies and saves files. IAAFProgress and IAAFDiagnosticOutput
// are listeners: a caller implements them, and the library calls them on the thread
// that is at work.

struct IAAFContentStorage;
struct IAAFDictionary;
struct IAAFEssenceData;
struct IAAFFile;
struct IAAFFileEncoding;
struct IAAFGetFileBits;
struct IAAFHeader;
struct IAAFIdentification;
struct IAAFMob;
struct IAAFSetFileBits;
struct IEnumAAFEssenceData;
struct IEnumAAFFileEncodings;
struct IEnumAAFIdentifications;
struct IEnumAAFMobs;

// Answered by AAFFile.
struct IAAFFile : IUnknown {
    virtual HRESULT Open() = 0;                                      // 3
    virtual HRESULT SaveCopyAs(IAAFFile* destFile) = 0;              // 4
    virtual HRESULT GetHeader(IAAFHeader** header) = 0;              // 5
    virtual HRESULT GetRevision(aafFileRev_t* rev) = 0;              // 6
    virtual HRESULT Save() = 0;                                      // 7
    virtual HRESULT Close() = 0;                                     // 8
    virtual HRESULT GetDictionary(IAAFDictionary** dictionary) = 0;  // 9

protected:
    ~IAAFFile() = default;
};

inline constexpr GUID IID_IAAFFile = ncfGuid("9346ACD3-2713-11D2-8035-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFFile*) {
    return IID_IAAFFile;
}

// Answered by AAFHeader.
struct IAAFHeader : IUnknown {
    virtual HRESULT LookupMob(aafMobID_constref mobID, IAAFMob** mob) = 0;                    // 3
    virtual HRESULT CountMobs(aafMobKind_t mobKind, aafNumSlots_t* result) = 0;               // 4
    virtual HRESULT GetMobs(aafSearchCrit_t* searchCriteria, IEnumAAFMobs** enumerator) = 0;  // 5
    virtual HRESULT AddMob(IAAFMob* mob) = 0;                                                 // 6
    virtual HRESULT RemoveMob(IAAFMob* mob) = 0;                                              // 7
    virtual HRESULT CountEssenceData(aafUInt32* result) = 0;                                  // 8
    virtual HRESULT IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt,
                                         aafBoolean_t* result) = 0;         // 9
    virtual HRESULT EnumEssenceData(IEnumAAFEssenceData** enumerator) = 0;  // 10
    virtual HRESULT AddEssenceData(IAAFEssenceData* essenceData) = 0;       // 11
    virtual HRESULT RemoveEssenceData(IAAFEssenceData* essenceData) = 0;    // 12
    virtual HRESULT LookupEssenceData(aafMobID_constref mobID,
                                      IAAFEssenceData** essenceData) = 0;            // 13
    virtual HRESULT GetDictionary(IAAFDictionary** dictionary) = 0;                  // 14
    virtual HRESULT GetLastIdentification(IAAFIdentification** identification) = 0;  // 15
    virtual HRESULT LookupIdentification(aafUID_constref generation,
                                         IAAFIdentification** identification) = 0;  // 16
    virtual HRESULT CountIdentifications(aafUInt32* result) = 0;                    // 17
    virtual HRESULT GetIdentifications(IEnumAAFIdentifications** enumerator) = 0;   // 18
    virtual HRESULT AppendIdentification(IAAFIdentification* ident) = 0;            // 19
    virtual HRESULT GetIdentificationAt(aafUInt32 index,
                                        IAAFIdentification** identification) = 0;  // 20
    virtual HRESULT GetRefImplVersion(aafProductVersion_t* version) = 0;           // 21
    virtual HRESULT GetFileRevision(aafVersionType_t* revision) = 0;               // 22
    virtual HRESULT GetLastModified(aafTimeStamp_t* timeStamp) = 0;                // 23
    virtual HRESULT GetContentStorage(IAAFContentStorage** storage) = 0;           // 24

protected:
    ~IAAFHeader() = default;
};

inline constexpr GUID IID_IAAFHeader = ncfGuid("B1A21382-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFHeader*) {
    return IID_IAAFHeader;
}

// Answered by AAFHeader.
struct IAAFHeader2 : IUnknown {
    virtual HRESULT LookupMob(aafMobID_constref mobID, IAAFMob** mob) = 0;                    // 3
    virtual HRESULT CountMobs(aafMobKind_t mobKind, aafNumSlots_t* result) = 0;               // 4
    virtual HRESULT GetMobs(aafSearchCrit_t* searchCriteria, IEnumAAFMobs** enumerator) = 0;  // 5
    virtual HRESULT AddMob(IAAFMob* mob) = 0;                                                 // 6
    virtual HRESULT RemoveMob(IAAFMob* mob) = 0;                                              // 7
    virtual HRESULT CountEssenceData(aafUInt32* result) = 0;                                  // 8
    virtual HRESULT IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt,
                                         aafBoolean_t* result) = 0;         // 9
    virtual HRESULT EnumEssenceData(IEnumAAFEssenceData** enumerator) = 0;  // 10
    virtual HRESULT AddEssenceData(IAAFEssenceData* essenceData) = 0;       // 11
    virtual HRESULT RemoveEssenceData(IAAFEssenceData* essenceData) = 0;    // 12
    virtual HRESULT LookupEssenceData(aafMobID_constref mobID,
                                      IAAFEssenceData** essenceData) = 0;            // 13
    virtual HRESULT GetDictionary(IAAFDictionary** dictionary) = 0;                  // 14
    virtual HRESULT GetLastIdentification(IAAFIdentification** identification) = 0;  // 15
    virtual HRESULT LookupIdentification(aafUID_constref generation,
                                         IAAFIdentification** identification) = 0;  // 16
    virtual HRESULT CountIdentifications(aafUInt32* result) = 0;                    // 17
    virtual HRESULT GetIdentifications(IEnumAAFIdentifications** enumerator) = 0;   // 18
    virtual HRESULT AppendIdentification(IAAFIdentification* ident) = 0;            // 19
    virtual HRESULT GetIdentificationAt(aafUInt32 index,
                                        IAAFIdentification** identification) = 0;     // 20
    virtual HRESULT GetRefImplVersion(aafProductVersion_t* version) = 0;              // 21
    virtual HRESULT GetFileRevision(aafVersionType_t* revision) = 0;                  // 22
    virtual HRESULT GetLastModified(aafTimeStamp_t* timeStamp) = 0;                   // 23
    virtual HRESULT GetContentStorage(IAAFContentStorage** storage) = 0;              // 24
    virtual HRESULT GetPrimaryMob(IAAFMob** primaryMob) = 0;                          // 25
    virtual HRESULT SetPrimaryMob(IAAFMob* primaryMob) = 0;                           // 26
    virtual HRESULT GetOperationalPattern(aafUID_t* operationalPatternID) = 0;        // 27
    virtual HRESULT SetOperationalPattern(aafUID_constref operationalPatternID) = 0;  // 28
    virtual HRESULT UpdateEssenceContainers() = 0;                                    // 29
    virtual HRESULT CountEssenceContainers(aafUInt32* count) = 0;                     // 30
    virtual HRESULT GetEssenceContainers(aafUInt32 maxEssenceContainersCount,
                                         aafUID_t* essenceContainerIDs) = 0;  // 31
    virtual HRESULT IsEssenceContainerPresent(aafUID_constref essenceContainerID,
                                              aafBoolean_t* isPresent) = 0;  // 32
    virtual HRESULT CountDescriptiveSchemes(aafUInt32* count) = 0;           // 33
    virtual HRESULT GetDescriptiveSchemes(aafUInt32 maxDescriptiveSchemesCount,
                                          aafUID_t* descriptiveSchemeIDs) = 0;  // 34
    virtual HRESULT IsDescriptiveSchemePresent(aafUID_constref descriptiveSchemeID,
                                               aafBoolean_t* isPresent) = 0;           // 35
    virtual HRESULT AddDescriptiveScheme(aafUID_constref descriptiveSchemeID) = 0;     // 36
    virtual HRESULT RemoveDescriptiveScheme(aafUID_constref descriptiveSchemeID) = 0;  // 37

protected:
    ~IAAFHeader2() = default;
};

inline constexpr GUID IID_IAAFHeader2 = ncfGuid("463C0CA0-926B-4BE4-84C1-4455FF5628EE");
constexpr const GUID& aafIdOf(const IAAFHeader2*) {
    return IID_IAAFHeader2;
}

// Answered by AAFContentStorage.
struct IAAFContentStorage : IUnknown {
    virtual HRESULT LookupMob(aafMobID_constref mobID, IAAFMob** mob) = 0;                    // 3
    virtual HRESULT CountMobs(aafMobKind_t mobKind, aafNumSlots_t* result) = 0;               // 4
    virtual HRESULT GetMobs(aafSearchCrit_t* searchCriteria, IEnumAAFMobs** enumerator) = 0;  // 5
    virtual HRESULT AddMob(IAAFMob* mob) = 0;                                                 // 6
    virtual HRESULT RemoveMob(IAAFMob* mob) = 0;                                              // 7
    virtual HRESULT CountEssenceData(aafUInt32* result) = 0;                                  // 8
    virtual HRESULT IsEssenceDataPresent(aafMobID_constref fileMobID, aafFileFormat_t fmt,
                                         aafBoolean_t* result) = 0;         // 9
    virtual HRESULT EnumEssenceData(IEnumAAFEssenceData** enumerator) = 0;  // 10
    virtual HRESULT AddEssenceData(IAAFEssenceData* essenceData) = 0;       // 11
    virtual HRESULT RemoveEssenceData(IAAFEssenceData* essenceData) = 0;    // 12
    virtual HRESULT LookupEssenceData(aafMobID_constref mobID,
                                      IAAFEssenceData** essenceData) = 0;  // 13

protected:
    ~IAAFContentStorage() = default;
};

inline constexpr GUID IID_IAAFContentStorage = ncfGuid("54D4C482-5F8B-11D2-8073-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFContentStorage*) {
    return IID_IAAFContentStorage;
}

// Answered by AAFIdentification.
struct IAAFIdentification : IUnknown {
    virtual HRESULT Initialize(aafCharacter_constptr companyName, aafCharacter_constptr productName,
                               aafCharacter_constptr productVersionString,
                               aafUID_constref productID) = 0;                         // 3
    virtual HRESULT GetCompanyName(aafCharacter* companyName, aafUInt32 bufSize) = 0;  // 4
    virtual HRESULT GetCompanyNameBufLen(aafUInt32* bufSize) = 0;                      // 5
    virtual HRESULT GetProductName(aafCharacter* productName, aafUInt32 bufSize) = 0;  // 6
    virtual HRESULT GetProductNameBufLen(aafUInt32* bufSize) = 0;                      // 7
    virtual HRESULT GetProductVersionString(aafCharacter* productVersionString,
                                            aafUInt32 bufSize) = 0;              // 8
    virtual HRESULT GetProductVersionStringBufLen(aafUInt32* bufSize) = 0;       // 9
    virtual HRESULT GetProductVersion(aafProductVersion_t* version) = 0;         // 10
    virtual HRESULT SetProductVersion(aafProductVersion_constref version) = 0;   // 11
    virtual HRESULT GetProductID(aafUID_t* productID) = 0;                       // 12
    virtual HRESULT GetDate(aafTimeStamp_t* timestamp) = 0;                      // 13
    virtual HRESULT GetRefImplVersion(aafProductVersion_t* version) = 0;         // 14
    virtual HRESULT GetPlatform(aafCharacter* platform, aafUInt32 bufSize) = 0;  // 15
    virtual HRESULT GetPlatformBufLen(aafUInt32* bufSize) = 0;                   // 16
    virtual HRESULT GetGenerationID(aafUID_t* generation) = 0;                   // 17

protected:
    ~IAAFIdentification() = default;
};

inline constexpr GUID IID_IAAFIdentification = ncfGuid("B1A2137E-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFIdentification*) {
    return IID_IAAFIdentification;
}

// Answered by EnumAAFIdentifications.
struct IEnumAAFIdentifications : IUnknown {
    virtual HRESULT NextOne(IAAFIdentification** identification) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFIdentification** identifications,
                         aafUInt32* numFetched) = 0;                  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                        // 5
    virtual HRESULT Reset() = 0;                                      // 6
    virtual HRESULT Clone(IEnumAAFIdentifications** enumerator) = 0;  // 7

protected:
    ~IEnumAAFIdentifications() = default;
};

inline constexpr GUID IID_IEnumAAFIdentifications = ncfGuid("B1A21384-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFIdentifications*) {
    return IID_IEnumAAFIdentifications;
}

// Answered by AAFHeader.
struct IAAFEndian : IUnknown {
    virtual HRESULT GetStoredByteOrder(eAAFByteOrder_t* order) = 0;  // 3
    virtual HRESULT GetNativeByteOrder(eAAFByteOrder_t* order) = 0;  // 4

protected:
    ~IAAFEndian() = default;
};

inline constexpr GUID IID_IAAFEndian = ncfGuid("6BACC0C1-6091-11D2-841B-00600832ACB8");
constexpr const GUID& aafIdOf(const IAAFEndian*) {
    return IID_IAAFEndian;
}

// Answered by AAFCachePageAllocator.
struct IAAFCachePageAllocator : IUnknown {
    virtual HRESULT Initialize(aafUInt32 pageCount, aafUInt32 pageSize) = 0;  // 3
    virtual HRESULT Allocate(aafMemPtr_t* page) = 0;                          // 4
    virtual HRESULT Deallocate(aafMemPtr_t page) = 0;                         // 5

protected:
    ~IAAFCachePageAllocator() = default;
};

inline constexpr GUID IID_IAAFCachePageAllocator = ncfGuid("23630652-56E9-4A17-AC31-796FE6E26E80");
constexpr const GUID& aafIdOf(const IAAFCachePageAllocator*) {
    return IID_IAAFCachePageAllocator;
}

// Answered by none of the SDK (callback that a caller supplies).
struct IAAFDiagnosticOutput : IUnknown {
    virtual HRESULT PutString(aafCharacter_constptr string) = 0;  // 3

protected:
    ~IAAFDiagnosticOutput() = default;
};

inline constexpr GUID IID_IAAFDiagnosticOutput = ncfGuid("C9346826-1CFE-4AEF-BA4D-54D414138739");
constexpr const GUID& aafIdOf(const IAAFDiagnosticOutput*) {
    return IID_IAAFDiagnosticOutput;
}

// Answered by AAFFileEncoding.
struct IAAFFileEncoding : IUnknown {
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                // 3
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                             // 4
    virtual HRESULT GetDescription(aafCharacter* description, aafUInt32 bufSize) = 0;  // 5
    virtual HRESULT GetDescriptionBufLen(aafUInt32* bufSize) = 0;                      // 6
    virtual HRESULT GetFileKind(aafUID_t* fileKind) = 0;                               // 7

protected:
    ~IAAFFileEncoding() = default;
};

inline constexpr GUID IID_IAAFFileEncoding = ncfGuid("56904725-A95C-40F4-A746-8754E7D16F6D");
constexpr const GUID& aafIdOf(const IAAFFileEncoding*) {
    return IID_IAAFFileEncoding;
}

// Answered by AAFGetFileBits.
struct IAAFGetFileBits : IUnknown {
    virtual HRESULT ReadAt(aafMemPtr_t buf, aafUInt32 bufSize, aafUInt64 position) = 0;  // 3
    virtual HRESULT GetSize(aafUInt64* size) = 0;                                        // 4

protected:
    ~IAAFGetFileBits() = default;
};

inline constexpr GUID IID_IAAFGetFileBits = ncfGuid("3CC80282-72A8-11D4-B80D-0000863F2C27");
constexpr const GUID& aafIdOf(const IAAFGetFileBits*) {
    return IID_IAAFGetFileBits;
}

// Answered by none of the SDK (callback that a caller supplies).
struct IAAFProgress : IUnknown {
    virtual HRESULT ProgressCallback() = 0;  // 3

protected:
    ~IAAFProgress() = default;
};

inline constexpr GUID IID_IAAFProgress = ncfGuid("8E7B0F14-A759-416A-98FD-346242D5081F");
constexpr const GUID& aafIdOf(const IAAFProgress*) {
    return IID_IAAFProgress;
}

// Answered by AAFRandomFile.
struct IAAFRandomFile : IUnknown {
    virtual HRESULT GetFileBits(IAAFGetFileBits** getFileBits) = 0;  // 3
    virtual HRESULT Revert() = 0;                                    // 4
    virtual HRESULT SaveAsFile(IAAFFile* destFile) = 0;              // 5
    virtual HRESULT SetFileBits(IAAFSetFileBits** setFileBits) = 0;  // 6

protected:
    ~IAAFRandomFile() = default;
};

inline constexpr GUID IID_IAAFRandomFile = ncfGuid("3CC80284-72A8-11D4-B80D-0000863F2C27");
constexpr const GUID& aafIdOf(const IAAFRandomFile*) {
    return IID_IAAFRandomFile;
}

// Answered by AAFRandomRawStorage.
struct IAAFRandomRawStorage : IUnknown {
    virtual HRESULT ReadAt(aafUInt64 position, aafMemPtr_t buf, aafUInt32 bufSize,
                           aafUInt32* numRead) = 0;  // 3
    virtual HRESULT WriteAt(aafUInt64 position, aafMemConstPtr_t buf, aafUInt32 bufSize,
                            aafUInt32* numWritten) = 0;      // 4
    virtual HRESULT GetSize(aafUInt64* size) = 0;            // 5
    virtual HRESULT IsExtendable(aafBoolean_t* result) = 0;  // 6
    virtual HRESULT GetExtent(aafUInt64* extent) = 0;        // 7
    virtual HRESULT SetExtent(aafUInt64 extent) = 0;         // 8

protected:
    ~IAAFRandomRawStorage() = default;
};

inline constexpr GUID IID_IAAFRandomRawStorage = ncfGuid("B1341782-71FE-11D4-B80D-0000863F2C27");
constexpr const GUID& aafIdOf(const IAAFRandomRawStorage*) {
    return IID_IAAFRandomRawStorage;
}

// Answered by AAFRawStorage.
struct IAAFRawStorage : IUnknown {
    virtual HRESULT IsReadable(aafBoolean_t* result) = 0;                                       // 3
    virtual HRESULT Read(aafMemPtr_t buf, aafUInt32 bufSize, aafUInt32* numRead) = 0;           // 4
    virtual HRESULT IsWriteable(aafBoolean_t* result) = 0;                                      // 5
    virtual HRESULT Write(aafMemConstPtr_t buf, aafUInt32 bufSize, aafUInt32* numWritten) = 0;  // 6
    virtual HRESULT Synchronize() = 0;                                                          // 7

protected:
    ~IAAFRawStorage() = default;
};

inline constexpr GUID IID_IAAFRawStorage = ncfGuid("F45FA9E1-7166-11D4-B80D-0000863F2C27");
constexpr const GUID& aafIdOf(const IAAFRawStorage*) {
    return IID_IAAFRawStorage;
}

// Answered by AAFSetFileBits.
struct IAAFSetFileBits : IUnknown {
    virtual HRESULT WriteAt(aafMemPtr_t buf, aafUInt32 bufSize, aafUInt64 position) = 0;  // 3
    virtual HRESULT SetSize(aafUInt64 size) = 0;                                          // 4

protected:
    ~IAAFSetFileBits() = default;
};

inline constexpr GUID IID_IAAFSetFileBits = ncfGuid("6D950762-8DB4-11D4-B80D-0000863F2C27");
constexpr const GUID& aafIdOf(const IAAFSetFileBits*) {
    return IID_IAAFSetFileBits;
}

// Answered by EnumAAFFileEncodings.
struct IEnumAAFFileEncodings : IUnknown {
    virtual HRESULT NextOne(IAAFFileEncoding** fileEncodings) = 0;  // 3
    virtual HRESULT Next(aafUInt32 count, IAAFFileEncoding** fileEncodings,
                         aafUInt32* numFetched) = 0;                // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                      // 5
    virtual HRESULT Reset() = 0;                                    // 6
    virtual HRESULT Clone(IEnumAAFFileEncodings** enumerator) = 0;  // 7

protected:
    ~IEnumAAFFileEncodings() = default;
};

inline constexpr GUID IID_IEnumAAFFileEncodings = ncfGuid("6173C2CF-9A7A-4FF1-A8FC-BE0819AEA2DE");
constexpr const GUID& aafIdOf(const IEnumAAFFileEncodings*) {
    return IID_IEnumAAFFileEncodings;
}
