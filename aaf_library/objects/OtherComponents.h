// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/OperationDefinition.h"
#include "aaf_library/objects/Annotations.h"
#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/Component.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFEffectDefinitions.h"
#include "not_implemented/AAFComponents.h"
#include "not_implemented/AAFEffects.h"
#include "not_implemented/AAFEvents.h"
#include "not_implemented/AAFTimecodes.h"

// Components and parameters that this system does not make but meets in the
// files of other programs.

namespace aaf {

class Transition : public Implements<Component, IAAFTransition> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef, aafLength_t length, aafPosition_t cutPoint,
                       IAAFOperationGroup* op) override;
    HRESULT GetCutPoint(aafPosition_t* cutPoint) override {
        return ReadInteger(prop::Transition_CutPoint, cutPoint);
    }
    HRESULT GetOperationGroup(IAAFOperationGroup** groupObj) override {
        return ReadObject(prop::Transition_OperationGroup, groupObj);
    }
    HRESULT SetCutPoint(aafPosition_t cutPoint) override {
        return PutInteger(prop::Transition_CutPoint, cutPoint);
    }
    HRESULT SetOperationGroup(IAAFOperationGroup* opgroup) override;
};

class OperationGroup : public Implements<Segment, IAAFOperationGroup> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef, aafLength_t length,
                       IAAFOperationDef* operationDef) override;
    HRESULT GetOperationDefinition(IAAFOperationDef** operationDef) override {
        return ReadWeak(prop::OperationGroup_Operation, operationDef);
    }
    HRESULT SetOperationDefinition(IAAFOperationDef* operationDef) override {
        return PutWeak(prop::OperationGroup_Operation, operationDef);
    }
    HRESULT GetRender(IAAFSourceReference** sourceRef) override {
        return ReadObject(prop::OperationGroup_Rendering, sourceRef);
    }
    HRESULT SetRender(IAAFSourceReference* sourceRef) override {
        return PutObject(prop::OperationGroup_Rendering, sourceRef);
    }
    HRESULT GetBypassOverride(aafUInt32* bypassOverride) override {
        return ReadInteger(prop::OperationGroup_BypassOverride, bypassOverride);
    }
    HRESULT SetBypassOverride(aafUInt32 bypassOverride) override {
        return PutInteger(prop::OperationGroup_BypassOverride, bypassOverride);
    }
    HRESULT CountSourceSegments(aafUInt32* result) override {
        return ReadCount(prop::OperationGroup_InputSegments, result);
    }
    HRESULT AppendInputSegment(IAAFSegment* segment) override {
        return AppendObject(prop::OperationGroup_InputSegments, segment);
    }
    HRESULT PrependInputSegment(IAAFSegment* segment) override {
        return PrependObject(prop::OperationGroup_InputSegments, segment);
    }
    HRESULT InsertInputSegmentAt(aafUInt32 index, IAAFSegment* segment) override {
        return InsertObjectAt(prop::OperationGroup_InputSegments, index, segment);
    }
    HRESULT GetInputSegmentAt(aafUInt32 index, IAAFSegment** inputSegment) override {
        return ReadObjectAt(prop::OperationGroup_InputSegments, index, inputSegment);
    }
    HRESULT RemoveInputSegmentAt(aafUInt32 index) override {
        return RemoveObjectAt(prop::OperationGroup_InputSegments, index);
    }
    HRESULT CountParameters(aafUInt32* result) override {
        return ReadCount(prop::OperationGroup_Parameters, result);
    }
    HRESULT AddParameter(IAAFParameter* parameter) override {
        return AppendObject(prop::OperationGroup_Parameters, parameter);
    }
    HRESULT GetParameters(IEnumAAFParameters** enumerator) override {
        return EnumerateList<IAAFParameter>(this, prop::OperationGroup_Parameters, enumerator);
    }
    HRESULT LookupParameter(aafArgIDType_constref argID, IAAFParameter** parameter) override;
    // Whether its definition says so.
    HRESULT IsATimeWarp(aafBoolean_t* isTimeWarp) override;
    // Whether it takes two inputs, as a transition has.
    HRESULT IsValidTranOperation(aafBoolean_t* validTransition) override;

private:
    HRESULT ReadDefinition(OperationDefinition** definition) const;
    HRESULT AskDefinition(bool (*question)(const OperationDefinition&), aafBoolean_t* answer) const;
};

// A value of an effect. The dictionary's definition with its id tells the type.
class Parameter : public Implements<Object, IAAFParameter> {
public:
    HRESULT GetParameterDefinition(IAAFParameterDef** parmDef) override;
    HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) override;
    HRESULT FindDefinition(ParameterDefinition** definition) const;

protected:
    // The dictionary's definition with the id of the argument: a free one is
    // AAFRESULT_OBJECT_NOT_ATTACHED, one that only another file has AAFRESULT_INVALID_OBJ.
    HRESULT TakeDefinition(IAAFParameterDef* argument, ParameterDefinition** definition) const;
};

class ConstantValue : public Implements<Parameter, IAAFConstantValue> {
public:
    HRESULT Initialize(IAAFParameterDef* parameterDef, aafUInt32 valueSize,
                       aafDataBuffer_t value) override;
    HRESULT SetValue(aafUInt32 valueSize, aafDataBuffer_t value) override;
    HRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) override;
    HRESULT GetValueBufLen(aafUInt32* len) override;
    HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) override;
};

class VaryingValue : public Implements<Parameter, IAAFVaryingValue> {
public:
    HRESULT AddControlPoint(IAAFControlPoint* controlPoint) override {
        return AppendObject(prop::VaryingValue_PointList, controlPoint);
    }
    HRESULT GetControlPoints(IEnumAAFControlPoints** enumerator) override;
    HRESULT CountControlPoints(aafUInt32* result) override {
        return ReadCount(prop::VaryingValue_PointList, result);
    }
    HRESULT GetControlPointAt(aafUInt32 index, IAAFControlPoint** controlPoint) override {
        return ReadObjectAt(prop::VaryingValue_PointList, index, controlPoint);
    }
    HRESULT RemoveControlPointAt(aafUInt32 index) override;
    HRESULT Initialize(IAAFParameterDef* parameterDef,
                       IAAFInterpolationDef* interpolation) override;
    HRESULT GetInterpolationDefinition(IAAFInterpolationDef** interpolation) override {
        return ReadWeak(prop::VaryingValue_Interpolation, interpolation);
    }
    // The size of a value between two points.
    HRESULT GetValueBufLen(aafInt32* len) override;
};

class ControlPoint : public Implements<Object, IAAFControlPoint> {
public:
    // The value has the type of the parameter that it is made for, which doesn't get the point yet.
    HRESULT Initialize(IAAFVaryingValue* varyingValue, aafRational_constref time,
                       aafUInt32 valueSize, aafDataBuffer_t value) override;
    HRESULT SetValue(aafUInt32 valueSize, aafDataBuffer_t value) override;
    HRESULT GetTime(aafRational_t* time) override {
        return ReadStruct(prop::ControlPoint_Time, time);
    }
    HRESULT SetTime(aafRational_t time) override {
        return PutStruct(prop::ControlPoint_Time, time);
    }
    HRESULT GetEditHint(aafEditHint_t* editHint) override {
        return ReadInteger(prop::ControlPoint_EditHint, editHint);
    }
    HRESULT SetEditHint(aafEditHint_t editHint) override;
    HRESULT GetValueBufLen(aafUInt32* len) override;
    HRESULT GetValue(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) override;
    HRESULT GetTypeDefinition(IAAFTypeDef** typeDef) override;
};

class NestedScope : public Implements<Segment, IAAFNestedScope> {
public:
    HRESULT AppendSegment(IAAFSegment* segment) override {
        return AppendObject(prop::NestedScope_Slots, segment);
    }
    HRESULT PrependSegment(IAAFSegment* segment) override {
        return PrependObject(prop::NestedScope_Slots, segment);
    }
    HRESULT InsertSegmentAt(aafUInt32 index, IAAFSegment* segment) override {
        return InsertObjectAt(prop::NestedScope_Slots, index, segment);
    }
    HRESULT RemoveSegmentAt(aafUInt32 index) override {
        return RemoveObjectAt(prop::NestedScope_Slots, index);
    }
    HRESULT CountSegments(aafUInt32* result) override {
        return ReadCount(prop::NestedScope_Slots, result);
    }
    HRESULT GetSegmentAt(aafUInt32 index, IAAFSegment** segment) override {
        return ReadObjectAt(prop::NestedScope_Slots, index, segment);
    }
    HRESULT GetSegments(IEnumAAFSegments** enumerator) override;
};

class ScopeReference : public Implements<Segment, IAAFScopeReference> {
public:
    HRESULT Initialize(IAAFDataDef* dataDef, aafUInt32 relativeScope,
                       aafUInt32 relativeSlot) override;
    HRESULT Create(aafUInt32 relativeScope, aafUInt32 relativeSlot) override;
    HRESULT GetRelativeScope(aafUInt32* relativeScope) override {
        return ReadInteger(prop::ScopeReference_RelativeScope, relativeScope);
    }
    HRESULT GetRelativeSlot(aafUInt32* relativeSlot) override;
};

class Selector : public Implements<Segment, IAAFSelector> {
public:
    HRESULT GetSelectedSegment(IAAFSegment** selected) override {
        return ReadObject(prop::Selector_Selected, selected);
    }
    HRESULT SetSelectedSegment(IAAFSegment* selected) override {
        return PutObject(prop::Selector_Selected, selected);
    }
    HRESULT AppendAlternateSegment(IAAFSegment* segment) override {
        return AppendObject(prop::Selector_Alternates, segment);
    }
    HRESULT GetNumAlternateSegments(aafInt32* numSegments) override;
    HRESULT EnumAlternateSegments(IEnumAAFSegments** enumerator) override {
        return EnumerateList<IAAFSegment>(this, prop::Selector_Alternates, enumerator);
    }
    HRESULT RemoveAlternateSegment(IAAFSegment* segment) override;
};

class EssenceGroup : public Implements<Segment, IAAFEssenceGroup> {
public:
    HRESULT SetStillFrame(IAAFSourceClip* stillFrame) override {
        return PutObject(prop::EssenceGroup_StillFrame, stillFrame);
    }
    HRESULT GetStillFrame(IAAFSourceClip** stillFrame) override {
        return ReadObject(prop::EssenceGroup_StillFrame, stillFrame);
    }
    HRESULT AppendChoice(IAAFSegment* choice) override {
        return AppendObject(prop::EssenceGroup_Choices, choice);
    }
    HRESULT PrependChoice(IAAFSegment* choice) override {
        return PrependObject(prop::EssenceGroup_Choices, choice);
    }
    HRESULT InsertChoiceAt(aafUInt32 index, IAAFSegment* choice) override {
        return InsertObjectAt(prop::EssenceGroup_Choices, index, choice);
    }
    HRESULT CountChoices(aafUInt32* count) override {
        return ReadCount(prop::EssenceGroup_Choices, count);
    }
    HRESULT GetChoiceAt(aafUInt32 index, IAAFSegment** choice) override {
        return ReadObjectAt(prop::EssenceGroup_Choices, index, choice);
    }
    HRESULT RemoveChoiceAt(aafUInt32 index) override;
};

class Pulldown : public Implements<Segment, IAAFPulldown> {
public:
    HRESULT GetInputSegment(IAAFSegment** inputSegment) override {
        return ReadObject(prop::Pulldown_InputSegment, inputSegment);
    }
    HRESULT SetInputSegment(IAAFSegment* inputSegment) override {
        return PutObject(prop::Pulldown_InputSegment, inputSegment);
    }
    HRESULT GetPulldownKind(aafPulldownKind_t* pulldownKind) override {
        return ReadInteger(prop::Pulldown_PulldownKind, pulldownKind);
    }
    HRESULT SetPulldownKind(aafPulldownKind_t pulldownKind) override;
    HRESULT GetPulldownDirection(aafPulldownDir_t* direction) override {
        return ReadInteger(prop::Pulldown_PulldownDirection, direction);
    }
    HRESULT SetPulldownDirection(aafPulldownDir_t direction) override;
    HRESULT GetPhaseFrame(aafPhaseFrame_t* phaseFrame) override {
        return ReadInteger(prop::Pulldown_PhaseFrame, phaseFrame);
    }
    HRESULT SetPhaseFrame(aafPhaseFrame_t phaseFrame) override;
};

// Something at a place in time rather than over a stretch of it.
class Event : public Implements<Segment, IAAFEvent> {
public:
    HRESULT GetPosition(aafPosition_t* position) override {
        return ReadInteger(prop::Event_Position, position);
    }
    HRESULT SetPosition(aafPosition_t position) override {
        return PutInteger(prop::Event_Position, position);
    }
    HRESULT SetComment(aafCharacter_constptr comment) override {
        return PutString(prop::Event_Comment, comment);
    }
    HRESULT GetComment(aafCharacter* comment, aafUInt32 bufSize) override {
        return ReadString(prop::Event_Comment, comment, bufSize);
    }
    HRESULT GetCommentBufLen(aafUInt32* bufSize) override;
};

class CommentMarker : public Implements<Event, IAAFCommentMarker> {
public:
    HRESULT GetAnnotation(IAAFSourceReference** result) override {
        return ReadObject(prop::CommentMarker_Annotation, result);
    }
    HRESULT SetAnnotation(IAAFSourceReference* annotation) override;
};

class GPITrigger : public Implements<Event, IAAFGPITrigger> {
public:
    HRESULT GetActiveState(aafBoolean_t* activeState) override {
        return ReadInteger(prop::GPITrigger_ActiveState, activeState);
    }
    HRESULT SetActiveState(aafBoolean_t activeState) override;
};

}  // namespace aaf
