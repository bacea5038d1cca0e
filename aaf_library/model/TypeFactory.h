// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/TypeDefinition.h"

namespace aaf {

// The definition of a built-in type, free; makes those that it is built of in the model.
RefPtr<TypeDefinition> MakeBuiltInType(Model& model, const BuiltInType& entry);

}  // namespace aaf
