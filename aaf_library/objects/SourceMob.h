// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Mob.h"
#include "not_implemented/AAFMobs.h"

namespace aaf {

class EssenceDescriptor;

// Essence in a file or on some other carrier, told by the descriptor that it
// owns.
class SourceMob : public Implements<Mob, IAAFSourceMob, IAAFSearchSource> {
public:
    aafMobKind_t MobKind() const override;
    EssenceDescriptor* descriptor() const;

    HRESULT Initialize() override { return AAFRESULT_SUCCESS; }
    HRESULT GetEssenceDescriptor(IAAFEssenceDescriptor** essence) override;
    HRESULT SetEssenceDescriptor(IAAFEssenceDescriptor* essence) override;
    HRESULT AddNilReference(aafSlotID_t slotID, aafLength_t length, IAAFDataDef* dataDef,
                            aafRational_t editRate) override;
    HRESULT AppendTimecodeSlot(aafRational_t editrate, aafInt32 slotID, aafTimecode_t startTC,
                               aafFrameLength_t length32) override;
    HRESULT AppendEdgecodeSlot(aafRational_t editrate, aafInt32 slotID, aafFrameOffset_t startEC,
                               aafFrameLength_t length32, aafFilmType_t filmKind,
                               aafEdgeType_t codeFormat, aafEdgecodeHeader_t header) override;
    HRESULT NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot, IAAFDataDef* essenceKind,
                             aafSourceRef_t ref, aafLength_t srcRefLength) override;
    HRESULT AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                aafLength_t srcRefLength) override;
    // A pulldown over a clip of that length: into the sequence of the slot, or in place of what is
    // there. It is as long as the clip becomes.
    HRESULT AddPulldownRef(aafAppendOption_t addType, aafRational_t editrate, aafSlotID_t aMobSlot,
                           IAAFDataDef* essenceKind, aafSourceRef_t ref, aafLength_t srcRefLength,
                           aafPulldownKind_t pulldownKind, aafPhaseFrame_t phaseFrame,
                           aafPulldownDir_t direction) override;
    // A slot of a tape or film whose code is valid over that range: nothing up to its start, then a
    // clip that ends the chain.
    HRESULT SpecifyValidCodeRange(IAAFDataDef* essenceKind, aafSlotID_t slotID,
                                  aafRational_t editrate, aafFrameOffset_t startOffset,
                                  aafFrameLength_t length32) override;

    // -- IAAFSearchSource
    HRESULT SearchSource(aafSlotID_t slotID, aafPosition_t offset, aafMobKind_t mobKind,
                         aafMediaCriteria_t* mediaCrit, aafOperationChoice_t* operationChoice,
                         IAAFFindSourceInfo** sourceInfo) override;
};

}  // namespace aaf
