// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

// What is new each time: random ids and the time of day. The latter two kinds
// reach files, so a host that wants equal files of equal movies can pin them.

namespace aaf {

aafUID_t FreshId();

// The pinned time, or now in UTC with hundredths of zero.
aafTimeStamp_t CurrentTime();

// The pinned generation id, or a fresh one.
aafUID_t NewGenerationId();

// Null pointers let time and generation run free again.
void PinTime(const aafTimeStamp_t* time, const aafUID_t* generation);

}  // namespace aaf
