// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFEffects.h"
#include "host_interfaces/aaf/AAFTimecodes.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

using Component = TransientFile;
using Sequence = TransientFile;

namespace {

aafLength_t LengthOf(IAAFSequence* sequence) {
    aafLength_t length = -1;
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFComponent>(sequence)->GetLength(&length));
    return length;
}

}  // namespace

TEST_F(Component, StartsWithoutLengthAndDataDefinition) {
    Ptr<IAAFComponent> filler = Make<IAAFComponent>(AUID_AAFFiller);
    aafLength_t length = 0;
    Ptr<IAAFDataDef> dataDef;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, filler->GetLength(&length));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_FOUND, filler->GetDataDef(dataDef.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, filler->GetLength(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, filler->GetDataDef(nullptr));
}

TEST_F(Component, RefusesNegativeLengths) {
    Ptr<IAAFComponent> component = Make<IAAFComponent>(AUID_AAFFiller);
    EXPECT_EQ(AAFRESULT_BAD_LENGTH, component->SetLength(-1));
    EXPECT_EQ(AAFRESULT_SUCCESS, component->SetLength(0));
    Ptr<IAAFFiller> filler = Make<IAAFFiller>(AUID_AAFFiller);
    Ptr<IAAFDataDef> timecode = DataDef(kAAFDataDef_LegacyTimecode);
    EXPECT_EQ(AAFRESULT_BAD_LENGTH, filler->Initialize(timecode, -5));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, filler->Initialize(nullptr, 5));
    EXPECT_EQ(AAFRESULT_SUCCESS, filler->Initialize(timecode, 0));
    EXPECT_EQ(AAFRESULT_SUCCESS, filler->Initialize(timecode, 7));
    EXPECT_EQ(7, Get(As<IAAFComponent>(filler), &IAAFComponent::GetLength));
}

TEST_F(Component, TakesDataDefinitionsOfTheDictionaryOnly) {
    Ptr<IAAFComponent> component = Make<IAAFComponent>(AUID_AAFFiller);
    Ptr<IAAFDataDef> loose = Make<IAAFDataDef>(AUID_AAFDataDef);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              loose->Initialize(ncfGuid("ABCDEF00-0000-0000-0000-000000000001"), L"n", L"d"));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, component->SetDataDef(nullptr));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, component->SetDataDef(loose));
    EXPECT_EQ(AAFRESULT_SUCCESS, component->SetDataDef(DataDef(kAAFDataDef_Sound)));
    Ptr<IAAFDataDef> found = Get(component, &IAAFComponent::GetDataDef);
    EXPECT_EQ(DataDef(kAAFDataDef_Sound).get(), found.get());
}

TEST_F(Component, TakesTheLikeNamedDefinitionOfAnotherFile) {
    Ptr<IAAFFile> other;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, other.Out()));
    Ptr<IAAFDictionary> dictionary = Get(other, &IAAFFile::GetDictionary);
    Ptr<IAAFDataDef> theirs = Get(dictionary, &IAAFDictionary::LookupDataDef, kAAFDataDef_Sound);
    Ptr<IAAFComponent> component = Make<IAAFComponent>(AUID_AAFFiller);
    EXPECT_EQ(AAFRESULT_SUCCESS, component->SetDataDef(theirs));
    Ptr<IAAFDataDef> found = Get(component, &IAAFComponent::GetDataDef);
    EXPECT_EQ(DataDef(kAAFDataDef_Sound).get(), found.get());
}

TEST_F(Component, KeepsCommentsAndAttributesWithTheirDuplicates) {
    Ptr<IAAFComponent2> component = Make<IAAFComponent2>(AUID_AAFFiller);
    Ptr<IEnumAAFTaggedValues> all;
    EXPECT_EQ(0u, Get(component, &IAAFComponent2::CountComments));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, component->GetComments(all.Out()));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, component->GetAttributes(all.Out()));
    for (int time = 0; time < 2; ++time) {
        EXPECT_EQ(AAFRESULT_SUCCESS, component->AppendComment(L"n", L"v"));
        EXPECT_EQ(AAFRESULT_SUCCESS, component->AppendAttribute(L"n", L"v"));
    }
    EXPECT_EQ(AAFRESULT_NULL_PARAM, component->AppendComment(nullptr, L"v"));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, component->AppendAttribute(L"n", nullptr));
    EXPECT_EQ(2u, Get(component, &IAAFComponent2::CountComments));
    EXPECT_EQ(2u, Get(component, &IAAFComponent2::CountAttributes));
    ASSERT_EQ(AAFRESULT_SUCCESS, component->GetAttributes(all.Out()));
    Ptr<IAAFTaggedValue> value = Get(all, &IEnumAAFTaggedValues::NextOne);
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_FOUND, component->RemoveComment(value));
    EXPECT_EQ(AAFRESULT_SUCCESS, component->RemoveAttribute(value));
}

TEST_F(Component, OfTimecodeBringsItsDataDefinitionAlong) {
    Ptr<IAAFTimecode> timecode = Make<IAAFTimecode>(AUID_AAFTimecode);
    aafTimecode_t value{10, 1, 30};
    aafTimecode_t bad{0, 2, 30};
    aafTimecode_t found{};
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, timecode->GetTimecode(&found));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, timecode->SetTimecode(&value));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, timecode->Initialize(0, nullptr));
    EXPECT_EQ(AAFRESULT_INVALID_TIMECODE, timecode->Initialize(0, &bad));
    EXPECT_EQ(AAFRESULT_BAD_LENGTH, timecode->Initialize(-1, &value));
    ASSERT_EQ(AAFRESULT_SUCCESS, timecode->Initialize(5, &value));
    EXPECT_EQ(AAFRESULT_ALREADY_INITIALIZED, timecode->Initialize(5, &value));
    EXPECT_EQ(AAFRESULT_SUCCESS, timecode->GetTimecode(&found));
    EXPECT_EQ(10, found.startFrame);
    EXPECT_EQ(kAAFTcDrop, found.drop);
    EXPECT_EQ(30, found.fps);
    EXPECT_EQ(AAFRESULT_INVALID_TIMECODE, timecode->SetTimecode(&bad));
    aafTimecode_t odd{-7, 0, 0};
    EXPECT_EQ(AAFRESULT_SUCCESS, timecode->SetTimecode(&odd));
    EXPECT_EQ(AAFRESULT_SUCCESS, timecode->GetTimecode(&found));
    EXPECT_EQ(-7, found.startFrame);
    EXPECT_EQ(0, found.fps);
    Ptr<IAAFDataDef> dataDef = Get(As<IAAFComponent>(timecode), &IAAFComponent::GetDataDef);
    EXPECT_EQ(DataDef(kAAFDataDef_LegacyTimecode).get(), dataDef.get());
    EXPECT_EQ(5, Get(As<IAAFComponent>(timecode), &IAAFComponent::GetLength));
}

TEST_F(Component, OfTimecodeTellsTheTimecodeAtAnOffset) {
    Ptr<IAAFTimecode> timecode = Make<IAAFTimecode>(AUID_AAFTimecode);
    aafTimecode_t value{10, 0, 25};
    ASSERT_EQ(AAFRESULT_SUCCESS, timecode->Initialize(100, &value));
    aafPosition_t offset = 15;
    aafTimecode_t found{};
    Ptr<IAAFSegment> segment = As<IAAFSegment>(timecode);
    EXPECT_EQ(AAFRESULT_SUCCESS, segment->SegmentOffsetToTC(&offset, &found));
    EXPECT_EQ(25, found.startFrame);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, segment->SegmentOffsetToTC(nullptr, &found));
}

TEST_F(Component, OfASourceHasNoReferenceBeforeItIsInitialized) {
    Ptr<IAAFSourceClip> clip = Make<IAAFSourceClip>(AUID_AAFSourceClip);
    aafSourceRef_t reference{};
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, clip->GetSourceReference(&reference));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, clip->GetSourceReference(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, clip->Initialize(nullptr, 5, reference));
}

TEST_F(Component, OfASourceKeepsNoLengthWhenItIsNegative) {
    Ptr<IAAFSourceClip> clip = Clip(-1);
    aafLength_t length = 0;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, As<IAAFComponent>(clip)->GetLength(&length));
}

TEST_F(Component, OfASourceStoresReferencesAsTheyAreButForNilOnes) {
    Ptr<IAAFSourceClip> clip = Clip(5);
    aafSourceRef_t found{};
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->SetSourceReference({MobId(1), 0, -9}));
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->GetSourceReference(&found));
    EXPECT_EQ(-9, found.startTime);
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->SetSourceReference({aafMobID_t{}, 3, 4}));
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->GetSourceReference(&found));
    EXPECT_EQ(0u, found.sourceSlotID);
    EXPECT_EQ(0, found.startTime);

    Ptr<IAAFSourceReference2> reference = As<IAAFSourceReference2>(clip);
    aafUInt32 ids[] = {4, 5};
    aafUInt32 back[2] = {};
    aafUInt32 count = 0;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, reference->GetChannelIDsSize(&count));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, reference->SetChannelIDs(2, nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, reference->SetChannelIDs(2, ids));
    EXPECT_EQ(AAFRESULT_SUCCESS, reference->SetMonoSourceSlotIDs(2, ids));
    EXPECT_EQ(2u, Get(reference, &IAAFSourceReference2::GetChannelIDsSize));
    EXPECT_EQ(AAFRESULT_SUCCESS, reference->GetChannelIDs(2, back));
    EXPECT_EQ(5u, back[1]);
    EXPECT_EQ(AAFRESULT_SUCCESS, reference->GetMonoSourceSlotIDs(2, back));
}

TEST_F(Component, OfASourceKeepsFades) {
    Ptr<IAAFSourceClip> clip = Clip(5);
    aafLength_t inLength = 9;
    aafLength_t outLength = 9;
    aafFadeType_t inType = 9;
    aafFadeType_t outType = 9;
    aafBoolean_t in = 9;
    aafBoolean_t out = 9;
    EXPECT_EQ(AAFRESULT_SUCCESS,
              clip->GetFade(&inLength, &inType, &in, &outLength, &outType, &out));
    EXPECT_EQ(kAAFFalse, in);
    EXPECT_EQ(kAAFFalse, out);
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, clip->SetFade(1, 7, 2, 0));
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->SetFade(1, kAAFFadeLinearAmp, 2, kAAFFadeLinearPower));
    EXPECT_EQ(AAFRESULT_SUCCESS,
              clip->GetFade(&inLength, &inType, &in, &outLength, &outType, &out));
    EXPECT_EQ(1, inLength);
    EXPECT_EQ(2, outLength);
    EXPECT_EQ(kAAFFadeLinearPower, outType);
    EXPECT_EQ(kAAFTrue, in);
}

TEST_F(Sequence, SumsTheLengthsOfWhatIsAdded) {
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    aafLength_t length = 0;
    EXPECT_EQ(AAFRESULT_NULL_PARAM, sequence->Initialize(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, sequence->Initialize(DataDef(kAAFDataDef_LegacyPicture)));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, As<IAAFComponent>(sequence)->GetLength(&length));
    Ptr<IAAFComponent> first = Filler(5);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, sequence->AppendComponent(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(first));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, sequence->AppendComponent(first));
    EXPECT_EQ(AAFRESULT_SUCCESS, sequence->PrependComponent(Filler(7)));
    EXPECT_EQ(12, LengthOf(sequence));
    // From here on the sum stands by itself.
    EXPECT_EQ(AAFRESULT_SUCCESS, first->SetLength(100));
    EXPECT_EQ(12, LengthOf(sequence));
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFComponent>(sequence)->SetLength(3));
    EXPECT_EQ(3, LengthOf(sequence));
}

TEST_F(Sequence, RefusesAComponentWithoutLength) {
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT,
              sequence->AppendComponent(Make<IAAFComponent>(AUID_AAFFiller)));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, sequence->PrependComponent(As<IAAFComponent>(Clip(-1))));
}

TEST_F(Sequence, TakesWhatCanBeConvertedToItsKind) {
    const struct {
        aafUID_t component;
        aafUID_t sequence;
        HRESULT result;
    } cases[] = {
        {kAAFDataDef_Picture, kAAFDataDef_Picture, AAFRESULT_SUCCESS},
        {kAAFDataDef_LegacyPicture, kAAFDataDef_Picture, AAFRESULT_SUCCESS},
        {kAAFDataDef_Picture, kAAFDataDef_LegacyPicture, AAFRESULT_SUCCESS},
        {kAAFDataDef_LegacySound, kAAFDataDef_Sound, AAFRESULT_SUCCESS},
        {kAAFDataDef_Timecode, kAAFDataDef_LegacyTimecode, AAFRESULT_SUCCESS},
        {kAAFDataDef_PictureWithMatte, kAAFDataDef_Picture, AAFRESULT_SUCCESS},
        {kAAFDataDef_Picture, kAAFDataDef_PictureWithMatte, AAFRESULT_INVALID_DATADEF},
        {kAAFDataDef_Sound, kAAFDataDef_Picture, AAFRESULT_INVALID_DATADEF},
    };
    for (const auto& entry : cases) {
        Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
        sequence->Initialize(DataDef(entry.sequence));
        EXPECT_EQ(entry.result, sequence->AppendComponent(Filler(1, entry.component)));
    }
    Ptr<IAAFSequence> open = Make<IAAFSequence>(AUID_AAFSequence);
    EXPECT_EQ(AAFRESULT_SUCCESS, open->AppendComponent(Filler(1, kAAFDataDef_Sound)));
    EXPECT_EQ(AAFRESULT_SUCCESS, open->AppendComponent(Filler(1, kAAFDataDef_Picture)));
}

TEST_F(Sequence, HoldsTransitionsBetweenLongEnoughNeighbours) {
    const auto transition = [this](aafLength_t length) {
        Ptr<IAAFComponent> made = Make<IAAFComponent>(AUID_AAFTransition);
        made->SetDataDef(DataDef(kAAFDataDef_LegacyPicture));
        made->SetLength(length);
        return made;
    };
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    sequence->Initialize(DataDef(kAAFDataDef_LegacyPicture));
    EXPECT_EQ(AAFRESULT_LEADING_TRAN, sequence->AppendComponent(transition(2)));
    EXPECT_EQ(AAFRESULT_LEADING_TRAN, sequence->PrependComponent(transition(2)));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(Filler(10)));
    EXPECT_EQ(AAFRESULT_INSUFF_TRAN_MATERIAL, sequence->AppendComponent(transition(11)));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(transition(4)));
    EXPECT_EQ(6, LengthOf(sequence));
    EXPECT_EQ(AAFRESULT_ADJACENT_TRAN, sequence->AppendComponent(transition(1)));
    EXPECT_EQ(AAFRESULT_INSUFF_TRAN_MATERIAL, sequence->AppendComponent(Filler(3)));
    EXPECT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(Filler(10)));
    EXPECT_EQ(16, LengthOf(sequence));
}

TEST_F(Sequence, RefusesSumsThatDoNotFit) {
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(Filler(INT64_MAX)));
    EXPECT_EQ(AAFRESULT_BAD_LENGTH, sequence->AppendComponent(Filler(1)));
}

TEST_F(Sequence, DoesNotMixEventsWithOthers) {
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    Ptr<IAAFComponent> marker = Make<IAAFComponent>(AUID_AAFCommentMarker);
    marker->SetLength(1);
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(Filler(1)));
    EXPECT_EQ(AAFRESULT_EVENT_SEMANTICS, sequence->AppendComponent(marker));
}

TEST_F(Sequence, TakesEventsWithoutALength) {
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    Ptr<IAAFComponent> marker = Make<IAAFComponent>(AUID_AAFCommentMarker);
    Ptr<IAAFComponent> longer = Make<IAAFComponent>(AUID_AAFCommentMarker);
    longer->SetLength(3);
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(marker));
    aafLength_t length = 0;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, As<IAAFComponent>(sequence)->GetLength(&length));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(longer));
    EXPECT_EQ(3, LengthOf(sequence));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->RemoveComponentAt(0));
    EXPECT_EQ(3, LengthOf(sequence));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT,
              Make<IAAFSequence>(AUID_AAFSequence)
                  ->AppendComponent(Make<IAAFComponent>(AUID_AAFSourceClip)));
}

TEST_F(Sequence, GivesAndRemovesComponentsByPlace) {
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    Ptr<IAAFComponent> parts[] = {Filler(1), Filler(2), Filler(4)};
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(parts[0]));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(parts[2]));
    EXPECT_EQ(AAFRESULT_BADINDEX, sequence->InsertComponentAt(3, parts[1]));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->InsertComponentAt(1, parts[1]));
    for (aafUInt32 at = 0; at < 3; ++at) {
        Ptr<IAAFComponent> found = Get(sequence, &IAAFSequence::GetComponentAt, at);
        EXPECT_EQ(parts[at].get(), found.get());
    }
    Ptr<IAAFComponent> found;
    EXPECT_EQ(AAFRESULT_BADINDEX, sequence->GetComponentAt(3, found.Out()));
    EXPECT_EQ(AAFRESULT_BADINDEX, sequence->RemoveComponentAt(3));
    EXPECT_EQ(AAFRESULT_SUCCESS, sequence->RemoveComponentAt(1));
    EXPECT_EQ(5, LengthOf(sequence));
    EXPECT_EQ(2u, Get(sequence, &IAAFSequence::CountComponents));
    Ptr<IEnumAAFComponents> all = Get(sequence, &IAAFSequence::GetComponents);
    IAAFComponent* both[3] = {};
    aafUInt32 fetched = 0;
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS, all->Next(3, both, &fetched));
    EXPECT_EQ(2u, fetched);
    EXPECT_EQ(parts[0].get(), both[0]);
    EXPECT_EQ(parts[2].get(), both[1]);
    both[0]->Release();
    both[1]->Release();
}

TEST_F(Component, OfOtherProgramsKeepsItsParts) {
    Ptr<IAAFOperationGroup> group = Make<IAAFOperationGroup>(AUID_AAFOperationGroup);
    EXPECT_EQ(AAFRESULT_SUCCESS, group->AppendInputSegment(As<IAAFSegment>(Clip(1))));
    EXPECT_EQ(1u, Get(group, &IAAFOperationGroup::CountSourceSegments));
    EXPECT_EQ(AAFRESULT_SUCCESS, group->AddParameter(Make<IAAFParameter>(AUID_AAFConstantValue)));
    EXPECT_EQ(1u, Get(group, &IAAFOperationGroup::CountParameters));

    Ptr<IAAFTransition> transition = Make<IAAFTransition>(AUID_AAFTransition);
    ASSERT_EQ(AAFRESULT_SUCCESS, transition->SetOperationGroup(group));
    Ptr<IAAFOperationGroup> found = Get(transition, &IAAFTransition::GetOperationGroup);
    EXPECT_EQ(group.get(), found.get());

    Ptr<IAAFSelector> selector = Make<IAAFSelector>(AUID_AAFSelector);
    EXPECT_EQ(AAFRESULT_SUCCESS, selector->SetSelectedSegment(As<IAAFSegment>(Clip(1))));
    EXPECT_EQ(AAFRESULT_SUCCESS, selector->AppendAlternateSegment(As<IAAFSegment>(Clip(1))));
    EXPECT_EQ(1, Get(selector, &IAAFSelector::GetNumAlternateSegments));

    Ptr<IAAFPulldown> pulldown = Make<IAAFPulldown>(AUID_AAFPulldown);
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, pulldown->SetPulldownKind(8));
    EXPECT_EQ(AAFRESULT_SUCCESS, pulldown->SetPulldownKind(kAAFTwoToOnePD));
    EXPECT_EQ(kAAFTwoToOnePD, Get(pulldown, &IAAFPulldown::GetPulldownKind));
}

}  // namespace aaf_test
