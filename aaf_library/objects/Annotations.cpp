// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Annotations.h"

#include "aaf_library/model/Model.h"
#include "aaf_library/objects/TaggedValue.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf {

HRESULT AppendTaggedText(Object& object, const PropertyKey& list, aafCharacter_constptr name,
                         aafCharacter_constptr text) {
    if (name == nullptr || text == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const RefPtr<TaggedValue> value = object.model()->NewObject<TaggedValue>(AUID_AAFTaggedValue);
    const HRESULT result = value->InitializeText(name, text);
    return result < 0 ? result : object.AppendObject(list, value->Identity());
}

HRESULT RemoveFromList(Object& object, const PropertyKey& list, IUnknown* element) {
    if (element == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (!object.IsPresent(list)) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    const Object* known = ImplementationAs<Object>(element);
    if (known == nullptr || known->owner() == nullptr) {
        return AAFRESULT_OBJECT_NOT_ATTACHED;
    }
    return object.RemoveObject(list, element);
}

}  // namespace aaf
