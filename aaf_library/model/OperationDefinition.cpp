// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/OperationDefinition.h"

namespace aaf {

HRESULT OperationDefinition::SetDataDef(IAAFDataDef* dataDef) {
    return PutWeak(prop::OperationDefinition_DataDefinition, dataDef);
}

HRESULT OperationDefinition::LookupParameterDef(aafUID_constref parameterDefId,
                                                IAAFParameterDef** parameterDef) {
    if (parameterDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    for (Unknown* target : WeakTargets(prop::OperationDefinition_ParametersDefined)) {
        auto* const definition = dynamic_cast<ParameterDefinition*>(target);
        if (definition != nullptr && definition->Identification() == parameterDefId) {
            return GiveOut(definition, parameterDef);
        }
    }
    return AAFRESULT_NO_MORE_OBJECTS;
}

}  // namespace aaf
