// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/NMAParamInfoGroup.h"

#include "source/parameters/ParamItems.h"
#include "source/parameters/ParamVocabulary.h"

namespace NMA::XMLUtils {

NMAParamInfoGroup::~NMAParamInfoGroup() = default;

NCFRESULT NMAParamInfoGroup::GetID(GUID& out) const {
    out = GetParamId(Element());
    return NCF_OK;
}

NCFRESULT NMAParamInfoGroup::GetDisplayState(NMAString& out) const {
    out = GetParamAttribute(Element(), kParamDisplayState);
    return NCF_OK;
}

NCFRESULT NMAParamInfoGroup::SetDisplayState(const NMAString& text) {
    Element().SetAttribute(NMAString(kParamDisplayState), text);
    return NCF_OK;
}

NCFRESULT NMAParamInfoGroup::GetShortName(NMAString& out) const {
    GetParamText(Element(), kParamShortName, out);
    return NCF_OK;
}

NCFRESULT NMAParamInfoGroup::SetShortName(const NMAString& text) {
    SetParamText(Element(), kParamShortName, text);
    return NCF_OK;
}

NCFRESULT NMAParamInfoGroup::GetDescription(NMAString& out) const {
    GetParamText(Element(), kParamDescription, out);
    return NCF_OK;
}

NCFRESULT NMAParamInfoGroup::SetDescription(const NMAString& text) {
    SetParamText(Element(), kParamDescription, text);
    return NCF_OK;
}

ncfUInt32 NMAParamInfoGroup::GetParameterCount() const {
    return CountParamItems(Element(), kParamItem);
}

NCFRESULT NMAParamInfoGroup::GetParameterAt(ncfUInt32 index, NMAParamInfoParam& out) const {
    return FillParam(out, GetParamItemAt(Element(), kParamItem, index));
}

NCFRESULT NMAParamInfoGroup::GetParameter(const GUID& id, NMAParamInfoParam& out) const {
    return FillParam(out, GetParamItem(Element(), kParamItem, ParamIdKey(id)));
}

NCFRESULT NMAParamInfoGroup::AddParameter(const GUID& id, NMAParamInfoParam& out) {
    return FillParam(out, AddParamItem(Element(), kParamItem, ParamIdKey(id)));
}

NCFRESULT NMAParamInfoGroup::RemoveParameter(const GUID& id) {
    RemoveParamItem(Element(), kParamItem, ParamIdKey(id));
    return NCF_OK;
}

ncfUInt32 NMAParamInfoGroup::GetGroupCount() const {
    return CountParamItems(Element(), kParamGroupItem);
}

NCFRESULT NMAParamInfoGroup::GetGroupAt(ncfUInt32 index, NMAParamInfoGroup& out) const {
    return FillParam(out, GetParamItemAt(Element(), kParamGroupItem, index));
}

NCFRESULT NMAParamInfoGroup::GetGroup(const GUID& id, NMAParamInfoGroup& out) const {
    return FillParam(out, GetParamItem(Element(), kParamGroupItem, ParamIdKey(id)));
}

NCFRESULT NMAParamInfoGroup::AddGroup(const GUID& id, NMAParamInfoGroup& out) {
    return FillParam(out, AddParamItem(Element(), kParamGroupItem, ParamIdKey(id)));
}

NCFRESULT NMAParamInfoGroup::RemoveGroup(const GUID& id) {
    RemoveParamItem(Element(), kParamGroupItem, ParamIdKey(id));
    return NCF_OK;
}

}  // namespace NMA::XMLUtils
