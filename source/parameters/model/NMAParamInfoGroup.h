// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamInfoList.h"
#include "source/parameters/model/ParamItems.h"

namespace NMA::XMLUtils {

// A named group of parameter descriptions and of further groups. Its searches
// stay on its own level.
class NMAParamInfoGroup : public NMAParamInfoList<NMAParamInfoGroup> {
public:
    NCFRESULT GetID(GUID& out) const {
        out = GetParamId(Element());
        return NCF_OK;
    }
    // Free text, an attribute.
    NCFRESULT GetDisplayState(NMAString& out) const {
        out = GetParamAttribute(Element(), kParamDisplayState);
        return NCF_OK;
    }
    NCFRESULT SetDisplayState(const NMAString& text) {
        Element().SetAttribute(NMAString(kParamDisplayState), text);
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
};

}  // namespace NMA::XMLUtils
