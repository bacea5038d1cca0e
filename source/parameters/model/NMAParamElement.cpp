// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamElement.h"

#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {

NMAParamElement::~NMAParamElement() = default;

NMAXmlElement& NMAParamElement::Element() const {
    if (!element_) {
        ThrowIfFailed(NMA_E_NOTINITIALIZED);
    }
    return *element_;
}

NCFRESULT FillParam(NMAParamElement& out, NMAXmlElement* element) {
    out.SetElement(element);
    return NCF_OK;
}

}  // namespace NMA::XMLUtils
