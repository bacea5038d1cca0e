// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/AAFSmartPointer.h"
#include "source/clips/BaseClip.h"
#include "source/plugin/Tr1Memory.h"

namespace NMA::Impl {

// Appends a picture descriptor to the multiple descriptor. A picture that the
// host can read from the file is described by its record in the data files,
// down to subsampling and line map; one that the sample provider serves by what
// the clip itself tells: size, aspect and field layout.
//
// The retriever of descriptor data must be there.
NCFRESULT AddVideoDescriptor(std::tr1::shared_ptr<BaseClip> media,
                             NCFSmartPtr<INCFConsole> pConsole,
                             IAAFSmartPointer<IAAFMob> pMobMasterMob,
                             IAAFSmartPointer<IAAFHeader> pHeader,
                             IAAFSmartPointer<IAAFDictionary> pDictionary,
                             IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor);

// Gives the multiple descriptor the rate of its first child; later children
// change nothing.
NCFRESULT FixMultiDescSampleRate(IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDesc,
                                 const aafRational_t& sampleRate);

}  // namespace NMA::Impl
