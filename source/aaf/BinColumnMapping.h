// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/framework/ResultCodes.h"
#include "source/aaf/AAFSmartPointer.h"

namespace NMA::Impl {

// Ties the clip's user parameters to bin columns: one comment for each with its
// starting value, and one that maps parameter ids to column names. Failures go
// to the process logger; NMA_E_AAF_ADD for a comment that is refused.
NCFRESULT AddBinColMappingToMob(IAAFSmartPointer<IAAFMob> pMobMasterMob);

}  // namespace NMA::Impl
