// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/parameters/model/NMAParamTrack.h"

namespace NMA::XMLUtils {

// A component whose parameters the document holds, with its tracks.
class NMAParamComponent : public NMAParamElement {
public:
    ~NMAParamComponent() override;

    NCFRESULT GetID(GUID& out) const;
    NCFRESULT GetVersion(NMAString& out) const;
    NCFRESULT SetVersion(const NMAString& text);
    NCFRESULT GetShortName(NMAString& out) const;
    NCFRESULT SetShortName(const NMAString& text);

    ncfUInt32 GetTrackCount() const;
    NCFRESULT GetTrackAt(ncfUInt32 index, NMAParamTrack& out) const;
    NCFRESULT GetTrack(ncfUInt32 number, NMAParamTrack& out) const;
    NCFRESULT AddTrack(ncfUInt32 number, NMAParamTrack& out);
    NCFRESULT RemoveTrack(ncfUInt32 number);
};

}  // namespace NMA::XMLUtils
