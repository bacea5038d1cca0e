// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/Enumerator.h"
#include "aaf_library/model/Object.h"

// Properties that refer to several definitions: vectors, and sets ordered by the bytes of the ids.

namespace aaf {

aafUInt32 CountWeak(const Object& object, const PropertyKey& key);
HRESULT ReadWeakCount(const Object& object, const PropertyKey& key, aafUInt32* count);

// The place of the reference with that id; the number of references when there is none.
aafUInt32 FindWeak(const Object& object, const PropertyKey& key, const GUID& id);
// The same by a definition, which may be that of another file.
aafUInt32 FindWeak(const Object& object, const PropertyKey& key, IUnknown* target);

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
            return RefPtr<Unknown>(holder->WeakTargetAt(key, index));
        },
        enumerator);
}

}  // namespace aaf
