// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/AAFSmartPointer.h"
#include "source/clips/BaseClip.h"
#include "source/plugin/Tr1Memory.h"

namespace NMA::Impl {

// Timecode slots stand in the source mob. A slot begins at zero; where the
// movie's timecode begins is told by the start of the file mob's source clips.

// Adds one slot with id `slotIndex` + 1. `tcTrackNum` 0 is the main timecode,
// labelled "TC1"; others are "AuxTCn" and have fillers around the timecode that
// bring the slot from `movieLength` to `maxLength`.
NCFRESULT AddTimecodeAAFTrack(const aafTimecode_t& timecode, ncfUInt32 tcTrackNum,
                              ncfUInt32 slotIndex, const aafRational_t& aafEditRate,
                              const aafLength_t& movieLength, const aafLength_t& maxLength,
                              const aafLength_t& startTime,
                              IAAFSmartPointer<IAAFDictionary> pDictionary,
                              IAAFSmartPointer<IAAFMob> pMobSourceMob);

// The slot's sequence. Failures go to the process logger with the library's
// result and come back as a code that names the step.
NCFRESULT AddTimecode(IAAFSmartPointer<IAAFDictionary> pDictionary,
                      const aafRational_t& movieEditRate, const aafCharacter* trackLabel,
                      IAAFSmartPointer<IAAFMob> pMobSourceMob, aafSlotID_t nSlotID,
                      aafLength_t movieLength, aafLength_t maxLength, aafLength_t startTime,
                      const aafTimecode_t& timecode, ncfUInt32 timecodeTrackNum);

// Two slots for a movie without usable timecode: one from zero, and an
// auxiliary one of the clip's length that begins at the file's time of day in
// UTC. Moves `*totalExistingSlots` on by two.
NCFRESULT AddSyntheticTimeCode(std::tr1::shared_ptr<BaseClip> media, ncfUInt32* totalExistingSlots,
                               NCFSmartPtr<INCFConsole> pConsole,
                               IAAFSmartPointer<IAAFDictionary> pDictionary,
                               IAAFSmartPointer<IAAFMob> pMobSourceMob);

}  // namespace NMA::Impl
