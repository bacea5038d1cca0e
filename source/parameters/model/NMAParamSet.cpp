// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamSet.h"

namespace NMA::XMLUtils {

// As with a new set, the id is for the caller to write. A description without a
// value info leaves a parameter without a value behind.
NCFRESULT NMAParamSet::AddParameter(const NMAParamInfoParam& infoParam, NMAParameter& out) {
    GUID id{};
    infoParam.GetID(id);
    RequireFreeParamKey(Element(), kParamItem, ParamIdKey(id));
    NMAXmlElement* const parameter = AddParamElement(Element(), kParamItem);
    NMAParamValueInfo valueInfo;
    infoParam.GetValueInfo(valueInfo);
    AddParamElement(*parameter, kParamKindNames[valueInfo.GetKind()].value);
    return FillParam(out, parameter);
}

}  // namespace NMA::XMLUtils
