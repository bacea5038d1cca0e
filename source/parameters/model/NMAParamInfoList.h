// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamInfoParam.h"
#include "source/parameters/model/ParamItems.h"

namespace NMA::XMLUtils {

// Parameter descriptions, single and in groups. Searches stay on their own level.
template <class Group>
class NMAParamInfoList : public NMAParamElement {
public:
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
    NCFRESULT GetGroupAt(ncfUInt32 index, Group& out) const {
        return FillParam(out, GetParamItemAt(Element(), kParamGroupItem, index));
    }
    NCFRESULT GetGroup(const GUID& id, Group& out) const {
        return FillParam(out, GetParamItem(Element(), kParamGroupItem, ParamIdKey(id)));
    }
    NCFRESULT AddGroup(const GUID& id, Group& out) {
        return FillParam(out, AddParamItem(Element(), kParamGroupItem, ParamIdKey(id)));
    }
    NCFRESULT RemoveGroup(const GUID& id) {
        RemoveParamItem(Element(), kParamGroupItem, ParamIdKey(id));
        return NCF_OK;
    }
};

}  // namespace NMA::XMLUtils
