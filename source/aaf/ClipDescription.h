// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "source/aaf/AAFSmartPointer.h"
#include "source/clips/BaseClip.h"
#include "source/plugin/Tr1Memory.h"

namespace NMA::Impl {

// What the steps of a description share: the clip, the host's services and the parts
// of the file, two views of each mob. The names are those that the log shows.
struct ClipDescription {
    std::tr1::shared_ptr<BaseClip> media;
    NCFSmartPtr<INCFConsole> pConsole;
    INCFComponentFactory* pComponentFactory = nullptr;
    IAAFSmartPointer<IAAFFile> pTheAAFFile;  // released after its parts
    IAAFSmartPointer<IAAFHeader> pHeader;
    IAAFSmartPointer<IAAFDictionary> pDictionary;
    IAAFSmartPointer<IAAFMob> pMobMasterMob;
    IAAFSmartPointer<IAAFMasterMob> pMasterMob;
    IAAFSmartPointer<IAAFMob> pMobFileMob;
    IAAFSmartPointer<IAAFSourceMob> pFileMob;
    IAAFSmartPointer<IAAFMob> pMobSourceMob;
    IAAFSmartPointer<IAAFSourceMob> pSourceMob;
    IAAFSmartPointer<IAAFMultipleDescriptor> pMultiDescriptor;
};

}  // namespace NMA::Impl
