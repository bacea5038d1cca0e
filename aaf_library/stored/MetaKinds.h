// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/stored/MetaPids.h"
#include "aaf_library/stored/MetaRecords.h"

// How each kind of definition is stored; between MetaRecords and its two
// directions only.

namespace aaf::stored {

// The weak reference of a type's definition to the type or class it is made of, or 0.
std::uint16_t TargetPidOf(TypeKind kind);

}  // namespace aaf::stored
