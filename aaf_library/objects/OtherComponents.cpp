// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/OtherComponents.h"

#include "aaf_library/model/Model.h"
#include "aaf_library/model/TypeDefinition.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"

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

// The first value, of the type that a parameter has by its definition.
HRESULT PutFirst(Object& object, const PropertyKey& key, ParameterDefinition& definition,
                 aafUInt32 valueSize, aafDataBuffer_t value) {
    IAAFTypeDef* type = nullptr;
    const HRESULT result = definition.GetTypeDefinition(&type);
    if (result < 0) {
        return result;
    }
    const RefPtr<IAAFTypeDef> holder = RefPtr<IAAFTypeDef>::Adopt(type);
    return object.PutIndirect(key, type, value, valueSize);
}

// Another value of the same type.
HRESULT PutNext(Object& object, const PropertyKey& key, aafUInt32 valueSize,
                aafDataBuffer_t value) {
    const HRESULT result = object.ReplaceIndirect(key, value, valueSize);
    return result == AAFRESULT_PROP_NOT_PRESENT ? AAFRESULT_NOT_INITIALIZED : result;
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

HRESULT OperationGroup::ReadDefinition(OperationDefinition** definition) const {
    if (!IsPresent(prop::OperationGroup_Operation)) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    *definition = dynamic_cast<OperationDefinition*>(WeakTarget(prop::OperationGroup_Operation));
    return *definition == nullptr ? AAFRESULT_OBJECT_NOT_FOUND : AAFRESULT_SUCCESS;
}

HRESULT OperationGroup::AskDefinition(bool (*question)(const OperationDefinition&),
                                      aafBoolean_t* answer) const {
    if (answer == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    OperationDefinition* definition = nullptr;
    const HRESULT result = ReadDefinition(&definition);
    if (result >= 0) {
        *answer = question(*definition) ? kAAFTrue : kAAFFalse;
    }
    return result;
}

HRESULT OperationGroup::IsATimeWarp(aafBoolean_t* isTimeWarp) {
    return AskDefinition(
        [](const OperationDefinition& definition) {
            return definition.IntegerOr(prop::OperationDefinition_IsTimeWarp, kAAFFalse) != 0;
        },
        isTimeWarp);
}

HRESULT OperationGroup::IsValidTranOperation(aafBoolean_t* validTransition) {
    return AskDefinition(
        [](const OperationDefinition& definition) {
            return definition.IntegerOr(prop::OperationDefinition_NumberInputs, 0) == 2;
        },
        validTransition);
}

// Parameters

HRESULT Parameter::FindDefinition(ParameterDefinition** definition) const {
    aafUID_t id{};
    if (const HRESULT result = ReadStruct(prop::Parameter_Definition, &id); result < 0) {
        return result;
    }
    *definition = dynamic_cast<ParameterDefinition*>(model()->FindTarget(AUID_AAFParameterDef, id));
    return *definition == nullptr ? AAFRESULT_OBJECT_NOT_FOUND : AAFRESULT_SUCCESS;
}

HRESULT Parameter::GetParameterDefinition(IAAFParameterDef** parmDef) {
    if (parmDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    ParameterDefinition* definition = nullptr;
    const HRESULT result = FindDefinition(&definition);
    return result < 0 ? result : GiveOut(definition, parmDef);
}

HRESULT Parameter::GetTypeDefinition(IAAFTypeDef** typeDef) {
    if (typeDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    ParameterDefinition* definition = nullptr;
    const HRESULT result = FindDefinition(&definition);
    return result < 0 ? result : definition->GetTypeDefinition(typeDef);
}

HRESULT Parameter::TakeDefinition(IAAFParameterDef* argument,
                                  ParameterDefinition** definition) const {
    const auto* const given = ImplementationAs<ParameterDefinition>(argument);
    if (given == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    if (given->owner() == nullptr) {
        return AAFRESULT_OBJECT_NOT_ATTACHED;
    }
    *definition = dynamic_cast<ParameterDefinition*>(
        model()->FindTarget(AUID_AAFParameterDef, given->Identification()));
    return *definition == nullptr ? AAFRESULT_INVALID_OBJ : AAFRESULT_SUCCESS;
}

HRESULT ConstantValue::Initialize(IAAFParameterDef* parameterDef, aafUInt32 valueSize,
                                  aafDataBuffer_t value) {
    if (parameterDef == nullptr || value == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (IsPresent(prop::ConstantValue_Value)) {
        return AAFRESULT_ALREADY_INITIALIZED;
    }
    ParameterDefinition* definition = nullptr;
    HRESULT result = TakeDefinition(parameterDef, &definition);
    if (result >= 0) {
        result = PutFirst(*this, prop::ConstantValue_Value, *definition, valueSize, value);
    }
    return result < 0 ? result
                      : PutStruct(prop::Parameter_Definition, definition->Identification());
}

HRESULT ConstantValue::SetValue(aafUInt32 valueSize, aafDataBuffer_t value) {
    return PutNext(*this, prop::ConstantValue_Value, valueSize, value);
}

HRESULT VaryingValue::Initialize(IAAFParameterDef* parameterDef,
                                 IAAFInterpolationDef* interpolation) {
    if (parameterDef == nullptr || interpolation == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (IsPresent(prop::VaryingValue_Interpolation)) {
        return AAFRESULT_ALREADY_INITIALIZED;
    }
    ParameterDefinition* definition = nullptr;
    HRESULT result = TakeDefinition(parameterDef, &definition);
    if (result >= 0) {
        result = PutWeak(prop::VaryingValue_Interpolation, interpolation);
    }
    return result < 0 ? result
                      : PutStruct(prop::Parameter_Definition, definition->Identification());
}

HRESULT VaryingValue::GetValueBufLen(aafInt32* len) {
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    IAAFTypeDef* type = nullptr;
    const HRESULT result = GetTypeDefinition(&type);
    if (result < 0) {
        return result;
    }
    const RefPtr<IAAFTypeDef> holder = RefPtr<IAAFTypeDef>::Adopt(type);
    const TypeDefinition* const known = TypeOf(type, model());
    if (known == nullptr || known->NativeSize() == 0) {
        return AAFRESULT_BAD_TYPE;
    }
    *len = static_cast<aafInt32>(known->NativeSize());
    return AAFRESULT_SUCCESS;
}

HRESULT ControlPoint::Initialize(IAAFVaryingValue* varyingValue, aafRational_constref time,
                                 aafUInt32 valueSize, aafDataBuffer_t value) {
    if (varyingValue == nullptr || value == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const auto* const parameter = ImplementationAs<Parameter>(varyingValue);
    if (parameter == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    if (IsPresent(prop::ControlPoint_Value)) {
        return AAFRESULT_ALREADY_INITIALIZED;
    }
    ParameterDefinition* definition = nullptr;
    HRESULT result = parameter->FindDefinition(&definition);
    if (result >= 0) {
        result = PutFirst(*this, prop::ControlPoint_Value, *definition, valueSize, value);
    }
    return result < 0 ? result : SetTime(time);
}

HRESULT ControlPoint::SetValue(aafUInt32 valueSize, aafDataBuffer_t value) {
    return PutNext(*this, prop::ControlPoint_Value, valueSize, value);
}

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
    return PutBoolean(prop::GPITrigger_ActiveState, activeState);
}

}  // namespace aaf
