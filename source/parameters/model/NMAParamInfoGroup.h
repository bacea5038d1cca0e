// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/model/NMAParamInfoParam.h"

namespace NMA::XMLUtils {

// A named group of parameter descriptions and of further groups. Its searches
// stay on its own level.
class NMAParamInfoGroup : public NMAParamElement {
public:
    ~NMAParamInfoGroup() override;

    NCFRESULT GetID(GUID& out) const;
    // Free text, an attribute.
    NCFRESULT GetDisplayState(NMAString& out) const;
    NCFRESULT SetDisplayState(const NMAString& text);
    NCFRESULT GetShortName(NMAString& out) const;
    NCFRESULT SetShortName(const NMAString& text);
    NCFRESULT GetDescription(NMAString& out) const;
    NCFRESULT SetDescription(const NMAString& text);

    ncfUInt32 GetParameterCount() const;
    NCFRESULT GetParameterAt(ncfUInt32 index, NMAParamInfoParam& out) const;
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
