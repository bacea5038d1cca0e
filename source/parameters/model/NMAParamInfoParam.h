// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamValueInfo.h"
#include "source/parameters/model/ParamItems.h"

namespace NMA::XMLUtils {

// The description of one parameter.
class NMAParamInfoParam : public NMAParamElement {
public:
    NCFRESULT GetID(GUID& out) const {
        out = GetParamId(Element());
        return NCF_OK;
    }
    NCFRESULT GetShortName(NMAString& out) const {
        GetParamText(Element(), kParamShortName, out);
        return NCF_OK;
    }
    NCFRESULT SetShortName(const NMAString& text) {
        SetParamText(Element(), kParamShortName, text);
        return NCF_OK;
    }
    NCFRESULT GetDescription(NMAString& out) const {
        GetParamText(Element(), kParamDescription, out);
        return NCF_OK;
    }
    NCFRESULT SetDescription(const NMAString& text) {
        SetParamText(Element(), kParamDescription, text);
        return NCF_OK;
    }
    NCFRESULT GetValueInfo(NMAParamValueInfo& out) const {
        return FillParam(out, GetParamItemAt(Element(), kParamValueInfo, 0));
    }
};

}  // namespace NMA::XMLUtils
