// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/WeakLists.h"

#include <algorithm>
#include <cstring>

#include "aaf_library/model/StoredNumbers.h"
#include "aaf_library/model/TypeReference.h"

namespace aaf {

namespace {

// Moves the last id of a list before the one at that index.
void MoveLastTo(Bytes& ids, std::size_t index) {
    std::rotate(ids.begin() + static_cast<std::ptrdiff_t>(index * kGuidSize),
                ids.end() - static_cast<std::ptrdiff_t>(kGuidSize), ids.end());
}

}  // namespace

aafUInt32 CountWeak(const Object& object, const PropertyKey& key) {
    const PropertyValue* const value = object.FindValue(key);
    return value == nullptr ? 0 : static_cast<aafUInt32>(value->bytes().size() / kGuidSize);
}

HRESULT ReadWeakCount(const Object& object, const PropertyKey& key, aafUInt32* count) {
    if (count == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *count = CountWeak(object, key);
    return AAFRESULT_SUCCESS;
}

aafUInt32 FindWeak(const Object& object, const PropertyKey& key, const GUID& id) {
    const PropertyValue* const ids = object.FindValue(key);
    const aafUInt32 count = CountWeak(object, key);
    aafUInt32 place = 0;
    while (place < count && GuidAt(ids->bytes().data() + place * kGuidSize) != id) {
        ++place;
    }
    return place;
}

aafUInt32 FindWeak(const Object& object, const PropertyKey& key, IUnknown* target) {
    GUID id{};
    Unknown* const known = ImplementationOf(target);
    return known != nullptr && WeakKeyOf(*known, &id) ? FindWeak(object, key, id)
                                                      : CountWeak(object, key);
}

HRESULT InsertWeakAt(Object& object, const PropertyKey& key, aafUInt32 index, IUnknown* target) {
    if (target == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (index > CountWeak(object, key)) {
        return AAFRESULT_BADINDEX;
    }
    const HRESULT result = object.AppendWeak(key, target);
    if (result >= 0) {
        MoveLastTo(object.RequireValue(key)->BytesToChange(), index);
    }
    return result;
}

HRESULT RemoveWeakAt(Object& object, const PropertyKey& key, aafUInt32 index) {
    if (index >= CountWeak(object, key)) {
        return AAFRESULT_BADINDEX;
    }
    Bytes& ids = object.RequireValue(key)->BytesToChange();
    const auto at = ids.begin() + static_cast<std::ptrdiff_t>(index * kGuidSize);
    ids.erase(at, at + static_cast<std::ptrdiff_t>(kGuidSize));
    return AAFRESULT_SUCCESS;
}

HRESULT RemoveWeak(Object& object, const PropertyKey& key, IUnknown* target) {
    if (target == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const HRESULT result = RemoveWeakAt(object, key, FindWeak(object, key, target));
    return result == AAFRESULT_BADINDEX ? AAFRESULT_OBJECT_NOT_FOUND : result;
}

HRESULT AddWeakToSet(Object& object, const PropertyKey& key, IUnknown* target) {
    const aafUInt32 count = CountWeak(object, key);
    if (const HRESULT result = object.AppendWeak(key, target); result < 0) {
        return result;
    }
    Bytes& ids = object.RequireValue(key)->BytesToChange();
    const std::uint8_t* const added = ids.data() + count * kGuidSize;
    // A file, or a caller by way of values, may have them in any order.
    if (FindWeak(object, key, GuidAt(added)) < count) {
        ids.resize(count * kGuidSize);
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    std::size_t place = 0;
    while (place < count && std::memcmp(ids.data() + place * kGuidSize, added, kGuidSize) < 0) {
        ++place;
    }
    MoveLastTo(ids, place);
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
