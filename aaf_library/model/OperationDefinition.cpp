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
    const PropertyKey& all = prop::OperationDefinition_ParametersDefined;
    Unknown* const found = WeakTargetAt(all, FindWeak(*this, all, parameterDefId));
    return found == nullptr ? AAFRESULT_NO_MORE_OBJECTS : GiveOut(found, parameterDef);
}

}  // namespace aaf
