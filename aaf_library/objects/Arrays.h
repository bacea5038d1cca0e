// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <vector>

#include "aaf_library/model/Object.h"

namespace aaf {

// Copies an array property into a caller's buffer, which may be larger.
inline HRESULT ReadArray(const Object& object, const PropertyKey& key, void* data,
                         std::size_t bytes) {
    const HRESULT result = object.ReadNative(key, data, bytes);
    return result == AAFRESULT_BAD_SIZE ? AAFRESULT_SMALLBUF : result;
}

// How many elements of that size an array property has.
inline HRESULT CountElements(const Object& object, const PropertyKey& key, std::size_t elementSize,
                             aafUInt32* count) {
    const HRESULT result = object.ReadNativeSize(key, count);
    if (result >= 0) {
        *count /= static_cast<aafUInt32>(elementSize);
    }
    return result;
}

// The elements of an array or a set of plain values.
template <class Element>
HRESULT ReadElements(const Object& object, const PropertyKey& key, std::vector<Element>& elements) {
    aafUInt32 count = 0;
    const HRESULT result = CountElements(object, key, sizeof(Element), &count);
    if (result < 0) {
        return result;
    }
    elements.resize(count);
    return count == 0 ? result : object.ReadNative(key, elements.data(), count * sizeof(Element));
}

// The elements in order and each once, as two equal sets should be stored alike.
template <class Element, class Less>
HRESULT PutSet(Object& object, const PropertyKey& key, std::vector<Element> elements, Less less) {
    std::sort(elements.begin(), elements.end(), less);
    elements.erase(std::unique(elements.begin(), elements.end()), elements.end());
    elements.reserve(1);  // an empty set has an address too
    return object.PutNative(key, elements.data(), elements.size() * sizeof(Element));
}

template <class Element>
HRESULT IsElement(const Object& object, const PropertyKey& key, const Element& element,
                  aafBoolean_t* isPresent) {
    if (isPresent == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    std::vector<Element> elements;
    const HRESULT result = ReadElements(object, key, elements);
    if (result >= 0) {
        const bool found = std::find(elements.begin(), elements.end(), element) != elements.end();
        *isPresent = found ? kAAFTrue : kAAFFalse;
    }
    return result;
}

// AAFRESULT_INVALID_PARAM for one that is there.
template <class Element, class Less>
HRESULT AddElement(Object& object, const PropertyKey& key, const Element& element, Less less) {
    std::vector<Element> elements;
    ReadElements(object, key, elements);
    if (std::find(elements.begin(), elements.end(), element) != elements.end()) {
        return AAFRESULT_INVALID_PARAM;
    }
    elements.push_back(element);
    return PutSet(object, key, std::move(elements), less);
}

// AAFRESULT_PROP_NOT_PRESENT without the set, AAFRESULT_ELEMENT_NOT_PRESENT without the element.
template <class Element, class Less>
HRESULT RemoveElement(Object& object, const PropertyKey& key, const Element& element, Less less) {
    std::vector<Element> elements;
    const HRESULT result = ReadElements(object, key, elements);
    if (result < 0) {
        return result;
    }
    const auto found = std::find(elements.begin(), elements.end(), element);
    if (found == elements.end()) {
        return AAFRESULT_ELEMENT_NOT_PRESENT;
    }
    elements.erase(found);
    return PutSet(object, key, std::move(elements), less);
}

}  // namespace aaf
