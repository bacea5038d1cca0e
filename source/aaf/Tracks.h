// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/aaf/ClipDescription.h"

namespace NMA::Impl {

// Gives the three mobs their slots and the multiple descriptor its children:
// timecode, then picture, then alpha, then sound. The host numbers its tracks
// by the children, so their order and count are binding. Slot ids run from 1
// through all kinds; timecode slots exist in the source mob alone.
//
// `*absoluteStartTime` becomes the movie's first timecode in edit units, 0 for
// a movie without timecode. The clip's rate and length must be set.
NCFRESULT AddTracksToAAF(
    std::tr1::shared_ptr<BaseClip> media, NCFSmartPtr<INCFConsole> pConsole,
    IAAFSmartPointer<IAAFHeader> pHeader, IAAFSmartPointer<IAAFDictionary> pDictionary,
    IAAFSmartPointer<IAAFMob> pMobMasterMob, IAAFSmartPointer<IAAFMasterMob> pMasterMob,
    IAAFSmartPointer<IAAFMob> pMobFileMob, IAAFSmartPointer<IAAFSourceMob> pFileMob,
    IAAFSmartPointer<IAAFMob> pMobSourceMob, IAAFSmartPointer<IAAFSourceMob> pSourceMob,
    IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor,
    INCFComponentFactory* pComponentFactory, aafPosition_t* absoluteStartTime);

}  // namespace NMA::Impl
