// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/framework/Definitions.h"

// Ids of what a clip's parameters are made of. Users keep documents that contain
// them, so none ever changes.

// The set that holds what the file itself says.
inline constexpr GUID kParamSetDefault = ncfGuid("9F9FC555-4014-11C5-8FDE-5ED45EED7C03");
inline constexpr GUID kParamGroup = ncfGuid("A1CE72A4-FA19-40E3-9E83-266DAF8AF5BB");

// 256 progressive, 512 upper field first, 4096 lower field first.
inline constexpr GUID kParamFieldOrdering = ncfGuid("6CAEDE80-2DE0-4E2F-9F5D-904B7A2C2F4A");
// 2 merged, 3 split; any other number leaves the file's layout.
inline constexpr GUID kParamFieldLayout = ncfGuid("76320B7E-5BF9-4E30-BF04-2BE7D48D4C69");
// 16 as they are, 1 expand, 2 compress.
inline constexpr GUID kParamLevelRemapping = ncfGuid("322655D5-0A56-46CA-9260-D006F719B8A4");

// A parameter whose value is one of a list.
inline constexpr GUID kParamTypeChoice = ncfGuid("4AA0FBA6-F8E2-400F-A4A1-E8575B6EF887");

// A 32-bit unsigned number: type of a value, and component id of the factory
// that makes such values.
inline constexpr GUID kValueTypeUInt32 = kNCFValueTypeUInt32;
