// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "host_interfaces/framework/Unknown.h"

namespace validate {

// An interface that an object of a module may have.
struct KnownInterface {
    const char* name;
    GUID id;
};

// Those that the rules of queries are held against. Left out are the three of a sample mapping
// that say otherwise: a query for INCFParametersXML makes another object, and one for the providers
// of samples prepares them, and fails where they can't be prepared.
const std::vector<KnownInterface>& KnownInterfaces();

}  // namespace validate
