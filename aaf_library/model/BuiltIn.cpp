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

struct OwnedProperty {
    const BuiltInProperty* property = nullptr;
    const BuiltInClass* owner = nullptr;
};
using PropertyIndex = std::unordered_map<GUID, OwnedProperty, GuidHash>;

PropertyIndex IndexOfProperties() {
    PropertyIndex index;
    for (const BuiltInClass& entry : BuiltInClasses()) {
        for (const BuiltInProperty& property : entry.properties) {
            index.emplace(property.key.id, OwnedProperty{&property, &entry});
        }
    }
    return index;
}

OwnedProperty FindOwned(const GUID& id) {
    static const PropertyIndex index = IndexOfProperties();
    const auto found = index.find(id);
    return found == index.end() ? OwnedProperty{} : found->second;
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
    return FindOwned(id).property;
}

const BuiltInClass* FindClassOfBuiltInProperty(const GUID& id) {
    return FindOwned(id).owner;
}

}  // namespace aaf
