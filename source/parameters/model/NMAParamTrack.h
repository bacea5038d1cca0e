// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/model/NMAParamInfos.h"
#include "source/parameters/model/NMAParamSet.h"

namespace NMA::XMLUtils {

// One track of a component: the descriptions of its parameters, the sets of
// their values, and which set is in use.
class NMAParamTrack : public NMAParamElement {
public:
    ~NMAParamTrack() override;

    NCFRESULT GetNumber(ncfUInt32& out) const;
    NCFRESULT GetParameterInfos(NMAParamInfos& out) const;
    NCFRESULT GetActiveSet(GUID& out) const;
    NCFRESULT SetActiveSet(const GUID& id);

    ncfUInt32 GetParameterSetCount() const;
    NCFRESULT GetParameterSetAt(ncfUInt32 index, NMAParamSet& out) const;
    NCFRESULT GetParameterSet(const GUID& id, NMAParamSet& out) const;
    // The new set carries no id, so it is found by index only.
    NCFRESULT AddParameterSet(const GUID& id, NMAParamSet& out);
    NCFRESULT RemoveParameterSet(const GUID& id);
};

}  // namespace NMA::XMLUtils
