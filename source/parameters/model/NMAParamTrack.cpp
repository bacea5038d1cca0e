// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/NMAParamTrack.h"

namespace NMA::XMLUtils {

NCFRESULT NMAParamTrack::GetActiveSet(GUID& out) const {
    NMAString text;
    GetParamText(Element(), kParamActiveSet, text);
    ParamText::Read(text, out);
    return NCF_OK;
}

// The id serves to refuse a second set of that id; writing it is left to the
// caller, and the host relies on a new set being without one.
NCFRESULT NMAParamTrack::AddParameterSet(const GUID& id, NMAParamSet& out) {
    RequireFreeParamKey(Element(), kParamSetItem, ParamIdKey(id));
    return FillParam(out, AddParamElement(Element(), kParamSetItem));
}

}  // namespace NMA::XMLUtils
