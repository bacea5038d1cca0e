// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"

// Ids of well-known definitions and labels: what a dictionary finds definitions by.

inline constexpr aafUID_t kAAFDataDef_Picture = ncfGuid("01030202-0100-0000-060E-2B3404010101");
inline constexpr aafUID_t kAAFDataDef_LegacyPicture =
    ncfGuid("6F3C8CE1-6CEF-11D2-807D-006008143E6F");
inline constexpr aafUID_t kAAFDataDef_Matte = ncfGuid("05CBA731-1DAA-11D3-80AD-006008143E6F");
inline constexpr aafUID_t kAAFDataDef_PictureWithMatte =
    ncfGuid("05CBA732-1DAA-11D3-80AD-006008143E6F");
inline constexpr aafUID_t kAAFDataDef_Sound = ncfGuid("01030202-0200-0000-060E-2B3404010101");
inline constexpr aafUID_t kAAFDataDef_LegacySound = ncfGuid("78E1EBE1-6CEF-11D2-807D-006008143E6F");
inline constexpr aafUID_t kAAFDataDef_Timecode = ncfGuid("01030201-0100-0000-060E-2B3404010101");
inline constexpr aafUID_t kAAFDataDef_LegacyTimecode =
    ncfGuid("7F275E81-77E5-11D2-807F-006008143E6F");
inline constexpr aafUID_t kAAFDataDef_Edgecode = ncfGuid("D2BB2AF0-D234-11D2-89EE-006097116212");
inline constexpr aafUID_t kAAFDataDef_DescriptiveMetadata =
    ncfGuid("01030201-1000-0000-060E-2B3404010101");
inline constexpr aafUID_t kAAFDataDef_Auxiliary = ncfGuid("01030203-0100-0000-060E-2B3404010105");
inline constexpr aafUID_t kAAFDataDef_Unknown = ncfGuid("851419D0-2E4F-11D3-8A5B-0050040EF7D2");
