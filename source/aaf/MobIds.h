// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFPlainTypes.h"
#include "source/clips/BaseClip.h"
#include "source/plugin/Tr1Memory.h"

namespace NMA::Impl {

// The ids of the three mobs of a clip. They differ in one byte, and the same
// movie content gives the same ids on every machine: the host knows a clip
// again by them.
inline constexpr aafUInt8 kFileMobInstance = 0xB1;
inline constexpr aafUInt8 kMasterMobInstance = 0x00;
inline constexpr aafUInt8 kSourceMobInstance = 0xA1;

// Label, length and instance bytes of a mob id; the material is all zero.
aafMobID_t MobIdTemplate(aafUInt8 instanceHigh);

// Sixteen bytes of digest over the content. `media` is not read.
NCFRESULT GenerateUID(std::tr1::shared_ptr<BaseClip> media, const void* pContent,
                      ncfUInt32 contentSize, aafUID_t& uid);

}  // namespace NMA::Impl
