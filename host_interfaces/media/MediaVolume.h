// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/media/AAFClips.h"

namespace NMA {

// Identity and date of a folder that a plug-in claims.
//
// Implemented by the module (QuickTimeVolumeInfo), made by
// IMediaVolume::GetVolumeInfo. Called by the host, on one thread at a time. Each
// call looks at the file system afresh; the caller owns the strings.
struct IVolumeInfo : INCFUnknown {
    virtual NCFRESULT GetSerialNumber(ncfUInt32* serial) = 0;  // 3. 0 when there is none
    virtual NCFRESULT GetLabel(INCFString** label) = 0;        // 4. of the volume
    // 5. 0 unknown, 2 removable, 3 fixed, 4 network.
    virtual NCFRESULT GetType(ncfUInt32* type) = 0;
    // 6. Low 32 bits of the newest movie's date, seconds from 1970 UTC; 0 without
    // movies.
    virtual NCFRESULT GetModificationDate(ncfUInt32* date) = 0;
    // 7. NMA_E_NODATA; nothing is written.
    virtual NCFRESULT VolumeQueryA(void* reserved) = 0;
    virtual NCFRESULT VolumeQueryB() = 0;  // 8: 1
    virtual NCFRESULT VolumeQueryC() = 0;  // 9: 1
    virtual NCFRESULT VolumeQueryD() = 0;  // 10: 0xFFFFFFFF

protected:
    ~IVolumeInfo() = default;
};

// The same object: its name for people.
struct IVolumeInfo2 : IVolumeInfo {
    // 11. The last part of the folder's path. The caller owns the string.
    virtual NCFRESULT GetVolumeName(INCFString** name) = 0;

protected:
    ~IVolumeInfo2() = default;
};

// What a claimed folder offers.
//
// Implemented by the module (QuickTimeMediaFormat), made by
// IMediaVolume::GetMediaFormat. Called by the host, on one thread at a time.
struct IMediaFormat : INCFUnknown {
    // 3 to 6. Flags of the format, always the same: the value, no result.
    virtual ncfBool FormatFlagA() = 0;                         // 3: 1
    virtual ncfBool FormatFlagB() = 0;                         // 4: 0
    virtual ncfBool FormatFlagC() = 0;                         // 5: 0
    virtual ncfBool FormatFlagD() = 0;                         // 6: 1
    virtual NCFRESULT FormatUnsupportedA(void* reserved) = 0;  // 7. NCF_E_FAIL
    virtual NCFRESULT FormatUnsupportedB(void* reserved) = 0;  // 8. NCF_E_FAIL
    // 9. Lists the folder's movies now; nothing is opened. When the folder can't be
    // listed the failure may come with a list that the caller releases.
    virtual NCFRESULT GetAAFClips(IAAFClips** clips) = 0;

protected:
    ~IMediaFormat() = default;
};

// Claims folders: where a host that looks through its volumes begins.
//
// Implemented by the module (QuickTimeMediaVolume); the host creates it by
// CompID_QuickTimeMediaVolume and may ask one object about any number of folders,
// on one thread at a time. Paths are absolute.
struct IMediaVolume : INCFUnknown {
    // 3. 1 for a folder that holds a file named *.mov, whatever is in it, else 0,
    // failures included.
    virtual NCFRESULT IsMediaVolume(INCFString* path) = 0;
    virtual NCFRESULT GetVolumeInfo(INCFString* path, IVolumeInfo** info) = 0;      // 4
    virtual NCFRESULT GetMediaFormat(INCFString* path, IMediaFormat** format) = 0;  // 5
    // 6. The component to create for one file of the folder.
    virtual NCFRESULT GetContainerComponentId(GUID* id) = 0;

protected:
    ~IMediaVolume() = default;
};

inline constexpr GUID IID_IVolumeInfo = ncfGuid("50DC91ED-F177-4C09-A1A3-DAC626AC27FE");
inline constexpr GUID IID_IVolumeInfo2 = ncfGuid("E8DB7522-4A6B-45CE-ACD5-3DF3D6D5FDF4");
inline constexpr GUID IID_IMediaFormat = ncfGuid("BE697E45-A0CD-4EBC-A21C-FA3652220D60");
inline constexpr GUID IID_IMediaVolume = ncfGuid("41400962-A89C-4BBD-8EFC-F0CC0744AFF4");
constexpr const GUID& ncfIdOf(const IVolumeInfo*) {
    return IID_IVolumeInfo;
}
constexpr const GUID& ncfIdOf(const IVolumeInfo2*) {
    return IID_IVolumeInfo2;
}
constexpr const GUID& ncfIdOf(const IMediaFormat*) {
    return IID_IMediaFormat;
}
constexpr const GUID& ncfIdOf(const IMediaVolume*) {
    return IID_IMediaVolume;
}

}  // namespace NMA
