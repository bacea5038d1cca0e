// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/OtherComponents.h"

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/objects/Annotations.h"
#include "aaf_library/objects/Checks.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFEffectDefinitions.h"

namespace aaf {

namespace {

HRESULT ReadTyped(const Object& object, const PropertyKey& key, aafUInt32 valueSize,
                  aafDataBuffer_t value, aafUInt32* bytesRead) {
    if (value == nullptr || bytesRead == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafUInt32 size = 0;
    HRESULT result = object.ReadIndirectSize(key, &size);
    if (result >= 0) {
        result = object.ReadIndirect(key, value, valueSize);
    }
    if (result >= 0) {
        *bytesRead = size;
    }
    return result;
}

}  // namespace

// Transition

HRESULT Transition::Initialize(IAAFDataDef* dataDef, aafLength_t length, aafPosition_t cutPoint,
                               IAAFOperationGroup* op) {
    if (dataDef == nullptr || op == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    HRESULT result = SetLength(length);
    if (result >= 0) {
        result = SetDataDef(dataDef);
    }
    if (result >= 0) {
        result = SetOperationGroup(op);
    }
    return result < 0 ? result : SetCutPoint(cutPoint);
}

HRESULT Transition::GetCutPoint(aafPosition_t* cutPoint) {
    return ReadInteger(prop::Transition_CutPoint, cutPoint);
}

HRESULT Transition::GetOperationGroup(IAAFOperationGroup** groupObj) {
    return ReadObject(prop::Transition_OperationGroup, groupObj);
}

HRESULT Transition::SetCutPoint(aafPosition_t cutPoint) {
    return PutInteger(prop::Transition_CutPoint, cutPoint);
}

HRESULT Transition::SetOperationGroup(IAAFOperationGroup* opgroup) {
    return PutObject(prop::Transition_OperationGroup, opgroup);
}

// OperationGroup

HRESULT OperationGroup::Initialize(IAAFDataDef* dataDef, aafLength_t length,
                                   IAAFOperationDef* operationDef) {
    if (dataDef == nullptr || operationDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    HRESULT result = SetDataDef(dataDef);
    if (result >= 0) {
        result = SetLength(length);
    }
    return result < 0 ? result : SetOperationDefinition(operationDef);
}

HRESULT OperationGroup::GetOperationDefinition(IAAFOperationDef** operationDef) {
    return ReadWeak(prop::OperationGroup_Operation, operationDef);
}

HRESULT OperationGroup::SetOperationDefinition(IAAFOperationDef* operationDef) {
    return PutWeak(prop::OperationGroup_Operation, operationDef);
}

HRESULT OperationGroup::GetRender(IAAFSourceReference** sourceRef) {
    return ReadObject(prop::OperationGroup_Rendering, sourceRef);
}

HRESULT OperationGroup::SetRender(IAAFSourceReference* sourceRef) {
    return PutObject(prop::OperationGroup_Rendering, sourceRef);
}

HRESULT OperationGroup::GetBypassOverride(aafUInt32* bypassOverride) {
    return ReadInteger(prop::OperationGroup_BypassOverride, bypassOverride);
}

HRESULT OperationGroup::SetBypassOverride(aafUInt32 bypassOverride) {
    return PutInteger(prop::OperationGroup_BypassOverride, bypassOverride);
}

HRESULT OperationGroup::CountSourceSegments(aafUInt32* result) {
    return ReadCount(prop::OperationGroup_InputSegments, result);
}

HRESULT OperationGroup::AppendInputSegment(IAAFSegment* segment) {
    return AppendObject(prop::OperationGroup_InputSegments, segment);
}

HRESULT OperationGroup::PrependInputSegment(IAAFSegment* segment) {
    return PrependObject(prop::OperationGroup_InputSegments, segment);
}

HRESULT OperationGroup::InsertInputSegmentAt(aafUInt32 index, IAAFSegment* segment) {
    return InsertObjectAt(prop::OperationGroup_InputSegments, index, segment);
}

HRESULT OperationGroup::GetInputSegmentAt(aafUInt32 index, IAAFSegment** inputSegment) {
    return ReadObjectAt(prop::OperationGroup_InputSegments, index, inputSegment);
}

HRESULT OperationGroup::RemoveInputSegmentAt(aafUInt32 index) {
    return RemoveObjectAt(prop::OperationGroup_InputSegments, index);
}

HRESULT OperationGroup::CountParameters(aafUInt32* result) {
    return ReadCount(prop::OperationGroup_Parameters, result);
}

HRESULT OperationGroup::AddParameter(IAAFParameter* parameter) {
    return AppendObject(prop::OperationGroup_Parameters, parameter);
}

HRESULT OperationGroup::GetParameters(IEnumAAFParameters** enumerator) {
    return EnumerateList<IAAFParameter>(this, prop::OperationGroup_Parameters, enumerator);
}

HRESULT OperationGroup::LookupParameter(aafArgIDType_constref argID, IAAFParameter** parameter) {
    if (parameter == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const aafUInt32 count = CountObjects(prop::OperationGroup_Parameters);
    for (aafUInt32 at = 0; at < count; ++at) {
        Object* const candidate = ObjectAt(prop::OperationGroup_Parameters, at);
        aafUID_t id{};
        if (candidate->ReadStruct(prop::Parameter_Definition, &id) >= 0 && id == argID) {
            return GiveOut(candidate, parameter);
        }
    }
    return AAFRESULT_OBJECT_NOT_FOUND;
}

// Parameters

HRESULT ConstantValue::GetValue(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) {
    return ReadTyped(*this, prop::ConstantValue_Value, valueSize, value, bytesRead);
}

HRESULT ConstantValue::GetValueBufLen(aafUInt32* len) {
    return ReadIndirectSize(prop::ConstantValue_Value, len);
}

HRESULT ConstantValue::GetTypeDefinition(IAAFTypeDef** typeDef) {
    return ReadIndirectType(prop::ConstantValue_Value, typeDef);
}

HRESULT VaryingValue::AddControlPoint(IAAFControlPoint* controlPoint) {
    return AppendObject(prop::VaryingValue_PointList, controlPoint);
}

HRESULT VaryingValue::GetControlPoints(IEnumAAFControlPoints** enumerator) {
    return MakeEnumerator<IAAFControlPoint>(this, prop::VaryingValue_PointList, enumerator);
}

HRESULT VaryingValue::CountControlPoints(aafUInt32* result) {
    return ReadCount(prop::VaryingValue_PointList, result);
}

HRESULT VaryingValue::GetControlPointAt(aafUInt32 index, IAAFControlPoint** controlPoint) {
    return ReadObjectAt(prop::VaryingValue_PointList, index, controlPoint);
}

HRESULT VaryingValue::RemoveControlPointAt(aafUInt32 index) {
    return RemoveObjectAt(prop::VaryingValue_PointList, index);
}

HRESULT ControlPoint::GetTime(aafRational_t* time) {
    return ReadStruct(prop::ControlPoint_Time, time);
}

HRESULT ControlPoint::SetTime(aafRational_t time) {
    return PutStruct(prop::ControlPoint_Time, time);
}

HRESULT ControlPoint::GetEditHint(aafEditHint_t* editHint) {
    return ReadInteger(prop::ControlPoint_EditHint, editHint);
}

HRESULT ControlPoint::SetEditHint(aafEditHint_t editHint) {
    if (!IsWithin(editHint, kAAFNoEditHint, kAAFRelativeFixed)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    return PutInteger(prop::ControlPoint_EditHint, editHint);
}

HRESULT ControlPoint::GetValueBufLen(aafUInt32* len) {
    return ReadIndirectSize(prop::ControlPoint_Value, len);
}

HRESULT ControlPoint::GetValue(aafUInt32 valueSize, aafDataBuffer_t value, aafUInt32* bytesRead) {
    return ReadTyped(*this, prop::ControlPoint_Value, valueSize, value, bytesRead);
}

HRESULT ControlPoint::GetTypeDefinition(IAAFTypeDef** typeDef) {
    return ReadIndirectType(prop::ControlPoint_Value, typeDef);
}

// NestedScope and ScopeReference

HRESULT NestedScope::AppendSegment(IAAFSegment* segment) {
    return AppendObject(prop::NestedScope_Slots, segment);
}

HRESULT NestedScope::PrependSegment(IAAFSegment* segment) {
    return PrependObject(prop::NestedScope_Slots, segment);
}

HRESULT NestedScope::InsertSegmentAt(aafUInt32 index, IAAFSegment* segment) {
    return InsertObjectAt(prop::NestedScope_Slots, index, segment);
}

HRESULT NestedScope::RemoveSegmentAt(aafUInt32 index) {
    return RemoveObjectAt(prop::NestedScope_Slots, index);
}

HRESULT NestedScope::CountSegments(aafUInt32* result) {
    return ReadCount(prop::NestedScope_Slots, result);
}

HRESULT NestedScope::GetSegmentAt(aafUInt32 index, IAAFSegment** segment) {
    return ReadObjectAt(prop::NestedScope_Slots, index, segment);
}

HRESULT NestedScope::GetSegments(IEnumAAFSegments** enumerator) {
    return MakeEnumerator<IAAFSegment>(this, prop::NestedScope_Slots, enumerator);
}

HRESULT ScopeReference::Initialize(IAAFDataDef* dataDef, aafUInt32 relativeScope,
                                   aafUInt32 relativeSlot) {
    const HRESULT result = SetDataDef(dataDef);
    return result < 0 ? result : Create(relativeScope, relativeSlot);
}

HRESULT ScopeReference::Create(aafUInt32 relativeScope, aafUInt32 relativeSlot) {
    PutInteger(prop::ScopeReference_RelativeScope, relativeScope);
    return PutInteger(prop::ScopeReference_RelativeSlot, relativeSlot);
}

HRESULT ScopeReference::GetRelativeScope(aafUInt32* relativeScope) {
    return ReadInteger(prop::ScopeReference_RelativeScope, relativeScope);
}

HRESULT ScopeReference::GetRelativeSlot(aafUInt32* relativeSlot) {
    return ReadInteger(prop::ScopeReference_RelativeSlot, relativeSlot);
}

// Selector and EssenceGroup

HRESULT Selector::GetSelectedSegment(IAAFSegment** selected) {
    return ReadObject(prop::Selector_Selected, selected);
}

HRESULT Selector::SetSelectedSegment(IAAFSegment* selected) {
    return PutObject(prop::Selector_Selected, selected);
}

HRESULT Selector::AppendAlternateSegment(IAAFSegment* segment) {
    return AppendObject(prop::Selector_Alternates, segment);
}

HRESULT Selector::GetNumAlternateSegments(aafInt32* numSegments) {
    if (numSegments == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *numSegments = static_cast<aafInt32>(CountObjects(prop::Selector_Alternates));
    return AAFRESULT_SUCCESS;
}

HRESULT Selector::EnumAlternateSegments(IEnumAAFSegments** enumerator) {
    return EnumerateList<IAAFSegment>(this, prop::Selector_Alternates, enumerator);
}

HRESULT Selector::RemoveAlternateSegment(IAAFSegment* segment) {
    return RemoveFromList(*this, prop::Selector_Alternates, segment);
}

HRESULT EssenceGroup::SetStillFrame(IAAFSourceClip* stillFrame) {
    return PutObject(prop::EssenceGroup_StillFrame, stillFrame);
}

HRESULT EssenceGroup::GetStillFrame(IAAFSourceClip** stillFrame) {
    return ReadObject(prop::EssenceGroup_StillFrame, stillFrame);
}

HRESULT EssenceGroup::AppendChoice(IAAFSegment* choice) {
    return AppendObject(prop::EssenceGroup_Choices, choice);
}

HRESULT EssenceGroup::PrependChoice(IAAFSegment* choice) {
    return PrependObject(prop::EssenceGroup_Choices, choice);
}

HRESULT EssenceGroup::InsertChoiceAt(aafUInt32 index, IAAFSegment* choice) {
    return InsertObjectAt(prop::EssenceGroup_Choices, index, choice);
}

HRESULT EssenceGroup::CountChoices(aafUInt32* count) {
    return ReadCount(prop::EssenceGroup_Choices, count);
}

HRESULT EssenceGroup::GetChoiceAt(aafUInt32 index, IAAFSegment** choice) {
    return ReadObjectAt(prop::EssenceGroup_Choices, index, choice);
}

HRESULT EssenceGroup::RemoveChoiceAt(aafUInt32 index) {
    return RemoveObjectAt(prop::EssenceGroup_Choices, index);
}

// Pulldown

HRESULT Pulldown::GetInputSegment(IAAFSegment** inputSegment) {
    return ReadObject(prop::Pulldown_InputSegment, inputSegment);
}

HRESULT Pulldown::SetInputSegment(IAAFSegment* inputSegment) {
    return PutObject(prop::Pulldown_InputSegment, inputSegment);
}

HRESULT Pulldown::GetPulldownKind(aafPulldownKind_t* pulldownKind) {
    return ReadInteger(prop::Pulldown_PulldownKind, pulldownKind);
}

HRESULT Pulldown::SetPulldownKind(aafPulldownKind_t pulldownKind) {
    if (!IsWithin(pulldownKind, kAAFTwoThreePD, kAAFTwoToOnePD)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    return PutInteger(prop::Pulldown_PulldownKind, pulldownKind);
}

HRESULT Pulldown::GetPulldownDirection(aafPulldownDir_t* direction) {
    return ReadInteger(prop::Pulldown_PulldownDirection, direction);
}

HRESULT Pulldown::SetPulldownDirection(aafPulldownDir_t direction) {
    if (!IsWithin(direction, kAAFTapeToFilmSpeed, kAAFFilmToTapeSpeed)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    return PutInteger(prop::Pulldown_PulldownDirection, direction);
}

HRESULT Pulldown::GetPhaseFrame(aafPhaseFrame_t* phaseFrame) {
    return ReadInteger(prop::Pulldown_PhaseFrame, phaseFrame);
}

HRESULT Pulldown::SetPhaseFrame(aafPhaseFrame_t phaseFrame) {
    return PutInteger(prop::Pulldown_PhaseFrame, phaseFrame);
}

// Events

HRESULT Event::GetPosition(aafPosition_t* position) {
    return ReadInteger(prop::Event_Position, position);
}

HRESULT Event::SetPosition(aafPosition_t position) {
    return PutInteger(prop::Event_Position, position);
}

HRESULT Event::SetComment(aafCharacter_constptr comment) {
    return PutString(prop::Event_Comment, comment);
}

HRESULT Event::GetComment(aafCharacter* comment, aafUInt32 bufSize) {
    return ReadString(prop::Event_Comment, comment, bufSize);
}

HRESULT Event::GetCommentBufLen(aafUInt32* bufSize) {
    return ReadStringLength(prop::Event_Comment, bufSize);
}

HRESULT CommentMarker::GetAnnotation(IAAFSourceReference** result) {
    return ReadObject(prop::CommentMarker_Annotation, result);
}

HRESULT CommentMarker::SetAnnotation(IAAFSourceReference* annotation) {
    return PutObject(prop::CommentMarker_Annotation, annotation);
}

HRESULT GPITrigger::GetActiveState(aafBoolean_t* activeState) {
    return ReadInteger(prop::GPITrigger_ActiveState, activeState);
}

HRESULT GPITrigger::SetActiveState(aafBoolean_t activeState) {
    if (!IsBoolean(activeState)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    return PutInteger(prop::GPITrigger_ActiveState, activeState);
}

}  // namespace aaf
