// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/model/NMAParamInfoParam.h"
#include "source/parameters/model/NMAParameter.h"

namespace NMA::XMLUtils {

// A named set of parameter values.
class NMAParamSet : public NMAParamElement {
public:
    ~NMAParamSet() override;

    NCFRESULT GetID(GUID& out) const;
    bool IsReadOnly() const;
    NCFRESULT SetReadOnly(bool readOnly);
    NCFRESULT GetVersion(NMAString& out) const;
    NCFRESULT SetVersion(const NMAString& text);
    NCFRESULT GetName(NMAString& out) const;
    NCFRESULT SetName(const NMAString& text);

    ncfUInt32 GetParameterCount() const;
    ncfUInt32 CountParameters(const GUID& id) const;
    NCFRESULT GetParameterAt(ncfUInt32 index, NMAParameter& out) const;
    NCFRESULT GetParameter(const GUID& id, NMAParameter& out) const;
    // A parameter of the kind that is described, with an empty value. It
    // carries no id, so it is found by index only.
    NCFRESULT AddParameter(const NMAParamInfoParam& infoParam, NMAParameter& out);
    NCFRESULT RemoveParameter(const GUID& id);
};

}  // namespace NMA::XMLUtils
