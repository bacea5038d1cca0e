// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/aaf_library/objects/SavedFile.h"

// Segments and events that other programs put into compositions: what is set through the published
// operations is there after saving and opening.
namespace aaf_test {

class KeptSegments : public SavedFile {
protected:
    template <class T>
    Ptr<T> OfPicture(const aafUID_t& classId, aafLength_t length) {
        Ptr<T> made = Make<T>(classId);
        Ptr<IAAFComponent> component = As<IAAFComponent>(made);
        EXPECT_EQ(AAFRESULT_SUCCESS, component->SetDataDef(DataDef(kAAFDataDef_LegacyPicture)));
        EXPECT_EQ(AAFRESULT_SUCCESS, component->SetLength(length));
        return made;
    }
    Ptr<IAAFSegment> Part(aafLength_t length) { return As<IAAFSegment>(Filler(length)); }
    static aafLength_t LengthOf(IUnknown* part) {
        return Get(As<IAAFComponent>(part), &IAAFComponent::GetLength);
    }
};

TEST_F(KeptSegments, TransitionHasItsCutAndItsEffect) {
    Ptr<IAAFOperationDef> blend = Make<IAAFOperationDef>(AUID_AAFOperationDef);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              blend->Initialize(ncfGuid("0C3BEA40-FC05-11D2-8A29-0050040EF7D2"), L"Blend", L""));
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterOperationDef(blend));
    Ptr<IAAFDataDef> picture = DataDef(kAAFDataDef_LegacyPicture);
    Ptr<IAAFOperationGroup> effect = Make<IAAFOperationGroup>(AUID_AAFOperationGroup);
    ASSERT_EQ(AAFRESULT_SUCCESS, effect->Initialize(picture, 4, blend));
    EXPECT_EQ(AAFRESULT_SUCCESS, effect->SetBypassOverride(1));
    EXPECT_EQ(AAFRESULT_SUCCESS, effect->AppendInputSegment(Part(7)));
    EXPECT_EQ(AAFRESULT_SUCCESS, effect->PrependInputSegment(Part(6)));
    Ptr<IAAFTransition> transition = Make<IAAFTransition>(AUID_AAFTransition);
    ASSERT_EQ(AAFRESULT_SUCCESS, transition->Initialize(picture, 4, 2, effect));
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->Initialize(picture));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(Filler(10)));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(As<IAAFComponent>(transition)));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(Filler(10)));
    AddComposition(sequence);

    Ptr<IAAFSequence> read = ReopenedSegment<IAAFSequence>();
    EXPECT_EQ(16, LengthOf(read));
    Ptr<IAAFTransition> found =
        As<IAAFTransition>(Get(read, &IAAFSequence::GetComponentAt, aafUInt32{1}));
    EXPECT_EQ(2, Get(found, &IAAFTransition::GetCutPoint));
    Ptr<IAAFOperationGroup> group = Get(found, &IAAFTransition::GetOperationGroup);
    EXPECT_EQ(1u, Get(group, &IAAFOperationGroup::GetBypassOverride));
    EXPECT_EQ(2u, Get(group, &IAAFOperationGroup::CountSourceSegments));
    EXPECT_EQ(6, LengthOf(Get(group, &IAAFOperationGroup::GetInputSegmentAt, aafUInt32{0})));
    Ptr<IAAFOperationDef> definition = Get(group, &IAAFOperationGroup::GetOperationDefinition);
    EXPECT_EQ(L"Blend",
              TextOf<IAAFDefObject>(As<IAAFDefObject>(definition).get(),
                                    &IAAFDefObject::GetNameBufLen, &IAAFDefObject::GetName));
}

TEST_F(KeptSegments, SelectorHasWhatIsSelectedAndTheRest) {
    Ptr<IAAFSelector> selector = OfPicture<IAAFSelector>(AUID_AAFSelector, 10);
    Ptr<IAAFSegment> gone = Part(12);
    EXPECT_EQ(AAFRESULT_SUCCESS, selector->SetSelectedSegment(Part(10)));
    EXPECT_EQ(AAFRESULT_SUCCESS, selector->AppendAlternateSegment(gone));
    EXPECT_EQ(AAFRESULT_SUCCESS, selector->AppendAlternateSegment(Part(13)));
    EXPECT_EQ(AAFRESULT_SUCCESS, selector->RemoveAlternateSegment(gone));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, selector->RemoveAlternateSegment(gone));
    AddComposition(selector);
    Ptr<IAAFSelector> read = ReopenedSegment<IAAFSelector>();
    EXPECT_EQ(10, LengthOf(Get(read, &IAAFSelector::GetSelectedSegment)));
    EXPECT_EQ(1, Get(read, &IAAFSelector::GetNumAlternateSegments));
    Ptr<IEnumAAFSegments> others = Get(read, &IAAFSelector::EnumAlternateSegments);
    EXPECT_EQ(13, LengthOf(Get(others, &IEnumAAFSegments::NextOne)));
}

TEST_F(KeptSegments, EssenceGroupHasItsChoicesAndItsStill) {
    Ptr<IAAFEssenceGroup> group = OfPicture<IAAFEssenceGroup>(AUID_AAFEssenceGroup, 10);
    EXPECT_EQ(AAFRESULT_SUCCESS, group->SetStillFrame(Clip(1)));
    EXPECT_EQ(AAFRESULT_SUCCESS, group->AppendChoice(As<IAAFSegment>(Clip(2))));
    EXPECT_EQ(AAFRESULT_SUCCESS, group->PrependChoice(As<IAAFSegment>(Clip(3))));
    EXPECT_EQ(AAFRESULT_SUCCESS, group->InsertChoiceAt(1, As<IAAFSegment>(Clip(4))));
    EXPECT_EQ(AAFRESULT_SUCCESS, group->RemoveChoiceAt(2));
    EXPECT_EQ(AAFRESULT_BADINDEX, group->RemoveChoiceAt(2));
    AddComposition(group);
    Ptr<IAAFEssenceGroup> read = ReopenedSegment<IAAFEssenceGroup>();
    EXPECT_EQ(1, LengthOf(Get(read, &IAAFEssenceGroup::GetStillFrame)));
    ASSERT_EQ(2u, Get(read, &IAAFEssenceGroup::CountChoices));
    EXPECT_EQ(3, LengthOf(Get(read, &IAAFEssenceGroup::GetChoiceAt, aafUInt32{0})));
    EXPECT_EQ(4, LengthOf(Get(read, &IAAFEssenceGroup::GetChoiceAt, aafUInt32{1})));
}

TEST_F(KeptSegments, NestedScopeHasItsSlotsAndReferencesToThem) {
    Ptr<IAAFNestedScope> scope = OfPicture<IAAFNestedScope>(AUID_AAFNestedScope, 10);
    Ptr<IAAFScopeReference> reference = Make<IAAFScopeReference>(AUID_AAFScopeReference);
    ASSERT_EQ(AAFRESULT_SUCCESS, reference->Initialize(DataDef(kAAFDataDef_LegacyPicture), 0, 1));
    ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFComponent>(reference)->SetLength(10));
    EXPECT_EQ(AAFRESULT_SUCCESS, scope->AppendSegment(As<IAAFSegment>(reference)));
    EXPECT_EQ(AAFRESULT_SUCCESS, scope->PrependSegment(Part(5)));
    EXPECT_EQ(AAFRESULT_SUCCESS, scope->InsertSegmentAt(1, Part(6)));
    EXPECT_EQ(AAFRESULT_SUCCESS, scope->RemoveSegmentAt(0));
    EXPECT_EQ(AAFRESULT_BADINDEX, scope->RemoveSegmentAt(2));
    AddComposition(scope);
    Ptr<IAAFNestedScope> read = ReopenedSegment<IAAFNestedScope>();
    ASSERT_EQ(2u, Get(read, &IAAFNestedScope::CountSegments));
    EXPECT_EQ(6,
              LengthOf(Get(Get(read, &IAAFNestedScope::GetSegments), &IEnumAAFSegments::NextOne)));
    Ptr<IAAFScopeReference> found =
        As<IAAFScopeReference>(Get(read, &IAAFNestedScope::GetSegmentAt, aafUInt32{1}));
    EXPECT_EQ(0u, Get(found, &IAAFScopeReference::GetRelativeScope));
    EXPECT_EQ(1u, Get(found, &IAAFScopeReference::GetRelativeSlot));
}

TEST_F(KeptSegments, EventsHaveTheirPlaceAndTheirNote) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFCompositionMob);
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->SetMobID(MobId(0xC0)));
    Ptr<IAAFSequence> events = Make<IAAFSequence>(AUID_AAFSequence);
    ASSERT_EQ(AAFRESULT_SUCCESS, events->Initialize(DataDef(kAAFDataDef_DescriptiveMetadata)));
    for (const aafUID_t& id :
         {AUID_AAFCommentMarker, AUID_AAFDescriptiveMarker, AUID_AAFGPITrigger}) {
        Ptr<IAAFEvent> event = Make<IAAFEvent>(id);
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  As<IAAFComponent>(event)->SetDataDef(DataDef(kAAFDataDef_DescriptiveMetadata)));
        EXPECT_EQ(AAFRESULT_SUCCESS, event->SetPosition(42));
        EXPECT_EQ(AAFRESULT_SUCCESS, event->SetComment(L"Look here"));
        ASSERT_EQ(AAFRESULT_SUCCESS, events->AppendComponent(As<IAAFComponent>(event)));
    }
    const auto at = [](IAAFSequence* sequence, aafUInt32 index) {
        Ptr<IAAFComponent> found;
        EXPECT_EQ(AAFRESULT_SUCCESS, sequence->GetComponentAt(index, found.Out()));
        return found;
    };
    EXPECT_EQ(
        AAFRESULT_SUCCESS,
        As<IAAFCommentMarker>(at(events, 0))->SetAnnotation(As<IAAFSourceReference>(Clip(3))));
    aafUInt32 slots[] = {2, 5};
    EXPECT_EQ(AAFRESULT_SUCCESS,
              As<IAAFDescriptiveMarker>(at(events, 1))->SetDescribedSlotIDs(2, slots));
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFGPITrigger>(at(events, 2))->SetActiveState(kAAFTrue));
    Ptr<IAAFEventMobSlot> slot;
    ASSERT_EQ(AAFRESULT_SUCCESS,
              As<IAAFMob2>(mob)->AppendNewEventSlot({25, 1}, As<IAAFSegment>(events), 1, L"Events",
                                                    0, slot.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));

    Ptr<IAAFSequence> read = ReopenedSegment<IAAFSequence>();
    ASSERT_EQ(3u, Get(read, &IAAFSequence::CountComponents));
    for (aafUInt32 index = 0; index < 3; ++index) {
        Ptr<IAAFEvent> event = As<IAAFEvent>(at(read, index));
        EXPECT_EQ(42, Get(event, &IAAFEvent::GetPosition));
        EXPECT_EQ(L"Look here",
                  TextOf<IAAFEvent>(event, &IAAFEvent::GetCommentBufLen, &IAAFEvent::GetComment));
    }
    EXPECT_EQ(3,
              LengthOf(Get(As<IAAFCommentMarker>(at(read, 0)), &IAAFCommentMarker::GetAnnotation)));
    Ptr<IAAFDescriptiveMarker> marker = As<IAAFDescriptiveMarker>(at(read, 1));
    EXPECT_EQ(2u, Get(marker, &IAAFDescriptiveMarker::GetDescribedSlotIDsSize));
    aafUInt32 found[2] = {};
    EXPECT_EQ(AAFRESULT_SUCCESS, marker->GetDescribedSlotIDs(2, found));
    EXPECT_EQ(5u, found[1]);
    EXPECT_EQ(kAAFTrue, Get(As<IAAFGPITrigger>(at(read, 2)), &IAAFGPITrigger::GetActiveState));
}

}  // namespace aaf_test
