// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFObjects.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "host_interfaces/framework/ResultCodes.h"
#include "source/aaf/AAFSmartPointer.h"

namespace NMA::Impl {

// Properties of mobs beyond the published model.
inline constexpr aafUID_t kAAFPropID_MobAppCode = ncfGuid("96C46992-4F62-11D3-A022-006094EB75CB");
inline constexpr aafUID_t kAAFPropID_MobAttributeList =
    ncfGuid("60958183-47B1-11D4-A01C-0004AC969F50");

// The clip is to be kept as rendered: pictures with alpha.
inline constexpr aafInt32 kPrecomputeMasterMob = 1;

// Sets the property "AppCode" of the master mob.
NCFRESULT AddMasterMobAppCode(IAAFSmartPointer<IAAFDictionary> pDictionary,
                              IAAFSmartPointer<IAAFMasterMob> pMasterMob, aafInt32 appCode);

// Sets the property "MobAttributeList" of the master mob to a list of one
// tagged value, the reformatting option.
NCFRESULT AddMasterMobAttributes(IAAFSmartPointer<IAAFDictionary> pDictionary,
                                 IAAFSmartPointer<IAAFMasterMob> pMasterMob);

// Appends the reformatting option to the list.
NCFRESULT AddReformattingOption(IAAFSmartPointer<IAAFDictionary> pDictionary,
                                IAAFSmartPointer<IAAFTypeDefVariableArray> pTDVarArray,
                                IAAFSmartPointer<IAAFPropertyValue> pPVArray);

}  // namespace NMA::Impl
