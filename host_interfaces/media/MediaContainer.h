// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/media/AAFClips.h"

namespace NMA {

struct ISampleMapping;

// The host's handle on one media file.
//
// Implemented by the module (QuickTimeContainer), as one object with the two
// interfaces below. The host creates it by CompID_QuickTimeContainer, gives it a
// path once, and asks it from one thread at a time. The clip is loaded at the first
// operation that needs it, and shared with every sample mapping, so mappings may
// outlive the container.
struct IMediaContainer : INCFUnknown {
    // 3. 1 when the file could be loaded, 0 when not. Lets exceptions
    // through: an NCFRESULT for a file that can't be opened.
    virtual NCFRESULT IsContainerSupported() = 0;
    virtual NCFRESULT ContainerFlag() = 0;  // 4: 1
    // 5. NCF_E_NOTIMPL.
    virtual NCFRESULT ContainerUnsupportedA(void* reservedA, void* reservedB, void* reservedC) = 0;
    // 6. Describes the clip anew, in place of the description before. NCF_E_POINTER
    // without a path.
    virtual NCFRESULT GetAAFMasterClips(IAAFClips** ppClips) = 0;
    // 7. Works once: NMA_E_ALREADYSET afterwards. The string is copied.
    virtual NCFRESULT SetFilePath(INCFString* path) = 0;

protected:
    ~IMediaContainer() = default;
};

// The same handle: the way to the file's essence.
struct IMediaContainer2 : IMediaContainer {
    // 8. A new mapping over the clip, which it shares with all others: no two of
    // them may deliver at once, see SampleMapping.h.
    virtual NCFRESULT GetSampleMapping(ISampleMapping** ppSampleMapping) = 0;
    virtual NCFRESULT ContainerUnsupportedB(void* reserved) = 0;  // 9. NCF_E_NOTIMPL

protected:
    ~IMediaContainer2() = default;
};

// The same handle: what containers of this kind can do. Needs no path.
struct IMediaContainer3 : IMediaContainer2 {
    // 10. 16387 plus 256, or plus 512 when the host's INCFCapability says so.
    virtual NCFRESULT GetCapabilities(ncfUInt32* flags) = 0;
    virtual ncfUInt32 GetFileTypeCount() = 0;  // 11: the value
    // 12. File type `index`, from 0: its extension in capitals, what it is called,
    // and the name of its group. Each output may be null, else it is a new string
    // of the caller. NCF_E_NOTFOUND beyond the count.
    virtual NCFRESULT GetFileType(ncfUInt32 index, INCFString** extension, INCFString** description,
                                  INCFString** group) = 0;

protected:
    ~IMediaContainer3() = default;
};

inline constexpr GUID IID_IMediaContainer = ncfGuid("51092B47-F81C-46E3-B9AB-376705C79F12");
inline constexpr GUID IID_IMediaContainer2 = ncfGuid("5FEB3C83-08DF-4CCC-A9F4-083EEA2A1DAB");
inline constexpr GUID IID_IMediaContainer3 = ncfGuid("13B79A3E-6A3E-45E3-B9F6-E516CA4DF372");
constexpr const GUID& ncfIdOf(const IMediaContainer*) {
    return IID_IMediaContainer;
}
constexpr const GUID& ncfIdOf(const IMediaContainer2*) {
    return IID_IMediaContainer2;
}
constexpr const GUID& ncfIdOf(const IMediaContainer3*) {
    return IID_IMediaContainer3;
}

}  // namespace NMA
