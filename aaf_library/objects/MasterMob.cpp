// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/MasterMob.h"

#include "aaf_library/objects/Component.h"
#include "aaf_library/objects/MobSlot.h"
#include "aaf_library/objects/OtherComponents.h"
#include "aaf_library/objects/SourceSearch.h"

namespace aaf {

HRESULT MasterMob::ReadSource(IAAFSourceMob* sourceMob, aafSlotID_t slotId, Source& source) {
    const Mob* const mob = ImplementationAs<Mob>(sourceMob);
    if (mob == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    const MobSlot* const slot = mob->FindSlot(slotId);
    if (slot == nullptr) {
        return AAFRESULT_SLOT_NOT_FOUND;
    }
    if (slot->segment() == nullptr) {
        return AAFRESULT_NULLOBJECT;
    }
    source.rate = slot->editRate();
    source.reference = aafSourceRef_t{mob->id(), slotId, 0};
    source.length = slot->segment()->IntegerOr(prop::Component_Length, -1);
    return AAFRESULT_SUCCESS;
}

HRESULT MasterMob::AddMasterSlot(IAAFDataDef* dataDef, aafSlotID_t sourceSlotID,
                                 IAAFSourceMob* sourceMob, aafSlotID_t masterSlotID,
                                 aafCharacter_constptr slotName) {
    if (dataDef == nullptr || sourceMob == nullptr || slotName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Source source;
    HRESULT result = ReadSource(sourceMob, sourceSlotID, source);
    if (result >= 0) {
        result = PutSourceClip(source.rate, masterSlotID, dataDef, source.reference, source.length);
    }
    return result < 0 ? result : FindSlot(masterSlotID)->SetName(slotName);
}

HRESULT MasterMob::AddMasterSlotWithSequence(IAAFDataDef* dataDef, aafSlotID_t sourceSlotID,
                                             IAAFSourceMob* sourceMob, aafSlotID_t masterSlotID,
                                             aafCharacter_constptr slotName) {
    if (dataDef == nullptr || sourceMob == nullptr || slotName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Source source;
    HRESULT result = ReadSource(sourceMob, sourceSlotID, source);
    RefPtr<Object> clip;
    if (result >= 0) {
        result = MakeSourceClip(dataDef, source.reference, source.length, clip);
    }
    if (result >= 0) {
        result =
            AppendToSequence(source.rate, masterSlotID, static_cast<Component&>(*clip), slotName);
    }
    return result < 0 ? result : FindSlot(masterSlotID)->SetName(slotName);
}

HRESULT MasterMob::GetTapeName(aafUInt32 masterSlotID, aafCharacter* tapeName, aafUInt32 bufSize) {
    if (tapeName == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    SourcePlace tape;
    const HRESULT result = FindSource(*this, masterSlotID, 0, kAAFTapeMob, kAAFFindNull, tape);
    return result < 0 ? result : tape.mob->GetName(tapeName, bufSize);
}

HRESULT MasterMob::GetTapeNameBufLen(aafUInt32 masterSlotID, aafUInt32* len) {
    if (len == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    SourcePlace tape;
    const HRESULT result = FindSource(*this, masterSlotID, 0, kAAFTapeMob, kAAFFindNull, tape);
    return result < 0 ? result : tape.mob->GetNameBufLen(len);
}

HRESULT MasterMob::FindSegment(aafSlotID_t slotId, Segment** segment) const {
    const MobSlot* const slot = FindSlot(slotId);
    if (slot == nullptr) {
        return AAFRESULT_SLOT_NOT_FOUND;
    }
    *segment = slot->segment();
    return *segment == nullptr ? AAFRESULT_NULLOBJECT : AAFRESULT_SUCCESS;
}

HRESULT MasterMob::GetNumRepresentations(aafSlotID_t slotID, aafNumSlots_t* numReps) {
    if (numReps == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Segment* segment = nullptr;
    const HRESULT result = FindSegment(slotID, &segment);
    if (result >= 0) {
        *numReps = dynamic_cast<EssenceGroup*>(segment) != nullptr
                       ? segment->CountObjects(prop::EssenceGroup_Choices)
                       : 1;
    }
    return result;
}

HRESULT MasterMob::GetRepresentation(aafSlotID_t slotID, aafUInt32 index,
                                     IAAFSegment** sourceClip) {
    if (sourceClip == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    Segment* segment = nullptr;
    if (const HRESULT result = FindSegment(slotID, &segment); result < 0) {
        return result;
    }
    if (dynamic_cast<EssenceGroup*>(segment) != nullptr) {
        return segment->ReadObjectAt(prop::EssenceGroup_Choices, index, sourceClip);
    }
    return index == 0 ? GiveOut(segment, sourceClip) : AAFRESULT_BADINDEX;
}

HRESULT MasterMob::SearchSource(aafSlotID_t slotID, aafPosition_t offset, aafMobKind_t mobKind,
                                aafMediaCriteria_t* mediaCrit,
                                aafOperationChoice_t* operationChoice,
                                IAAFFindSourceInfo** sourceInfo) {
    return SearchSourceOf(*this, slotID, offset, mobKind, mediaCrit, operationChoice, sourceInfo);
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
