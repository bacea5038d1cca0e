// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/CompositionMob.h"

#include "aaf_library/objects/Checks.h"

namespace aaf {

HRESULT CompositionMob::Initialize(aafCharacter_constptr name) {
    return SetName(name);
}

HRESULT CompositionMob::GetDefaultFade(aafDefaultFade_t* result) {
    if (result == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafDefaultFade_t fade{};
    if (IsPresent(prop::CompositionMob_DefaultFadeLength)) {
        ReadInteger(prop::CompositionMob_DefaultFadeLength, &fade.fadeLength);
        ReadInteger(prop::CompositionMob_DefFadeType, &fade.fadeType);
        ReadStruct(prop::CompositionMob_DefFadeEditUnit, &fade.fadeEditUnit);
        fade.valid = kAAFTrue;
    }
    *result = fade;
    return AAFRESULT_SUCCESS;
}

HRESULT CompositionMob::SetDefaultFade(aafLength_t fadeLength, aafFadeType_t fadeType,
                                       aafRational_t fadeEditUnit) {
    if (!IsWithin(fadeType, kAAFFadeNone, kAAFFadeLinearPower)) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    PutInteger(prop::CompositionMob_DefaultFadeLength, fadeLength);
    PutInteger(prop::CompositionMob_DefFadeType, fadeType);
    return PutStruct(prop::CompositionMob_DefFadeEditUnit, fadeEditUnit);
}

HRESULT CompositionMob::SetRendering(aafMobID_constref mobID) {
    return PutStruct(prop::CompositionMob_Rendering, mobID);
}

HRESULT CompositionMob::GetRendering(aafMobID_t* mobID) {
    return ReadStruct(prop::CompositionMob_Rendering, mobID);
}

}  // namespace aaf
