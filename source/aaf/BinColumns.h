// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/AAFSmartPointer.h"
#include "source/clips/BaseClip.h"
#include "source/descriptor_data/AAFInfo.h"
#include "source/plugin/Tr1Memory.h"

namespace NMA::Impl {

// The cells of the host's bin are comments on the master mob: the name is the
// column, the value the cell.

// Adds one cell. A refusal is told to the console and gives NCF_E_FAIL.
NCFRESULT AddBinColumnEntry(IAAFSmartPointer<IAAFMob> pMobMasterMob,
                            NCFSmartPtr<INCFConsole> pConsole, const aafCharacter* pBinColumnEntry,
                            const aafCharacter* pBinColumnValue);

// "Image Aspect Ratio". The two values go into `aafInfo`, change place there if
// it says so, and come out as `aspectRatioOut`.
void AddAspectRatioBinColumnEntry(IAAFSmartPointer<IAAFMob> pMobMasterMob,
                                  NCFSmartPtr<INCFConsole> pConsole, AAFInfo& aafInfo,
                                  ncfUInt32 numerator, ncfUInt32 denominator,
                                  aafRational_t& aspectRatioOut);

// "Video": the codec's name without the maker's. NCF_E_FAIL for a codec that
// the system can't name.
NCFRESULT AddVideoBinColumnEntry(std::tr1::shared_ptr<BaseClip> media,
                                 IAAFSmartPointer<IAAFMob> pMobMasterMob,
                                 NCFSmartPtr<INCFConsole> pConsole);

// "Audio Format", by the code of the sound system.
void AddAudioFormatBinColumnEntry(IAAFSmartPointer<IAAFMob> pMobMasterMob,
                                  NCFSmartPtr<INCFConsole> pConsole, ncfUInt32 formatID);

}  // namespace NMA::Impl
