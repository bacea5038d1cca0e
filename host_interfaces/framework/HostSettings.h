// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Unknown.h"

namespace NMA {

// Settings that the user makes in the host.
//
// Implemented by the host as a component. The module creates it when a clip with a
// picture is loaded and asks for NMAHostSetting_IgnoreAlpha; without an answer the
// clip keeps its own way. Thread-safe, since one object may serve all clips.
struct IHostSettings : INCFUnknown {
    // The scope in which the module asks.
    static constexpr ncfUInt32 kUserScope = 64;

    // 3. Reads a flag, 0 or not, of a scope. A setting that was never made gives
    // NCF_E_PARAMETERNOTAVAILABLE and leaves the value untouched.
    virtual NCFRESULT GetHostSettingBoolean(const GUID& setting, ncfUInt32 scope,
                                            ncfBool* value) = 0;

protected:
    ~IHostSettings() = default;
};

inline constexpr GUID IID_IHostSettings = ncfGuid("71C45980-1345-419D-AB91-E40C80377330");
constexpr const GUID& ncfIdOf(const IHostSettings*) {
    return IID_IHostSettings;
}

// Whether alpha channels are left out of the description.
inline constexpr GUID NMAHostSetting_IgnoreAlpha = ncfGuid("535F13B4-D9DF-4C6B-A3D1-89163A534900");

namespace Impl {
// The component that answers IHostSettings; the editor settings come from the
// same one.
inline constexpr GUID CompID_HostSettings = ncfGuid("BF17159D-1581-453E-83BD-9E0E4AF57B40");
}  // namespace Impl

}  // namespace NMA
