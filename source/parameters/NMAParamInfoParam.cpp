// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/NMAParamInfoParam.h"

#include "source/parameters/ParamItems.h"
#include "source/parameters/ParamVocabulary.h"

namespace NMA::XMLUtils {

NMAParamInfoParam::~NMAParamInfoParam() = default;

NCFRESULT NMAParamInfoParam::GetID(GUID& out) const {
    out = GetParamId(Element());
    return NCF_OK;
}

NCFRESULT NMAParamInfoParam::GetShortName(NMAString& out) const {
    GetParamText(Element(), kParamShortName, out);
    return NCF_OK;
}

NCFRESULT NMAParamInfoParam::SetShortName(const NMAString& text) {
    SetParamText(Element(), kParamShortName, text);
    return NCF_OK;
}

NCFRESULT NMAParamInfoParam::GetDescription(NMAString& out) const {
    GetParamText(Element(), kParamDescription, out);
    return NCF_OK;
}

NCFRESULT NMAParamInfoParam::SetDescription(const NMAString& text) {
    SetParamText(Element(), kParamDescription, text);
    return NCF_OK;
}

NCFRESULT NMAParamInfoParam::GetValueInfo(NMAParamValueInfo& out) const {
    return FillParam(out, GetParamItemAt(Element(), kParamValueInfo, 0));
}

}  // namespace NMA::XMLUtils
