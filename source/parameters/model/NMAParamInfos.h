// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/model/NMAParamInfoGroup.h"

namespace NMA::XMLUtils {

// The descriptions of a track's parameters, single and in groups, and the files
// that parameters may be kept in.
class NMAParamInfos : public NMAParamElement {
public:
    ~NMAParamInfos() override;

    NCFRESULT GetVersion(NMAString& out) const;
    NCFRESULT SetVersion(const NMAString& text);

    // Kinds of files, by their extension; case does not count.
    ncfUInt32 GetExternalCount() const;
    NCFRESULT GetExternalAt(ncfUInt32 index, NMAString& outExtension, NMAString& outShortName,
                            NMAString& outDescription) const;
    NCFRESULT GetExternal(const NMAString& extension, NMAString& outShortName,
                          NMAString& outDescription) const;
    NCFRESULT AddExternal(const NMAString& extension, const NMAString& shortName,
                          const NMAString& description);
    NCFRESULT RemoveExternal(const NMAString& extension);

    ncfUInt32 GetParameterCount() const;
    NCFRESULT GetParameterAt(ncfUInt32 index, NMAParamInfoParam& out) const;
    // Looks in the groups too, one level down. Not found is returned, not
    // thrown: NMA_E_NODATA.
    NCFRESULT GetParameter(const GUID& id, NMAParamInfoParam& out) const;
    NCFRESULT AddParameter(const GUID& id, NMAParamInfoParam& out);
    NCFRESULT RemoveParameter(const GUID& id);

    ncfUInt32 GetGroupCount() const;
    NCFRESULT GetGroupAt(ncfUInt32 index, NMAParamInfoGroup& out) const;
    NCFRESULT GetGroup(const GUID& id, NMAParamInfoGroup& out) const;
    NCFRESULT AddGroup(const GUID& id, NMAParamInfoGroup& out);
    NCFRESULT RemoveGroup(const GUID& id);
};

}  // namespace NMA::XMLUtils
