// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFObjects.h"
#include "reference_host/cliphost/AafQuery.h"

namespace cliphost {

// Forms in which values of AAF objects are shown.
std::string ToText(const aafUID_t& id);
std::string ToText(const aafMobID_t& id);
std::string ToText(const aafTimeStamp_t& time);

// A property value as text: numbers, names of enumerations, texts in quotes,
// records by their members, references to definitions by name. Anything that
// can't be read is "?".
std::string ValueText(IAAFPropertyValue* value);

}  // namespace cliphost
