// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Component.h"
#include "not_implemented/AAFComponents.h"
#include "not_implemented/AAFEffects.h"
#include "not_implemented/AAFEvents.h"
#include "not_implemented/AAFTimecodes.h"

// Components and parameters that this system does not make but meets in the
// files of other programs: it reads, copies and saves them with all their
// properties. What a class does not say here answers not implemented.

namespace aaf {

class Transition : public Implements<Component, IAAFTransition> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef, aafLength_t length, aafPosition_t cutPoint,
                       IAAFOperationGroup* op) override;
    HRESULT GetCutPoint(aafPosition_t* cutPoint) override;
    HRESULT GetOperationGroup(IAAFOperationGroup** groupObj) override;
    HRESULT SetCutPoint(aafPosition_t cutPoint) override;
    HRESULT SetOperationGroup(IAAFOperationGroup* opgroup) override;
};

class OperationGroup : public Implements<Segment, IAAFOperationGroup> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef, aafLength_t length,
                       IAAFOperationDef* operationDef) override;
    HRESULT GetOperationDefinition(IAAFOperationDef** operationDef) override;
    HRESULT SetOperationDefinition(IAAFOperationDef* operationDef) override;
    HRESULT GetRender(IAAFSourceReference** sourceRef) override;
    HRESULT SetRender(IAAFSourceReference* sourceRef) override;
    HRESULT GetBypassOverride(aafUInt32* bypassOverride) override;
    HRESULT SetBypassOverride(aafUInt32 bypassOverride) override;
    HRESULT CountSourceSegments(aafUInt32* result) override;
    HRESULT AppendInputSegment(IAAFSegment* segment) override;
    HRESULT PrependInputSegment(IAAFSegment* segment) override;
    HRESULT InsertInputSegmentAt(aafUInt32 index, IAAFSegment* segment) override;
    HRESULT GetInputSegmentAt(aafUInt32 index, IAAFSegment** inputSegment) override;
    HRESULT RemoveInputSegmentAt(aafUInt32 index) override;
    HRESULT CountParameters(aafUInt32* result) override;
    HRESULT AddParameter(IAAFParameter* parameter) override;
    HRESULT GetParameters(IEnumAAFParameters** enumerator) override;
    HRESULT LookupParameter(aafArgIDType_constref argID, IAAFParameter** parameter) override;
};

class Parameter : public Implements<Object, IAAFParameter> {};

class ConstantValue : public Implements<Parameter, IAAFConstantValue> {
public:
    HRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) override;
    HRESULT GetValueBufLen(aafUInt32* len) override;
    HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) override;
};

class VaryingValue : public Implements<Parameter, IAAFVaryingValue> {
public:
    HRESULT AddControlPoint(IAAFControlPoint* controlPoint) override;
    HRESULT GetControlPoints(IEnumAAFControlPoints** enumerator) override;
    HRESULT CountControlPoints(aafUInt32* result) override;
    HRESULT GetControlPointAt(aafUInt32 index, IAAFControlPoint** controlPoint) override;
    HRESULT RemoveControlPointAt(aafUInt32 index) override;
};

class ControlPoint : public Implements<Object, IAAFControlPoint> {
public:
    HRESULT GetTime(aafRational_t* time) override;
    HRESULT SetTime(aafRational_t time) override;
    HRESULT GetEditHint(aafEditHint_t* editHint) override;
    HRESULT SetEditHint(aafEditHint_t editHint) override;
    HRESULT GetValueBufLen(aafUInt32* len) override;
    HRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) override;
    HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) override;
};

class NestedScope : public Implements<Segment, IAAFNestedScope> {
public:
    HRESULT AppendSegment(IAAFSegment* segment) override;
    HRESULT PrependSegment(IAAFSegment* segment) override;
    HRESULT InsertSegmentAt(aafUInt32 index, IAAFSegment* segment) override;
    HRESULT RemoveSegmentAt(aafUInt32 index) override;
    HRESULT CountSegments(aafUInt32* result) override;
    HRESULT GetSegmentAt(aafUInt32 index, IAAFSegment** segment) override;
    HRESULT GetSegments(IEnumAAFSegments** enumerator) override;
};

class ScopeReference : public Implements<Segment, IAAFScopeReference> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef, aafUInt32 relativeScope,
                       aafUInt32 relativeSlot) override;
    HRESULT Create(aafUInt32 relativeScope, aafUInt32 relativeSlot) override;
    HRESULT GetRelativeScope(aafUInt32* relativeScope) override;
    HRESULT GetRelativeSlot(aafUInt32* relativeSlot) override;
};

class Selector : public Implements<Segment, IAAFSelector> {
public:
    HRESULT GetSelectedSegment(IAAFSegment** selected) override;
    HRESULT SetSelectedSegment(IAAFSegment* selected) override;
    HRESULT AppendAlternateSegment(IAAFSegment* segment) override;
    HRESULT GetNumAlternateSegments(aafInt32* numSegments) override;
    HRESULT EnumAlternateSegments(IEnumAAFSegments** enumerator) override;
    HRESULT RemoveAlternateSegment(IAAFSegment* segment) override;
};

class EssenceGroup : public Implements<Segment, IAAFEssenceGroup> {
public:
    HRESULT SetStillFrame(IAAFSourceClip* stillFrame) override;
    HRESULT GetStillFrame(IAAFSourceClip** stillFrame) override;
    HRESULT AppendChoice(IAAFSegment* choice) override;
    HRESULT PrependChoice(IAAFSegment* choice) override;
    HRESULT InsertChoiceAt(aafUInt32 index, IAAFSegment* choice) override;
    HRESULT CountChoices(aafUInt32* count) override;
    HRESULT GetChoiceAt(aafUInt32 index, IAAFSegment** choice) override;
    HRESULT RemoveChoiceAt(aafUInt32 index) override;
};

class Pulldown : public Implements<Segment, IAAFPulldown> {
public:
    HRESULT GetInputSegment(IAAFSegment** inputSegment) override;
    HRESULT SetInputSegment(IAAFSegment* inputSegment) override;
    HRESULT GetPulldownKind(aafPulldownKind_t* pulldownKind) override;
    HRESULT SetPulldownKind(aafPulldownKind_t pulldownKind) override;
    HRESULT GetPulldownDirection(aafPulldownDir_t* direction) override;
    HRESULT SetPulldownDirection(aafPulldownDir_t direction) override;
    HRESULT GetPhaseFrame(aafPhaseFrame_t* phaseFrame) override;
    HRESULT SetPhaseFrame(aafPhaseFrame_t phaseFrame) override;
};

// Something at a place in time rather than over a stretch of it.
class Event : public Implements<Segment, IAAFEvent> {
public:
    HRESULT GetPosition(aafPosition_t* position) override;
    HRESULT SetPosition(aafPosition_t position) override;
    HRESULT SetComment(aafCharacter_constptr comment) override;
    HRESULT GetComment(aafCharacter* comment, aafUInt32 bufSize) override;
    HRESULT GetCommentBufLen(aafUInt32* bufSize) override;
};

class CommentMarker : public Implements<Event, IAAFCommentMarker> {
public:
    HRESULT GetAnnotation(IAAFSourceReference** result) override;
    HRESULT SetAnnotation(IAAFSourceReference* annotation) override;
};

class GPITrigger : public Implements<Event, IAAFGPITrigger> {
public:
    HRESULT GetActiveState(aafBoolean_t* activeState) override;
    HRESULT SetActiveState(aafBoolean_t activeState) override;
};

}  // namespace aaf
