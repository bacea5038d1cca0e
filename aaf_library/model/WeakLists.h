// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Object.h"

// Properties that refer to several definitions: vectors, and sets ordered by the bytes of the ids.

namespace aaf {

aafUInt32 CountWeak(const Object& object, const PropertyKey& key);
HRESULT ReadWeakCount(const Object& object, const PropertyKey& key, aafUInt32* count);

// Behind the last: AAFRESULT_BADINDEX.
HRESULT InsertWeakAt(Object& object, const PropertyKey& key, aafUInt32 index, IUnknown* target);
HRESULT RemoveWeakAt(Object& object, const PropertyKey& key, aafUInt32 index);
// AAFRESULT_OBJECT_NOT_FOUND when the list doesn't have it.
HRESULT RemoveWeak(Object& object, const PropertyKey& key, IUnknown* target);

// AAFRESULT_OBJECT_ALREADY_ATTACHED when the set has it.
HRESULT AddWeakToSet(Object& object, const PropertyKey& key, IUnknown* target);

// Over the targets.
template <class Element, class Enum>
HRESULT EnumerateWeak(Object* object, const PropertyKey& key, Enum** enumerator) {
    return MakeEnumerator<Element>(
        [holder = RefPtr<Object>(object), key](std::size_t index) {
            const std::vector<Unknown*> targets = holder->WeakTargets(key);
            return RefPtr<Unknown>(index < targets.size() ? targets[index] : nullptr);
        },
        enumerator);
}

}  // namespace aaf
