// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/AAFSmartPointer.h"
#include "source/clips/BaseClip.h"
#include "source/plugin/Tr1Memory.h"

namespace NMA::Impl {

// Appends a sound descriptor for the audio track at place `trackNum` to the
// multiple descriptor and sets `numAudioChannels`, which is the number of slots
// that the track gets. The descriptor is of the class for PCM also where the
// sound is compressed; its compression label tells the two apart.
NCFRESULT AddAudioDescriptor(std::tr1::shared_ptr<BaseClip> media, ncfUInt32 trackNum,
                             NCFSmartPtr<INCFConsole> pConsole,
                             IAAFSmartPointer<IAAFMob> pMobMasterMob,
                             IAAFSmartPointer<IAAFDictionary> pDictionary,
                             IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor,
                             ncfUInt32& numAudioChannels);

}  // namespace NMA::Impl
