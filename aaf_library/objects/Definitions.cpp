// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Definitions.h"

#include "aaf_library/model/Model.h"

namespace aaf {

bool ReadDefinitionId(IUnknown* definition, aafUID_t& id) {
    const Object* object = ImplementationAs<Object>(definition);
    return object != nullptr && object->ReadStruct(prop::DefinitionObject_Identification, &id) >= 0;
}

HRESULT PutDefinition(Object& object, const PropertyKey& key, const GUID& definitionClass,
                      IUnknown* definition, HRESULT unknown) {
    if (definition == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafUID_t id{};
    if (!ReadDefinitionId(definition, id)) {
        return unknown;
    }
    Unknown* own = object.model()->FindTarget(definitionClass, id);
    return own == nullptr ? unknown : object.PutWeak(key, own);
}

}  // namespace aaf
