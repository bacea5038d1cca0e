// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/NMAParamComponent.h"

#include "source/parameters/ParamItems.h"
#include "source/parameters/ParamVocabulary.h"

namespace NMA::XMLUtils {

NMAParamComponent::~NMAParamComponent() = default;

NCFRESULT NMAParamComponent::GetID(GUID& out) const {
    out = GetParamId(Element());
    return NCF_OK;
}

NCFRESULT NMAParamComponent::GetVersion(NMAString& out) const {
    GetParamText(Element(), kParamVersion, out);
    return NCF_OK;
}

NCFRESULT NMAParamComponent::SetVersion(const NMAString& text) {
    SetParamText(Element(), kParamVersion, text);
    return NCF_OK;
}

NCFRESULT NMAParamComponent::GetShortName(NMAString& out) const {
    GetParamText(Element(), kParamShortName, out);
    return NCF_OK;
}

NCFRESULT NMAParamComponent::SetShortName(const NMAString& text) {
    SetParamText(Element(), kParamShortName, text);
    return NCF_OK;
}

ncfUInt32 NMAParamComponent::GetTrackCount() const {
    return CountParamItems(Element(), kParamTrack);
}

NCFRESULT NMAParamComponent::GetTrackAt(ncfUInt32 index, NMAParamTrack& out) const {
    return FillParam(out, GetParamItemAt(Element(), kParamTrack, index));
}

NCFRESULT NMAParamComponent::GetTrack(ncfUInt32 number, NMAParamTrack& out) const {
    return FillParam(out, GetParamItem(Element(), kParamTrack, ParamNumberKey(number)));
}

NCFRESULT NMAParamComponent::AddTrack(ncfUInt32 number, NMAParamTrack& out) {
    return FillParam(out, AddParamItem(Element(), kParamTrack, ParamNumberKey(number)));
}

NCFRESULT NMAParamComponent::RemoveTrack(ncfUInt32 number) {
    RemoveParamItem(Element(), kParamTrack, ParamNumberKey(number));
    return NCF_OK;
}

}  // namespace NMA::XMLUtils
