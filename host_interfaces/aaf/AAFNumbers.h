// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Guid.h"

// Numbers, characters and ids of the AAF object model as published.

#ifdef _WIN32
using aafInt32 = long;
using aafUInt32 = unsigned long;
#else
using aafInt32 = std::int32_t;
using aafUInt32 = std::uint32_t;
#endif
using aafInt8 = signed char;
using aafUInt8 = unsigned char;
using aafInt16 = std::int16_t;
using aafUInt16 = std::uint16_t;
using aafInt64 = std::int64_t;
using aafUInt64 = std::uint64_t;
using aafCharacter = wchar_t;
using aafWChar = wchar_t;
using aafBool = aafInt32;

// Results and counts of the published interfaces. HRESULT is `long` on
// Windows: convert before it is thrown or compared with an NCFRESULT.
using HRESULT = aafInt32;
using AAFRESULT = aafInt32;
using ULONG = aafUInt32;

#ifndef _WIN32  // the system's header for GUID has these
using IID = GUID;
using CLSID = GUID;
using REFIID = const GUID&;
using REFCLSID = const GUID&;
#endif

using aafUID_t = GUID;
using aafMemPtr_t = aafUInt8*;
using aafMemConstPtr_t = const aafUInt8*;
using aafDataBuffer_t = aafUInt8*;
using aafDataValue_t = aafUInt8*;
using aafString_t = aafCharacter*;
using aafCharacter_constptr = const aafCharacter*;
