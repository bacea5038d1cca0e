// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamInfoParam.h"
#include "source/parameters/model/NMAParameter.h"
#include "source/parameters/model/ParamItems.h"

namespace NMA::XMLUtils {

// A named set of parameter values.
class NMAParamSet : public NMAParamElement {
public:
    NCFRESULT GetID(GUID& out) const {
        out = GetParamId(Element());
        return NCF_OK;
    }
    bool IsReadOnly() const { return GetParamFlag(Element(), kParamReadOnly); }
    NCFRESULT SetReadOnly(bool readOnly) {
        SetParamFlag(Element(), kParamReadOnly, readOnly);
        return NCF_OK;
    }
    NCFRESULT GetVersion(NMAString& out) const {
        GetParamText(Element(), kParamVersion, out);
        return NCF_OK;
    }
    NCFRESULT SetVersion(const NMAString& text) {
        SetParamText(Element(), kParamVersion, text);
        return NCF_OK;
    }
    NCFRESULT GetName(NMAString& out) const {
        GetParamText(Element(), kParamName, out);
        return NCF_OK;
    }
    NCFRESULT SetName(const NMAString& text) {
        SetParamText(Element(), kParamName, text);
        return NCF_OK;
    }

    ncfUInt32 GetParameterCount() const { return CountParamItems(Element(), kParamItem); }
    ncfUInt32 CountParameters(const GUID& id) const {
        return CountParamItems(Element(), kParamItem, ParamIdKey(id));
    }
    NCFRESULT GetParameterAt(ncfUInt32 index, NMAParameter& out) const {
        return FillParam(out, GetParamItemAt(Element(), kParamItem, index));
    }
    NCFRESULT GetParameter(const GUID& id, NMAParameter& out) const {
        return FillParam(out, GetParamItem(Element(), kParamItem, ParamIdKey(id)));
    }
    // A parameter of the kind that is described, with an empty value. It
    // carries no id, so it is found by index only.
    NCFRESULT AddParameter(const NMAParamInfoParam& infoParam, NMAParameter& out);
    NCFRESULT RemoveParameter(const GUID& id) {
        RemoveParamItem(Element(), kParamItem, ParamIdKey(id));
        return NCF_OK;
    }
};

}  // namespace NMA::XMLUtils
