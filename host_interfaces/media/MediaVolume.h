// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/media/AAFClips.h"

namespace NMA {

// Identity and date of a folder that a plug-in claims.
struct IVolumeInfo : INCFUnknown {
    virtual NCFRESULT GetSerialNumber(ncfUInt32* serial) = 0;  // 3
    virtual NCFRESULT GetLabel(INCFString** label) = 0;        // 4, a new reference
    virtual NCFRESULT GetType(ncfUInt32* type) = 0;            // 5
    // 6. Low 32 bits of the newest movie's date, seconds from 1970 UTC.
    virtual NCFRESULT GetModificationDate(ncfUInt32* date) = 0;
    virtual NCFRESULT VolumeQueryA(void* out) = 0;  // 7
    virtual NCFRESULT VolumeQueryB() = 0;           // 8
    virtual NCFRESULT VolumeQueryC() = 0;           // 9
    virtual NCFRESULT VolumeQueryD() = 0;           // 10

protected:
    ~IVolumeInfo() = default;
};

struct IVolumeInfo2 : IVolumeInfo {
    virtual NCFRESULT GetVolumeName(INCFString** name) = 0;  // 11, a new reference

protected:
    ~IVolumeInfo2() = default;
};

// What a claimed folder offers.
struct IMediaFormat : INCFUnknown {
    virtual ncfBool FormatFlagA() = 0;                         // 3
    virtual ncfBool FormatFlagB() = 0;                         // 4
    virtual ncfBool FormatFlagC() = 0;                         // 5
    virtual ncfBool FormatFlagD() = 0;                         // 6
    virtual NCFRESULT FormatUnsupportedA(void* argument) = 0;  // 7
    virtual NCFRESULT FormatUnsupportedB(void* argument) = 0;  // 8
    virtual NCFRESULT GetAAFClips(IAAFClips** clips) = 0;      // 9

protected:
    ~IMediaFormat() = default;
};

// Claims folders.
struct IMediaVolume : INCFUnknown {
    virtual NCFRESULT IsMediaVolume(INCFString* path) = 0;                          // 3: 1 or 0
    virtual NCFRESULT GetVolumeInfo(INCFString* path, IVolumeInfo** info) = 0;      // 4
    virtual NCFRESULT GetMediaFormat(INCFString* path, IMediaFormat** format) = 0;  // 5
    virtual NCFRESULT GetContainerComponentId(GUID* id) = 0;                        // 6

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
