// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/NMAParamTrack.h"

#include "source/parameters/ParamItems.h"
#include "source/parameters/ParamText.h"
#include "source/parameters/ParamVocabulary.h"

namespace NMA::XMLUtils {

NMAParamTrack::~NMAParamTrack() = default;

NCFRESULT NMAParamTrack::GetNumber(ncfUInt32& out) const {
    ParamText::Read(GetParamAttribute(Element(), kParamNumber), out);
    return NCF_OK;
}

NCFRESULT NMAParamTrack::GetParameterInfos(NMAParamInfos& out) const {
    return FillParam(out, GetParamItemAt(Element(), kParamInfos, 0));
}

NCFRESULT NMAParamTrack::GetActiveSet(GUID& out) const {
    NMAString text;
    GetParamText(Element(), kParamActiveSet, text);
    ParamText::Read(text, out);
    return NCF_OK;
}

NCFRESULT NMAParamTrack::SetActiveSet(const GUID& id) {
    SetParamText(Element(), kParamActiveSet, ParamText::Write(id));
    return NCF_OK;
}

ncfUInt32 NMAParamTrack::GetParameterSetCount() const {
    return CountParamItems(Element(), kParamSetItem);
}

NCFRESULT NMAParamTrack::GetParameterSetAt(ncfUInt32 index, NMAParamSet& out) const {
    return FillParam(out, GetParamItemAt(Element(), kParamSetItem, index));
}

NCFRESULT NMAParamTrack::GetParameterSet(const GUID& id, NMAParamSet& out) const {
    return FillParam(out, GetParamItem(Element(), kParamSetItem, ParamIdKey(id)));
}

// The id serves to refuse a second set of that id; writing it is left to the
// caller, and the host relies on a new set being without one.
NCFRESULT NMAParamTrack::AddParameterSet(const GUID& id, NMAParamSet& out) {
    RequireFreeParamKey(Element(), kParamSetItem, ParamIdKey(id));
    return FillParam(out, AddParamElement(Element(), kParamSetItem));
}

NCFRESULT NMAParamTrack::RemoveParameterSet(const GUID& id) {
    RemoveParamItem(Element(), kParamSetItem, ParamIdKey(id));
    return NCF_OK;
}

}  // namespace NMA::XMLUtils
