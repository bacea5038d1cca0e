// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Mob.h"
#include "not_implemented/AAFMasterMobs.h"
#include "not_implemented/AAFMobs.h"

namespace aaf {

// What a user sees as a clip: slots that refer to file mobs. Access to essence
// is not part of this library.
class MasterMob : public Implements<Mob, IAAFMasterMob, IAAFSearchSource, IAAFMasterMobEx,
                                    IAAFMasterMob2, IAAFMasterMob3> {
public:
    aafMobKind_t MobKind() const override { return kAAFMasterMob; }

    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT AddMasterSlot(IAAFDataDef* dataDef, aafSlotID_t sourceSlotID, IAAFSourceMob* sourceMob,
                          aafSlotID_t masterSlotID, aafCharacter_constptr slotName) override;
    HRESULT NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* essenceKind,
                             aafSourceRef_t ref, aafLength_t srcRefLength) override;
    HRESULT AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                aafLength_t srcRefLength) override;
};

}  // namespace aaf
