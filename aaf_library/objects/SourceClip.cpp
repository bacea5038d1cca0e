// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/SourceClip.h"

#include "aaf_library/objects/ContentStorage.h"

namespace aaf {

void SourceReference::SetDefaults() {
    Segment::SetDefaults();
    PutInteger(prop::SourceReference_SourceMobSlotID, 0);
}

HRESULT SourceReference::GetMonoSourceSlotIDsSize(aafUInt32* size) {
    return CountElements(*this, prop::SourceReference_MonoSourceSlotIDs, sizeof(aafUInt32), size);
}

HRESULT SourceClip::Initialize(IAAFDataDef* dataDef, aafLength_constref length,
                               aafSourceRef_t sourceRef) {
    const HRESULT result = SetDataDef(dataDef);
    return result < 0 ? result : SetSource(length, sourceRef);
}

HRESULT SourceClip::SetSource(aafLength_t length, const aafSourceRef_t& sourceRef) {
    // A negative length means one that is not known.
    if (length < 0) {
        RemoveValue(prop::Component_Length);
    } else {
        PutInteger(prop::Component_Length, length);
    }
    return SetSourceReference(sourceRef);
}

HRESULT SourceClip::SetSourceReference(aafSourceRef_t sourceRef) {
    if (IsNilMobId(sourceRef.sourceID)) {
        sourceRef.sourceSlotID = 0;
        sourceRef.startTime = 0;
    }
    PutStruct(prop::SourceReference_SourceID, sourceRef.sourceID);
    PutInteger(prop::SourceReference_SourceMobSlotID, sourceRef.sourceSlotID);
    return PutInteger(prop::SourceClip_StartTime, sourceRef.startTime);
}

HRESULT SourceClip::GetSourceReference(aafSourceRef_t* sourceRef) {
    if (sourceRef == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafSourceRef_t found{};
    HRESULT result = ReadInteger(prop::SourceClip_StartTime, &found.startTime);
    if (result >= 0) {
        result = ReadInteger(prop::SourceReference_SourceMobSlotID, &found.sourceSlotID);
    }
    if (result < 0) {
        return result;
    }
    // A file of another writer may leave the id out, for a slot of the same mob.
    ReadStruct(prop::SourceReference_SourceID, &found.sourceID);
    *sourceRef = found;
    return AAFRESULT_SUCCESS;
}

HRESULT SourceClip::ResolveRef(IAAFMob** mob) {
    if (mob == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    ContentStorage* const storage = FindOwner<ContentStorage>();
    if (storage == nullptr) {
        return AAFRESULT_OBJECT_NOT_ATTACHED;
    }
    aafMobID_t id{};
    if (GetSourceID(&id) < 0 || IsNilMobId(id)) {
        return AAFRESULT_TRAVERSAL_NOT_POSS;
    }
    return storage->LookupMob(id, mob);
}

HRESULT SourceClip::SetFade(aafInt32 fadeInLen, aafFadeType_t fadeInType, aafInt32 fadeOutLen,
                            aafFadeType_t fadeOutType) {
    if (!IsWithin(fadeInType, kAAFFadeNone, kAAFFadeLinearPower) ||
        !IsWithin(fadeOutType, kAAFFadeNone, kAAFFadeLinearPower)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    PutInteger(prop::SourceClip_FadeInLength, fadeInLen);
    PutInteger(prop::SourceClip_FadeInType, fadeInType);
    PutInteger(prop::SourceClip_FadeOutLength, fadeOutLen);
    return PutInteger(prop::SourceClip_FadeOutType, fadeOutType);
}

HRESULT SourceClip::GetFade(aafLength_t* fadeInLen, aafFadeType_t* fadeInType,
                            aafBoolean_t* fadeInPresent, aafLength_t* fadeOutLen,
                            aafFadeType_t* fadeOutType, aafBoolean_t* fadeOutPresent) {
    if (fadeInLen == nullptr || fadeInType == nullptr || fadeInPresent == nullptr ||
        fadeOutLen == nullptr || fadeOutType == nullptr || fadeOutPresent == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    *fadeInPresent = IsPresent(prop::SourceClip_FadeInLength) ? kAAFTrue : kAAFFalse;
    *fadeOutPresent = IsPresent(prop::SourceClip_FadeOutLength) ? kAAFTrue : kAAFFalse;
    *fadeInLen = IntegerOr(prop::SourceClip_FadeInLength, 0);
    *fadeInType = static_cast<aafFadeType_t>(IntegerOr(prop::SourceClip_FadeInType, 0));
    *fadeOutLen = IntegerOr(prop::SourceClip_FadeOutLength, 0);
    *fadeOutType = static_cast<aafFadeType_t>(IntegerOr(prop::SourceClip_FadeOutType, 0));
    return AAFRESULT_SUCCESS;
}

}  // namespace aaf
