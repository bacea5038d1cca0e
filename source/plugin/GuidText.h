// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Guid.h"
#include "host_interfaces/util/NMAString.h"

// Reads a label of the form 8-4-4-4-12 hexadecimal digits in either case, as sscanf
// reads numbers: one may have fewer digits, or begin with blanks, a sign or 0X,
// which count among its digits but for the blanks. What follows the last isn't
// looked at. false, with the output untouched, where fewer than all numbers are there.
bool StringToGUID(const NMAString& text, GUID* out);

// The form 8-4-4-4-12 with capital letters.
NMAString GUIDToString(const GUID& id);
