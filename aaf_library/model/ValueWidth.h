// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"

// A file may give a type another width: an enumeration of larger integers, a rename of a shorter
// type. Then the bytes of a value don't suit the type of the same id in another model.

namespace aaf {

// Whether values of both types are stored in the same bytes, as far as their widths tell.
bool HasWidthOf(const TypeDefinition& type, const TypeDefinition& other);

// A value's bytes as another type has them, which HasWidthOf denied. False for what is neither a
// number nor an array of numbers, and for a number that doesn't fit.
bool Widen(const PropertyValue& value, const TypeDefinition& to, Bytes& bytes);

// Whether a model has renames or enumerations of other integers than every file begins with.
bool HasRedefinedTypes(const Model& model);

}  // namespace aaf
