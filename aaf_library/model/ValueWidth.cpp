// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/ValueWidth.h"

#include <algorithm>

#include "aaf_library/model/Model.h"
#include "aaf_library/model/StoredNumbers.h"
#include "aaf_library/model/TypeInteger.h"

namespace aaf {

namespace {

// The integer that a number is stored as; null for anything else.
const TypeInteger* IntegerIn(const TypeDefinition& type) {
    const TypeDefinition& plain = type.Resolved();
    const TypeDefinition& number =
        plain.kind() == TypeKind::Enumeration ? plain.element()->Resolved() : plain;
    return number.kind() == TypeKind::Integer ? static_cast<const TypeInteger*>(&number) : nullptr;
}

}  // namespace

bool HasWidthOf(const TypeDefinition& type, const TypeDefinition& other) {
    if (type.form() != ValueForm::Data || type.StoredSize() != other.StoredSize()) {
        return type.form() != ValueForm::Data;
    }
    return type.StoredSize() != 0 || type.element() == nullptr || other.element() == nullptr ||
           HasWidthOf(*type.element(), *other.element());
}

bool Widen(const PropertyValue& value, const TypeDefinition& to, Bytes& bytes) {
    const TypeInteger* const from = IntegerIn(value.type());
    const TypeInteger* const target = IntegerIn(to);
    const Bytes& stored = value.bytes();
    if (from == nullptr || target == nullptr || stored.size() != from->StoredSize()) {
        return false;
    }
    const std::uint64_t number =
        from->IsSignedType() ? static_cast<std::uint64_t>(SignedAt(stored.data(), stored.size()))
                             : UnsignedAt(stored.data(), stored.size());
    bytes.clear();
    AppendNumber(number, target->StoredSize(), bytes);
    // It has to come back as the same.
    const std::uint64_t back =
        target->IsSignedType() ? static_cast<std::uint64_t>(SignedAt(bytes.data(), bytes.size()))
                               : UnsignedAt(bytes.data(), bytes.size());
    return back == number;
}

bool HasRedefinedTypes(const Model& model) {
    const auto& types = model.madeTypes();
    return std::any_of(types.begin(), types.end(), [](const RefPtr<TypeDefinition>& type) {
        if (type->kind() != TypeKind::Rename && type->kind() != TypeKind::Enumeration) {
            return false;
        }
        const BuiltInType* const entry = FindBuiltInType(type->id());
        return entry != nullptr && !(type->element()->id() == entry->target);
    });
}

}  // namespace aaf
