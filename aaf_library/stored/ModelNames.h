// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/MetaRecords.h"
#include "aaf_library/stored/StoredNames.h"

#include <string>

namespace aaf {
class TypeDefinition;
}

// Small translations between the object model and the stored form.

namespace aaf::stored {

std::u16string Utf16Of(const std::wstring& text);
std::wstring WideOf(const std::u16string& text);
// For messages, as ToUtf8 of StoredNames.h.
std::string ToUtf8(const std::wstring& text);

// Form in which a property of that type is stored.
StoredForm StoredFormOf(const TypeDefinition& type);

// The reference type behind a reference, or behind the elements of a
// collection of references.
const TypeDefinition& ReferenceIn(const TypeDefinition& type);

// Ids of the root's two properties, with which every path of a weak reference
// begins. The root's class stands in no dictionary.
inline constexpr GUID kRootMetaDictionaryId = ncfGuid("0D010301-0101-0100-060E-2B3401010102");
inline constexpr GUID kRootHeaderId = ncfGuid("0D010301-0102-0100-060E-2B3401010102");

}  // namespace aaf::stored
