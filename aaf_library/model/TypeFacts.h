// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"

// All that the definition of a type says, as plain values. What is built in, what
// comes from another model and what a file's meta-dictionary holds become types by
// them, and a type is stored by them.

namespace aaf {

struct TypeFacts {
    GUID id{};
    std::wstring name;
    TypeKind kind = TypeKind::Integer;
    GUID target{};           // element, renamed or character type; class referred to
    std::uint32_t size = 0;  // integer: bytes; fixed array: elements
    bool isSigned = false;   // integer
    TypeMembers members;
};

bool operator==(const TypeFacts& left, const TypeFacts& right);

// Those of a built-in type are the same object for the whole process.
const TypeFacts& FactsOf(const BuiltInType& entry);
TypeFacts FactsOf(const TypeDefinition& type);
TypeMembers MembersOf(const TypeDefinition& type);

// References name a class; all other targets are types.
inline bool RefersToClass(TypeKind kind) {
    return kind == TypeKind::StrongReference || kind == TypeKind::WeakReference;
}

// The class of the definitions of one kind, and the other way round: false for a class of
// anything else.
const GUID& ClassOfTypes(TypeKind kind);
bool IsClassOfTypes(const GUID& classId, TypeKind* kind);
inline constexpr int kTypeKinds = static_cast<int>(TypeKind::Character) + 1;
eAAFTypeCategory_t CategoryOf(TypeKind kind);

// An empty type of a model.
RefPtr<TypeDefinition> MakeType(Model& model, TypeKind kind);
// A free type with these facts; null when the model lacks a type that they name.
RefPtr<TypeDefinition> MakeType(Model& model, const TypeFacts& facts);
// Makes a type say what the facts of the same id say: its name, the members of an enumeration in
// front of those that they don't mention, the type that is renamed. False when they say something
// that a type can't change: that it is of another kind.
bool Redefine(TypeDefinition& type, Model& model, const TypeFacts& facts);
// Adds the members of an enumeration that a file has besides, and nothing else. What the type had
// added before counts more than they do. False for facts of another kind.
bool AddMembers(TypeDefinition& type, const TypeFacts& facts);
// The definition of a built-in type, free; makes those that it is built of in the model.
RefPtr<TypeDefinition> MakeBuiltInType(Model& model, const BuiltInType& entry);

}  // namespace aaf
