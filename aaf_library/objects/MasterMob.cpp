// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/MasterMob.h"

#include "aaf_library/objects/Component.h"
#include "aaf_library/objects/MobSlot.h"

namespace aaf {

HRESULT MasterMob::AddMasterSlot(IAAFDataDef* dataDef, aafSlotID_t sourceSlotID,
                                 IAAFSourceMob* sourceMob, aafSlotID_t masterSlotID,
                                 aafCharacter_constptr slotName) {
    if (dataDef == nullptr || sourceMob == nullptr || slotName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    const Mob* const source = ImplementationAs<Mob>(sourceMob);
    if (source == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    MobSlot* const sourceSlot = source->FindSlot(sourceSlotID);
    if (sourceSlot == nullptr) {
        return AAFRESULT_SLOT_NOT_FOUND;
    }
    if (sourceSlot->segment() == nullptr) {
        return AAFRESULT_NULLOBJECT;
    }
    aafRational_t rate{};
    if (TimelineMobSlot* const timeline = dynamic_cast<TimelineMobSlot*>(sourceSlot)) {
        timeline->GetEditRate(&rate);
    }
    const aafLength_t length = sourceSlot->segment()->IntegerOr(prop::Component_Length, -1);
    const HRESULT result = PutSourceClip(rate, masterSlotID, dataDef,
                                         aafSourceRef_t{source->id(), sourceSlotID, 0}, length);
    return result < 0 ? result : FindSlot(masterSlotID)->SetName(slotName);
}

HRESULT MasterMob::NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                    IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                    aafLength_t srcRefLength) {
    return PutSourceClip(editrate, aMobSlot, essenceKind, ref, srcRefLength);
}

HRESULT MasterMob::AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                       IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                       aafLength_t srcRefLength) {
    return AppendSourceClip(editrate, aMobSlot, essenceKind, ref, srcRefLength);
}

}  // namespace aaf
