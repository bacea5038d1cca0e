// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamTrack.h"
#include "source/parameters/model/ParamItems.h"

namespace NMA::XMLUtils {

// A component whose parameters the document holds, with its tracks.
class NMAParamComponent : public NMAParamElement {
public:
    NCFRESULT GetID(GUID& out) const {
        out = GetParamId(Element());
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
    NCFRESULT GetShortName(NMAString& out) const {
        GetParamText(Element(), kParamShortName, out);
        return NCF_OK;
    }
    NCFRESULT SetShortName(const NMAString& text) {
        SetParamText(Element(), kParamShortName, text);
        return NCF_OK;
    }

    ncfUInt32 GetTrackCount() const { return CountParamItems(Element(), kParamTrack); }
    NCFRESULT GetTrackAt(ncfUInt32 index, NMAParamTrack& out) const {
        return FillParam(out, GetParamItemAt(Element(), kParamTrack, index));
    }
    NCFRESULT GetTrack(ncfUInt32 number, NMAParamTrack& out) const {
        return FillParam(out, GetParamItem(Element(), kParamTrack, ParamNumberKey(number)));
    }
    NCFRESULT AddTrack(ncfUInt32 number, NMAParamTrack& out) {
        return FillParam(out, AddParamItem(Element(), kParamTrack, ParamNumberKey(number)));
    }
    NCFRESULT RemoveTrack(ncfUInt32 number) {
        RemoveParamItem(Element(), kParamTrack, ParamNumberKey(number));
        return NCF_OK;
    }
};

}  // namespace NMA::XMLUtils
