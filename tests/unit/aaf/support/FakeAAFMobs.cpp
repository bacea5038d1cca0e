// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Mobs, slots and what slots hold.

#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "tests/unit/aaf/support/FakeAAFObject.h"

namespace {

// A slot with its segment, appended to a mob.
FakeAAFObject* NewSlot(FakeAAFObject& mob, aafSlotID_t id, FakeAAFObject* segment) {
    FakeAAFObject* const slot = mob.make(mob.name() + "Slot");
    slot->keep(segment);
    slot->segment = segment;
    mob.keep(slot);
    mob.slots.emplace_back(id, slot);
    slot->release();
    return slot;
}

void AppendClipSlot(FakeAAFObject& mob, aafSlotID_t id, const aafSourceRef_t& reference) {
    FakeAAFObject* const clip = mob.make(mob.name() + "Clip");
    clip->reference = reference;
    NewSlot(mob, id, clip);
    clip->release();
}

struct MobFace final : FakeAAFFace<IAAFMob> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT GetMobID(aafMobID_t* id) override {
        const HRESULT refused = note("GetMobID");
        if (!refused) {
            *id = self_.mobID;
        }
        return refused;
    }
    HRESULT SetMobID(aafMobID_constref id) override {
        self_.mobID = id;
        return note("SetMobID", id);
    }
    HRESULT SetName(aafCharacter_constptr name) override { return note("SetName", name); }
    HRESULT AppendComment(aafCharacter* name, aafCharacter_constptr value) override {
        return note("AppendComment", (aafCharacter_constptr)name, value);
    }
    HRESULT GetSlots(IEnumAAFMobSlots** out) override {
        const HRESULT refused = note("GetSlots");
        if (refused) {
            return refused;
        }
        FakeAAFObject* const enumerator = self_.make("SlotEnumerator");
        enumerator->keep(&self_);
        enumerator->slots = self_.slots;
        *out = static_cast<IEnumAAFMobSlots*>(enumerator->face(IID_IEnumAAFMobSlots));
        enumerator->release();
        return AAFRESULT_SUCCESS;
    }
    HRESULT AppendNewTimelineSlot(aafRational_t rate, IAAFSegment* segment, aafSlotID_t id,
                                  aafCharacter_constptr name, aafPosition_t origin,
                                  IAAFTimelineMobSlot** out) override {
        const HRESULT refused =
            note("AppendNewTimelineSlot", rate, (IUnknown*)segment, id, name, origin);
        if (refused) {
            return refused;
        }
        FakeAAFObject* const slot = NewSlot(self_, id, FakeAAFObject::of(segment));
        *out = static_cast<IAAFTimelineMobSlot*>(slot->face(IID_IAAFTimelineMobSlot));
        return AAFRESULT_SUCCESS;
    }
    HRESULT LookupSlot(aafSlotID_t id, IAAFMobSlot** out) override {
        const HRESULT refused = note("LookupSlot", id);
        if (refused) {
            return refused;
        }
        for (const auto& [known, slot] : self_.slots) {
            if (known == id) {
                *out = static_cast<IAAFMobSlot*>(slot->face(IID_IAAFMobSlot));
                return AAFRESULT_SUCCESS;
            }
        }
        return AAFRESULT_SLOT_NOT_FOUND;
    }
};

struct MasterMobFace final : FakeAAFFace<IAAFMasterMob> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize() override { return note("Initialize"); }
    HRESULT NewPhysSourceRef(aafRational_t rate, aafSlotID_t id, IAAFDataDef* kind,
                             aafSourceRef_t reference, aafLength_t length) override {
        const HRESULT refused =
            note("NewPhysSourceRef", rate, id, (IUnknown*)kind, reference, length);
        if (!refused) {
            AppendClipSlot(self_, id, reference);
        }
        return refused;
    }
};

struct SourceMobFace final : FakeAAFFace<IAAFSourceMob> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize() override { return note("Initialize"); }
    HRESULT SetEssenceDescriptor(IAAFEssenceDescriptor* descriptor) override {
        const HRESULT refused = note("SetEssenceDescriptor", (IUnknown*)descriptor);
        if (!refused) {
            self_.keep(FakeAAFObject::of(descriptor));
        }
        return refused;
    }
    HRESULT NewPhysSourceRef(aafRational_t rate, aafSlotID_t id, IAAFDataDef* kind,
                             aafSourceRef_t reference, aafLength_t length) override {
        const HRESULT refused =
            note("NewPhysSourceRef", rate, id, (IUnknown*)kind, reference, length);
        if (!refused) {
            AppendClipSlot(self_, id, reference);
        }
        return refused;
    }
    HRESULT AddNilReference(aafSlotID_t id, aafLength_t length, IAAFDataDef* kind,
                            aafRational_t rate) override {
        const HRESULT refused = note("AddNilReference", id, length, (IUnknown*)kind, rate);
        if (!refused) {
            AppendClipSlot(self_, id, {});
        }
        return refused;
    }
};

struct SlotEnumeratorFace final : FakeAAFFace<IEnumAAFMobSlots> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT NextOne(IAAFMobSlot** out) override {
        const HRESULT refused = note("NextOne");
        if (refused) {
            return refused;
        }
        if (self_.nextSlot == self_.slots.size()) {
            return AAFRESULT_NO_MORE_OBJECTS;
        }
        *out =
            static_cast<IAAFMobSlot*>(self_.slots[self_.nextSlot++].second->face(IID_IAAFMobSlot));
        return AAFRESULT_SUCCESS;
    }
};

struct MobSlotFace final : FakeAAFFace<IAAFMobSlot> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT GetSegment(IAAFSegment** out) override {
        const HRESULT refused = note("GetSegment");
        if (!refused) {
            *out = static_cast<IAAFSegment*>(self_.segment->face(IID_IAAFSegment));
        }
        return refused;
    }
    HRESULT SetName(aafCharacter_constptr name) override { return note("SetName", name); }
    HRESULT SetPhysicalNum(aafUInt32 number) override { return note("SetPhysicalNum", number); }
};

struct TimelineMobSlotFace final : FakeAAFFace<IAAFTimelineMobSlot> {
    using FakeAAFFace::FakeAAFFace;
};

struct SegmentFace final : FakeAAFFace<IAAFSegment> {
    using FakeAAFFace::FakeAAFFace;
};

struct SourceClipFace final : FakeAAFFace<IAAFSourceClip> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT GetSourceReference(aafSourceRef_t* reference) override {
        const HRESULT refused = note("GetSourceReference");
        if (!refused) {
            *reference = self_.reference;
        }
        return refused;
    }
    HRESULT SetSourceReference(aafSourceRef_t reference) override {
        const HRESULT refused = note("SetSourceReference", reference);
        if (!refused) {
            self_.reference = reference;
        }
        return refused;
    }
};

struct SequenceFace final : FakeAAFFace<IAAFSequence> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize(IAAFDataDef* kind) override { return note("Initialize", (IUnknown*)kind); }
    HRESULT AppendComponent(IAAFComponent* component) override {
        return note("AppendComponent", (IUnknown*)component);
    }
    HRESULT PrependComponent(IAAFComponent* component) override {
        return note("PrependComponent", (IUnknown*)component);
    }
};

struct ComponentFace final : FakeAAFFace<IAAFComponent> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT SetLength(aafLength_constref length) override { return note("SetLength", length); }
    HRESULT SetDataDef(IAAFDataDef* kind) override { return note("SetDataDef", (IUnknown*)kind); }
};

struct TimecodeFace final : FakeAAFFace<IAAFTimecode> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize(aafLength_t length, aafTimecode_t* timecode) override {
        return note("Initialize", length, *timecode);
    }
};

struct FillerFace final : FakeAAFFace<IAAFFiller> {
    using FakeAAFFace::FakeAAFFace;
    HRESULT Initialize(IAAFDataDef* kind, aafLength_t length) override {
        const HRESULT refused = note("Initialize", (IUnknown*)kind, length);
        if (refused) {
            return refused;
        }
        const bool bad = length < 0 && self_.library().refusesNegativeLengths;
        return bad ? AAFRESULT_BAD_LENGTH : AAFRESULT_SUCCESS;
    }
};

}  // namespace

FakeAAFFaceMaker FindMobFace(const GUID& iid) {
    static const FakeAAFFaceEntry entries[] = {
        {IID_IAAFMob, MakeFakeAAFFace<MobFace, IAAFMob>},
        {IID_IAAFMasterMob, MakeFakeAAFFace<MasterMobFace, IAAFMasterMob>},
        {IID_IAAFSourceMob, MakeFakeAAFFace<SourceMobFace, IAAFSourceMob>},
        {IID_IEnumAAFMobSlots, MakeFakeAAFFace<SlotEnumeratorFace, IEnumAAFMobSlots>},
        {IID_IAAFMobSlot, MakeFakeAAFFace<MobSlotFace, IAAFMobSlot>},
        {IID_IAAFTimelineMobSlot, MakeFakeAAFFace<TimelineMobSlotFace, IAAFTimelineMobSlot>},
        {IID_IAAFSegment, MakeFakeAAFFace<SegmentFace, IAAFSegment>},
        {IID_IAAFSourceClip, MakeFakeAAFFace<SourceClipFace, IAAFSourceClip>},
        {IID_IAAFSequence, MakeFakeAAFFace<SequenceFace, IAAFSequence>},
        {IID_IAAFComponent, MakeFakeAAFFace<ComponentFace, IAAFComponent>},
        {IID_IAAFTimecode, MakeFakeAAFFace<TimecodeFace, IAAFTimecode>},
        {IID_IAAFFiller, MakeFakeAAFFace<FillerFace, IAAFFiller>},
    };
    return FindFace(entries, iid);
}
