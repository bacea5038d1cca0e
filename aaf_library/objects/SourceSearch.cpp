// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/SourceSearch.h"

#include <algorithm>

#include "aaf_library/objects/Checks.h"
#include "aaf_library/objects/ContentStorage.h"
#include "aaf_library/objects/MobSlot.h"
#include "aaf_library/objects/OtherComponents.h"
#include "aaf_library/objects/Rates.h"
#include "aaf_library/objects/Sequence.h"
#include "aaf_library/objects/SourceClip.h"
#include "aaf_library/objects/SourceMob.h"

namespace aaf {

namespace {

// References that lead round and round end here.
constexpr int kMostMobs = 100;

// A component, a position in it, and how much is wanted from there; below zero: not known.
struct At {
    const Component* component = nullptr;
    aafPosition_t position = 0;
    aafLength_t length = -1;
};

// No file can make it less than nothing.
aafLength_t KnownLength(const Object& component) {
    return std::max<aafLength_t>(component.IntegerOr(prop::Component_Length, 0), 0);
}

// No more can be wanted than a component has left; nothing is told of one without length.
void Limit(At& at) {
    if (at.component->IsPresent(prop::Component_Length)) {
        const aafLength_t left =
            std::max<aafLength_t>(Minus(KnownLength(*at.component), at.position), 0);
        at.length = at.length < 0 ? left : std::min(at.length, left);
    }
}

// A component without frames has its start, as a still.
bool IsInside(const Component& component, aafPosition_t position) {
    return position == 0 || (position > 0 && (!component.IsPresent(prop::Component_Length) ||
                                              position < KnownLength(component)));
}

const Component* PartOf(const Object& object, const PropertyKey& key, std::size_t index = 0) {
    return dynamic_cast<const Component*>(object.ObjectAt(key, index));
}

HRESULT IntoSequence(const Sequence& sequence, aafOperationChoice_t choice, At& at) {
    const aafUInt32 count = sequence.CountObjects(prop::Sequence_Components);
    aafPosition_t start = 0;
    At before;
    for (aafUInt32 index = 0; index < count; ++index) {
        const Component* const part = PartOf(sequence, prop::Sequence_Components, index);
        if (part == nullptr) {
            return AAFRESULT_NOT_SOURCE_CLIP;
        }
        const aafLength_t length = KnownLength(*part);
        if (dynamic_cast<const Transition*>(part) == nullptr) {
            const Component* const next = PartOf(sequence, prop::Sequence_Components, index + 1);
            const bool blends = dynamic_cast<const Transition*>(next) != nullptr;
            before = At{part, start, at.length};
            const aafPosition_t end = Plus(start, length);
            if (at.position < (blends ? Minus(end, KnownLength(*next)) : end)) {
                at = At{part, Minus(at.position, start), at.length};
                return AAFRESULT_SUCCESS;
            }
            start = end;
            continue;
        }
        // A transition lies over the end of what is before it and the start of what is behind.
        const aafPosition_t end = start;
        start = Minus(start, length);
        if (at.position >= end || choice == kAAFFindIncoming) {
            continue;
        }
        at = choice == kAAFFindOutgoing
                 ? At{before.component, Minus(at.position, before.position), at.length}
                 : At{PartOf(*part, prop::Transition_OperationGroup), Minus(at.position, start),
                      at.length};
        return at.component == nullptr ? AAFRESULT_TRAVERSAL_NOT_POSS : AAFRESULT_SUCCESS;
    }
    return AAFRESULT_TRAVERSAL_NOT_POSS;
}

HRESULT IntoGroup(const OperationGroup& group, aafOperationChoice_t choice, At& at) {
    const aafUInt32 inputs = group.CountObjects(prop::OperationGroup_InputSegments);
    if (choice == kAAFFindRender) {
        at.component = PartOf(group, prop::OperationGroup_Rendering);
    } else if (choice >= kAAFFindOperationSrc1) {
        at.component = PartOf(group, prop::OperationGroup_InputSegments,
                              static_cast<std::size_t>(choice - kAAFFindOperationSrc1));
    } else {
        at.component = inputs == 1 ? PartOf(group, prop::OperationGroup_InputSegments) : nullptr;
    }
    return at.component == nullptr ? AAFRESULT_TRAVERSAL_NOT_POSS : AAFRESULT_SUCCESS;
}

// One step from a component to the part of it that counts there.
HRESULT StepInto(aafOperationChoice_t choice, At& at) {
    const Component& whole = *at.component;
    if (const auto* const sequence = dynamic_cast<const Sequence*>(&whole)) {
        return IntoSequence(*sequence, choice, at);
    }
    if (const auto* const group = dynamic_cast<const OperationGroup*>(&whole)) {
        return IntoGroup(*group, choice, at);
    }
    if (const auto* const pulldown = dynamic_cast<const Pulldown*>(&whole)) {
        const PulldownRatio ratio = PulldownRatioOf(*pulldown);
        at.position = ratio.ToInput(at.position);
        at.length = at.length < 0 ? at.length : ratio.ToInput(at.length);
        at.component = PartOf(whole, prop::Pulldown_InputSegment);
    } else if (dynamic_cast<const Selector*>(&whole) != nullptr) {
        at.component = PartOf(whole, prop::Selector_Selected);
    } else if (dynamic_cast<const EssenceGroup*>(&whole) != nullptr) {
        at.component = PartOf(whole, prop::EssenceGroup_Choices);
    } else if (dynamic_cast<const NestedScope*>(&whole) != nullptr) {
        const aafUInt32 slots = whole.CountObjects(prop::NestedScope_Slots);
        at.component = slots == 0 ? nullptr : PartOf(whole, prop::NestedScope_Slots, slots - 1);
    } else {
        return dynamic_cast<const Filler*>(&whole) != nullptr ? AAFRESULT_FILL_FOUND
                                                              : AAFRESULT_NOT_SOURCE_CLIP;
    }
    return at.component == nullptr ? AAFRESULT_TRAVERSAL_NOT_POSS : AAFRESULT_SUCCESS;
}

// The source clip at a place, and the position in it.
HRESULT FindClip(aafOperationChoice_t choice, At& at) {
    Limit(at);
    while (dynamic_cast<const SourceClip*>(at.component) == nullptr) {
        if (const HRESULT result = StepInto(choice, at); result < 0) {
            return result;
        }
        Limit(at);
    }
    return IsInside(*at.component, at.position) ? AAFRESULT_SUCCESS : AAFRESULT_TRAVERSAL_NOT_POSS;
}

bool IsOfKind(const Mob& mob, aafMobKind_t kind) {
    if (kind == kAAFPhysicalMob) {
        return dynamic_cast<const SourceMob*>(&mob) != nullptr;
    }
    return kind == kAAFAllMob || (kind != kAAFPrimaryMob && mob.MobKind() == kind);
}

// From a place to the one that its source clip refers to. A reference of zeros ends the chain:
// `place` has no mob then.
HRESULT Follow(const ContentStorage& storage, aafOperationChoice_t choice, SourcePlace& place) {
    const MobSlot* const slot = place.mob->FindSlot(place.reference.sourceSlotID);
    if (slot == nullptr) {
        return AAFRESULT_SLOT_NOT_FOUND;
    }
    At at{slot->segment(),
          Plus(place.reference.startTime, slot->IntegerOr(prop::TimelineMobSlot_Origin, 0)),
          place.length};
    if (at.component == nullptr) {
        return AAFRESULT_NULLOBJECT;
    }
    if (const HRESULT result = FindClip(choice, at); result < 0) {
        return result;
    }
    const Component& clip = *at.component;
    aafMobID_t id = place.mob->id();
    clip.ReadStruct(prop::SourceReference_SourceID, &id);
    if (IsNilMobId(id)) {
        place.mob = nullptr;
        return AAFRESULT_SUCCESS;
    }
    place.mob = RefPtr<Mob>(storage.FindMob(id));
    if (!place.mob) {
        return AAFRESULT_MOB_NOT_FOUND;
    }
    const auto slotId =
        static_cast<aafSlotID_t>(clip.IntegerOr(prop::SourceReference_SourceMobSlotID, 0));
    const MobSlot* const next = place.mob->FindSlot(slotId);
    if (next == nullptr) {
        return AAFRESULT_SLOT_NOT_FOUND;
    }
    const aafRational_t from = slot->editRate();
    place.editRate = next->editRate();
    const aafPosition_t start = Plus(clip.IntegerOr(prop::SourceClip_StartTime, 0), at.position);
    place.reference = {id, slotId, Rescaled(start, from, place.editRate)};
    place.length = at.length < 0 ? at.length : Rescaled(at.length, from, place.editRate);
    return AAFRESULT_SUCCESS;
}

// A place as callers get it.
class FindSourceInfo final : public Implements<Unknown, IAAFFindSourceInfo> {
public:
    explicit FindSourceInfo(SourcePlace place) : place_(std::move(place)) {}

    HRESULT GetMob(IAAFMob** mob) override {
        return mob == nullptr ? AAFRESULT_NULL_PARAM : GiveOut(place_.mob.get(), mob);
    }
    HRESULT GetSourceReference(aafSourceRef_t* sourceRef) override {
        return Copy(place_.reference, sourceRef);
    }
    // AAFRESULT_PROP_NOT_PRESENT for a length that isn't known.
    HRESULT GetLength(aafLength_t* length) override {
        return length != nullptr && place_.length < 0 ? AAFRESULT_PROP_NOT_PRESENT
                                                      : Copy(place_.length, length);
    }
    HRESULT GetEditRate(aafRational_t* editRate) override {
        return Copy(place_.editRate, editRate);
    }

private:
    template <class T>
    static HRESULT Copy(const T& value, T* out) {
        if (out == nullptr) {
            return AAFRESULT_NULL_PARAM;
        }
        *out = value;
        return AAFRESULT_SUCCESS;
    }

    SourcePlace place_;
};

}  // namespace

HRESULT FindSource(Mob& start, aafSlotID_t slotId, aafPosition_t offset, aafMobKind_t kind,
                   aafOperationChoice_t choice, SourcePlace& found) {
    const auto* const storage = start.FindOwner<ContentStorage>();
    if (storage == nullptr) {
        return AAFRESULT_OBJECT_NOT_ATTACHED;
    }
    SourcePlace place;
    place.mob = RefPtr<Mob>(&start);
    place.reference = {start.id(), slotId, offset};
    for (int mobs = 0; mobs < kMostMobs; ++mobs) {
        const SourcePlace before = place;
        const HRESULT result = Follow(*storage, choice, place);
        if (result < 0) {
            return result;
        }
        if (!place.mob) {
            found = before;
            return kind == kAAFPrimaryMob && mobs > 0 ? AAFRESULT_SUCCESS
                                                      : AAFRESULT_TRAVERSAL_NOT_POSS;
        }
        if (IsOfKind(*place.mob, kind)) {
            found = place;
            return AAFRESULT_SUCCESS;
        }
    }
    return AAFRESULT_TRAVERSAL_NOT_POSS;
}

HRESULT SearchSourceOf(Mob& start, aafSlotID_t slotId, aafPosition_t offset, aafMobKind_t kind,
                       const aafMediaCriteria_t* criteria, const aafOperationChoice_t* choice,
                       IAAFFindSourceInfo** sourceInfo) {
    if (!IsWithin(kind, kAAFCompMob, kAAFPhysicalMob) ||
        (criteria != nullptr &&
         !IsWithin(criteria->type, kAAFAnyRepresentation, kAAFSmallestRepresentation)) ||
        (choice != nullptr && !IsWithin(*choice, kAAFFindNull, kAAFFindOperationSrc8))) {
        return AAFRESULT_INVALID_ENUM_VALUE;
    }
    if (sourceInfo == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    SourcePlace found;
    const HRESULT result =
        FindSource(start, slotId, offset, kind, choice == nullptr ? kAAFFindNull : *choice, found);
    return result < 0
               ? result
               : GiveOut(RefPtr<FindSourceInfo>(new FindSourceInfo(found)).get(), sourceInfo);
}

}  // namespace aaf
