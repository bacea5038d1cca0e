// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamInfoGroup.h"
#include "source/parameters/model/ParamItems.h"

namespace NMA::XMLUtils {

// The descriptions of a track's parameters, single and in groups, and the files
// that parameters may be kept in.
class NMAParamInfos : public NMAParamElement {
public:
    NCFRESULT GetVersion(NMAString& out) const;
    NCFRESULT SetVersion(const NMAString& text) {
        SetParamText(Element(), kParamVersion, text);
        return NCF_OK;
    }

    // Kinds of files, by their extension; case does not count.
    ncfUInt32 GetExternalCount() const { return CountParamItems(Element(), kParamExternal); }
    NCFRESULT GetExternalAt(ncfUInt32 index, NMAString& outExtension, NMAString& outShortName,
                            NMAString& outDescription) const;
    NCFRESULT GetExternal(const NMAString& extension, NMAString& outShortName,
                          NMAString& outDescription) const;
    NCFRESULT AddExternal(const NMAString& extension, const NMAString& shortName,
                          const NMAString& description);
    NCFRESULT RemoveExternal(const NMAString& extension);

    ncfUInt32 GetParameterCount() const { return CountParamItems(Element(), kParamItem); }
    NCFRESULT GetParameterAt(ncfUInt32 index, NMAParamInfoParam& out) const {
        return FillParam(out, GetParamItemAt(Element(), kParamItem, index));
    }
    // Looks in the groups too, one level down. Not found is returned, not
    // thrown: NMA_E_NODATA.
    NCFRESULT GetParameter(const GUID& id, NMAParamInfoParam& out) const;
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
