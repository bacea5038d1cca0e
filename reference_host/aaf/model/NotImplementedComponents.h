// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFResultCodes.h"
#include "reference_host/aaf/model/NotImplemented.h"

// Bodies for operations that a class leaves out; see NotImplemented.h.
namespace aaf {

template <>
class NotImplemented<IAAFSegment> : public IAAFSegment {
public:
    HRESULT SegmentOffsetToTC(aafPosition_t*, aafTimecode_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SegmentTCToOffset(aafTimecode_t*, aafRational_t*, aafFrameOffset_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFComponent> : public IAAFComponent {
public:
    HRESULT SetLength(aafLength_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLength(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDataDef(IAAFDataDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendKLVData(IAAFKLVData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountKLVData(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetKLVData(IEnumAAFKLVData**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveKLVData(IAAFKLVData*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFComponent2> : public IAAFComponent2 {
public:
    HRESULT SetLength(aafLength_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetLength(aafLength_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDataDef(IAAFDataDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDataDef(IAAFDataDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendKLVData(IAAFKLVData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountKLVData(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetKLVData(IEnumAAFKLVData**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveKLVData(IAAFKLVData*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendComment(aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountComments(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetComments(IEnumAAFTaggedValues**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveComment(IAAFTaggedValue*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendAttribute(aafCharacter_constptr, aafCharacter_constptr) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountAttributes(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetAttributes(IEnumAAFTaggedValues**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveAttribute(IAAFTaggedValue*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFSequence> : public IAAFSequence {
public:
    HRESULT Initialize(IAAFDataDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendComponent(IAAFComponent*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependComponent(IAAFComponent*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT InsertComponentAt(aafUInt32, IAAFComponent*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetComponentAt(aafUInt32, IAAFComponent**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RemoveComponentAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountComponents(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetComponents(IEnumAAFComponents**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFComponents> : public IEnumAAFComponents {
public:
    HRESULT NextOne(IAAFComponent**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFComponent**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFComponents**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFSourceReference> : public IAAFSourceReference {
public:
    HRESULT GetSourceID(aafMobID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSourceID(aafMobID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSourceMobSlotID(aafSlotID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSourceMobSlotID(aafSlotID_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFSourceReference2> : public IAAFSourceReference2 {
public:
    HRESULT GetSourceID(aafMobID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSourceID(aafMobID_constref) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSourceMobSlotID(aafSlotID_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSourceMobSlotID(aafSlotID_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetChannelIDs(aafUInt32, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetChannelIDs(aafUInt32, aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetChannelIDsSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetMonoSourceSlotIDs(aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetMonoSourceSlotIDs(aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetMonoSourceSlotIDsSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFSourceClip> : public IAAFSourceClip {
public:
    HRESULT Initialize(IAAFDataDef*, aafLength_constref, aafSourceRef_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetFade(aafLength_t*, aafFadeType_t*, aafBoolean_t*, aafLength_t*, aafFadeType_t*,
                    aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT ResolveRef(IAAFMob**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSourceReference(aafSourceRef_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetFade(aafInt32, aafFadeType_t, aafInt32, aafFadeType_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetSourceReference(aafSourceRef_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTimecode> : public IAAFTimecode {
public:
    HRESULT Initialize(aafLength_t, aafTimecode_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetTimecode(aafTimecode_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetTimecode(aafTimecode_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFFiller> : public IAAFFiller {
public:
    HRESULT Initialize(IAAFDataDef*, aafLength_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFSegments> : public IEnumAAFSegments {
public:
    HRESULT NextOne(IAAFSegment**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFSegment**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFSegments**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFCommentMarker> : public IAAFCommentMarker {
public:
    HRESULT GetAnnotation(IAAFSourceReference**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetAnnotation(IAAFSourceReference*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFConstantValue> : public IAAFConstantValue {
public:
    HRESULT Initialize(IAAFParameterDef*, aafUInt32, aafDataBuffer_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetValue(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetValueBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetTypeDefinition(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetValue(aafUInt32, aafDataBuffer_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFControlPoint> : public IAAFControlPoint {
public:
    HRESULT Initialize(IAAFVaryingValue*, aafRational_constref, aafUInt32,
                       aafDataBuffer_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTime(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEditHint(aafEditHint_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetValueBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetValue(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetTime(aafRational_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetEditHint(aafEditHint_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetTypeDefinition(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetValue(aafUInt32, aafDataBuffer_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDescriptiveClip> : public IAAFDescriptiveClip {
public:
    HRESULT Initialize(IAAFDataDef*, aafLength_constref, aafSourceRef_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT CountDescribedSlotIDs(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetDescribedSlotIDs(aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT IsDescribedSlotIDPresent(aafUInt32, aafBoolean_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AddDescribedSlotID(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveDescribedSlotID(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFDescriptiveMarker> : public IAAFDescriptiveMarker {
public:
    HRESULT Initialize() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDescribedSlotIDs(aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDescribedSlotIDs(aafUInt32, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDescribedSlotIDsSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetDescriptiveFramework(IAAFDescriptiveFramework*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetDescriptiveFramework(IAAFDescriptiveFramework**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEdgecode> : public IAAFEdgecode {
public:
    HRESULT Initialize(aafLength_t, aafEdgecode_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetEdgecode(aafEdgecode_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEssenceGroup> : public IAAFEssenceGroup {
public:
    HRESULT SetStillFrame(IAAFSourceClip*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetStillFrame(IAAFSourceClip**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendChoice(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependChoice(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT InsertChoiceAt(aafUInt32, IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountChoices(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetChoiceAt(aafUInt32, IAAFSegment**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveChoiceAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFEvent> : public IAAFEvent {
public:
    HRESULT GetPosition(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPosition(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetComment(aafCharacter_constptr) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetComment(aafCharacter*, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetCommentBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFGPITrigger> : public IAAFGPITrigger {
public:
    HRESULT GetActiveState(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetActiveState(aafBoolean_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFNestedScope> : public IAAFNestedScope {
public:
    HRESULT AppendSegment(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependSegment(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT InsertSegmentAt(aafUInt32, IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveSegmentAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountSegments(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSegmentAt(aafUInt32, IAAFSegment**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSegments(IEnumAAFSegments**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFOperationGroup> : public IAAFOperationGroup {
public:
    HRESULT Initialize(IAAFDataDef*, aafLength_t, IAAFOperationDef*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetOperationDefinition(IAAFOperationDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetOperationDefinition(IAAFOperationDef*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetRender(IAAFSourceReference**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsATimeWarp(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetBypassOverride(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountSourceSegments(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT IsValidTranOperation(aafBoolean_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountParameters(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AddParameter(IAAFParameter*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendInputSegment(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT PrependInputSegment(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT InsertInputSegmentAt(aafUInt32, IAAFSegment*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetRender(IAAFSourceReference*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetBypassOverride(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetParameters(IEnumAAFParameters**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT LookupParameter(aafArgIDType_constref, IAAFParameter**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetInputSegmentAt(aafUInt32, IAAFSegment**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RemoveInputSegmentAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFParameter> : public IAAFParameter {
public:
    HRESULT GetParameterDefinition(IAAFParameterDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetTypeDefinition(IAAFTypeDef**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFPulldown> : public IAAFPulldown {
public:
    HRESULT GetInputSegment(IAAFSegment**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetInputSegment(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPulldownKind(aafPulldownKind_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPulldownKind(aafPulldownKind_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPulldownDirection(aafPulldownDir_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPulldownDirection(aafPulldownDir_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetPhaseFrame(aafPhaseFrame_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetPhaseFrame(aafPhaseFrame_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFScopeReference> : public IAAFScopeReference {
public:
    HRESULT Create(aafUInt32, aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Initialize(IAAFDataDef*, aafUInt32, aafUInt32) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetRelativeScope(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetRelativeSlot(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFSelector> : public IAAFSelector {
public:
    HRESULT GetSelectedSegment(IAAFSegment**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSelectedSegment(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT AppendAlternateSegment(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetNumAlternateSegments(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT EnumAlternateSegments(IEnumAAFSegments**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT RemoveAlternateSegment(IAAFSegment*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTimecodeStream> : public IAAFTimecodeStream {
public:
    HRESULT GetPositionTimecode(aafPosition_t, aafTimecode_t*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetPositionTimecode(aafPosition_t, aafTimecode_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetUserDataLength(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetUserDataAtPosition(aafPosition_t, aafInt32, aafDataBuffer_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetUserDataAtPosition(aafPosition_t, aafInt32, aafDataBuffer_t) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT SetSampleRate(aafRational_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSampleRate(aafRational_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSourceType(aafTimecodeSourceType_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSourceType(aafTimecodeSourceType_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSampleSize(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetSource(aafUInt32, aafDataBuffer_t, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetSourceBufLen(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetSource(aafUInt32, aafDataBuffer_t) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTimecodeStream12M> : public IAAFTimecodeStream12M {
protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFTransition> : public IAAFTransition {
public:
    HRESULT Initialize(IAAFDataDef*, aafLength_t, aafPosition_t, IAAFOperationGroup*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetCutPoint(aafPosition_t*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetOperationGroup(IAAFOperationGroup**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetCutPoint(aafPosition_t) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT SetOperationGroup(IAAFOperationGroup*) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IAAFVaryingValue> : public IAAFVaryingValue {
public:
    HRESULT Initialize(IAAFParameterDef*, IAAFInterpolationDef*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT AddControlPoint(IAAFControlPoint*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetControlPoints(IEnumAAFControlPoints**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT CountControlPoints(aafUInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetControlPointAt(aafUInt32, IAAFControlPoint**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT RemoveControlPointAt(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetInterpolationDefinition(IAAFInterpolationDef**) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT GetValueBufLen(aafInt32*) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT GetInterpolatedValue(aafRational_t, aafInt32, aafDataBuffer_t, aafInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFControlPoints> : public IEnumAAFControlPoints {
public:
    HRESULT NextOne(IAAFControlPoint**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFControlPoint**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFControlPoints**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

template <>
class NotImplemented<IEnumAAFParameters> : public IEnumAAFParameters {
public:
    HRESULT NextOne(IAAFParameter**) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Next(aafUInt32, IAAFParameter**, aafUInt32*) override {
        return AAFRESULT_NOT_IMPLEMENTED;
    }
    HRESULT Skip(aafUInt32) override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Reset() override { return AAFRESULT_NOT_IMPLEMENTED; }
    HRESULT Clone(IEnumAAFParameters**) override { return AAFRESULT_NOT_IMPLEMENTED; }

protected:
    ~NotImplemented() = default;
};

}  // namespace aaf
