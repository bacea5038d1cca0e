// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/model/NMAParameterSuite.h"

namespace fuzz {

// Reads all that the views show of a document, then writes it over. Of many
// items of one kind side by side the first few stand for all.
void WalkSuite(NMA::XMLUtils::NMAParameterSuite& suite);

}  // namespace fuzz
