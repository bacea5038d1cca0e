// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParameter.h"

#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {
namespace {

NMAXmlElement* FindValue(NMAXmlElement& parameter, NMAParamKind kind) {
    return parameter.FindChild(NMAString(kParamKindNames[kind].value), 0);
}

}  // namespace

NMAXmlElement& NMAParameter::valueElement(NMAParamKind kind) const {
    NMAXmlElement* const found = FindValue(Element(), kind);
    if (!found) {
        ThrowIfFailed(NCF_E_UNEXPECTED);
    }
    return *found;
}

NMAXmlElement& NMAParameter::uint32Element() const {
    NMAXmlElement* const found = FindValue(Element(), kParamKindUInt32);
    return found ? *found : valueElement(kParamKindDiscrete);
}

}  // namespace NMA::XMLUtils
