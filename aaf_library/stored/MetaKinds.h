// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/MetaRecords.h"

// How each kind of definition is stored; between MetaRecords and its two
// directions only.

namespace aaf::stored {

struct TypeKindClass {
    TypeKind kind;
    std::uint16_t classNumber;  // the group in which the ids of meta classes differ
    std::uint16_t targetPid;    // weak reference to the type or class it is made of, or 0
};

extern const GUID classDefinitionClass;
extern const GUID propertyDefinitionClass;
extern const GUID metaDictionaryClass;

Span<TypeKindClass> allKindClasses();
const TypeKindClass& kindClass(TypeKind kind);
const TypeKindClass* findKindClass(const GUID& definitionClass);

// References name a class; all other targets are types.
inline bool refersToClass(TypeKind kind) {
    return kind == TypeKind::StrongReference || kind == TypeKind::WeakReference;
}

}  // namespace aaf::stored
