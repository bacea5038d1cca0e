// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "aaf_library/objects/Mob.h"

namespace aaf {

// A place in a slot of a mob, and how much of what led there follows.
struct SourcePlace {
    RefPtr<Mob> mob;
    aafSourceRef_t reference{};  // from the origin of the slot
    aafLength_t length = -1;     // that the whole way has; below zero: not known
    aafRational_t editRate{};    // of the slot; 0/0 where it has none
};

// Follows the source clips of a slot from mob to mob until one is of that kind.
//
// - kAAFAllMob takes the first mob, kAAFPhysicalMob the first source mob of any kind, and
//   kAAFPrimaryMob the mob that refers to no other.
// - Of an essence group its first choice counts, of a selector the selected segment, of a nested
//   scope the last slot. An effect with one input is passed through; one with several by
//   `choice`, which also tells the side of a transition.
//
// AAFRESULT_TRAVERSAL_NOT_POSS when there is no such mob, no way on, or a clip doesn't reach as far
// as the position in it, AAFRESULT_FILL_FOUND and
// AAFRESULT_NOT_SOURCE_CLIP for what ends a way, AAFRESULT_MOB_NOT_FOUND and
// AAFRESULT_SLOT_NOT_FOUND for a reference that leads out of the file.
HRESULT FindSource(Mob& start, aafSlotID_t slotId, aafPosition_t offset, aafMobKind_t kind,
                   aafOperationChoice_t choice, SourcePlace& found);

// What IAAFSearchSource answers: checks the arguments, of which the criterion and the choice may be
// null, and gives out the place.
HRESULT SearchSourceOf(Mob& start, aafSlotID_t slotId, aafPosition_t offset, aafMobKind_t kind,
                       const aafMediaCriteria_t* criteria, const aafOperationChoice_t* choice,
                       IAAFFindSourceInfo** sourceInfo);

}  // namespace aaf
