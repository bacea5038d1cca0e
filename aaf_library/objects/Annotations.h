// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Object.h"
#include "host_interfaces/aaf/AAFObjects.h"

// Lists of tagged values and raw data, which mobs and components have alike.

namespace aaf {

// Adds a tagged text at the end, also when its name stands there already: a
// clip has a cell of the same name for each of its tracks.
HRESULT AppendTaggedText(Object& object, const PropertyKey& list, aafCharacter_constptr name,
                         aafCharacter_constptr text);

// Takes an element out of such a list, which frees it.
HRESULT RemoveFromList(Object& object, const PropertyKey& list, IUnknown* element);

// An enumerator over such a list; there is none while the list has never had
// an element.
template <class Element, class Enum>
HRESULT EnumerateList(Object* object, const PropertyKey& list, Enum** enumerator) {
    if (enumerator == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    return object->IsPresent(list) ? MakeEnumerator<Element>(object, list, enumerator)
                                   : AAFRESULT_PROP_NOT_PRESENT;
}

}  // namespace aaf
