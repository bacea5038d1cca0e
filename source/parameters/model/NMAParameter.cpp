// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParameter.h"

#include "source/parameters/model/ParamItems.h"
#include "source/plugin/ResultChecks.h"

namespace NMA::XMLUtils {
namespace {

NMAXmlElement* FindValue(NMAXmlElement& parameter, NMAParamKind kind) {
    return parameter.FindChild(NMAString(kParamKindNames[kind].value), 0);
}

}  // namespace

NMAParameter::~NMAParameter() = default;

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

NCFRESULT NMAParameter::GetID(GUID& out) const {
    out = GetParamId(Element());
    return NCF_OK;
}

bool NMAParameter::IsSilent() const {
    return GetParamFlag(Element(), kParamSilent);
}

NCFRESULT NMAParameter::SetSilent(bool silent) {
    SetParamFlag(Element(), kParamSilent, silent);
    return NCF_OK;
}

NCFRESULT NMAParameter::GetBoolean(bool& out) const {
    out = ParamText::IsTrue(textOf(valueElement(kParamKindBoolean)));
    return NCF_OK;
}

NCFRESULT NMAParameter::GetString(NMAString& out) const {
    valueElement(kParamKindString).GetText(out);
    return NCF_OK;
}

}  // namespace NMA::XMLUtils
