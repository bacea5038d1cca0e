// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/SourceMob.h"

#include <algorithm>

#include "aaf_library/model/Model.h"
#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/EssenceDescriptor.h"
#include "aaf_library/objects/MobSlot.h"
#include "aaf_library/objects/OtherComponents.h"
#include "aaf_library/objects/Rates.h"
#include "aaf_library/objects/Sequence.h"
#include "aaf_library/objects/SourceSearch.h"
#include "aaf_library/objects/Timecode.h"
#include "host_interfaces/aaf/AAFClassIds.h"
#include "host_interfaces/aaf/AAFDescriptors.h"

namespace aaf {

EssenceDescriptor* SourceMob::descriptor() const {
    return dynamic_cast<EssenceDescriptor*>(ObjectAt(prop::SourceMob_EssenceDescription));
}

aafMobKind_t SourceMob::MobKind() const {
    const EssenceDescriptor* const described = descriptor();
    return described == nullptr ? Mob::MobKind() : described->MobKind();
}

HRESULT SourceMob::GetEssenceDescriptor(IAAFEssenceDescriptor** essence) {
    if (essence == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *essence = nullptr;
    EssenceDescriptor* const described = descriptor();
    return described == nullptr ? AAFRESULT_SUCCESS : GiveOut(described, essence);
}

HRESULT SourceMob::SetEssenceDescriptor(IAAFEssenceDescriptor* essence) {
    return PutObject(prop::SourceMob_EssenceDescription, essence);
}

HRESULT SourceMob::AddNilReference(aafSlotID_t slotID, aafLength_t length, IAAFDataDef* dataDef,
                                   aafRational_t editRate) {
    if (dataDef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (editRate.denominator == 0) {
        return AAFRESULT_BADRATE;
    }
    RefPtr<Object> clip;
    const HRESULT result = MakeSourceClip(dataDef, aafSourceRef_t{}, length, clip);
    return result < 0 ? result : AppendTimelineSlot(editRate, *clip, slotID, L"Test");
}

HRESULT SourceMob::AppendTimecodeSlot(aafRational_t editrate, aafInt32 slotID,
                                      aafTimecode_t startTC, aafFrameLength_t length32) {
    const RefPtr<Timecode> timecode = model()->NewObject<Timecode>(AUID_AAFTimecode);
    const HRESULT result = timecode->Initialize(length32, &startTC);
    return result < 0 ? result
                      : AppendToSequence(editrate, static_cast<aafSlotID_t>(slotID), *timecode,
                                         L"Timecode");
}

HRESULT SourceMob::AppendEdgecodeSlot(aafRational_t editrate, aafInt32 slotID,
                                      aafFrameOffset_t startEC, aafFrameLength_t length32,
                                      aafFilmType_t filmKind, aafEdgeType_t codeFormat,
                                      aafEdgecodeHeader_t header) {
    if (!Edgecode::IsKnown(filmKind, codeFormat)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    if (header == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafEdgecode_t code{startEC, filmKind, codeFormat, {}};
    std::copy_n(header, sizeof code.header, code.header);
    const RefPtr<Edgecode> edgecode = model()->NewObject<Edgecode>(AUID_AAFEdgecode);
    const HRESULT result = edgecode->Initialize(length32, code);
    return result < 0 ? result
                      : AppendToSequence(editrate, static_cast<aafSlotID_t>(slotID), *edgecode,
                                         L"Edgecode");
}

HRESULT SourceMob::NewPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                    IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                    aafLength_t srcRefLength) {
    return PutSourceClip(editrate, aMobSlot, essenceKind, ref, srcRefLength);
}

HRESULT SourceMob::AppendPhysSourceRef(aafRational_t editrate, aafSlotID_t aMobSlot,
                                       IAAFDataDef* essenceKind, aafSourceRef_t ref,
                                       aafLength_t srcRefLength) {
    return AppendSourceClip(editrate, aMobSlot, essenceKind, ref, srcRefLength);
}

HRESULT SourceMob::AddPulldownRef(aafAppendOption_t addType, aafRational_t editrate,
                                  aafSlotID_t aMobSlot, IAAFDataDef* essenceKind,
                                  aafSourceRef_t ref, aafLength_t srcRefLength,
                                  aafPulldownKind_t pulldownKind, aafPhaseFrame_t phaseFrame,
                                  aafPulldownDir_t direction) {
    if (!IsWithin(addType, kAAFAppend, kAAFForceOverwrite) ||
        !IsWithin(pulldownKind, kAAFTwoThreePD, kAAFTwoToOnePD) ||
        !IsWithin(direction, kAAFTapeToFilmSpeed, kAAFFilmToTapeSpeed)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    if (srcRefLength < 0) {
        return AAFRESULT_BAD_LENGTH;
    }
    RefPtr<Object> clip;
    const HRESULT result = MakeSourceClip(essenceKind, ref, srcRefLength, clip);
    if (result < 0) {
        return result;
    }
    const RefPtr<Pulldown> pulldown = model()->NewObject<Pulldown>(AUID_AAFPulldown);
    pulldown->PutWeak(prop::Component_DataDefinition,
                      clip->WeakTarget(prop::Component_DataDefinition)->Identity());
    pulldown->SetLength(PulldownRatioOf(pulldownKind, direction).ToOwn(srcRefLength));
    pulldown->PutObject(prop::Pulldown_InputSegment, clip->Identity());
    pulldown->SetPulldownKind(pulldownKind);
    pulldown->SetPulldownDirection(direction);
    pulldown->SetPhaseFrame(phaseFrame);
    MobSlot* const slot = FindSlot(aMobSlot);
    return addType == kAAFForceOverwrite && slot != nullptr
               ? slot->PutObject(prop::MobSlot_Segment, pulldown->Identity())
               : AppendToSequence(editrate, aMobSlot, *pulldown, L"ASlot");
}

HRESULT SourceMob::SpecifyValidCodeRange(IAAFDataDef* essenceKind, aafSlotID_t slotID,
                                         aafRational_t editrate, aafFrameOffset_t startOffset,
                                         aafFrameLength_t length32) {
    if (essenceKind == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (MobKind() != kAAFTapeMob && MobKind() != kAAFFilmMob) {
        return AAFRESULT_TAPE_DESC_ONLY;
    }
    if (editrate.denominator == 0) {
        return AAFRESULT_BADRATE;
    }
    if (length32 < 0) {
        return AAFRESULT_BAD_LENGTH;
    }
    const RefPtr<Sequence> sequence = model()->NewObject<Sequence>(AUID_AAFSequence);
    const RefPtr<Filler> before = model()->NewObject<Filler>(AUID_AAFFiller);
    RefPtr<Object> clip;
    HRESULT result = MakeSourceClip(essenceKind, aafSourceRef_t{}, length32, clip);
    if (result >= 0) {
        result = sequence->Initialize(essenceKind);
    }
    if (result >= 0) {
        result = before->Initialize(essenceKind, startOffset);
    }
    if (result >= 0 && startOffset > 0) {
        result = sequence->AppendComponent(before.get());
    }
    if (result >= 0) {
        result = sequence->AppendComponent(static_cast<Component*>(clip.get()));
    }
    return result < 0 ? result : AppendTimelineSlot(editrate, *sequence, slotID, L"ASlot");
}

HRESULT SourceMob::SearchSource(aafSlotID_t slotID, aafPosition_t offset, aafMobKind_t mobKind,
                                aafMediaCriteria_t* mediaCrit,
                                aafOperationChoice_t* operationChoice,
                                IAAFFindSourceInfo** sourceInfo) {
    return SearchSourceOf(*this, slotID, offset, mobKind, mediaCrit, operationChoice, sourceInfo);
}

}  // namespace aaf
