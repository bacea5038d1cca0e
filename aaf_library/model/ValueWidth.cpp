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

bool WidenNumber(const TypeInteger& from, const TypeInteger& to, const std::uint8_t* stored,
                 Bytes& bytes) {
    const std::size_t size = from.StoredSize();
    const std::uint64_t number = from.IsSignedType()
                                     ? static_cast<std::uint64_t>(SignedAt(stored, size))
                                     : UnsignedAt(stored, size);
    AppendNumber(number, to.StoredSize(), bytes);
    // It has to come back as the same.
    const std::uint8_t* const widened = bytes.data() + bytes.size() - to.StoredSize();
    return number == (to.IsSignedType()
                          ? static_cast<std::uint64_t>(SignedAt(widened, to.StoredSize()))
                          : UnsignedAt(widened, to.StoredSize()));
}

// The type of the elements of an array; null for anything else.
const TypeDefinition* ElementIn(const TypeDefinition& type) {
    const TypeDefinition& plain = type.Resolved();
    const bool isArray = plain.kind() == TypeKind::VariableArray ||
                         plain.kind() == TypeKind::FixedArray || plain.kind() == TypeKind::Set;
    return isArray ? plain.element() : nullptr;
}

// A number, or all the elements of an array.
bool WidenEach(const TypeDefinition& from, const TypeDefinition& to, const std::uint8_t* stored,
               std::size_t size, Bytes& bytes) {
    const TypeDefinition* const element = ElementIn(from);
    const TypeDefinition* const wider = ElementIn(to);
    const TypeInteger* const number = IntegerIn(element == nullptr ? from : *element);
    const TypeInteger* const target = IntegerIn(wider == nullptr ? to : *wider);
    if ((element == nullptr) != (wider == nullptr) || number == nullptr || target == nullptr) {
        return false;
    }
    const std::size_t step = number->StoredSize();
    bool fits = step != 0 && (element == nullptr ? size == step : size % step == 0);
    for (std::size_t at = 0; fits && at < size; at += step) {
        fits = WidenNumber(*number, *target, stored + at, bytes);
    }
    return fits;
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
    bytes.clear();
    return WidenEach(value.type(), to, value.bytes().data(), value.bytes().size(), bytes);
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
