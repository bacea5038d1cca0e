// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/parameters/DocumentWords.h"
#include "source/parameters/model/NMAParamInfoGroup.h"
#include "source/parameters/model/ParamItems.h"

namespace NMA::XMLUtils {

// The descriptions of a track's parameters, single and in groups, and the files
// that parameters may be kept in.
class NMAParamInfos : public NMAParamInfoList<NMAParamInfoGroup> {
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

    // Looks in the groups too, one level down. Not found is returned, not
    // thrown: NMA_E_NODATA.
    NCFRESULT GetParameter(const GUID& id, NMAParamInfoParam& out) const;
};

}  // namespace NMA::XMLUtils
