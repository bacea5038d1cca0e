// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/framework/ResultCodes.h"

namespace cliphost {

// A result code for people: its name, its number and what it says, such as
// "NMA_E_NODATA (0xA000006F): there is no data".
std::string ResultText(NCFRESULT result);
// The name alone; the number where it has none.
std::string ResultName(NCFRESULT result);

}  // namespace cliphost
