// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/NMAParamSet.h"

#include "source/parameters/ParamItems.h"
#include "source/parameters/ParamVocabulary.h"

namespace NMA::XMLUtils {

NMAParamSet::~NMAParamSet() = default;

NCFRESULT NMAParamSet::GetID(GUID& out) const {
    out = GetParamId(Element());
    return NCF_OK;
}

bool NMAParamSet::IsReadOnly() const {
    return GetParamFlag(Element(), kParamReadOnly);
}

NCFRESULT NMAParamSet::SetReadOnly(bool readOnly) {
    SetParamFlag(Element(), kParamReadOnly, readOnly);
    return NCF_OK;
}

NCFRESULT NMAParamSet::GetVersion(NMAString& out) const {
    GetParamText(Element(), kParamVersion, out);
    return NCF_OK;
}

NCFRESULT NMAParamSet::SetVersion(const NMAString& text) {
    SetParamText(Element(), kParamVersion, text);
    return NCF_OK;
}

NCFRESULT NMAParamSet::GetName(NMAString& out) const {
    GetParamText(Element(), kParamName, out);
    return NCF_OK;
}

NCFRESULT NMAParamSet::SetName(const NMAString& text) {
    SetParamText(Element(), kParamName, text);
    return NCF_OK;
}

ncfUInt32 NMAParamSet::GetParameterCount() const {
    return CountParamItems(Element(), kParamItem);
}

ncfUInt32 NMAParamSet::CountParameters(const GUID& id) const {
    return CountParamItems(Element(), kParamItem, ParamIdKey(id));
}

NCFRESULT NMAParamSet::GetParameterAt(ncfUInt32 index, NMAParameter& out) const {
    return FillParam(out, GetParamItemAt(Element(), kParamItem, index));
}

NCFRESULT NMAParamSet::GetParameter(const GUID& id, NMAParameter& out) const {
    return FillParam(out, GetParamItem(Element(), kParamItem, ParamIdKey(id)));
}

// As with a new set, the id is for the caller to write. A description without a
// value info leaves a parameter without a value behind.
NCFRESULT NMAParamSet::AddParameter(const NMAParamInfoParam& infoParam, NMAParameter& out) {
    GUID id{};
    infoParam.GetID(id);
    RequireFreeParamKey(Element(), kParamItem, ParamIdKey(id));
    NMAXmlElement* const parameter = AddParamElement(Element(), kParamItem);
    NMAParamValueInfo valueInfo;
    infoParam.GetValueInfo(valueInfo);
    AddParamElement(*parameter, kParamKindNames[valueInfo.GetKind()].value);
    return FillParam(out, parameter);
}

NCFRESULT NMAParamSet::RemoveParameter(const GUID& id) {
    RemoveParamItem(Element(), kParamItem, ParamIdKey(id));
    return NCF_OK;
}

}  // namespace NMA::XMLUtils
