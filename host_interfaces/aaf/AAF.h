// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

// Every published interface, one header for each family of classes. The rules that
// hold for all of them are in AAFUnknown.h. The build reads this list to write the
// classes that answer AAFRESULT_NOT_IMPLEMENTED (cmake/NotImplementedInterfaces.cmake).
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFEffectDefinitions.h"
#include "host_interfaces/aaf/AAFEffects.h"
#include "host_interfaces/aaf/AAFEssenceData.h"
#include "host_interfaces/aaf/AAFEvents.h"
#include "host_interfaces/aaf/AAFFile.h"
#include "host_interfaces/aaf/AAFLocators.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "host_interfaces/aaf/AAFPluginDefinitions.h"
#include "host_interfaces/aaf/AAFSoundDescriptors.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
