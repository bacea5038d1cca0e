// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFUnknown.h"

// Master mobs: what a user sees as a clip in a bin. A master mob's slots lead to
// those of file mobs. The module makes one for each clip, with a slot for each track;
// the file owns it.

struct IAAFDataDef;
struct IAAFEssenceAccess;
struct IAAFEssenceMultiAccess;
struct IAAFLocator;
struct IAAFSegment;
struct IAAFSourceMob;

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
