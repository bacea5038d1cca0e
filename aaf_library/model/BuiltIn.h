// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "aaf_library/model/GuidHash.h"
#include "aaf_library/model/PropertyKey.h"

// The built-in model as constant tables: classes with their properties, types,
// and the definitions that a new dictionary holds. The object model creates its
// definitions from them; the stored form writes and compares them.

namespace aaf {

template <class T>
struct Span {
    const T* first = nullptr;
    std::size_t count = 0;

    constexpr Span() = default;
    template <std::size_t N>
    constexpr Span(const T (&table)[N]) : first(table), count(N) {}

    const T* begin() const { return first; }
    const T* end() const { return first + count; }
    std::size_t size() const { return count; }
    const T& operator[](std::size_t index) const { return first[index]; }
};

// In the order of the ids of their definitions' classes.
enum class TypeKind {
    Integer,
    StrongReference,
    WeakReference,
    Enumeration,
    FixedArray,
    VariableArray,
    Set,
    String,
    Stream,
    Record,
    Rename,
    ExtendibleEnumeration,
    Indirect,
    Opaque,
    Character,
};

struct BuiltInProperty {
    const char* name;
    PropertyKey key;
    GUID type;
    bool optional;
    bool unique;
};

struct BuiltInClass {
    const char* name;
    GUID id;
    GUID parent;  // its own id for a root class
    bool concrete;
    bool listedAtStart;  // the others appear in a dictionary when they are first looked up
    Span<BuiltInProperty> properties;
};

struct BuiltInMember {
    const char* name;
    GUID id;         // record: type of the member; extendible enumeration: value; weak reference:
                     // property on the path from the root to the target set
    aafInt64 value;  // enumeration: value
};

struct BuiltInType {
    const char* symbol;  // as in kAAFTypeID_...
    const char* name;    // as the definition's name
    GUID id;
    TypeKind kind;
    GUID target;    // element, renamed or character type; referenced class
    unsigned size;  // integer: bytes; fixed array: elements
    bool isSigned;  // integer
    bool listedAtStart;
    Span<BuiltInMember> members;
};

struct BuiltInDefinition {
    GUID id;
    const char* name;
    const char* description;
};

Span<BuiltInClass> BuiltInClasses();
Span<BuiltInType> BuiltInTypes();
Span<BuiltInDefinition> BuiltInDataDefinitions();
Span<BuiltInDefinition> BuiltInContainerDefinitions();

// Null when not built in.
const BuiltInClass* FindBuiltInClass(const GUID& id);
const BuiltInType* FindBuiltInType(const GUID& id);
const BuiltInProperty* FindBuiltInProperty(const GUID& id);
// The class that has the built-in property with that id.
const BuiltInClass* FindClassOfBuiltInProperty(const GUID& id);

}  // namespace aaf
