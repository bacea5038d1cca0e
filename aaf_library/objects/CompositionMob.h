// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Mob.h"
#include "not_implemented/AAFMobs.h"

namespace aaf {

// Material put together of other material.
class CompositionMob : public Implements<Mob, IAAFCompositionMob, IAAFCompositionMob2> {
public:
    aafMobKind_t MobKind() const override { return kAAFCompMob; }

    HRESULT Initialize(aafCharacter_constptr name) override;
    HRESULT GetDefaultFade(aafDefaultFade_t* result) override;
    HRESULT SetDefaultFade(aafLength_t fadeLength, aafFadeType_t fadeType,
                           aafRational_t fadeEditUnit) override;
    HRESULT SetRendering(aafMobID_constref mobID) override;
    HRESULT GetRendering(aafMobID_t* mobID) override;
};

}  // namespace aaf
