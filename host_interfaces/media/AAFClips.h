// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/String.h"

struct IAAFFile;

namespace NMA {

// Descriptions of one or more clips, each an in-memory AAF file.
//
// Implemented by the module, for a folder (QuickTimeMasterClips, from
// IMediaFormat::GetAAFClips) and for one file (from
// IMediaContainer::GetAAFMasterClips). Called by the host, on one thread at a time.
// A folder's list describes a clip when it is asked for it and keeps nothing; a
// container's list gives the description that the container made last.
struct IAAFClips : INCFUnknown {
    // 3. Number of clips: the value, no result.
    virtual ncfSInt32 GetCount() = 0;
    // 4. The description of clip `index`, from 0, with a reference for the caller.
    // NCF_E_NOTFOUND for an index that is not there.
    virtual NCFRESULT GetMetadata(ncfSInt32 index, IAAFFile** ppData) = 0;
    // 5. Path of a clip, assigned to the caller's string. NCF_E_NOTIMPL where
    // the object stands for one file.
    virtual NCFRESULT GetClipPath(ncfSInt32 index, INCFString* path) = 0;

protected:
    ~IAAFClips() = default;
};

inline constexpr GUID IID_IAAFClips = ncfGuid("CC4FD2EB-C226-48B5-BAAF-E3FBF99CB797");
constexpr const GUID& ncfIdOf(const IAAFClips*) {
    return IID_IAAFClips;
}

}  // namespace NMA
