// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/DefinitionObjects.h"
#include "aaf_library/model/WeakLists.h"

namespace aaf {

// What an effect does: its inputs and parameters, and what may take its place.
class OperationDefinition : public PlainDefinition<IAAFOperationDef> {
public:
    // -- IAAFOperationDef
    HRESULT GetDataDef(IAAFDataDef** dataDef) override {
        return ReadWeak(prop::OperationDefinition_DataDefinition, dataDef);
    }
    HRESULT SetDataDef(IAAFDataDef* dataDef) override;
    HRESULT IsTimeWarp(aafBoolean_t* isTimeWarp) override {
        return ReadInteger(prop::OperationDefinition_IsTimeWarp, isTimeWarp);
    }
    HRESULT SetIsTimeWarp(aafBoolean_t isTimeWarp) override {
        return PutBoolean(prop::OperationDefinition_IsTimeWarp, isTimeWarp);
    }
    HRESULT GetCategory(aafUID_t* value) override {
        return ReadStruct(prop::OperationDefinition_OperationCategory, value);
    }
    HRESULT SetCategory(aafUID_constref value) override {
        return PutStruct(prop::OperationDefinition_OperationCategory, value);
    }
    HRESULT GetNumberInputs(aafInt32* numberInputs) override {
        return ReadInteger(prop::OperationDefinition_NumberInputs, numberInputs);
    }
    HRESULT SetNumberInputs(aafInt32 numberInputs) override {
        return PutInteger(prop::OperationDefinition_NumberInputs, numberInputs);
    }
    // The number of the input that stands for the result where the operation isn't known.
    HRESULT GetBypass(aafUInt32* bypass) override {
        return ReadInteger(prop::OperationDefinition_Bypass, bypass);
    }
    HRESULT SetBypass(aafUInt32 bypass) override {
        return PutInteger(prop::OperationDefinition_Bypass, bypass);
    }

    // Operations that may take its place, the best first.
    HRESULT PrependDegradeToOperation(IAAFOperationDef* operation) override {
        return InsertWeakAt(*this, prop::OperationDefinition_DegradeTo, 0, operation);
    }
    HRESULT AppendDegradeToOperation(IAAFOperationDef* operation) override {
        return AppendWeak(prop::OperationDefinition_DegradeTo, operation);
    }
    HRESULT InsertDegradeToOperationAt(aafUInt32 index, IAAFOperationDef* operation) override {
        return InsertWeakAt(*this, prop::OperationDefinition_DegradeTo, index, operation);
    }
    HRESULT RemoveDegradeToOperationAt(aafUInt32 index) override {
        return RemoveWeakAt(*this, prop::OperationDefinition_DegradeTo, index);
    }
    HRESULT GetDegradeToOperations(IEnumAAFOperationDefs** enumerator) override {
        return EnumerateWeak<IAAFOperationDef>(this, prop::OperationDefinition_DegradeTo,
                                               enumerator);
    }
    HRESULT CountDegradeToOperations(aafUInt32* result) override {
        return ReadWeakCount(*this, prop::OperationDefinition_DegradeTo, result);
    }

    HRESULT AddParameterDef(IAAFParameterDef* parameterDef) override {
        return AddWeakToSet(*this, prop::OperationDefinition_ParametersDefined, parameterDef);
    }
    HRESULT GetParameterDefs(IEnumAAFParameterDefs** enumerator) override {
        return EnumerateWeak<IAAFParameterDef>(this, prop::OperationDefinition_ParametersDefined,
                                               enumerator);
    }
    HRESULT CountParameterDefs(aafUInt32* result) override {
        return ReadWeakCount(*this, prop::OperationDefinition_ParametersDefined, result);
    }
    // AAFRESULT_NO_MORE_OBJECTS for one that this operation doesn't have.
    HRESULT LookupParameterDef(aafUID_constref parameterDefId,
                               IAAFParameterDef** parameterDef) override;
};

}  // namespace aaf
