// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Guid.h"

// Component ids by which the host creates what the plug-in registers, through its
// component factory, between NCFStartup and NCFShutdown. A host begins with the
// first (folders) and with the container (single files). The format, the lists and
// the sample mapping are made by these two: only the module can give them the clip
// that they need. No class factory serves CompID_QuickTimeClips.
namespace NMA {

inline constexpr GUID CompID_QuickTimeMediaVolume = ncfGuid("A0529DD3-C63D-45EA-AF2A-D962C0DFB5B5");
inline constexpr GUID CompID_QuickTimeMediaFormat = ncfGuid("7B2BF59F-CA0E-4F0D-9FAE-6037B1137D3A");
inline constexpr GUID CompID_QuickTimeMasterClips = ncfGuid("32909CEE-3D47-4A8E-914E-006EFBAECDAC");
inline constexpr GUID CompID_QuickTimeVolumeInfo = ncfGuid("A720F6DD-D6DD-4E45-AE7A-A6FEA37065D8");
inline constexpr GUID CompID_QuickTimeContainer = ncfGuid("781F84B7-B989-4534-8A07-C595CB9A6FB8");
inline constexpr GUID CompID_QuickTimeSampleMapping =
    ncfGuid("0E74B673-0CA8-403B-A142-986D79508637");
inline constexpr GUID CompID_QuickTimeClips = ncfGuid("C7D2D55A-0A1A-44B3-A7D3-5D78EC80FAD8");
inline constexpr GUID CompID_QTParameters = ncfGuid("E01FB758-46AA-479F-BADA-1FB47C8D522C");

}  // namespace NMA

// Component id of the handler that fills data containers from XML events; the
// module makes it for itself.
inline constexpr GUID kCLSID_GenericDocHandler = ncfGuid("4E40C813-86AD-4275-92CC-3AAB04EB1689");
