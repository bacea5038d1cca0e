// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/aaf/AAFTrack.h"

#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "source/plugin/ResultChecks.h"
#include "source/plugin/ResultOf.h"

namespace NMA::Impl {
namespace {

// Slots carry an empty name: the library's own default would show otherwise.
void ClearSlotName(const IAAFSmartPointer<IAAFMob>& mob, aafSlotID_t id) {
    IAAFSmartPointer<IAAFMobSlot> slot;
    ThrowIfFailed(mob->LookupSlot(id, &slot));
    ThrowIfFailed(slot->SetName(L""));
}

}  // namespace

NCFRESULT AddAAFTrack(const aafUID_t& dataDefUID, const aafCharacter* /*slotFormatLabel*/,
                      ncfUInt32 slotsToAdd, ncfUInt32 /*startingSlot*/,
                      ncfUInt32 totalExistingSlots, const aafRational_t& aaf_rate,
                      aafLength_t movieLength, IAAFSmartPointer<IAAFDictionary> pDictionary,
                      IAAFSmartPointer<IAAFMob> pMobMasterMob,
                      IAAFSmartPointer<IAAFMasterMob> pMasterMob,
                      IAAFSmartPointer<IAAFMob> pMobFileMob,
                      IAAFSmartPointer<IAAFSourceMob> pFileMob,
                      IAAFSmartPointer<IAAFMob> pMobSourceMob,
                      IAAFSmartPointer<IAAFSourceMob> pSourceMob, aafPosition_t startTime) {
    return ResultOf([&]() -> NCFRESULT {
        aafSourceRef_t toFileMob{};
        aafSourceRef_t toSourceMob{};
        ThrowIfFailed(pMobFileMob->GetMobID(&toFileMob.sourceID));
        ThrowIfFailed(pMobSourceMob->GetMobID(&toSourceMob.sourceID));
        toFileMob.startTime = startTime;
        toSourceMob.startTime = -startTime;
        IAAFSmartPointer<IAAFDataDef> pDataDef;
        ThrowIfFailed(pDictionary->LookupDataDef(dataDefUID, &pDataDef));

        for (ncfUInt32 i = 1; i <= slotsToAdd; ++i) {
            const aafSlotID_t id = totalExistingSlots + i;
            toFileMob.sourceSlotID = id;
            toSourceMob.sourceSlotID = id;
            ThrowIfFailed(
                pMasterMob->NewPhysSourceRef(aaf_rate, id, pDataDef, toFileMob, movieLength));
            ClearSlotName(pMobMasterMob, id);
            ThrowIfFailed(pFileMob->NewPhysSourceRef(aaf_rate, id, pDataDef, toSourceMob,
                                                     movieLength + startTime));
            ClearSlotName(pMobFileMob, id);
            ThrowIfFailed(pSourceMob->AddNilReference(id, kNilReferenceLength, pDataDef, aaf_rate));
            ClearSlotName(pMobSourceMob, id);
        }
        return NCF_OK;
    });
}

}  // namespace NMA::Impl
