// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/objects/Sequence.h"

#include "aaf_library/objects/OtherComponents.h"
#include "aaf_library/objects/Rates.h"
#include "host_interfaces/aaf/AAFClassIds.h"

namespace aaf {

namespace {

struct Conversion {
    aafUID_t from;
    aafUID_t to;
};

// The older and the newer id of a kind stand for each other; a picture with a
// matte can be used as a picture.
constexpr Conversion kConversions[] = {
    {kAAFDataDef_LegacyPicture, kAAFDataDef_Picture},
    {kAAFDataDef_Picture, kAAFDataDef_LegacyPicture},
    {kAAFDataDef_LegacySound, kAAFDataDef_Sound},
    {kAAFDataDef_Sound, kAAFDataDef_LegacySound},
    {kAAFDataDef_LegacyTimecode, kAAFDataDef_Timecode},
    {kAAFDataDef_Timecode, kAAFDataDef_LegacyTimecode},
    {kAAFDataDef_PictureWithMatte, kAAFDataDef_Picture},
    {kAAFDataDef_PictureWithMatte, kAAFDataDef_LegacyPicture},
};

bool IsConvertible(const aafUID_t& from, const aafUID_t& to) {
    if (from == to) {
        return true;
    }
    for (const Conversion& conversion : kConversions) {
        if (conversion.from == from && conversion.to == to) {
            return true;
        }
    }
    return false;
}

bool IsTransition(const Component* component) {
    return component != nullptr && component->IsKindOf(AUID_AAFTransition);
}

bool IsEvent(const Component* component) {
    return component != nullptr && component->IsKindOf(AUID_AAFEvent);
}

aafLength_t LengthOf(const Component& component) {
    return component.IntegerOr(prop::Component_Length, 0);
}

// A sequence's length with a component more: a transition lies over its
// neighbours and so shortens it. False when that is no length.
bool AddLength(aafLength_t length, const Component& component, aafLength_t& sum) {
    const bool overflow = IsTransition(&component)
                              ? __builtin_sub_overflow(length, LengthOf(component), &sum)
                              : __builtin_add_overflow(length, LengthOf(component), &sum);
    return !overflow && sum >= 0;
}

// The same with a component less.
bool SubtractLength(aafLength_t length, const Component& component, aafLength_t& rest) {
    const bool overflow = IsTransition(&component)
                              ? __builtin_add_overflow(length, LengthOf(component), &rest)
                              : __builtin_sub_overflow(length, LengthOf(component), &rest);
    return !overflow && rest >= 0;
}

}  // namespace

Component* Sequence::ComponentAt(aafUInt32 index) const {
    return dynamic_cast<Component*>(ObjectAt(prop::Sequence_Components, index));
}

HRESULT Sequence::CheckDataDefinition(Component& component) {
    const Unknown* own = WeakTarget(prop::Component_DataDefinition);
    if (own == nullptr) {
        return AAFRESULT_SUCCESS;
    }
    IAAFDataDef* theirs = nullptr;
    const HRESULT result = component.GetDataDef(&theirs);
    if (result < 0) {
        return result;
    }
    const RefPtr<IAAFDataDef> holder = RefPtr<IAAFDataDef>::Adopt(theirs);
    aafUID_t from{};
    aafUID_t to{};
    ReadDefinitionId(theirs, from);
    ReadDefinitionId(WeakTarget(prop::Component_DataDefinition)->Identity(), to);
    return IsConvertible(from, to) ? AAFRESULT_SUCCESS : AAFRESULT_INVALID_DATADEF;
}

HRESULT Sequence::CheckNeighbours(const Component& component, aafUInt32 index) const {
    const Component* const before = index == 0 ? nullptr : ComponentAt(index - 1);
    const Component* const behind = ComponentAt(index);
    const Component* const any = before != nullptr ? before : behind;
    if (any != nullptr && IsEvent(any) != IsEvent(&component)) {
        return AAFRESULT_EVENT_SEMANTICS;
    }
    const bool transition = IsTransition(&component);
    if (transition && before == nullptr) {
        return AAFRESULT_LEADING_TRAN;
    }
    for (const Component* neighbour : {before, behind}) {
        if (neighbour == nullptr || (!transition && !IsTransition(neighbour))) {
            continue;
        }
        if (transition && IsTransition(neighbour)) {
            return AAFRESULT_ADJACENT_TRAN;
        }
        const aafLength_t overlap = LengthOf(transition ? component : *neighbour);
        if (LengthOf(transition ? *neighbour : component) < overlap) {
            return AAFRESULT_INSUFF_TRAN_MATERIAL;
        }
    }
    return AAFRESULT_SUCCESS;
}

HRESULT Sequence::InsertComponentAt(aafUInt32 index, IAAFComponent* component) {
    if (component == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    if (index > CountObjects(prop::Sequence_Components)) {
        return AAFRESULT_BADINDEX;
    }
    Component* const added = ImplementationAs<Component>(component);
    if (added == nullptr) {
        return AAFRESULT_INVALID_OBJ;
    }
    if (added->owner() != nullptr) {
        return AAFRESULT_OBJECT_ALREADY_ATTACHED;
    }
    HRESULT result = CheckDataDefinition(*added);
    if (result >= 0) {
        result = CheckNeighbours(*added, index);
    }
    if (result < 0) {
        return result;
    }
    const bool hasLength = added->IsPresent(prop::Component_Length);
    if (!hasLength && !IsEvent(added)) {
        return AAFRESULT_PROP_NOT_PRESENT;
    }
    aafLength_t sum = 0;
    if (!AddLength(LengthOf(*this), *added, sum)) {
        return AAFRESULT_BAD_LENGTH;
    }
    result = InsertObjectAt(prop::Sequence_Components, index, component);
    return result < 0 || !hasLength ? result : PutInteger(prop::Component_Length, sum);
}

HRESULT Sequence::RemoveComponentAt(aafUInt32 index) {
    const Component* const removed = ComponentAt(index);
    if (removed == nullptr) {
        return AAFRESULT_BADINDEX;
    }
    if (!removed->IsPresent(prop::Component_Length)) {
        return RemoveObjectAt(prop::Sequence_Components, index);
    }
    aafLength_t rest = 0;
    if (!SubtractLength(LengthOf(*this), *removed, rest)) {
        rest = 0;  // the length was set by hand and no longer the sum
    }
    const HRESULT result = RemoveObjectAt(prop::Sequence_Components, index);
    return result < 0 ? result : PutInteger(prop::Component_Length, rest);
}

HRESULT Sequence::GetComponents(IEnumAAFComponents** enumerator) {
    return MakeEnumerator<IAAFComponent>(this, prop::Sequence_Components, enumerator);
}

bool Sequence::HasTimecode() const {
    const aafUInt32 count = CountObjects(prop::Sequence_Components);
    for (aafUInt32 at = 0; at < count; ++at) {
        const auto* const part = dynamic_cast<const Segment*>(ComponentAt(at));
        if (part != nullptr && part->HasTimecode()) {
            return true;
        }
    }
    return false;
}

HRESULT Sequence::SegmentOffsetToTC(aafPosition_t* offset, aafTimecode_t* timecode) {
    if (offset == nullptr || timecode == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    aafPosition_t start = 0;
    const aafUInt32 count = CountObjects(prop::Sequence_Components);
    for (aafUInt32 at = 0; at < count && *offset >= start; ++at) {
        auto* const part = dynamic_cast<Segment*>(ComponentAt(at));
        if (part == nullptr) {
            return AAFRESULT_TIMECODE_NOT_FOUND;
        }
        const aafPosition_t end = Plus(start, LengthOf(*part));
        if (*offset < end) {
            aafPosition_t inside = *offset - start;
            return part->SegmentOffsetToTC(&inside, timecode);
        }
        start = end;
    }
    return HasTimecode() ? AAFRESULT_BADSAMPLEOFFSET : AAFRESULT_TIMECODE_NOT_FOUND;
}

HRESULT Sequence::SegmentTCToOffset(aafTimecode_t* timecode, aafRational_t* editRate,
                                    aafFrameOffset_t* offset) {
    if (timecode == nullptr || editRate == nullptr || offset == nullptr) {
        return AAFRESULT_NULL_PARAM;
    }
    // The last stretch of timecode tells why there is none.
    HRESULT result = AAFRESULT_TIMECODE_NOT_FOUND;
    aafPosition_t start = 0;
    const aafUInt32 count = CountObjects(prop::Sequence_Components);
    for (aafUInt32 at = 0; at < count; ++at) {
        auto* const part = dynamic_cast<Segment*>(ComponentAt(at));
        if (part == nullptr) {
            return AAFRESULT_TIMECODE_NOT_FOUND;
        }
        aafFrameOffset_t inside = 0;
        const HRESULT found = part->SegmentTCToOffset(timecode, editRate, &inside);
        if (found >= 0) {
            *offset = Plus(start, inside);
            return found;
        }
        if (found != AAFRESULT_TIMECODE_NOT_FOUND) {
            result = found;
        }
        start = Plus(start, LengthOf(*part));
    }
    return result;
}

}  // namespace aaf
