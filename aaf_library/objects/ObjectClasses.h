// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/model/ClassRegistry.h"

namespace aaf {

// All classes of the object model that have a C++ class of their own, of this
// room and of the model's. Made once and shared.
const ClassRegistry& ObjectClasses();

}  // namespace aaf
