// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/aaf_library/objects/SavedFile.h"

// The way from a master mob to its file, its tape and its film.
namespace aaf_test {

namespace {

constexpr aafUInt8 kMaster = 0x01;
constexpr aafUInt8 kFile = 0x02;
constexpr aafUInt8 kTape = 0x03;

// A place that a search found: mob, slot, position, length.
struct Place {
    aafUInt8 mob = 0;
    aafSlotID_t slot = 0;
    aafPosition_t position = 0;
    aafLength_t length = -1;

    bool operator==(const Place& other) const {
        return mob == other.mob && slot == other.slot && position == other.position &&
               length == other.length;
    }
};

std::ostream& operator<<(std::ostream& out, const Place& place) {
    return out << int{place.mob} << " slot " << place.slot << " at " << place.position << " for "
               << place.length;
}

}  // namespace

class SourceSearch : public SavedFile {
protected:
    Ptr<IAAFSegment> ClipOf(aafUInt8 mob, aafSlotID_t slot, aafPosition_t start,
                            aafLength_t length) {
        Ptr<IAAFSourceClip> clip = Make<IAAFSourceClip>(AUID_AAFSourceClip);
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  clip->Initialize(DataDef(kAAFDataDef_LegacyPicture), length,
                                   {mob == 0 ? aafMobID_t{} : MobId(mob), slot, start}));
        return As<IAAFSegment>(clip);
    }
    template <class Object>
    Ptr<Object> OfPicture(const aafUID_t& classId, aafLength_t length) {
        Ptr<Object> made = Make<Object>(classId);
        Ptr<IAAFComponent> component = As<IAAFComponent>(made);
        EXPECT_EQ(AAFRESULT_SUCCESS, component->SetDataDef(DataDef(kAAFDataDef_LegacyPicture)));
        EXPECT_EQ(AAFRESULT_SUCCESS, component->SetLength(length));
        return made;
    }
    template <class Descriptor = IAAFEssenceDescriptor>
    Ptr<IAAFMob> Add(aafUInt8 number, const aafUID_t& descriptor = aafUID_t{}) {
        const bool isMaster = descriptor == aafUID_t{};
        Ptr<IAAFMob> mob = Make<IAAFMob>(isMaster ? AUID_AAFMasterMob : AUID_AAFSourceMob);
        EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetMobID(MobId(number)));
        if (!isMaster) {
            EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFSourceMob>(mob)->SetEssenceDescriptor(
                                             Make<IAAFEssenceDescriptor>(descriptor)));
        }
        EXPECT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
        return mob;
    }
    void AddSlot(IAAFMob* mob, aafSlotID_t id, IAAFSegment* segment, aafRational_t rate = {25, 1},
                 aafPosition_t origin = 0) {
        Ptr<IAAFTimelineMobSlot> slot;
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  mob->AppendNewTimelineSlot(rate, segment, id, L"V", origin, slot.Out()));
    }
    // A file and a tape behind it, of twice the rate.
    void AddFileAndTape() {
        AddSlot(Add(kFile, AUID_AAFCDCIDescriptor), 1, ClipOf(kTape, 2, 100, 50));
        tape_ = Add(kTape, AUID_AAFTapeDescriptor);
        EXPECT_EQ(AAFRESULT_SUCCESS, tape_->SetName(L"A001"));
        AddSlot(tape_, 2, ClipOf(0, 0, 0, 9000), {50, 1});
    }
    void AddMaster(IAAFSegment* segment) {
        master_ = Add(kMaster);
        AddSlot(master_, 1, segment);
    }
    HRESULT Search(IAAFMob* mob, aafPosition_t offset, aafMobKind_t kind, Place* place,
                   aafOperationChoice_t choice = kAAFFindNull, aafSlotID_t slot = 1) {
        aafMediaCriteria_t any{kAAFAnyRepresentation};
        Ptr<IAAFFindSourceInfo> info;
        const HRESULT result =
            As<IAAFSearchSource>(mob)->SearchSource(slot, offset, kind, &any, &choice, info.Out());
        if (result < 0) {
            return result;
        }
        const aafSourceRef_t reference = Get(info, &IAAFFindSourceInfo::GetSourceReference);
        Ptr<IAAFMob> found = Get(info, &IAAFFindSourceInfo::GetMob);
        EXPECT_TRUE(SameMobId(reference.sourceID, Get(found, &IAAFMob::GetMobID)));
        *place = {reference.sourceID.SMPTELabel[0], reference.sourceSlotID, reference.startTime,
                  -1};
        if (info->GetLength(&place->length) < 0) {
            place->length = -1;
        }
        return result;
    }
    Place Found(aafPosition_t offset, aafMobKind_t kind,
                aafOperationChoice_t choice = kAAFFindNull) {
        Place place;
        EXPECT_EQ(AAFRESULT_SUCCESS, Search(master_, offset, kind, &place, choice));
        return place;
    }
    HRESULT Failure(aafPosition_t offset, aafMobKind_t kind,
                    aafOperationChoice_t choice = kAAFFindNull, aafSlotID_t slot = 1) {
        Place place;
        return Search(master_, offset, kind, &place, choice, slot);
    }

    Ptr<IAAFMob> master_;
    Ptr<IAAFMob> tape_;
};

TEST_F(SourceSearch, FollowsClipsFromMobToMob) {
    AddFileAndTape();
    AddMaster(ClipOf(kFile, 1, 10, 30));
    EXPECT_EQ((Place{kFile, 1, 15, 25}), Found(5, kAAFFileMob));
    EXPECT_EQ((Place{kFile, 1, 15, 25}), Found(5, kAAFAllMob));
    EXPECT_EQ((Place{kFile, 1, 15, 25}), Found(5, kAAFPhysicalMob));
    // 115 frames of 25 a second are 230 of 50. Of the tape no more is wanted than of the file.
    EXPECT_EQ((Place{kTape, 2, 230, 50}), Found(5, kAAFTapeMob));
    EXPECT_EQ((Place{kTape, 2, 230, 50}), Found(5, kAAFPrimaryMob));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(5, kAAFFilmMob));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(5, kAAFCompMob));
}

TEST_F(SourceSearch, GoesOnInASavedFile) {
    AddFileAndTape();
    AddMaster(ClipOf(kFile, 1, 10, 30));
    Ptr<IAAFHeader> read = Reopen();
    Ptr<IAAFMob> master = Get(read, &IAAFHeader::LookupMob, MobId(kMaster));
    Place place;
    EXPECT_EQ(AAFRESULT_SUCCESS, Search(master, 5, kAAFTapeMob, &place));
    EXPECT_EQ((Place{kTape, 2, 230, 50}), place);
    Ptr<IAAFMasterMob> named = As<IAAFMasterMob>(master);
    aafUInt32 bytes = 0;
    aafCharacter name[5] = {};
    EXPECT_EQ(AAFRESULT_SUCCESS, named->GetTapeNameBufLen(1, &bytes));
    EXPECT_EQ(sizeof name, bytes);
    EXPECT_EQ(AAFRESULT_SMALLBUF, named->GetTapeName(1, name, 4));
    EXPECT_EQ(AAFRESULT_SUCCESS, named->GetTapeName(1, name, sizeof name));
    EXPECT_EQ(std::wstring(L"A001"), name);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, named->GetTapeName(1, nullptr, 0));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, named->GetTapeNameBufLen(1, nullptr));
    EXPECT_EQ(AAFRESULT_SLOT_NOT_FOUND, named->GetTapeNameBufLen(7, &bytes));
}

TEST_F(SourceSearch, FindsTheComponentOfASequence) {
    AddFileAndTape();
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->Initialize(DataDef(kAAFDataDef_LegacyPicture)));
    for (const Ptr<IAAFComponent>& part : {As<IAAFComponent>(ClipOf(kFile, 1, 0, 10)), Filler(5),
                                           As<IAAFComponent>(ClipOf(kFile, 1, 30, 10))}) {
        ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(part));
    }
    AddMaster(As<IAAFSegment>(sequence));
    EXPECT_EQ((Place{kFile, 1, 9, 1}), Found(9, kAAFFileMob));
    EXPECT_EQ(AAFRESULT_FILL_FOUND, Failure(10, kAAFFileMob));
    EXPECT_EQ((Place{kFile, 1, 30, 10}), Found(15, kAAFFileMob));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(25, kAAFFileMob));
}

TEST_F(SourceSearch, TakesTheWantedSideOfATransition) {
    AddFileAndTape();
    Ptr<IAAFSequence> sequence = Make<IAAFSequence>(AUID_AAFSequence);
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->Initialize(DataDef(kAAFDataDef_LegacyPicture)));
    Ptr<IAAFTransition> blend = OfPicture<IAAFTransition>(AUID_AAFTransition, 4);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              sequence->AppendComponent(As<IAAFComponent>(ClipOf(kFile, 1, 0, 10))));
    ASSERT_EQ(AAFRESULT_SUCCESS, sequence->AppendComponent(As<IAAFComponent>(blend)));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              sequence->AppendComponent(As<IAAFComponent>(ClipOf(kFile, 1, 40, 10))));
    AddMaster(As<IAAFSegment>(sequence));
    EXPECT_EQ((Place{kFile, 1, 5, 5}), Found(5, kAAFFileMob));
    EXPECT_EQ((Place{kFile, 1, 7, 3}), Found(7, kAAFFileMob, kAAFFindOutgoing));
    EXPECT_EQ((Place{kFile, 1, 41, 9}), Found(7, kAAFFileMob, kAAFFindIncoming));
    EXPECT_EQ((Place{kFile, 1, 44, 6}), Found(10, kAAFFileMob));
    // Without a side it is the effect's input that counts, and this effect has none.
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(7, kAAFFileMob));
    Ptr<IAAFOperationGroup> effect = OfPicture<IAAFOperationGroup>(AUID_AAFOperationGroup, 4);
    ASSERT_EQ(AAFRESULT_SUCCESS, effect->AppendInputSegment(ClipOf(kFile, 1, 20, 4)));
    ASSERT_EQ(AAFRESULT_SUCCESS, blend->SetOperationGroup(effect));
    EXPECT_EQ((Place{kFile, 1, 21, 3}), Found(7, kAAFFileMob));
}

TEST_F(SourceSearch, TakesTheWantedInputOfAnEffect) {
    AddFileAndTape();
    Ptr<IAAFOperationGroup> effect = OfPicture<IAAFOperationGroup>(AUID_AAFOperationGroup, 10);
    ASSERT_EQ(AAFRESULT_SUCCESS, effect->AppendInputSegment(ClipOf(kFile, 1, 1, 10)));
    AddMaster(As<IAAFSegment>(effect));
    EXPECT_EQ((Place{kFile, 1, 3, 8}), Found(2, kAAFFileMob));
    ASSERT_EQ(AAFRESULT_SUCCESS, effect->AppendInputSegment(ClipOf(kFile, 1, 20, 10)));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(2, kAAFFileMob));
    EXPECT_EQ((Place{kFile, 1, 3, 8}), Found(2, kAAFFileMob, kAAFFindOperationSrc1));
    EXPECT_EQ((Place{kFile, 1, 22, 8}), Found(2, kAAFFileMob, kAAFFindOperationSrc2));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(2, kAAFFileMob, kAAFFindOperationSrc3));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(2, kAAFFileMob, kAAFFindRender));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              effect->SetRender(As<IAAFSourceReference>(ClipOf(kFile, 1, 40, 10))));
    EXPECT_EQ((Place{kFile, 1, 42, 8}), Found(2, kAAFFileMob, kAAFFindRender));
}

TEST_F(SourceSearch, GoesThroughWhatHoldsSegments) {
    AddFileAndTape();
    Ptr<IAAFEssenceGroup> group = OfPicture<IAAFEssenceGroup>(AUID_AAFEssenceGroup, 10);
    Ptr<IAAFSelector> selector = OfPicture<IAAFSelector>(AUID_AAFSelector, 10);
    Ptr<IAAFNestedScope> scope = OfPicture<IAAFNestedScope>(AUID_AAFNestedScope, 10);
    AddMaster(As<IAAFSegment>(scope));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(0, kAAFFileMob));
    ASSERT_EQ(AAFRESULT_SUCCESS, scope->AppendSegment(As<IAAFSegment>(Filler(10))));
    ASSERT_EQ(AAFRESULT_SUCCESS, scope->AppendSegment(As<IAAFSegment>(selector)));
    ASSERT_EQ(AAFRESULT_SUCCESS, selector->AppendAlternateSegment(As<IAAFSegment>(Filler(10))));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(0, kAAFFileMob));
    ASSERT_EQ(AAFRESULT_SUCCESS, selector->SetSelectedSegment(As<IAAFSegment>(group)));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(0, kAAFFileMob));
    ASSERT_EQ(AAFRESULT_SUCCESS, group->AppendChoice(ClipOf(kFile, 1, 2, 10)));
    ASSERT_EQ(AAFRESULT_SUCCESS, group->AppendChoice(ClipOf(kTape, 2, 0, 10)));
    EXPECT_EQ((Place{kFile, 1, 5, 7}), Found(3, kAAFFileMob));
}

TEST_F(SourceSearch, CountsFromTheOriginOfASlot) {
    AddSlot(Add(kFile, AUID_AAFCDCIDescriptor), 1, ClipOf(kTape, 2, 100, 50), {25, 1}, 10);
    AddSlot(Add(kTape, AUID_AAFTapeDescriptor), 2, ClipOf(0, 0, 0, 9000));
    AddMaster(ClipOf(kFile, 1, 0, 30));
    EXPECT_EQ((Place{kFile, 1, 1, 29}), Found(1, kAAFFileMob));
    EXPECT_EQ((Place{kTape, 2, 111, 29}), Found(1, kAAFTapeMob));
}

TEST_F(SourceSearch, EndsWithTheShortestClipOfTheWay) {
    AddFileAndTape();
    AddMaster(ClipOf(kFile, 1, 40, 30));
    EXPECT_EQ((Place{kFile, 1, 40, 30}), Found(0, kAAFFileMob));
    // The file has 50 frames.
    EXPECT_EQ((Place{kTape, 2, 280, 20}), Found(0, kAAFTapeMob));
    // One that doesn't tell its length shortens nothing.
    AddSlot(master_, 2, ClipOf(kFile, 1, 0, -1));
    Place place;
    EXPECT_EQ(AAFRESULT_SUCCESS, Search(master_, 4, kAAFTapeMob, &place, kAAFFindNull, 2));
    EXPECT_EQ((Place{kTape, 2, 208, 92}), place);
    // An effect that takes part of its input.
    Ptr<IAAFOperationGroup> effect = OfPicture<IAAFOperationGroup>(AUID_AAFOperationGroup, 5);
    ASSERT_EQ(AAFRESULT_SUCCESS, effect->AppendInputSegment(ClipOf(kFile, 1, 1, 10)));
    AddSlot(master_, 3, As<IAAFSegment>(effect));
    EXPECT_EQ(AAFRESULT_SUCCESS, Search(master_, 2, kAAFFileMob, &place, kAAFFindNull, 3));
    EXPECT_EQ((Place{kFile, 1, 3, 3}), place);
}

TEST_F(SourceSearch, FindsNothingOutsideOfAClip) {
    AddFileAndTape();
    AddMaster(ClipOf(kFile, 1, 10, 30));
    EXPECT_EQ((Place{kFile, 1, 39, 1}), Found(29, kAAFFileMob));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(30, kAAFFileMob));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(-1, kAAFFileMob));
    // Behind the end of the file's own clip.
    AddSlot(master_, 2, ClipOf(kFile, 1, 45, 30));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(5, kAAFTapeMob, kAAFFindNull, 2));
    // A still has no length but a place.
    AddSlot(master_, 3, ClipOf(kFile, 1, 7, 0));
    Place place;
    EXPECT_EQ(AAFRESULT_SUCCESS, Search(master_, 0, kAAFFileMob, &place, kAAFFindNull, 3));
    EXPECT_EQ((Place{kFile, 1, 7, 0}), place);
}

TEST_F(SourceSearch, TellsWhereAWayEnds) {
    AddMaster(ClipOf(kFile, 1, 0, 10));
    EXPECT_EQ(AAFRESULT_MOB_NOT_FOUND, Failure(0, kAAFFileMob));
    Ptr<IAAFMob> file = Add(kFile, AUID_AAFCDCIDescriptor);
    EXPECT_EQ(AAFRESULT_SLOT_NOT_FOUND, Failure(0, kAAFFileMob));
    EXPECT_EQ(AAFRESULT_SLOT_NOT_FOUND, Failure(0, kAAFFileMob, kAAFFindNull, 9));
    // A circle.
    AddSlot(file, 1, ClipOf(kFile, 1, 0, 10));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(0, kAAFTapeMob));
    // Timecode has no source; a clip without a reference has none either.
    Ptr<IAAFTimecode> timecode = Make<IAAFTimecode>(AUID_AAFTimecode);
    aafTimecode_t start{0, kAAFTcNonDrop, 25};
    ASSERT_EQ(AAFRESULT_SUCCESS, timecode->Initialize(10, &start));
    AddSlot(master_, 2, As<IAAFSegment>(timecode));
    EXPECT_EQ(AAFRESULT_NOT_SOURCE_CLIP, Failure(0, kAAFFileMob, kAAFFindNull, 2));
    AddSlot(master_, 3, ClipOf(0, 0, 0, 10));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(0, kAAFAllMob, kAAFFindNull, 3));
    EXPECT_EQ(AAFRESULT_TRAVERSAL_NOT_POSS, Failure(0, kAAFPrimaryMob, kAAFFindNull, 3));
}

TEST_F(SourceSearch, ChecksItsArguments) {
    Ptr<IAAFMob> free = Make<IAAFMob>(AUID_AAFMasterMob);
    Place place;
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, Search(free, 0, kAAFFileMob, &place));
    AddFileAndTape();
    AddMaster(ClipOf(kFile, 1, 10, -1));
    Ptr<IAAFSearchSource> search = As<IAAFSearchSource>(master_);
    Ptr<IAAFFindSourceInfo> info;
    aafMediaCriteria_t odd{kAAFSmallestRepresentation + 1};
    aafOperationChoice_t choice = kAAFFindOperationSrc8 + 1;
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE,
              search->SearchSource(1, 0, kAAFPhysicalMob + 1, nullptr, nullptr, info.Out()));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE,
              search->SearchSource(1, 0, kAAFFileMob, &odd, nullptr, info.Out()));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE,
              search->SearchSource(1, 0, kAAFFileMob, nullptr, &choice, info.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM,
              search->SearchSource(1, 0, kAAFFileMob, nullptr, nullptr, nullptr));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              search->SearchSource(1, 0, kAAFFileMob, nullptr, nullptr, info.Out()));
    aafLength_t length = 77;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, info->GetLength(&length));
    EXPECT_EQ(77, length);
    const aafRational_t rate = Get(info, &IAAFFindSourceInfo::GetEditRate);
    EXPECT_EQ(25, rate.numerator);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, info->GetLength(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, info->GetMob(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, info->GetEditRate(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, info->GetSourceReference(nullptr));
}

TEST_F(SourceSearch, GivesTheRepresentationsOfASlot) {
    Ptr<IAAFEssenceGroup> group = OfPicture<IAAFEssenceGroup>(AUID_AAFEssenceGroup, 10);
    ASSERT_EQ(AAFRESULT_SUCCESS, group->AppendChoice(ClipOf(kFile, 1, 2, 10)));
    ASSERT_EQ(AAFRESULT_SUCCESS, group->AppendChoice(ClipOf(kFile, 1, 3, 10)));
    AddMaster(As<IAAFSegment>(group));
    AddSlot(master_, 2, ClipOf(kFile, 1, 2, 10));
    Ptr<IAAFHeader> file = Reopen();
    Ptr<IAAFMasterMob> master =
        As<IAAFMasterMob>(Get(file, &IAAFHeader::LookupMob, MobId(kMaster)));
    aafNumSlots_t count = 0;
    Ptr<IAAFSegment> segment;
    EXPECT_EQ(AAFRESULT_SUCCESS, master->GetNumRepresentations(1, &count));
    EXPECT_EQ(2u, count);
    EXPECT_EQ(AAFRESULT_SUCCESS, master->GetRepresentation(1, 1, segment.Out()));
    EXPECT_EQ(3, Get(As<IAAFSourceClip>(segment), &IAAFSourceClip::GetSourceReference).startTime);
    EXPECT_EQ(AAFRESULT_BADINDEX, master->GetRepresentation(1, 2, segment.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, master->GetNumRepresentations(2, &count));
    EXPECT_EQ(1u, count);
    EXPECT_EQ(AAFRESULT_SUCCESS, master->GetRepresentation(2, 0, segment.Out()));
    EXPECT_EQ(2, Get(As<IAAFSourceClip>(segment), &IAAFSourceClip::GetSourceReference).startTime);
    EXPECT_EQ(AAFRESULT_BADINDEX, master->GetRepresentation(2, 1, segment.Out()));
    EXPECT_EQ(AAFRESULT_SLOT_NOT_FOUND, master->GetNumRepresentations(3, &count));
    EXPECT_EQ(AAFRESULT_SLOT_NOT_FOUND, master->GetRepresentation(3, 0, segment.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, master->GetNumRepresentations(1, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, master->GetRepresentation(1, 0, nullptr));
}

TEST_F(SourceSearch, MasterSlotMayHoldASequence) {
    AddFileAndTape();
    Ptr<IAAFMob> master = Add(kMaster);
    Ptr<IAAFMasterMob3> slots = As<IAAFMasterMob3>(master);
    Ptr<IAAFSourceMob> file = As<IAAFSourceMob>(Get(header_, &IAAFHeader::LookupMob, MobId(kFile)));
    Ptr<IAAFDataDef> picture = DataDef(kAAFDataDef_LegacyPicture);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, slots->AddMasterSlotWithSequence(nullptr, 1, file, 4, L"V1"));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, slots->AddMasterSlotWithSequence(picture, 1, nullptr, 4, L"V"));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, slots->AddMasterSlotWithSequence(picture, 1, file, 4, nullptr));
    EXPECT_EQ(AAFRESULT_SLOT_NOT_FOUND,
              slots->AddMasterSlotWithSequence(picture, 8, file, 4, L"V1"));
    // A second call extends the sequence.
    EXPECT_EQ(AAFRESULT_SUCCESS, slots->AddMasterSlotWithSequence(picture, 1, file, 4, L"V1"));
    EXPECT_EQ(AAFRESULT_SUCCESS, slots->AddMasterSlotWithSequence(picture, 1, file, 4, L"V1"));
    Ptr<IAAFMob> read = Get(Reopen(), &IAAFHeader::LookupMob, MobId(kMaster));
    Ptr<IAAFMobSlot> slot = Get(read, &IAAFMob::LookupSlot, aafSlotID_t{4});
    EXPECT_EQ(L"V1", TextOf<IAAFMobSlot>(slot, &IAAFMobSlot::GetNameBufLen, &IAAFMobSlot::GetName));
    Ptr<IAAFSequence> sequence = As<IAAFSequence>(Get(slot, &IAAFMobSlot::GetSegment));
    EXPECT_EQ(2u, Get(sequence, &IAAFSequence::CountComponents));
    EXPECT_EQ(100, Get(As<IAAFComponent>(sequence), &IAAFComponent::GetLength));
}

TEST_F(SourceSearch, SlotOfAClipHasTheRateOfTheEventsThatItRefersTo) {
    Ptr<IAAFMob> file = Add(kFile, AUID_AAFCDCIDescriptor);
    Ptr<IAAFSequence> events = OfPicture<IAAFSequence>(AUID_AAFSequence, 10);
    Ptr<IAAFEventMobSlot> slot;
    ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFMob2>(file)->AppendNewEventSlot(
                                     {30, 1}, As<IAAFSegment>(events), 1, L"E", 0, slot.Out()));
    Ptr<IAAFMob> master = Add(kMaster);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              As<IAAFMasterMob>(master)->AddMasterSlot(DataDef(kAAFDataDef_LegacyPicture), 1,
                                                       As<IAAFSourceMob>(file), 1, L"E"));
    Ptr<IAAFTimelineMobSlot> made =
        As<IAAFTimelineMobSlot>(Get(master, &IAAFMob::LookupSlot, aafSlotID_t{1}));
    EXPECT_EQ(30, Get(made, &IAAFTimelineMobSlot::GetEditRate).numerator);
}

class Pulldown : public SourceSearch {};

TEST_F(Pulldown, IsAsLongAsItsClipBecomes) {
    Ptr<IAAFMob> mob = Add(kFile, AUID_AAFCDCIDescriptor);
    Ptr<IAAFMob> tape = Add(kTape, AUID_AAFTapeDescriptor);
    AddSlot(tape, 2, ClipOf(0, 0, 0, 9000), {30, 1});
    Ptr<IAAFSourceMob> source = As<IAAFSourceMob>(mob);
    Ptr<IAAFDataDef> picture = DataDef(kAAFDataDef_LegacyPicture);
    const aafSourceRef_t reference{MobId(kTape), 2, 100};
    const auto add = [&](aafAppendOption_t how, aafLength_t length, aafPulldownKind_t kind,
                         aafPulldownDir_t direction) {
        return source->AddPulldownRef(how, {24, 1}, 1, picture, reference, length, kind, 3,
                                      direction);
    };
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, add(2, 10, kAAFTwoThreePD, kAAFTapeToFilmSpeed));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, add(kAAFAppend, 10, 8, kAAFTapeToFilmSpeed));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, add(kAAFAppend, 10, kAAFTwoThreePD, 2));
    EXPECT_EQ(AAFRESULT_BAD_LENGTH, add(kAAFAppend, -1, kAAFTwoThreePD, kAAFTapeToFilmSpeed));
    EXPECT_EQ(AAFRESULT_NULL_PARAM,
              source->AddPulldownRef(kAAFAppend, {24, 1}, 1, nullptr, reference, 10, kAAFTwoThreePD,
                                     0, kAAFTapeToFilmSpeed));
    EXPECT_EQ(0u, Get(mob, &IAAFMob::CountSlots));
    EXPECT_EQ(AAFRESULT_SUCCESS, add(kAAFAppend, 10, kAAFTwoThreePD, kAAFTapeToFilmSpeed));
    EXPECT_EQ(AAFRESULT_SUCCESS, add(kAAFAppend, 8, kAAFTwoThreePD, kAAFFilmToTapeSpeed));
    EXPECT_EQ(AAFRESULT_SUCCESS, add(kAAFAppend, 7, kAAFOneToOnePAL, kAAFFilmToTapeSpeed));
    Ptr<IAAFMobSlot> slot = Get(mob, &IAAFMob::LookupSlot, aafSlotID_t{1});
    Ptr<IAAFSequence> sequence = As<IAAFSequence>(Get(slot, &IAAFMobSlot::GetSegment));
    const std::vector<aafLength_t> lengths = {8, 10, 7};
    for (aafUInt32 at = 0; at < lengths.size(); ++at) {
        EXPECT_EQ(lengths[at],
                  Get(Get(sequence, &IAAFSequence::GetComponentAt, at), &IAAFComponent::GetLength));
    }
    // In place of all that.
    EXPECT_EQ(AAFRESULT_SUCCESS, add(kAAFForceOverwrite, 25, kAAFPALPD, kAAFTapeToFilmSpeed));
    AddMaster(ClipOf(kFile, 1, 0, 24));
    Ptr<IAAFHeader> file = Reopen();
    Ptr<IAAFMob> read = Get(file, &IAAFHeader::LookupMob, MobId(kFile));
    Ptr<IAAFPulldown> pulldown = As<IAAFPulldown>(
        Get(Get(read, &IAAFMob::LookupSlot, aafSlotID_t{1}), &IAAFMobSlot::GetSegment));
    EXPECT_EQ(24, Get(As<IAAFComponent>(pulldown), &IAAFComponent::GetLength));
    EXPECT_EQ(kAAFPALPD, Get(pulldown, &IAAFPulldown::GetPulldownKind));
    EXPECT_EQ(kAAFTapeToFilmSpeed, Get(pulldown, &IAAFPulldown::GetPulldownDirection));
    EXPECT_EQ(3, Get(pulldown, &IAAFPulldown::GetPhaseFrame));
    // Place 12 of the master, at 25, is 11 of the film, at 24, and 11 of the clip under the
    // pulldown; 100 + 11 at 24 is 138 at 30. The 12 that are left of the master are 11 of the film
    // and of the clip, and 13 of the tape.
    EXPECT_EQ((Place{kTape, 2, 138, 13}), Found(12, kAAFTapeMob));
}

TEST_F(Pulldown, ValidCodeStartsBehindAFiller) {
    Ptr<IAAFMob> tape = Add(kTape, AUID_AAFTapeDescriptor);
    Ptr<IAAFSourceMob> source = As<IAAFSourceMob>(tape);
    Ptr<IAAFDataDef> picture = DataDef(kAAFDataDef_LegacyPicture);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, source->SpecifyValidCodeRange(nullptr, 1, {25, 1}, 5, 10));
    EXPECT_EQ(AAFRESULT_BADRATE, source->SpecifyValidCodeRange(picture, 1, {25, 0}, 5, 10));
    EXPECT_EQ(AAFRESULT_BAD_LENGTH, source->SpecifyValidCodeRange(picture, 1, {25, 1}, 5, -1));
    EXPECT_EQ(AAFRESULT_BAD_LENGTH, source->SpecifyValidCodeRange(picture, 1, {25, 1}, -5, 10));
    EXPECT_EQ(AAFRESULT_TAPE_DESC_ONLY, As<IAAFSourceMob>(Add(kFile, AUID_AAFCDCIDescriptor))
                                            ->SpecifyValidCodeRange(picture, 1, {25, 1}, 5, 10));
    EXPECT_EQ(0u, Get(tape, &IAAFMob::CountSlots));
    EXPECT_EQ(AAFRESULT_SUCCESS, source->SpecifyValidCodeRange(picture, 1, {25, 1}, 5, 10));
    EXPECT_EQ(AAFRESULT_SUCCESS, source->SpecifyValidCodeRange(picture, 2, {25, 1}, 0, 10));
    header_->RemoveMob(Get(header_, &IAAFHeader::LookupMob, MobId(kFile)));
    Ptr<IAAFMob> read = Get(Reopen(), &IAAFHeader::LookupMob, MobId(kTape));
    const auto sequence = [&](aafSlotID_t slot) {
        return As<IAAFSequence>(
            Get(Get(read, &IAAFMob::LookupSlot, slot), &IAAFMobSlot::GetSegment));
    };
    EXPECT_EQ(2u, Get(sequence(1), &IAAFSequence::CountComponents));
    EXPECT_EQ(15, Get(As<IAAFComponent>(sequence(1)), &IAAFComponent::GetLength));
    As<IAAFFiller>(Get(sequence(1), &IAAFSequence::GetComponentAt, aafUInt32{0}));
    As<IAAFSourceClip>(Get(sequence(1), &IAAFSequence::GetComponentAt, aafUInt32{1}));
    EXPECT_EQ(1u, Get(sequence(2), &IAAFSequence::CountComponents));
}

}  // namespace aaf_test
