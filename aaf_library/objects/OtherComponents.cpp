// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/OtherComponents.h"

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

HRESULT VaryingValue::GetControlPoints(IEnumAAFControlPoints** enumerator) {
    return MakeEnumerator<IAAFControlPoint>(this, prop::VaryingValue_PointList, enumerator);
}

HRESULT VaryingValue::RemoveControlPointAt(aafUInt32 index) {
    return RemoveObjectAt(prop::VaryingValue_PointList, index);
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

HRESULT ScopeReference::GetRelativeSlot(aafUInt32* relativeSlot) {
    return ReadInteger(prop::ScopeReference_RelativeSlot, relativeSlot);
}

// Selector and EssenceGroup

HRESULT Selector::GetNumAlternateSegments(aafInt32* numSegments) {
    if (numSegments == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *numSegments = static_cast<aafInt32>(CountObjects(prop::Selector_Alternates));
    return AAFRESULT_SUCCESS;
}

HRESULT Selector::RemoveAlternateSegment(IAAFSegment* segment) {
    return RemoveFromList(*this, prop::Selector_Alternates, segment);
}

HRESULT EssenceGroup::RemoveChoiceAt(aafUInt32 index) {
    return RemoveObjectAt(prop::EssenceGroup_Choices, index);
}

// Pulldown

HRESULT Pulldown::SetPulldownKind(aafPulldownKind_t pulldownKind) {
    if (!IsWithin(pulldownKind, kAAFTwoThreePD, kAAFTwoToOnePD)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    return PutInteger(prop::Pulldown_PulldownKind, pulldownKind);
}

HRESULT Pulldown::SetPulldownDirection(aafPulldownDir_t direction) {
    if (!IsWithin(direction, kAAFTapeToFilmSpeed, kAAFFilmToTapeSpeed)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    return PutInteger(prop::Pulldown_PulldownDirection, direction);
}

HRESULT Pulldown::SetPhaseFrame(aafPhaseFrame_t phaseFrame) {
    return PutInteger(prop::Pulldown_PhaseFrame, phaseFrame);
}

// Events

HRESULT Event::GetCommentBufLen(aafUInt32* bufSize) {
    return ReadStringLength(prop::Event_Comment, bufSize);
}

HRESULT CommentMarker::SetAnnotation(IAAFSourceReference* annotation) {
    return PutObject(prop::CommentMarker_Annotation, annotation);
}

HRESULT GPITrigger::SetActiveState(aafBoolean_t activeState) {
    if (!IsBoolean(activeState)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    return PutInteger(prop::GPITrigger_ActiveState, activeState);
}

}  // namespace aaf
