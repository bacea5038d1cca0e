// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFSoundDescriptors.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "tests/unit/aaf_library/objects/ClipDescription.h"

namespace aaf_test {

TEST_F(ClipDescription, OfAWholeClipSucceedsInEveryCall) {
    DescribeClip();
    aafNumSlots_t count = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->CountMobs(kAAFAllMob, &count));
    EXPECT_EQ(3u, count);
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->CountMobs(kAAFPhysicalMob, &count));
    EXPECT_EQ(1u, count);
    EXPECT_EQ(AAFRESULT_SUCCESS, file_->Save());
}

TEST_F(ClipDescription, LetsTheFileOutliveItsMaker) {
    DescribeClip();
    file_->AddRef();
    IAAFFile* handedOver = file_;
    master_.Reset();
    file_mob_.Reset();
    source_.Reset();
    multiple_.Reset();
    header_.Reset();
    dictionary_.Reset();
    file_.Reset();
    Ptr<IAAFFile> file(handedOver);
    EXPECT_EQ(1u, ReferencesOf(file.get()));
    Ptr<IAAFHeader> header = Get(file, &IAAFFile::GetHeader);
    Ptr<IAAFMob> mob = Get(header, &IAAFHeader::LookupMob, MobId(0x01));
}

TEST_F(ClipDescription, GivesEssenceSlotsOneIdInAllMobs) {
    MakeMobs();
    AddTrack(kAAFDataDef_LegacyPicture, 2);
    AddTrack(kAAFDataDef_LegacySound, 3);
    const struct {
        IAAFMob* mob;
        aafLength_t length;
        aafMobID_t source;
    } expected[] = {{master_, 300, MobId(0xB1)},
                    {file_mob_, 300, MobId(0xA1)},
                    {source_, 12960000, aafMobID_t{}}};
    for (const auto& entry : expected) {
        aafUInt32 count = 0;
        EXPECT_EQ(AAFRESULT_SUCCESS, entry.mob->CountSlots(&count));
        EXPECT_EQ(2u, count);
        for (aafSlotID_t id : {2u, 3u}) {
            Ptr<IAAFMobSlot> slot;
            aafLength_t length = 0;
            aafSourceRef_t reference{};
            ASSERT_EQ(AAFRESULT_SUCCESS, entry.mob->LookupSlot(id, slot.Out()));
            EXPECT_EQ(
                L"", TextOf<IAAFMobSlot>(slot, &IAAFMobSlot::GetNameBufLen, &IAAFMobSlot::GetName));
            Ptr<IAAFSegment> segment = Get(slot, &IAAFMobSlot::GetSegment);
            EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFComponent>(segment)->GetLength(&length));
            EXPECT_EQ(entry.length, length);
            EXPECT_EQ(AAFRESULT_SUCCESS,
                      As<IAAFSourceClip>(segment)->GetSourceReference(&reference));
            EXPECT_TRUE(SameMobId(entry.source, reference.sourceID));
        }
    }
    MoveFileMobClips(77);
    aafSourceRef_t reference{};
    Ptr<IAAFMobSlot> slot = Get(file_mob_, &IAAFMob::LookupSlot, 3);
    Ptr<IAAFSegment> segment = Get(slot, &IAAFMobSlot::GetSegment);
    ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFSourceClip>(segment)->GetSourceReference(&reference));
    EXPECT_EQ(77, reference.startTime);
}

TEST_F(ClipDescription, PutsLaterTimecodeBetweenFillers) {
    MakeMobs();
    AddTimecode({0, 0, 30}, 2592000, 2592000, 1, 0);
    AddTimecode({1234, 1, 30}, 300, 2592000, 2, 1);
    Ptr<IAAFMobSlot> slot = Get(source_, &IAAFMob::LookupSlot, 2);
    EXPECT_EQ(3u, Get(slot, &IAAFMobSlot::GetPhysicalNum));
    Ptr<IAAFSegment> segment = Get(slot, &IAAFMobSlot::GetSegment);
    EXPECT_EQ(3u, Get(As<IAAFSequence>(segment), &IAAFSequence::CountComponents));
    EXPECT_EQ(2592000, Get(As<IAAFComponent>(segment), &IAAFComponent::GetLength));
}

TEST_F(ClipDescription, HoldsPictureAndSoundInOneDescriptor) {
    MakeMobs();
    AddPicture();
    AddPicture();  // a second one, as for alpha, on the same dictionary
    AddSound();
    aafUInt32 count = 0;
    aafRational_t rate{};
    EXPECT_EQ(AAFRESULT_SUCCESS, multiple_->CountFileDescriptors(&count));
    EXPECT_EQ(3u, count);
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFFileDescriptor>(multiple_)->GetSampleRate(&rate));
    EXPECT_EQ(30000, rate.numerator);
    Ptr<IAAFFileDescriptor> last = Get(multiple_, &IAAFMultipleDescriptor::GetFileDescriptorAt, 2);
    EXPECT_EQ(1536000u, Get(As<IAAFPCMDescriptor>(last), &IAAFPCMDescriptor::GetAverageBPS));
}

TEST_F(ClipDescription, KeepsTheBoxesOfAPicture) {
    MakeMobs();
    AddPicture();
    Ptr<IAAFFileDescriptor> picture =
        Get(multiple_, &IAAFMultipleDescriptor::GetFileDescriptorAt, 0);
    Ptr<IAAFPropertyDef> property;
    Ptr<IAAFClassDef> pictures =
        Get(dictionary_, &IAAFDictionary::LookupClassDef, AUID_AAFCDCIDescriptor);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              pictures->LookupPropertyDef(ncfGuid("0E040101-0101-0106-060E-2B3401010101"),
                                          property.Out()));
    Ptr<IAAFPropertyValue> value =
        Get(As<IAAFObject>(picture), &IAAFObject::GetPropertyValue, property);
    Ptr<IAAFTypeDef> type = Get(value, &IAAFPropertyValue::GetType);
    aafRational_t box[4] = {};
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFTypeDefRecord>(type)->GetStruct(
                                     value, reinterpret_cast<aafMemPtr_t>(box), sizeof box));
    EXPECT_EQ(2, box[0].numerator);
    EXPECT_EQ(-2, box[1].numerator);
    EXPECT_EQ(1920, box[2].numerator);
}

TEST_F(ClipDescription, KeepsColumnsAppCodeAndAttributeList) {
    MakeMobs();
    SetAppCode();
    AddColumns();
    SetAttributeList();
    EXPECT_EQ((Texts{{L"Video", L"ProRes 422"},
                     {L"Video File Format", L"MOV"},
                     {L"Audio Format", L"LPCM"},
                     {L"Audio Format", L"LPCM"},
                     {L"Field Ordering", L"Default"},
                     {L"GFX-Video Level", L"Do not modify levels"}}),
              Comments(master_));
    Ptr<IAAFPropertyDef> property;
    aafUInt32 count = 0;
    Ptr<IAAFClassDef> mobs = Get(dictionary_, &IAAFDictionary::LookupClassDef, AUID_AAFMob);
    ASSERT_EQ(
        AAFRESULT_SUCCESS,
        mobs->LookupPropertyDef(ncfGuid("60958183-47B1-11D4-A01C-0004AC969F50"), property.Out()));
    Ptr<IAAFPropertyValue> list =
        Get(As<IAAFObject>(master_), &IAAFObject::GetPropertyValue, property);
    Ptr<IAAFTypeDef> type = Get(list, &IAAFPropertyValue::GetType);
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFTypeDefVariableArray>(type)->GetCount(list, &count));
    EXPECT_EQ(1u, count);
}

}  // namespace aaf_test
