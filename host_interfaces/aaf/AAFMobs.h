// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Mobs: things with an identity, such as a clip, a file or a tape; and how they are
// found. A mob that was added to a file's header belongs to the file. The module makes
// a master, a file and a source mob for each clip; the host lists, prints and copies
// them.

struct IAAFDataDef;
struct IAAFEssenceDescriptor;
struct IAAFEventMobSlot;
struct IAAFFile;
struct IAAFFindSourceInfo;
struct IAAFKLVData;
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
