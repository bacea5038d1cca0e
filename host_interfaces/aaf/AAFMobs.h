// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Mobs and their slots.

struct IAAFDataDef;
struct IAAFEssenceAccess;
struct IAAFEssenceDescriptor;
struct IAAFEssenceMultiAccess;
struct IAAFEventMobSlot;
struct IAAFFile;
struct IAAFFindSourceInfo;
struct IAAFKLVData;
struct IAAFLocator;
struct IAAFMob;
struct IAAFMobSlot;
struct IAAFSegment;
struct IAAFSourceMob;
struct IAAFStaticMobSlot;
struct IAAFTaggedValue;
struct IAAFTimelineMobSlot;
struct IEnumAAFKLVData;
struct IEnumAAFMobSlots;
struct IEnumAAFMobs;
struct IEnumAAFTaggedValues;

// Answered by AAFMob.
struct IAAFMob : IUnknown {
    virtual HRESULT GetMobID(aafMobID_t* mobID) = 0;                                           // 3
    virtual HRESULT SetMobID(aafMobID_constref mobID) = 0;                                     // 4
    virtual HRESULT SetName(aafCharacter_constptr name) = 0;                                   // 5
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                        // 6
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                                     // 7
    virtual HRESULT CountSlots(aafNumSlots_t* numSlots) = 0;                                   // 8
    virtual HRESULT AppendSlot(IAAFMobSlot* slot) = 0;                                         // 9
    virtual HRESULT PrependSlot(IAAFMobSlot* slot) = 0;                                        // 10
    virtual HRESULT InsertSlotAt(aafUInt32 index, IAAFMobSlot* slot) = 0;                      // 11
    virtual HRESULT RemoveSlotAt(aafUInt32 index) = 0;                                         // 12
    virtual HRESULT GetSlotAt(aafUInt32 index, IAAFMobSlot** slot) = 0;                        // 13
    virtual HRESULT GetSlots(IEnumAAFMobSlots** enumerator) = 0;                               // 14
    virtual HRESULT GetModTime(aafTimeStamp_t* lastModified) = 0;                              // 15
    virtual HRESULT SetModTime(aafTimeStamp_constref modTime) = 0;                             // 16
    virtual HRESULT GetCreateTime(aafTimeStamp_t* creationTime) = 0;                           // 17
    virtual HRESULT SetCreateTime(aafTimeStamp_constref createTime) = 0;                       // 18
    virtual HRESULT AppendComment(aafCharacter* category, aafCharacter_constptr comment) = 0;  // 19
    virtual HRESULT CountComments(aafUInt32* numComments) = 0;                                 // 20
    virtual HRESULT GetComments(IEnumAAFTaggedValues** enumerator) = 0;                        // 21
    virtual HRESULT RemoveComment(IAAFTaggedValue* comment) = 0;                               // 22
    virtual HRESULT AppendNewTimelineSlot(aafRational_t editRate, IAAFSegment* segment,
                                          aafSlotID_t slotID, aafCharacter_constptr slotName,
                                          aafPosition_t origin,
                                          IAAFTimelineMobSlot** newSlot) = 0;  // 23
    virtual HRESULT GetMobInfo(aafTimeStamp_t* lastModified, aafTimeStamp_t* creationTime,
                               aafCharacter* name, aafInt32 bufSize) = 0;  // 24
    virtual HRESULT OffsetToMobTimecode(IAAFSegment* tcSeg, aafPosition_t* offset,
                                        aafTimecode_t* result) = 0;                         // 25
    virtual HRESULT LookupSlot(aafSlotID_t slotId, IAAFMobSlot** destSlot) = 0;             // 26
    virtual HRESULT ChangeRef(aafMobID_constref oldMobID, aafMobID_constref newMobID) = 0;  // 27
    virtual HRESULT CloneExternal(aafDepend_t resolveDependencies, aafIncMedia_t includeMedia,
                                  IAAFFile* destFile, IAAFMob** destMob) = 0;        // 28
    virtual HRESULT Copy(aafCharacter_constptr destMobName, IAAFMob** destMob) = 0;  // 29
    virtual HRESULT AppendKLVData(IAAFKLVData* data) = 0;                            // 30
    virtual HRESULT CountKLVData(aafUInt32* numData) = 0;                            // 31
    virtual HRESULT GetKLVData(IEnumAAFKLVData** enumerator) = 0;                    // 32
    virtual HRESULT RemoveKLVData(IAAFKLVData* data) = 0;                            // 33

protected:
    ~IAAFMob() = default;
};

inline constexpr GUID IID_IAAFMob = ncfGuid("B1A21374-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFMob*) {
    return IID_IAAFMob;
}

// Answered by AAFMob.
struct IAAFMob2 : IUnknown {
    virtual HRESULT GetMobID(aafMobID_t* mobID) = 0;                                           // 3
    virtual HRESULT SetMobID(aafMobID_constref mobID) = 0;                                     // 4
    virtual HRESULT SetName(aafCharacter_constptr name) = 0;                                   // 5
    virtual HRESULT GetName(aafCharacter* name, aafUInt32 bufSize) = 0;                        // 6
    virtual HRESULT GetNameBufLen(aafUInt32* bufSize) = 0;                                     // 7
    virtual HRESULT CountSlots(aafNumSlots_t* numSlots) = 0;                                   // 8
    virtual HRESULT AppendSlot(IAAFMobSlot* slot) = 0;                                         // 9
    virtual HRESULT PrependSlot(IAAFMobSlot* slot) = 0;                                        // 10
    virtual HRESULT InsertSlotAt(aafUInt32 index, IAAFMobSlot* slot) = 0;                      // 11
    virtual HRESULT RemoveSlotAt(aafUInt32 index) = 0;                                         // 12
    virtual HRESULT GetSlotAt(aafUInt32 index, IAAFMobSlot** slot) = 0;                        // 13
    virtual HRESULT GetSlots(IEnumAAFMobSlots** enumerator) = 0;                               // 14
    virtual HRESULT GetModTime(aafTimeStamp_t* lastModified) = 0;                              // 15
    virtual HRESULT SetModTime(aafTimeStamp_constref modTime) = 0;                             // 16
    virtual HRESULT GetCreateTime(aafTimeStamp_t* creationTime) = 0;                           // 17
    virtual HRESULT SetCreateTime(aafTimeStamp_constref createTime) = 0;                       // 18
    virtual HRESULT AppendComment(aafCharacter* category, aafCharacter_constptr comment) = 0;  // 19
    virtual HRESULT CountComments(aafUInt32* numComments) = 0;                                 // 20
    virtual HRESULT GetComments(IEnumAAFTaggedValues** enumerator) = 0;                        // 21
    virtual HRESULT RemoveComment(IAAFTaggedValue* comment) = 0;                               // 22
    virtual HRESULT AppendNewTimelineSlot(aafRational_t editRate, IAAFSegment* segment,
                                          aafSlotID_t slotID, aafCharacter_constptr slotName,
                                          aafPosition_t origin,
                                          IAAFTimelineMobSlot** newSlot) = 0;  // 23
    virtual HRESULT GetMobInfo(aafTimeStamp_t* lastModified, aafTimeStamp_t* creationTime,
                               aafCharacter* name, aafInt32 bufSize) = 0;  // 24
    virtual HRESULT OffsetToMobTimecode(IAAFSegment* tcSeg, aafPosition_t* offset,
                                        aafTimecode_t* result) = 0;                         // 25
    virtual HRESULT LookupSlot(aafSlotID_t slotId, IAAFMobSlot** destSlot) = 0;             // 26
    virtual HRESULT ChangeRef(aafMobID_constref oldMobID, aafMobID_constref newMobID) = 0;  // 27
    virtual HRESULT CloneExternal(aafDepend_t resolveDependencies, aafIncMedia_t includeMedia,
                                  IAAFFile* destFile, IAAFMob** destMob) = 0;        // 28
    virtual HRESULT Copy(aafCharacter_constptr destMobName, IAAFMob** destMob) = 0;  // 29
    virtual HRESULT AppendKLVData(IAAFKLVData* data) = 0;                            // 30
    virtual HRESULT CountKLVData(aafUInt32* numData) = 0;                            // 31
    virtual HRESULT GetKLVData(IEnumAAFKLVData** enumerator) = 0;                    // 32
    virtual HRESULT RemoveKLVData(IAAFKLVData* data) = 0;                            // 33
    virtual HRESULT AppendAttribute(aafCharacter_constptr name,
                                    aafCharacter_constptr value) = 0;      // 34
    virtual HRESULT CountAttributes(aafUInt32* numAttributes) = 0;         // 35
    virtual HRESULT GetAttributes(IEnumAAFTaggedValues** enumerator) = 0;  // 36
    virtual HRESULT RemoveAttribute(IAAFTaggedValue* attribute) = 0;       // 37
    virtual HRESULT SetUsageCode(aafUID_constref usageCode) = 0;           // 38
    virtual HRESULT GetUsageCode(aafUID_t* usageCode) = 0;                 // 39
    virtual HRESULT AppendNewStaticSlot(IAAFSegment* segment, aafSlotID_t slotID,
                                        aafCharacter_constptr slotName,
                                        IAAFStaticMobSlot** newSlot) = 0;  // 40
    virtual HRESULT AppendNewEventSlot(aafRational_t editRate, IAAFSegment* segment,
                                       aafSlotID_t slotID, aafCharacter_constptr slotName,
                                       aafPosition_t origin,
                                       IAAFEventMobSlot** newSlot) = 0;  // 41

protected:
    ~IAAFMob2() = default;
};

inline constexpr GUID IID_IAAFMob2 = ncfGuid("A94FDB8B-451F-4D62-AC17-16950344832E");
constexpr const GUID& aafIdOf(const IAAFMob2*) {
    return IID_IAAFMob2;
}

// Answered by AAFMasterMob.
struct IAAFMasterMob : IUnknown {
    virtual HRESULT Initialize() = 0;  // 3
    virtual HRESULT AddMasterSlot(IAAFDataDef* dataDef, aafSlotID_t sourceSlotID,
                                  IAAFSourceMob* sourceMob, aafSlotID_t masterSlotID,
                                  aafCharacter_constptr slotName) = 0;  // 4
    virtual HRESULT GetTapeName(aafUInt32 masterSlotID, aafCharacter* tapeName,
                                aafUInt32 bufSize) = 0;                                     // 5
    virtual HRESULT GetTapeNameBufLen(aafUInt32 masterSlotID, aafUInt32* len) = 0;          // 6
    virtual HRESULT GetNumRepresentations(aafSlotID_t slotID, aafNumSlots_t* numReps) = 0;  // 7
    virtual HRESULT GetRepresentation(aafSlotID_t slotID, aafUInt32 index,
                                      IAAFSegment** sourceClip) = 0;  // 8
    virtual HRESULT GetCriteriaSegment(aafSlotID_t slotID, aafMediaCriteria_t* criteria,
                                       IAAFSegment** segment) = 0;  // 9
    virtual HRESULT AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                        IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                        aafLength_t srcRefLength) = 0;  // 10
    virtual HRESULT NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                     IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                     aafLength_t srcRefLength) = 0;  // 11
    virtual HRESULT CreateEssence(aafSlotID_t masterSlotID, IAAFDataDef* mediaKind,
                                  aafUID_constref codecID, aafRational_t editRate,
                                  aafRational_t samplerate, aafCompressEnable_t enable,
                                  IAAFLocator* destination, aafUID_constref fileFormat,
                                  IAAFEssenceAccess** access) = 0;  // 12
    virtual HRESULT CreateMultiEssence(aafUID_constref codecID, aafUInt16 arrayElemCount,
                                       aafmMultiCreate_t* mediaArray, aafCompressEnable_t enable,
                                       IAAFLocator* destination, aafUID_constref fileFormat,
                                       IAAFEssenceMultiAccess** access) = 0;  // 13
    virtual HRESULT OpenEssence(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit,
                                aafMediaOpenMode_t openMode, aafCompressEnable_t compEnable,
                                IAAFEssenceAccess** access) = 0;  // 14
    virtual HRESULT OpenMultiEssence(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit,
                                     aafMediaOpenMode_t openMode, aafCompressEnable_t compEnable,
                                     IAAFEssenceMultiAccess** access) = 0;  // 15
    virtual HRESULT CountChannels(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit,
                                  IAAFDataDef* mediaKind, aafUInt16* numCh) = 0;  // 16

protected:
    ~IAAFMasterMob() = default;
};

inline constexpr GUID IID_IAAFMasterMob = ncfGuid("B1A21372-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFMasterMob*) {
    return IID_IAAFMasterMob;
}

// Answered by AAFMasterMob.
struct IAAFMasterMob2 : IUnknown {
    virtual HRESULT Initialize() = 0;  // 3
    virtual HRESULT AddMasterSlot(IAAFDataDef* dataDef, aafSlotID_t sourceSlotID,
                                  IAAFSourceMob* sourceMob, aafSlotID_t masterSlotID,
                                  aafCharacter_constptr slotName) = 0;  // 4
    virtual HRESULT GetTapeName(aafUInt32 masterSlotID, aafCharacter* tapeName,
                                aafUInt32 bufSize) = 0;                                     // 5
    virtual HRESULT GetTapeNameBufLen(aafUInt32 masterSlotID, aafUInt32* len) = 0;          // 6
    virtual HRESULT GetNumRepresentations(aafSlotID_t slotID, aafNumSlots_t* numReps) = 0;  // 7
    virtual HRESULT GetRepresentation(aafSlotID_t slotID, aafUInt32 index,
                                      IAAFSegment** sourceClip) = 0;  // 8
    virtual HRESULT GetCriteriaSegment(aafSlotID_t slotID, aafMediaCriteria_t* criteria,
                                       IAAFSegment** segment) = 0;  // 9
    virtual HRESULT AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                        IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                        aafLength_t srcRefLength) = 0;  // 10
    virtual HRESULT NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                     IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                     aafLength_t srcRefLength) = 0;  // 11
    virtual HRESULT CreateEssence(aafSlotID_t masterSlotID, IAAFDataDef* mediaKind,
                                  aafUID_constref codecID, aafRational_t editRate,
                                  aafRational_t samplerate, aafCompressEnable_t enable,
                                  IAAFLocator* destination, aafUID_constref fileFormat,
                                  IAAFEssenceAccess** access) = 0;  // 12
    virtual HRESULT CreateMultiEssence(aafUID_constref codecID, aafUInt16 arrayElemCount,
                                       aafmMultiCreate_t* mediaArray, aafCompressEnable_t enable,
                                       IAAFLocator* destination, aafUID_constref fileFormat,
                                       IAAFEssenceMultiAccess** access) = 0;  // 13
    virtual HRESULT OpenEssence(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit,
                                aafMediaOpenMode_t openMode, aafCompressEnable_t compEnable,
                                IAAFEssenceAccess** access) = 0;  // 14
    virtual HRESULT OpenMultiEssence(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit,
                                     aafMediaOpenMode_t openMode, aafCompressEnable_t compEnable,
                                     IAAFEssenceMultiAccess** access) = 0;  // 15
    virtual HRESULT CountChannels(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit,
                                  IAAFDataDef* mediaKind, aafUInt16* numCh) = 0;  // 16
    virtual HRESULT ExtendEssence(aafSlotID_t masterSlotID, IAAFDataDef* mediaKind,
                                  aafUID_constref codecID, aafRational_t editRate,
                                  aafRational_t samplerate, aafCompressEnable_t enable,
                                  IAAFLocator* destination, aafUID_constref fileFormat,
                                  IAAFEssenceAccess** access) = 0;  // 17
    virtual HRESULT ExtendMultiEssence(aafUID_constref codecID, aafUInt16 arrayElemCount,
                                       aafmMultiCreate_t* mediaArray, aafCompressEnable_t enable,
                                       IAAFLocator* destination, aafUID_constref fileFormat,
                                       IAAFEssenceMultiAccess** access) = 0;  // 18
    virtual HRESULT CreateStaticEssence(aafSlotID_t masterSlotID, IAAFDataDef* mediaKind,
                                        aafUID_constref codecID, aafCompressEnable_t enable,
                                        IAAFLocator* destination, aafUID_constref fileFormat,
                                        IAAFEssenceAccess** access) = 0;  // 19
    virtual HRESULT CreateEventEssence(aafSlotID_t masterSlotID, IAAFDataDef* mediaKind,
                                       aafUID_constref codecID, aafRational_t editRate,
                                       aafRational_t samplerate, aafCompressEnable_t enable,
                                       IAAFLocator* destination, aafUID_constref fileFormat,
                                       IAAFEssenceAccess** access) = 0;  // 20

protected:
    ~IAAFMasterMob2() = default;
};

inline constexpr GUID IID_IAAFMasterMob2 = ncfGuid("AFCFFD2C-279B-466F-A496-55CBDCC17531");
constexpr const GUID& aafIdOf(const IAAFMasterMob2*) {
    return IID_IAAFMasterMob2;
}

// Answered by AAFMasterMob.
struct IAAFMasterMob3 : IUnknown {
    virtual HRESULT Initialize() = 0;  // 3
    virtual HRESULT AddMasterSlot(IAAFDataDef* dataDef, aafSlotID_t sourceSlotID,
                                  IAAFSourceMob* sourceMob, aafSlotID_t masterSlotID,
                                  aafCharacter_constptr slotName) = 0;  // 4
    virtual HRESULT GetTapeName(aafUInt32 masterSlotID, aafCharacter* tapeName,
                                aafUInt32 bufSize) = 0;                                     // 5
    virtual HRESULT GetTapeNameBufLen(aafUInt32 masterSlotID, aafUInt32* len) = 0;          // 6
    virtual HRESULT GetNumRepresentations(aafSlotID_t slotID, aafNumSlots_t* numReps) = 0;  // 7
    virtual HRESULT GetRepresentation(aafSlotID_t slotID, aafUInt32 index,
                                      IAAFSegment** sourceClip) = 0;  // 8
    virtual HRESULT GetCriteriaSegment(aafSlotID_t slotID, aafMediaCriteria_t* criteria,
                                       IAAFSegment** segment) = 0;  // 9
    virtual HRESULT AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                        IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                        aafLength_t srcRefLength) = 0;  // 10
    virtual HRESULT NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                     IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                     aafLength_t srcRefLength) = 0;  // 11
    virtual HRESULT CreateEssence(aafSlotID_t masterSlotID, IAAFDataDef* mediaKind,
                                  aafUID_constref codecID, aafRational_t editRate,
                                  aafRational_t samplerate, aafCompressEnable_t enable,
                                  IAAFLocator* destination, aafUID_constref fileFormat,
                                  IAAFEssenceAccess** access) = 0;  // 12
    virtual HRESULT CreateMultiEssence(aafUID_constref codecID, aafUInt16 arrayElemCount,
                                       aafmMultiCreate_t* mediaArray, aafCompressEnable_t enable,
                                       IAAFLocator* destination, aafUID_constref fileFormat,
                                       IAAFEssenceMultiAccess** access) = 0;  // 13
    virtual HRESULT OpenEssence(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit,
                                aafMediaOpenMode_t openMode, aafCompressEnable_t compEnable,
                                IAAFEssenceAccess** access) = 0;  // 14
    virtual HRESULT OpenMultiEssence(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit,
                                     aafMediaOpenMode_t openMode, aafCompressEnable_t compEnable,
                                     IAAFEssenceMultiAccess** access) = 0;  // 15
    virtual HRESULT CountChannels(aafSlotID_t slotID, aafMediaCriteria_t* mediaCrit,
                                  IAAFDataDef* mediaKind, aafUInt16* numCh) = 0;  // 16
    virtual HRESULT ExtendEssence(aafSlotID_t masterSlotID, IAAFDataDef* mediaKind,
                                  aafUID_constref codecID, aafRational_t editRate,
                                  aafRational_t samplerate, aafCompressEnable_t enable,
                                  IAAFLocator* destination, aafUID_constref fileFormat,
                                  IAAFEssenceAccess** access) = 0;  // 17
    virtual HRESULT ExtendMultiEssence(aafUID_constref codecID, aafUInt16 arrayElemCount,
                                       aafmMultiCreate_t* mediaArray, aafCompressEnable_t enable,
                                       IAAFLocator* destination, aafUID_constref fileFormat,
                                       IAAFEssenceMultiAccess** access) = 0;  // 18
    virtual HRESULT CreateStaticEssence(aafSlotID_t masterSlotID, IAAFDataDef* mediaKind,
                                        aafUID_constref codecID, aafCompressEnable_t enable,
                                        IAAFLocator* destination, aafUID_constref fileFormat,
                                        IAAFEssenceAccess** access) = 0;  // 19
    virtual HRESULT CreateEventEssence(aafSlotID_t masterSlotID, IAAFDataDef* mediaKind,
                                       aafUID_constref codecID, aafRational_t editRate,
                                       aafRational_t samplerate, aafCompressEnable_t enable,
                                       IAAFLocator* destination, aafUID_constref fileFormat,
                                       IAAFEssenceAccess** access) = 0;  // 20
    virtual HRESULT AddMasterSlotWithSequence(IAAFDataDef* dataDef, aafSlotID_t sourceSlotID,
                                              IAAFSourceMob* sourceMob, aafSlotID_t masterSlotID,
                                              aafCharacter_constptr slotName) = 0;  // 21

protected:
    ~IAAFMasterMob3() = default;
};

inline constexpr GUID IID_IAAFMasterMob3 = ncfGuid("988AF5AC-57D8-47B7-9B0F-239971161939");
constexpr const GUID& aafIdOf(const IAAFMasterMob3*) {
    return IID_IAAFMasterMob3;
}

// Answered by AAFMasterMob.
struct IAAFMasterMobEx : IUnknown {
    virtual HRESULT ExtendEssence(aafSlotID_t masterSlotID, IAAFDataDef* mediaKind,
                                  aafUID_constref codecID, aafRational_t editRate,
                                  aafRational_t samplerate, aafCompressEnable_t enable,
                                  IAAFLocator* destination, aafUID_constref fileFormat,
                                  IAAFEssenceAccess** access) = 0;  // 3
    virtual HRESULT ExtendMultiEssence(aafUID_constref codecID, aafUInt16 arrayElemCount,
                                       aafmMultiCreate_t* mediaArray, aafCompressEnable_t enable,
                                       IAAFLocator* destination, aafUID_constref fileFormat,
                                       IAAFEssenceMultiAccess** access) = 0;  // 4

protected:
    ~IAAFMasterMobEx() = default;
};

inline constexpr GUID IID_IAAFMasterMobEx = ncfGuid("B1A21370-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFMasterMobEx*) {
    return IID_IAAFMasterMobEx;
}

// Answered by AAFSourceMob.
struct IAAFSourceMob : IUnknown {
    virtual HRESULT Initialize() = 0;                                           // 3
    virtual HRESULT GetEssenceDescriptor(IAAFEssenceDescriptor** essence) = 0;  // 4
    virtual HRESULT SetEssenceDescriptor(IAAFEssenceDescriptor* essence) = 0;   // 5
    virtual HRESULT AddNilReference(aafSlotID_t slotID, aafLength_t length, IAAFDataDef* dataDef,
                                    aafRational_t editRate) = 0;  // 6
    virtual HRESULT AppendTimecodeSlot(aafRational_t editrate, aafInt32 slotID,
                                       aafTimecode_t startTC,
                                       aafFrameLength_t length32) = 0;  // 7
    virtual HRESULT AppendEdgecodeSlot(aafRational_t editrate, aafInt32 slotID,
                                       aafFrameOffset_t startEC, aafFrameLength_t length32,
                                       aafFilmType_t filmKind, aafEdgeType_t codeFormat,
                                       aafEdgecodeHeader_t header) = 0;  // 8
    virtual HRESULT SpecifyValidCodeRange(IAAFDataDef* essenceKind, aafSlotID_t slotID,
                                          aafRational_t editrate, aafFrameOffset_t startOffset,
                                          aafFrameLength_t length32) = 0;  // 9
    virtual HRESULT AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                        IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                        aafLength_t srcRefLength) = 0;  // 10
    virtual HRESULT NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                     IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                     aafLength_t srcRefLength) = 0;  // 11
    virtual HRESULT AddPulldownRef(aafAppendOption_t addType, aafRational_t editrate,
                                   aafSlotID_t aMobSlot, IAAFDataDef* essenceKind,
                                   aafSourceRef_t ref, aafLength_t srcRefLength,
                                   aafPulldownKind_t pulldownKind, aafPhaseFrame_t phaseFrame,
                                   aafPulldownDir_t direction) = 0;  // 12

protected:
    ~IAAFSourceMob() = default;
};

inline constexpr GUID IID_IAAFSourceMob = ncfGuid("B1A2137C-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IAAFSourceMob*) {
    return IID_IAAFSourceMob;
}

// Answered by AAFMasterMob, AAFSourceMob.
struct IAAFSearchSource : IUnknown {
    virtual HRESULT SearchSource(aafSlotID_t slotID, aafPosition_t offset, aafMobKind_t mobKind,
                                 aafMediaCriteria_t* mediaCrit,
                                 aafOperationChoice_t* operationChoice,
                                 IAAFFindSourceInfo** sourceInfo) = 0;  // 3

protected:
    ~IAAFSearchSource() = default;
};

inline constexpr GUID IID_IAAFSearchSource = ncfGuid("332CBDD0-5425-11D2-AA7A-10003D000000");
constexpr const GUID& aafIdOf(const IAAFSearchSource*) {
    return IID_IAAFSearchSource;
}

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

// Answered by EnumAAFMobs.
struct IEnumAAFMobs : IUnknown {
    virtual HRESULT NextOne(IAAFMob** mob) = 0;                                        // 3
    virtual HRESULT Next(aafUInt32 count, IAAFMob** mobs, aafUInt32* numFetched) = 0;  // 4
    virtual HRESULT Skip(aafUInt32 count) = 0;                                         // 5
    virtual HRESULT Reset() = 0;                                                       // 6
    virtual HRESULT Clone(IEnumAAFMobs** enumerator) = 0;                              // 7

protected:
    ~IEnumAAFMobs() = default;
};

inline constexpr GUID IID_IEnumAAFMobs = ncfGuid("B1A21386-1A7D-11D2-BF78-00104BC9156D");
constexpr const GUID& aafIdOf(const IEnumAAFMobs*) {
    return IID_IEnumAAFMobs;
}

// Answered by AAFFindSourceInfo.
struct IAAFFindSourceInfo : IUnknown {
    virtual HRESULT GetMob(IAAFMob** mob) = 0;                          // 3
    virtual HRESULT GetSourceReference(aafSourceRef_t* sourceRef) = 0;  // 4
    virtual HRESULT GetLength(aafLength_t* length) = 0;                 // 5
    virtual HRESULT GetEditRate(aafRational_t* editRate) = 0;           // 6

protected:
    ~IAAFFindSourceInfo() = default;
};

inline constexpr GUID IID_IAAFFindSourceInfo = ncfGuid("9346ACD1-2713-11D2-8035-006008143E6F");
constexpr const GUID& aafIdOf(const IAAFFindSourceInfo*) {
    return IID_IAAFFindSourceInfo;
}

// Answered by AAFCompositionMob.
struct IAAFCompositionMob : IUnknown {
    virtual HRESULT Initialize(aafCharacter_constptr name) = 0;    // 3
    virtual HRESULT GetDefaultFade(aafDefaultFade_t* result) = 0;  // 4
    virtual HRESULT SetDefaultFade(aafLength_t fadeLength, aafFadeType_t fadeType,
                                   aafRational_t fadeEditUnit) = 0;  // 5

protected:
    ~IAAFCompositionMob() = default;
};

inline constexpr GUID IID_IAAFCompositionMob = ncfGuid("91920D63-2A2E-11D2-BFA3-006097116212");
constexpr const GUID& aafIdOf(const IAAFCompositionMob*) {
    return IID_IAAFCompositionMob;
}

// Answered by AAFCompositionMob.
struct IAAFCompositionMob2 : IUnknown {
    virtual HRESULT Initialize(aafCharacter_constptr name) = 0;    // 3
    virtual HRESULT GetDefaultFade(aafDefaultFade_t* result) = 0;  // 4
    virtual HRESULT SetDefaultFade(aafLength_t fadeLength, aafFadeType_t fadeType,
                                   aafRational_t fadeEditUnit) = 0;  // 5
    virtual HRESULT SetRendering(aafMobID_constref mobID) = 0;       // 6
    virtual HRESULT GetRendering(aafMobID_t* mobID) = 0;             // 7

protected:
    ~IAAFCompositionMob2() = default;
};

inline constexpr GUID IID_IAAFCompositionMob2 = ncfGuid("188A82C7-0D87-4AF3-89E0-5F96E56FF9DE");
constexpr const GUID& aafIdOf(const IAAFCompositionMob2*) {
    return IID_IAAFCompositionMob2;
}
