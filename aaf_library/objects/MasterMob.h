// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Mob.h"
#include "not_implemented/AAFMasterMobs.h"
#include "not_implemented/AAFMobs.h"

namespace aaf {

class Segment;

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
    // The same as AddMasterSlot, with the clip at the end of a sequence.
    HRESULT AddMasterSlotWithSequence(IAAFDataDef* dataDef, aafSlotID_t sourceSlotID,
                                      IAAFSourceMob* sourceMob, aafSlotID_t masterSlotID,
                                      aafCharacter_constptr slotName) override;

    // The name of the tape that the slot's sources lead to.
    HRESULT GetTapeName(aafUInt32 masterSlotID, aafCharacter* tapeName, aafUInt32 bufSize) override;
    HRESULT GetTapeNameBufLen(aafUInt32 masterSlotID, aafUInt32* len) override;
    // The choices of an essence group; any other segment is the only one.
    HRESULT GetNumRepresentations(aafSlotID_t slotID, aafNumSlots_t* numReps) override;
    HRESULT GetRepresentation(aafSlotID_t slotID, aafUInt32 index,
                              IAAFSegment** sourceClip) override;

    // -- IAAFSearchSource
    HRESULT SearchSource(aafSlotID_t slotID, aafPosition_t offset, aafMobKind_t mobKind,
                         aafMediaCriteria_t* mediaCrit, aafOperationChoice_t* operationChoice,
                         IAAFFindSourceInfo** sourceInfo) override;

private:
    // What a slot of a source mob gives for a slot of this mob.
    struct Source {
        aafRational_t rate{};
        aafSourceRef_t reference{};
        aafLength_t length = -1;
    };
    static HRESULT ReadSource(IAAFSourceMob* sourceMob, aafSlotID_t slotId, Source& source);
    HRESULT FindSegment(aafSlotID_t slotId, Segment** segment) const;
};

}  // namespace aaf
