// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/BuiltIn.h"

#include <unordered_map>

namespace aaf {

namespace {

template <class T>
using Index = std::unordered_map<GUID, const T*, GuidHash>;

template <class T>
Index<T> IndexOf(Span<T> table) {
    Index<T> index;
    for (const T& entry : table) {
        index.emplace(entry.id, &entry);
    }
    return index;
}

template <class T>
const T* Find(const Index<T>& index, const GUID& id) {
    const auto found = index.find(id);
    return found == index.end() ? nullptr : found->second;
}

Index<BuiltInProperty> IndexOfProperties() {
    Index<BuiltInProperty> index;
    for (const BuiltInClass& entry : BuiltInClasses()) {
        for (const BuiltInProperty& property : entry.properties) {
            index.emplace(property.key.id, &property);
        }
    }
    return index;
}

}  // namespace

const BuiltInClass* FindBuiltInClass(const GUID& id) {
    static const Index<BuiltInClass> index = IndexOf(BuiltInClasses());
    return Find(index, id);
}

const BuiltInType* FindBuiltInType(const GUID& id) {
    static const Index<BuiltInType> index = IndexOf(BuiltInTypes());
    return Find(index, id);
}

const BuiltInProperty* FindBuiltInProperty(const GUID& id) {
    static const Index<BuiltInProperty> index = IndexOfProperties();
    return Find(index, id);
}

}  // namespace aaf
