// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/framework/ResultCodes.h"
#include "host_interfaces/util/NMAString.h"
#include "source/aaf/AAFSmartPointer.h"

namespace NMA::Impl {

// Appends a network locator with the file URL of the movie to a descriptor.
NCFRESULT AddLocator(const NMAString& theMoviePathW, IAAFSmartPointer<IAAFDictionary> pDictionary,
                     IAAFSmartPointer<IAAFEssenceDescriptor> pEssenceDesc);

// Moves the start of every source clip of the file mob on by the movie's first
// timecode, so that a clip enters its source mob there.
NCFRESULT AddStartTimeToSourceClip(IAAFSmartPointer<IAAFMob> pMobFileMob,
                                   aafPosition_t absoluteStartTime);

}  // namespace NMA::Impl
