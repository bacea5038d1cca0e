// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

namespace aaf {

class Model;

// Registers with the target whatever was registered with the source beyond the
// built-in model, also what nothing uses yet.
HRESULT CopyExtensions(Model& source, Model& target);
// Whether a new file would then say the same of them in every byte but for their numbers.
bool AreExtensionsCopiedAlike(Model& model);

}  // namespace aaf
