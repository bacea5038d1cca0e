// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamInfos.h"
#include "source/parameters/model/NMAParamSet.h"
#include "source/parameters/model/ParamItems.h"
#include "source/parameters/model/ParamText.h"

namespace NMA::XMLUtils {

// One track of a component: the descriptions of its parameters, the sets of
// their values, and which set is in use.
class NMAParamTrack : public NMAParamElement {
public:
    NCFRESULT GetNumber(ncfUInt32& out) const {
        ParamText::Read(GetParamAttribute(Element(), kParamNumber), out);
        return NCF_OK;
    }
    NCFRESULT GetParameterInfos(NMAParamInfos& out) const {
        return FillParam(out, GetParamItemAt(Element(), kParamInfos, 0));
    }
    NCFRESULT GetActiveSet(GUID& out) const;
    NCFRESULT SetActiveSet(const GUID& id) {
        SetParamText(Element(), kParamActiveSet, ParamText::Write(id));
        return NCF_OK;
    }

    ncfUInt32 GetParameterSetCount() const { return CountParamItems(Element(), kParamSetItem); }
    NCFRESULT GetParameterSetAt(ncfUInt32 index, NMAParamSet& out) const {
        return FillParam(out, GetParamItemAt(Element(), kParamSetItem, index));
    }
    NCFRESULT GetParameterSet(const GUID& id, NMAParamSet& out) const {
        return FillParam(out, GetParamItem(Element(), kParamSetItem, ParamIdKey(id)));
    }
    // The new set carries no id, so it is found by index only.
    NCFRESULT AddParameterSet(const GUID& id, NMAParamSet& out);
    NCFRESULT RemoveParameterSet(const GUID& id) {
        RemoveParamItem(Element(), kParamSetItem, ParamIdKey(id));
        return NCF_OK;
    }
};

}  // namespace NMA::XMLUtils
