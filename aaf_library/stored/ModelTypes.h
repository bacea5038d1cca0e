// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/RefPtr.h"
#include "aaf_library/stored/MetaRecords.h"

namespace aaf {
class Model;
class TypeDefinition;
}  // namespace aaf

namespace aaf::stored {

// Pids from here on mean something else in every file.
inline constexpr std::uint16_t kFirstLocalPid = 0x8000;

// Whether the record makes sense: there is no integer of 3 bytes, for one, nor a value that is
// larger than any that can be stored.
bool IsStorable(const TypeFacts& record, Model& model);

// A free type made of the record. Everything that it refers to must be in the
// model. Null unless the record is storable.
RefPtr<TypeDefinition> StorableType(const TypeFacts& record, Model& model);

}  // namespace aaf::stored
