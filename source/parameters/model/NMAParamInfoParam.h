// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/model/NMAParamValueInfo.h"

namespace NMA::XMLUtils {

// The description of one parameter.
class NMAParamInfoParam : public NMAParamElement {
public:
    ~NMAParamInfoParam() override;

    NCFRESULT GetID(GUID& out) const;
    NCFRESULT GetShortName(NMAString& out) const;
    NCFRESULT SetShortName(const NMAString& text);
    NCFRESULT GetDescription(NMAString& out) const;
    NCFRESULT SetDescription(const NMAString& text);
    NCFRESULT GetValueInfo(NMAParamValueInfo& out) const;
};

}  // namespace NMA::XMLUtils
