// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/framework/ResultCodes.h"
#include "source/aaf/AAFSmartPointer.h"

namespace NMA::Impl {

// Length of the slots that end the chain in the source mob, whatever the
// clip's own length.
inline constexpr aafLength_t kNilReferenceLength = 12960000;

// Adds `slotsToAdd` slots to all three mobs at once, with ids from
// `totalExistingSlots` + 1 on: the master mob's slot refers to the file mob's
// of the same id, that one to the source mob's, which refers to nothing.
// Lengths are in edit units of `aaf_rate`, of sound too. Slots have no name; the label's
// format and number are where one would come from.
NCFRESULT AddAAFTrack(const aafUID_t& dataDefUID, const aafCharacter* slotFormatLabel,
                      ncfUInt32 slotsToAdd, ncfUInt32 startingSlot, ncfUInt32 totalExistingSlots,
                      const aafRational_t& aaf_rate, aafLength_t movieLength,
                      IAAFSmartPointer<IAAFDictionary> pDictionary,
                      IAAFSmartPointer<IAAFMob> pMobMasterMob,
                      IAAFSmartPointer<IAAFMasterMob> pMasterMob,
                      IAAFSmartPointer<IAAFMob> pMobFileMob,
                      IAAFSmartPointer<IAAFSourceMob> pFileMob,
                      IAAFSmartPointer<IAAFMob> pMobSourceMob,
                      IAAFSmartPointer<IAAFSourceMob> pSourceMob, aafPosition_t startTime);

}  // namespace NMA::Impl
