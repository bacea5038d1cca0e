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
};

}  // namespace aaf
