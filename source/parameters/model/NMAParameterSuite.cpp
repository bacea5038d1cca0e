// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParameterSuite.h"

#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {

NMAParameterSuite::~NMAParameterSuite() = default;

NMAXmlElement& NMAParameterSuite::root() const {
    if (!GetRoot()) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
    return *GetRoot();
}

}  // namespace NMA::XMLUtils
