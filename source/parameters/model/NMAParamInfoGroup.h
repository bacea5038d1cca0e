// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamInfoParam.h"
#include "source/parameters/model/ParamItems.h"

namespace NMA::XMLUtils {

// A named group of parameter descriptions and of further groups. Its searches
// stay on its own level.
class NMAParamInfoGroup : public NMAParamElement {
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

    ncfUInt32 GetParameterCount() const { return CountParamItems(Element(), kParamItem); }
    NCFRESULT GetParameterAt(ncfUInt32 index, NMAParamInfoParam& out) const {
        return FillParam(out, GetParamItemAt(Element(), kParamItem, index));
    }
    NCFRESULT GetParameter(const GUID& id, NMAParamInfoParam& out) const {
        return FillParam(out, GetParamItem(Element(), kParamItem, ParamIdKey(id)));
    }
    NCFRESULT AddParameter(const GUID& id, NMAParamInfoParam& out) {
        return FillParam(out, AddParamItem(Element(), kParamItem, ParamIdKey(id)));
    }
    NCFRESULT RemoveParameter(const GUID& id) {
        RemoveParamItem(Element(), kParamItem, ParamIdKey(id));
        return NCF_OK;
    }

    ncfUInt32 GetGroupCount() const { return CountParamItems(Element(), kParamGroupItem); }
    NCFRESULT GetGroupAt(ncfUInt32 index, NMAParamInfoGroup& out) const {
        return FillParam(out, GetParamItemAt(Element(), kParamGroupItem, index));
    }
    NCFRESULT GetGroup(const GUID& id, NMAParamInfoGroup& out) const {
        return FillParam(out, GetParamItem(Element(), kParamGroupItem, ParamIdKey(id)));
    }
    NCFRESULT AddGroup(const GUID& id, NMAParamInfoGroup& out) {
        return FillParam(out, AddParamItem(Element(), kParamGroupItem, ParamIdKey(id)));
    }
    NCFRESULT RemoveGroup(const GUID& id) {
        RemoveParamItem(Element(), kParamGroupItem, ParamIdKey(id));
        return NCF_OK;
    }
};

}  // namespace NMA::XMLUtils
