// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/SourceMob.h"

#include <algorithm>

#include "aaf_library/model/Model.h"
#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/EssenceDescriptor.h"
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
    if (!IsWithin(filmKind, kAAFFtNull, kAAFFt65MM) ||
        (!IsWithin(codeFormat, kAAFEtNull, kAAFEtEdgenum5) && codeFormat != kAAFEtHeaderSize)) {
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

}  // namespace aaf
