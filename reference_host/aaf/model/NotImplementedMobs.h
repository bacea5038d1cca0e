// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/aaf/model/NotImplemented.h"

// Bodies for operations that a class leaves out; see NotImplemented.h.
namespace aaf {

template <>
class NotImplemented<IAAFMob> : public IAAFMob {
public:
    HRESULT GetMobID(aafMobID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetMobID(aafMobID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetName(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountSlots(aafNumSlots_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendSlot(IAAFMobSlot*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependSlot(IAAFMobSlot*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT InsertSlotAt(aafUInt32, IAAFMobSlot*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveSlotAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSlotAt(aafUInt32, IAAFMobSlot**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSlots(IEnumAAFMobSlots**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetModTime(aafTimeStamp_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetModTime(aafTimeStamp_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCreateTime(aafTimeStamp_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCreateTime(aafTimeStamp_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendComment(aafCharacter*, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountComments(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetComments(IEnumAAFTaggedValues**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveComment(IAAFTaggedValue*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendNewTimelineSlot(aafRational_t, IAAFSegment*, aafSlotID_t, aafCharacter_constptr,
                                  aafPosition_t, IAAFTimelineMobSlot**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetMobInfo(aafTimeStamp_t*, aafTimeStamp_t*, aafCharacter*, aafInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT OffsetToMobTimecode(IAAFSegment*, aafPosition_t*, aafTimecode_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupSlot(aafSlotID_t, IAAFMobSlot**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT ChangeRef(aafMobID_constref, aafMobID_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CloneExternal(aafDepend_t, aafIncMedia_t, IAAFFile*, IAAFMob**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Copy(aafCharacter_constptr, IAAFMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendKLVData(IAAFKLVData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountKLVData(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetKLVData(IEnumAAFKLVData**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveKLVData(IAAFKLVData*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFMob2> : public IAAFMob2 {
public:
    HRESULT GetMobID(aafMobID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetMobID(aafMobID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetName(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountSlots(aafNumSlots_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendSlot(IAAFMobSlot*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependSlot(IAAFMobSlot*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT InsertSlotAt(aafUInt32, IAAFMobSlot*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveSlotAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSlotAt(aafUInt32, IAAFMobSlot**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSlots(IEnumAAFMobSlots**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetModTime(aafTimeStamp_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetModTime(aafTimeStamp_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCreateTime(aafTimeStamp_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCreateTime(aafTimeStamp_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendComment(aafCharacter*, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountComments(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetComments(IEnumAAFTaggedValues**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveComment(IAAFTaggedValue*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendNewTimelineSlot(aafRational_t, IAAFSegment*, aafSlotID_t, aafCharacter_constptr,
                                  aafPosition_t, IAAFTimelineMobSlot**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetMobInfo(aafTimeStamp_t*, aafTimeStamp_t*, aafCharacter*, aafInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT OffsetToMobTimecode(IAAFSegment*, aafPosition_t*, aafTimecode_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT LookupSlot(aafSlotID_t, IAAFMobSlot**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT ChangeRef(aafMobID_constref, aafMobID_constref) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CloneExternal(aafDepend_t, aafIncMedia_t, IAAFFile*, IAAFMob**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Copy(aafCharacter_constptr, IAAFMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendKLVData(IAAFKLVData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountKLVData(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetKLVData(IEnumAAFKLVData**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveKLVData(IAAFKLVData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendAttribute(aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountAttributes(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetAttributes(IEnumAAFTaggedValues**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveAttribute(IAAFTaggedValue*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetUsageCode(aafUID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetUsageCode(aafUID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendNewStaticSlot(IAAFSegment*, aafSlotID_t, aafCharacter_constptr,
                                IAAFStaticMobSlot**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendNewEventSlot(aafRational_t, IAAFSegment*, aafSlotID_t, aafCharacter_constptr,
                               aafPosition_t, IAAFEventMobSlot**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFMasterMob> : public IAAFMasterMob {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddMasterSlot(IAAFDataDef*, aafSlotID_t, IAAFSourceMob*, aafSlotID_t,
                          aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTapeName(aafUInt32, aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTapeNameBufLen(aafUInt32, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNumRepresentations(aafSlotID_t, aafNumSlots_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetRepresentation(aafSlotID_t, aafUInt32, IAAFSegment**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCriteriaSegment(aafSlotID_t, aafMediaCriteria_t*, IAAFSegment**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendPhysSourceRef(aafRational_t, aafSlotID_t, IAAFDataDef*, aafSourceRef_t,
                                aafLength_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT NewPhysSourceRef(aafRational_t, aafSlotID_t, IAAFDataDef*, aafSourceRef_t,
                             aafLength_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafRational_t, aafRational_t,
                          aafCompressEnable_t, IAAFLocator*, aafUID_constref,
                          IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateMultiEssence(aafUID_constref, aafUInt16, aafmMultiCreate_t*, aafCompressEnable_t,
                               IAAFLocator*, aafUID_constref, IAAFEssenceMultiAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT OpenEssence(aafSlotID_t, aafMediaCriteria_t*, aafMediaOpenMode_t, aafCompressEnable_t,
                        IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT OpenMultiEssence(aafSlotID_t, aafMediaCriteria_t*, aafMediaOpenMode_t,
                             aafCompressEnable_t, IAAFEssenceMultiAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountChannels(aafSlotID_t, aafMediaCriteria_t*, IAAFDataDef*, aafUInt16*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFMasterMob2> : public IAAFMasterMob2 {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddMasterSlot(IAAFDataDef*, aafSlotID_t, IAAFSourceMob*, aafSlotID_t,
                          aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTapeName(aafUInt32, aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTapeNameBufLen(aafUInt32, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNumRepresentations(aafSlotID_t, aafNumSlots_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetRepresentation(aafSlotID_t, aafUInt32, IAAFSegment**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCriteriaSegment(aafSlotID_t, aafMediaCriteria_t*, IAAFSegment**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendPhysSourceRef(aafRational_t, aafSlotID_t, IAAFDataDef*, aafSourceRef_t,
                                aafLength_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT NewPhysSourceRef(aafRational_t, aafSlotID_t, IAAFDataDef*, aafSourceRef_t,
                             aafLength_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafRational_t, aafRational_t,
                          aafCompressEnable_t, IAAFLocator*, aafUID_constref,
                          IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateMultiEssence(aafUID_constref, aafUInt16, aafmMultiCreate_t*, aafCompressEnable_t,
                               IAAFLocator*, aafUID_constref, IAAFEssenceMultiAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT OpenEssence(aafSlotID_t, aafMediaCriteria_t*, aafMediaOpenMode_t, aafCompressEnable_t,
                        IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT OpenMultiEssence(aafSlotID_t, aafMediaCriteria_t*, aafMediaOpenMode_t,
                             aafCompressEnable_t, IAAFEssenceMultiAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountChannels(aafSlotID_t, aafMediaCriteria_t*, IAAFDataDef*, aafUInt16*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ExtendEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafRational_t, aafRational_t,
                          aafCompressEnable_t, IAAFLocator*, aafUID_constref,
                          IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ExtendMultiEssence(aafUID_constref, aafUInt16, aafmMultiCreate_t*, aafCompressEnable_t,
                               IAAFLocator*, aafUID_constref, IAAFEssenceMultiAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateStaticEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafCompressEnable_t,
                                IAAFLocator*, aafUID_constref, IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateEventEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafRational_t,
                               aafRational_t, aafCompressEnable_t, IAAFLocator*, aafUID_constref,
                               IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFMasterMob3> : public IAAFMasterMob3 {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddMasterSlot(IAAFDataDef*, aafSlotID_t, IAAFSourceMob*, aafSlotID_t,
                          aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTapeName(aafUInt32, aafCharacter*, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTapeNameBufLen(aafUInt32, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNumRepresentations(aafSlotID_t, aafNumSlots_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetRepresentation(aafSlotID_t, aafUInt32, IAAFSegment**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCriteriaSegment(aafSlotID_t, aafMediaCriteria_t*, IAAFSegment**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendPhysSourceRef(aafRational_t, aafSlotID_t, IAAFDataDef*, aafSourceRef_t,
                                aafLength_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT NewPhysSourceRef(aafRational_t, aafSlotID_t, IAAFDataDef*, aafSourceRef_t,
                             aafLength_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafRational_t, aafRational_t,
                          aafCompressEnable_t, IAAFLocator*, aafUID_constref,
                          IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateMultiEssence(aafUID_constref, aafUInt16, aafmMultiCreate_t*, aafCompressEnable_t,
                               IAAFLocator*, aafUID_constref, IAAFEssenceMultiAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT OpenEssence(aafSlotID_t, aafMediaCriteria_t*, aafMediaOpenMode_t, aafCompressEnable_t,
                        IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT OpenMultiEssence(aafSlotID_t, aafMediaCriteria_t*, aafMediaOpenMode_t,
                             aafCompressEnable_t, IAAFEssenceMultiAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountChannels(aafSlotID_t, aafMediaCriteria_t*, IAAFDataDef*, aafUInt16*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ExtendEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafRational_t, aafRational_t,
                          aafCompressEnable_t, IAAFLocator*, aafUID_constref,
                          IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ExtendMultiEssence(aafUID_constref, aafUInt16, aafmMultiCreate_t*, aafCompressEnable_t,
                               IAAFLocator*, aafUID_constref, IAAFEssenceMultiAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateStaticEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafCompressEnable_t,
                                IAAFLocator*, aafUID_constref, IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CreateEventEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafRational_t,
                               aafRational_t, aafCompressEnable_t, IAAFLocator*, aafUID_constref,
                               IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AddMasterSlotWithSequence(IAAFDataDef*, aafSlotID_t, IAAFSourceMob*, aafSlotID_t,
                                      aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFMasterMobEx> : public IAAFMasterMobEx {
public:
    HRESULT ExtendEssence(aafSlotID_t, IAAFDataDef*, aafUID_constref, aafRational_t, aafRational_t,
                          aafCompressEnable_t, IAAFLocator*, aafUID_constref,
                          IAAFEssenceAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ExtendMultiEssence(aafUID_constref, aafUInt16, aafmMultiCreate_t*, aafCompressEnable_t,
                               IAAFLocator*, aafUID_constref, IAAFEssenceMultiAccess**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFSourceMob> : public IAAFSourceMob {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEssenceDescriptor(IAAFEssenceDescriptor**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetEssenceDescriptor(IAAFEssenceDescriptor*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AddNilReference(aafSlotID_t, aafLength_t, IAAFDataDef*, aafRational_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendTimecodeSlot(aafRational_t, aafInt32, aafTimecode_t, aafFrameLength_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendEdgecodeSlot(aafRational_t, aafInt32, aafFrameOffset_t, aafFrameLength_t,
                               aafFilmType_t, aafEdgeType_t, aafEdgecodeHeader_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SpecifyValidCodeRange(IAAFDataDef*, aafSlotID_t, aafRational_t, aafFrameOffset_t,
                                  aafFrameLength_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AppendPhysSourceRef(aafRational_t, aafSlotID_t, IAAFDataDef*, aafSourceRef_t,
                                aafLength_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT NewPhysSourceRef(aafRational_t, aafSlotID_t, IAAFDataDef*, aafSourceRef_t,
                             aafLength_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AddPulldownRef(aafAppendOption_t, aafRational_t, aafSlotID_t, IAAFDataDef*,
                           aafSourceRef_t, aafLength_t, aafPulldownKind_t, aafPhaseFrame_t,
                           aafPulldownDir_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFSearchSource> : public IAAFSearchSource {
public:
    HRESULT SearchSource(aafSlotID_t, aafPosition_t, aafMobKind_t, aafMediaCriteria_t*,
                         aafOperationChoice_t*, IAAFFindSourceInfo**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFMobSlot> : public IAAFMobSlot {
public:
    HRESULT GetSegment(IAAFSegment**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetName(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetName(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNameBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPhysicalNum(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSlotID(aafSlotID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSegment(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPhysicalNum(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSlotID(aafSlotID_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTimelineMobSlot> : public IAAFTimelineMobSlot {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEditRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEditRate(aafRational_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetOrigin(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetOrigin(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTimelineMobSlot2> : public IAAFTimelineMobSlot2 {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEditRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEditRate(aafRational_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetOrigin(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetOrigin(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetMarkIn(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetMarkIn(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetMarkOut(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetMarkOut(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetUserPos(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetUserPos(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFStaticMobSlot> : public IAAFStaticMobSlot {
protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEventMobSlot> : public IAAFEventMobSlot {
public:
    HRESULT GetEditRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEditRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEventMobSlot2> : public IAAFEventMobSlot2 {
public:
    HRESULT GetEditRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEditRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEventSlotOrigin(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEventSlotOrigin(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFMobSlots> : public IEnumAAFMobSlots {
public:
    HRESULT NextOne(IAAFMobSlot**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFMobSlot**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFMobSlots**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFMobs> : public IEnumAAFMobs {
public:
    HRESULT NextOne(IAAFMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFMob**, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFMobs**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFFindSourceInfo> : public IAAFFindSourceInfo {
public:
    HRESULT GetMob(IAAFMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSourceReference(aafSourceRef_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLength(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEditRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFCompositionMob> : public IAAFCompositionMob {
public:
    HRESULT Initialize(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDefaultFade(aafDefaultFade_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDefaultFade(aafLength_t, aafFadeType_t, aafRational_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFCompositionMob2> : public IAAFCompositionMob2 {
public:
    HRESULT Initialize(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDefaultFade(aafDefaultFade_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDefaultFade(aafLength_t, aafFadeType_t, aafRational_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetRendering(aafMobID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetRendering(aafMobID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

}  // namespace aaf
