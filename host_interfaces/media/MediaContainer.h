// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/media/AAFClips.h"

namespace NMA {

struct ISampleMapping;

// The host's handle on one media file. One thread at a time.
struct IMediaContainer : INCFUnknown {
    // 3. 1 when the file could be loaded, 0 when not. May throw an NCFRESULT:
    // the one operation that does, for a file that can't be opened.
    virtual NCFRESULT IsContainerSupported() = 0;
    virtual NCFRESULT ContainerFlag() = 0;                                   // 4: 1
    virtual NCFRESULT ContainerUnsupportedA(void* a, void* b, void* c) = 0;  // 5
    // 6. Describes the clip anew.
    virtual NCFRESULT GetAAFMasterClips(IAAFClips** ppClips) = 0;
    // 7. Works once: NMA_E_ALREADYSET afterwards. The string is copied.
    virtual NCFRESULT SetFilePath(INCFString* path) = 0;

protected:
    ~IMediaContainer() = default;
};

struct IMediaContainer2 : IMediaContainer {
    // 8. A new mapping over the clip, which it shares with all others: no two of
    // them may deliver at once, see SampleMapping.h.
    virtual NCFRESULT GetSampleMapping(ISampleMapping** ppSampleMapping) = 0;
    virtual NCFRESULT ContainerUnsupportedB(void* a) = 0;  // 9

protected:
    ~IMediaContainer2() = default;
};

struct IMediaContainer3 : IMediaContainer2 {
    virtual NCFRESULT GetCapabilities(ncfUInt32* flags) = 0;  // 10
    virtual ncfUInt32 GetFileTypeCount() = 0;                 // 11: the value
    // 12. One file type; each output may be null, else it is a new string.
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
