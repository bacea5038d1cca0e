// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/HostSettings.h"

// What the editor's project says about clips that are described for it.
//
// Implemented by the host, on the same component as IHostSettings. The module
// creates it at the beginning of each description and asks 3, 5, 4 and 7 once;
// when one of the first three fails, it describes with defaults of its own.
// Thread-safe, since one object may serve all descriptions. Outputs of a failed
// call stay untouched.
struct INCFNMAEditorSettings : INCFUnknown {
    // 3. Frames per second of the project, above 0; nothing reads the two further
    // outputs.
    virtual NCFRESULT GetEditorFrameRate(double* rate, ncfUInt32* reservedA,
                                         ncfUInt32* reservedB) = 0;
    // 4. Length given to one-frame clips, in edit units of the clip.
    virtual NCFRESULT GetSingleFrameDuration(ncfUInt32* duration) = 0;
    // 5. Whether (not 0) clips take `rate`, frames per second, instead of their own.
    virtual NCFRESULT GetForcedFrameRate(ncfUInt32* enabled, double* rate) = 0;
    virtual NCFRESULT ReservedEditorSetting() { return NCF_E_NOTIMPL; }  // 6
    // 7. A setting by its key, which is zero-terminated. "MovieDurationCalc" is the
    // one in use: 1 takes lengths from the movie header. The caller zeroes the
    // outputs; `out2` and `out3`, 64 bits each, may be null, and nothing reads
    // them. Not set: NCF_E_PARAMETERNOTAVAILABLE.
    virtual NCFRESULT GetNamedSetting(const ncfUTF8* key, ncfUInt32* value, ncfUInt64* out2,
                                      void* out3) = 0;

protected:
    ~INCFNMAEditorSettings() = default;
};

inline constexpr GUID IID_INCFNMAEditorSettings = ncfGuid("69A8F0F3-C6E4-4666-A3DD-8F24F50FC1E4");
inline constexpr const GUID& COMPID_INCFNMAEditorSettings = NMA::Impl::CompID_HostSettings;
constexpr const GUID& ncfIdOf(const INCFNMAEditorSettings*) {
    return IID_INCFNMAEditorSettings;
}
