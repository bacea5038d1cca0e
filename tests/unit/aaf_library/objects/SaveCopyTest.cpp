// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <cstring>
#include <filesystem>
#include <fstream>
#include <functional>
#include <iterator>

#include "aaf_library/model/PropertyKeys.h"
#include "host_interfaces/aaf/AAFComponents.h"
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFEffectDefinitions.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/aaf_library/objects/ClipDescription.h"

namespace aaf_test {

class SaveCopy : public ClipDescription {
protected:
    ~SaveCopy() override { AAFCliphostPinTime(nullptr, nullptr); }

    // By way of UTF-32, which needs no locale.
    std::wstring Path(const char* name) const {
        const std::u32string path = (folder_ / name).u32string();
        return {path.begin(), path.end()};
    }
    Ptr<IAAFFile> NewFile(const std::wstring& path,
                          const aafUID_t& kind = kAAFFileKind_Aaf512Binary, aafUInt32 flags = 0) {
        Ptr<IAAFFile> made;
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  AAFFileOpenNewModifyEx(path.c_str(), &kind, flags, &product_.ident, made.Out()));
        return made;
    }
    void Copy(const std::wstring& path, const aafUID_t& kind = kAAFFileKind_Aaf512Binary) {
        Ptr<IAAFFile> target = NewFile(path, kind);
        ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target));
        ASSERT_EQ(AAFRESULT_SUCCESS, target->Close());
    }
    static std::string Content(const std::wstring& path) {
        std::ifstream stream(std::filesystem::path(std::u32string(path.begin(), path.end())),
                             std::ios::binary);
        return {std::istreambuf_iterator<char>(stream), std::istreambuf_iterator<char>()};
    }

    const TestFolder folder_;
};

TEST_F(SaveCopy, WritesAFileThatReadsBackWhole) {
    DescribeClip();
    const std::wstring path = Path("clip.aaf");
    Copy(path);
    Ptr<IAAFFile> read;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(path.c_str(), 0, read.Out()));
    Ptr<IAAFHeader> header = Get(read, &IAAFFile::GetHeader);
    Ptr<IAAFDictionary> dictionary = Get(read, &IAAFFile::GetDictionary);
    Ptr<IAAFMob> master = Get(header, &IAAFHeader::LookupMob, MobId(0x01));
    Ptr<IAAFMob> fileMob = Get(header, &IAAFHeader::LookupMob, MobId(0xB1));
    Ptr<IAAFMob> source = Get(header, &IAAFHeader::LookupMob, MobId(0xA1));
    EXPECT_EQ(L"A001", TextOf<IAAFMob>(master, &IAAFMob::GetNameBufLen, &IAAFMob::GetName));
    EXPECT_EQ(Comments(master_), Comments(master));

    EXPECT_EQ(5u, Get(source, &IAAFMob::CountSlots));
    EXPECT_EQ(3u, Get(fileMob, &IAAFMob::CountSlots));

    aafSourceRef_t reference{};
    Ptr<IAAFMobSlot> slot = Get(fileMob, &IAAFMob::LookupSlot, 3);
    Ptr<IAAFSegment> segment = Get(slot, &IAAFMobSlot::GetSegment);
    Ptr<IAAFSourceClip> clip = As<IAAFSourceClip>(segment);
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->GetSourceReference(&reference));
    EXPECT_EQ(1000, reference.startTime);
    Ptr<IAAFMob> resolved = Get(clip, &IAAFSourceClip::ResolveRef);
    EXPECT_EQ(source.get(), resolved.get());

    Ptr<IAAFEssenceDescriptor> essence =
        Get(As<IAAFSourceMob>(fileMob), &IAAFSourceMob::GetEssenceDescriptor);
    Ptr<IAAFMultipleDescriptor> multiple = As<IAAFMultipleDescriptor>(essence);
    Ptr<IAAFFileDescriptor> part = Get(multiple, &IAAFMultipleDescriptor::GetFileDescriptorAt, 0);
    Ptr<IAAFContainerDef> container = Get(part, &IAAFFileDescriptor::GetContainerFormat);
    EXPECT_EQ(10, Get(As<IAAFCDCIDescriptor>(part), &IAAFCDCIDescriptor::GetComponentWidth));
    Ptr<IAAFLocator> locator = Get(essence, &IAAFEssenceDescriptor::GetLocatorAt, 0);
    EXPECT_EQ(L"file:///media/A001.mov",
              TextOf<IAAFLocator>(locator, &IAAFLocator::GetPathBufLen, &IAAFLocator::GetPath));

    // The extensions came along.
    Ptr<IAAFPropertyDef> property;
    Ptr<IAAFClassDef> pictures =
        Get(dictionary, &IAAFDictionary::LookupClassDef, AUID_AAFCDCIDescriptor);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              pictures->LookupPropertyDef(ncfGuid("0E040101-0101-010E-060E-2B3401010101"),
                                          property.Out()));
    Ptr<IAAFPropertyValue> value =
        Get(As<IAAFObject>(part), &IAAFObject::GetPropertyValue, property);
    Ptr<IAAFTypeDef> type = Get(value, &IAAFPropertyValue::GetType);
    aafInt32 slices = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFTypeDefInt>(type)->GetInteger(
                                     value, reinterpret_cast<aafMemPtr_t>(&slices), 4));
    EXPECT_EQ(10, slices);
    EXPECT_EQ(AAFRESULT_SUCCESS, dictionary->LookupTypeDef(
                                     ncfGuid("0E040301-0200-0000-060E-2B3401040101"), type.Out()));
    EXPECT_EQ(AAFRESULT_WRONG_OPENMODE, read->Save());
    EXPECT_EQ(AAFRESULT_SUCCESS, read->Close());
}

TEST_F(SaveCopy, CarriesExtensionsThatNothingUses) {
    Ptr<IAAFPropertyDef> property;
    const aafUID_t id = ncfGuid("ABCDEF00-0000-0000-0000-000000000004");
    Ptr<IAAFClassDef> mobs = Get(dictionary_, &IAAFDictionary::LookupClassDef, AUID_AAFMob);
    Ptr<IAAFTypeDef> type = Get(dictionary_, &IAAFDictionary::LookupTypeDef, kAAFTypeID_Int32);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              mobs->RegisterOptionalPropertyDef(id, L"Idle", type, property.Out()));
    Ptr<IAAFFile> target = NewFile(Path("idle.aaf"));
    ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target));
    Ptr<IAAFDictionary> dictionary = Get(target, &IAAFFile::GetDictionary);
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary->LookupClassDef(AUID_AAFMob, mobs.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, mobs->LookupPropertyDef(id, property.Out()));
    EXPECT_EQ(kAAFTrue, Get(property, &IAAFPropertyDef::GetIsOptional));
}

// Both files have added a use of mobs under one name.
TEST_F(SaveCopy, LeavesTheTargetItsOwnMembersOfAnEnumeration) {
    const aafUID_t ours = ncfGuid("ABCDEF00-0000-0000-0000-000000000006");
    const aafUID_t theirs = ncfGuid("ABCDEF00-0000-0000-0000-000000000007");
    const aafUID_t other = ncfGuid("ABCDEF00-0000-0000-0000-000000000008");
    const auto uses = [](IAAFDictionary* dictionary) {
        return As<IAAFTypeDefExtEnum>(
            Get(dictionary, &IAAFDictionary::LookupTypeDef, kAAFTypeID_UsageType));
    };
    Ptr<IAAFTypeDefExtEnum> source = uses(dictionary_);
    ASSERT_EQ(AAFRESULT_SUCCESS, source->AppendElement(ours, L"Usage_Own"));
    ASSERT_EQ(AAFRESULT_SUCCESS, source->AppendElement(other, L"Usage_Other"));
    Ptr<IAAFFile> target = NewFile(Path("uses.aaf"));
    {
        Ptr<IAAFDictionary> dictionary = Get(target, &IAAFFile::GetDictionary);
        ASSERT_EQ(AAFRESULT_SUCCESS, uses(dictionary)->AppendElement(theirs, L"Usage_Own"));
    }
    ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target));
    Ptr<IAAFDictionary> dictionary = Get(target, &IAAFFile::GetDictionary);
    Ptr<IAAFTypeDefExtEnum> joined = uses(dictionary);
    aafCharacter name[20] = {};
    EXPECT_EQ(AAFRESULT_SUCCESS, joined->GetNameFromAUID(theirs, name, sizeof name));
    EXPECT_EQ(std::wstring(L"Usage_Own"), name);
    EXPECT_EQ(AAFRESULT_SUCCESS, joined->GetNameFromAUID(other, name, sizeof name));
    EXPECT_EQ(std::wstring(L"Usage_Other"), name);
    EXPECT_GT(0, joined->GetNameFromAUID(ours, name, sizeof name));
}

TEST_F(SaveCopy, GivesEqualFilesOfEqualClipsWhileTimeIsPinned) {
    const aafTimeStamp_t time{{2026, 1, 2}, {3, 4, 5, 0}};
    const aafUID_t generation = ncfGuid("ABCDEF00-0000-0000-0000-000000000005");
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFCliphostPinTime(&time, &generation));
    DescribeClip();
    Copy(Path("a.aaf"));
    Copy(Path("b.aaf"));
    const std::string first = Content(Path("a.aaf"));
    EXPECT_FALSE(first.empty());
    EXPECT_TRUE(first == Content(Path("b.aaf")));
}

// The target takes its copy late. What it saves of that is what was saved before, byte for byte,
// whatever has become of the source.
class TargetOfACopy : public SaveCopy {
protected:
    TargetOfACopy() {
        const aafTimeStamp_t time{{2026, 1, 2}, {3, 4, 5, 0}};
        const aafUID_t generation = ncfGuid("ABCDEF00-0000-0000-0000-000000000005");
        EXPECT_EQ(AAFRESULT_SUCCESS, AAFCliphostPinTime(&time, &generation));
        DescribeClip();
        target_ = NewFile(path_);
    }

    void ExpectItKeepsWhatWasSavedWhen(const char* what, const std::function<void()>& change) {
        SCOPED_TRACE(what);
        ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target_));
        const std::string saved = Content(path_);
        change();
        ASSERT_EQ(AAFRESULT_SUCCESS, target_->Save());
        EXPECT_FALSE(saved.empty());
        EXPECT_TRUE(saved == Content(path_));
    }
    // Straight from the source's objects, and by way of a copy of each.
    void ExpectTheSameBytesByEitherWay() {
        ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target_));
        const std::wstring other = Path("copied.aaf");
        Ptr<IAAFFile> copied = NewFile(other);
        Get(copied, &IAAFFile::GetHeader);  // who looks at it makes it take a copy
        ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(copied));
        EXPECT_FALSE(Content(path_).empty());
        EXPECT_TRUE(Content(other) == Content(path_));
    }
    Ptr<IAAFPropertyDef> RegisterNumberOfMobs(const aafUID_t& id) {
        Ptr<IAAFPropertyDef> property;
        Ptr<IAAFClassDef> mobs = Get(dictionary_, &IAAFDictionary::LookupClassDef, AUID_AAFMob);
        Ptr<IAAFTypeDef> type = Get(dictionary_, &IAAFDictionary::LookupTypeDef, kAAFTypeID_Int32);
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  mobs->RegisterOptionalPropertyDef(id, L"Late", type, property.Out()));
        return property;
    }
    void ExpectThreeMobs(IAAFFile* file) {
        Ptr<IAAFHeader> header;
        ASSERT_EQ(AAFRESULT_SUCCESS, file->GetHeader(header.Out()));
        aafNumSlots_t count = 0;
        EXPECT_EQ(AAFRESULT_SUCCESS, header->CountMobs(kAAFAllMob, &count));
        EXPECT_EQ(3u, count);
        Ptr<IAAFMob> master = Get(header, &IAAFHeader::LookupMob, MobId(0x01));
        EXPECT_EQ(L"A001", TextOf<IAAFMob>(master, &IAAFMob::GetNameBufLen, &IAAFMob::GetName));
    }

    const std::wstring path_ = Path("target.aaf");
    Ptr<IAAFFile> target_;
};

TEST_F(TargetOfACopy, SavesTheSameAgain) {
    ExpectItKeepsWhatWasSavedWhen("nothing", [] {});
}

TEST_F(TargetOfACopy, KeepsAValueThatChanges) {
    ExpectItKeepsWhatWasSavedWhen(
        "name", [&] { EXPECT_EQ(AAFRESULT_SUCCESS, master_->SetName(L"later")); });
    ExpectThreeMobs(target_);
}

TEST_F(TargetOfACopy, LacksAnObjectThatJoinsASetAtItsEnd) {
    Ptr<IAAFMob> late = FileMob(0xF1);
    ExpectItKeepsWhatWasSavedWhen("mob",
                                  [&] { EXPECT_EQ(AAFRESULT_SUCCESS, header_->AddMob(late)); });
    ExpectThreeMobs(target_);
    aafNumSlots_t count = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->CountMobs(kAAFAllMob, &count));
    EXPECT_EQ(4u, count);
}

TEST_F(TargetOfACopy, KeepsAnObjectThatGoes) {
    ExpectItKeepsWhatWasSavedWhen(
        "mob", [&] { EXPECT_EQ(AAFRESULT_SUCCESS, header_->RemoveMob(source_)); });
    ExpectThreeMobs(target_);
}

TEST_F(TargetOfACopy, KeepsAValueThatGoes) {
    Ptr<IAAFClassDef> mobs = Get(dictionary_, &IAAFDictionary::LookupClassDef, AUID_AAFMob);
    Ptr<IAAFPropertyDef> name;
    ASSERT_EQ(AAFRESULT_SUCCESS, mobs->LookupPropertyDef(aaf::prop::Mob_Name.id, name.Out()));
    ExpectItKeepsWhatWasSavedWhen("name", [&] {
        EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFObject>(master_)->RemoveOptionalProperty(name));
    });
    ExpectThreeMobs(target_);
}

TEST_F(TargetOfACopy, OutlivesTheSource) {
    ExpectItKeepsWhatWasSavedWhen("file", [&] { EXPECT_EQ(AAFRESULT_SUCCESS, file_->Close()); });
    ExpectThreeMobs(target_);
}

TEST_F(TargetOfACopy, MayBeClosedFirst) {
    ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target_));
    EXPECT_EQ(AAFRESULT_SUCCESS, target_->Close());
    EXPECT_EQ(AAFRESULT_SUCCESS, master_->SetName(L"later"));
    Ptr<IAAFHeader> header;
    EXPECT_EQ(AAFRESULT_NOT_OPEN, target_->GetHeader(header.Out()));
}

TEST_F(TargetOfACopy, IsACopyWhenItIsLookedAt) {
    ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target_));
    ExpectThreeMobs(target_);
    Ptr<IAAFHeader> header = Get(target_, &IAAFFile::GetHeader);
    Ptr<IAAFMob> master = Get(header, &IAAFHeader::LookupMob, MobId(0x01));
    EXPECT_NE(master_.get(), master.get());
    EXPECT_EQ(AAFRESULT_SUCCESS, master->SetName(L"of the target"));
    ExpectThreeMobs(file_);
}

TEST_F(TargetOfACopy, ShowsItsMobsToWhoHeldItsHeaderBefore) {
    Ptr<IAAFHeader> header = Get(target_, &IAAFFile::GetHeader);
    ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target_));
    aafNumSlots_t count = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, header->CountMobs(kAAFAllMob, &count));
    EXPECT_EQ(3u, count);
}

TEST_F(TargetOfACopy, CanBeCopiedItself) {
    ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target_));
    const std::wstring path = Path("second.aaf");
    Ptr<IAAFFile> second = NewFile(path);
    ASSERT_EQ(AAFRESULT_SUCCESS, target_->SaveCopyAs(second));
    ExpectThreeMobs(second);
    // The same as by way of a copy of each mob.
    const std::wstring other = Path("third.aaf");
    Ptr<IAAFFile> third = NewFile(other);
    Get(third, &IAAFFile::GetHeader);
    ASSERT_EQ(AAFRESULT_SUCCESS, target_->SaveCopyAs(third));
    EXPECT_TRUE(Content(other) == Content(path));
}

TEST_F(TargetOfACopy, NumbersItsPropertiesAsACopyDoes) {
    // The built-in model leaves the numbers of these to each file, which allots them here before
    // those of a property that is registered.
    Ptr<IAAFMPEGVideoDescriptor> mpeg = Make<IAAFMPEGVideoDescriptor>(AUID_AAFMPEGVideoDescriptor);
    ASSERT_EQ(AAFRESULT_SUCCESS, mpeg->Initialize());
    ASSERT_EQ(AAFRESULT_SUCCESS, mpeg->SetMaxGOP(15));
    ASSERT_EQ(AAFRESULT_SUCCESS, multiple_->AppendFileDescriptor(As<IAAFFileDescriptor>(mpeg)));
    RegisterNumberOfMobs(ncfGuid("ABCDEF00-0000-0000-0000-00000000000A"));
    ExpectTheSameBytesByEitherWay();
}

TEST_F(TargetOfACopy, LacksDefinitionsThatNothingUses) {
    Ptr<IAAFOperationDef> operation = Make<IAAFOperationDef>(AUID_AAFOperationDefinition);
    ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFDefObject>(operation)->Initialize(
                                     ncfGuid("ABCDEF00-0000-0000-0000-00000000000B"), L"Unused"));
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterOperationDef(operation));
    // Of the containers that each file knows, one is looked up and another is used.
    const aafUID_t idle = ncfGuid("0D010301-0201-0101-060E-2B3404010101");
    const aafUID_t used = ncfGuid("0D010301-0201-0201-060E-2B3404010101");
    Get(dictionary_, &IAAFDictionary::LookupContainerDef, idle);
    Ptr<IAAFCDCIDescriptor> picture = Make<IAAFCDCIDescriptor>(AUID_AAFCDCIDescriptor);
    ASSERT_EQ(AAFRESULT_SUCCESS, picture->Initialize());
    Ptr<IAAFFileDescriptor> descriptor = As<IAAFFileDescriptor>(picture);
    ASSERT_EQ(AAFRESULT_SUCCESS, descriptor->SetContainerFormat(
                                     Get(dictionary_, &IAAFDictionary::LookupContainerDef, used)));
    ASSERT_EQ(AAFRESULT_SUCCESS, multiple_->AppendFileDescriptor(descriptor));
    ExpectTheSameBytesByEitherWay();
}

TEST_F(TargetOfACopy, HasBuiltInDefinitionsAsEveryNewFileHasThem) {
    Ptr<IAAFDataDef> pictures = DataDef(kAAFDataDef_LegacyPicture);
    ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFDefObject>(pictures)->SetName(L"Renamed"));
    ExpectTheSameBytesByEitherWay();
}

TEST_F(TargetOfACopy, HasTheNamesOfTheBuiltInModel) {
    Ptr<IAAFClassDef> mobs = Get(dictionary_, &IAAFDictionary::LookupClassDef, AUID_AAFMob);
    ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFMetaDefinition>(mobs)->SetName(L"Renamed"));
    ExpectTheSameBytesByEitherWay();
}

TEST_F(TargetOfACopy, LacksWhatIsRegisteredLater) {
    ExpectItKeepsWhatWasSavedWhen(
        "property", [&] { RegisterNumberOfMobs(ncfGuid("ABCDEF00-0000-0000-0000-00000000000C")); });
}

TEST_F(TargetOfACopy, KeepsTheNameOfWhatWasRegistered) {
    Ptr<IAAFPropertyDef> property =
        RegisterNumberOfMobs(ncfGuid("ABCDEF00-0000-0000-0000-00000000000D"));
    ExpectItKeepsWhatWasSavedWhen("name", [&] {
        EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFMetaDefinition>(property)->SetName(L"Renamed"));
    });
}

TEST_F(TargetOfACopy, LacksAMemberThatAnEnumerationGetsLater) {
    Ptr<IAAFTypeDefExtEnum> uses = As<IAAFTypeDefExtEnum>(
        Get(dictionary_, &IAAFDictionary::LookupTypeDef, kAAFTypeID_UsageType));
    ExpectItKeepsWhatWasSavedWhen("member", [&] {
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  uses->AppendElement(ncfGuid("ABCDEF00-0000-0000-0000-00000000000E"), L"Own"));
    });
}

TEST_F(TargetOfACopy, SeveralTargetsOfOneSourceKeepTheirs) {
    Ptr<IAAFFile> second = NewFile(Path("second.aaf"));
    ASSERT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(second));
    ExpectItKeepsWhatWasSavedWhen(
        "name", [&] { EXPECT_EQ(AAFRESULT_SUCCESS, master_->SetName(L"later")); });
    ExpectThreeMobs(second);
}

TEST_F(TargetOfACopy, HoldsTheMobsWhereItCanNotBeWritten) {
    Ptr<IAAFFile> target = NewFile(Path("no such folder/x.aaf"));
    EXPECT_EQ(AAFRESULT_FILE_NOT_FOUND, file_->SaveCopyAs(target));
    ExpectThreeMobs(target);
    EXPECT_EQ(AAFRESULT_OPERATION_NOT_PERMITTED, file_->SaveCopyAs(target));
}

// What can't be written now can be written later, the same as a file that could be.
TEST_F(TargetOfACopy, CanBeWrittenOnceItsFolderIsThere) {
    Ptr<IAAFFile> target = NewFile(Path("later/x.aaf"));
    EXPECT_EQ(AAFRESULT_FILE_NOT_FOUND, file_->SaveCopyAs(target));
    EXPECT_EQ(AAFRESULT_SUCCESS, master_->SetName(L"later"));
    std::filesystem::create_directory(folder_ / "later");
    EXPECT_EQ(AAFRESULT_SUCCESS, target->Save());
    EXPECT_EQ(AAFRESULT_SUCCESS, master_->SetName(L"A001"));
    EXPECT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target_));
    EXPECT_TRUE(Content(Path("later/x.aaf")) == Content(path_));
}

TEST_F(SaveCopy, NeedsATargetWithoutMobs) {
    Ptr<IAAFFile> target = NewFile(Path("full.aaf"));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(FileMob(1)));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, file_->SaveCopyAs(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, file_->SaveCopyAs(target));
    EXPECT_EQ(AAFRESULT_OPERATION_NOT_PERMITTED, file_->SaveCopyAs(target));
    EXPECT_EQ(AAFRESULT_OPERATION_NOT_PERMITTED, file_->SaveCopyAs(file_));
    EXPECT_EQ(AAFRESULT_SUCCESS, target->Close());
    EXPECT_EQ(AAFRESULT_NOT_OPEN, file_->SaveCopyAs(target));
    Ptr<IAAFFile> read;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(Path("full.aaf").c_str(), 0, read.Out()));
    EXPECT_EQ(AAFRESULT_WRONG_OPENMODE, file_->SaveCopyAs(read));
}

TEST_F(SaveCopy, LeavesTheOriginalAsItWas) {
    DescribeClip();
    Copy(Path("copy.aaf"));
    aafNumSlots_t count = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->CountMobs(kAAFAllMob, &count));
    EXPECT_EQ(3u, count);
    EXPECT_EQ(AAFRESULT_SUCCESS, master_->SetName(L"still mine"));
}

TEST_F(SaveCopy, TellsTheKindOfWhatItWrote) {
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(FileMob(1)));
    for (const aafUID_t& kind : {kAAFFileKind_Aaf512Binary, kAAFFileKind_Aaf4KBinary}) {
        const std::wstring path = Path("kind.aaf");
        Copy(path, kind);
        aafUID_t found{};
        aafBool is = kAAFFalse;
        EXPECT_EQ(AAFRESULT_SUCCESS, AAFFileIsAAFFile(path.c_str(), &found, &is));
        EXPECT_EQ(kAAFTrue, is);
        EXPECT_EQ(kind, found);
        EXPECT_EQ(AAFRESULT_SUCCESS, AAFFileIsAAFFileKind(path.c_str(), &kind, &is));
        EXPECT_EQ(kAAFTrue, is);
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  AAFFileIsAAFFileKind(path.c_str(), &kAAFFileKind_AafXmlText, &is));
        EXPECT_EQ(kAAFFalse, is);
    }
}

TEST_F(SaveCopy, RefusesKindsAndFlagsThatItDoesNotKnow) {
    Ptr<IAAFFile> made;
    const std::wstring path = Path("never.aaf");
    EXPECT_EQ(AAFRESULT_FILEKIND_NOT_REGISTERED,
              AAFFileOpenNewModifyEx(path.c_str(), &kAAFFileKind_AafXmlText, 0, &product_.ident,
                                     made.Out()));
    EXPECT_EQ(AAFRESULT_BAD_FLAGS, AAFFileOpenNewModifyEx(path.c_str(), &kAAFFileKind_DontCare,
                                                          0x40, &product_.ident, made.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM,
              AAFFileOpenNewModifyEx(path.c_str(), nullptr, 0, &product_.ident, made.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFFileOpenNewModify(path.c_str(), 0, nullptr, made.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFFileOpenNewModify(nullptr, 0, &product_.ident, made.Out()));
}

TEST_F(SaveCopy, RefusesWhatIsNoAafFile) {
    Ptr<IAAFFile> read;
    const std::wstring missing = Path("missing.aaf");
    EXPECT_EQ(AAFRESULT_FILE_NOT_FOUND, AAFFileOpenExistingRead(missing.c_str(), 0, read.Out()));
    const std::wstring text = Path("text.aaf");
    std::ofstream(std::filesystem::path(std::u32string(text.begin(), text.end())))
        << "no compound file, but long enough for one";
    EXPECT_EQ(AAFRESULT_NOT_AAF_FILE, AAFFileOpenExistingRead(text.c_str(), 0, read.Out()));
    aafUID_t kind{};
    aafBool is = kAAFTrue;
    EXPECT_EQ(AAFRESULT_SUCCESS, AAFFileIsAAFFile(text.c_str(), &kind, &is));
    EXPECT_EQ(kAAFFalse, is);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFFileOpenExistingRead(nullptr, 0, read.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFFileOpenExistingRead(text.c_str(), 0, nullptr));
}

TEST_F(SaveCopy, ChangesAnExistingFileAndSaysWho) {
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(FileMob(1)));
    const std::wstring path = Path("change.aaf");
    Copy(path);
    {
        Ptr<IAAFFile> file;
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  AAFFileOpenExistingModify(path.c_str(), 0, &product_.ident, file.Out()));
        Ptr<IAAFHeader> header = Get(file, &IAAFFile::GetHeader);
        Ptr<IAAFMob> mob = Get(header, &IAAFHeader::LookupMob, MobId(1));
        EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetName(L"changed"));
        EXPECT_EQ(AAFRESULT_SUCCESS, file->Save());
    }
    Ptr<IAAFFile> file;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(path.c_str(), 0, file.Out()));
    Ptr<IAAFHeader> header = Get(file, &IAAFFile::GetHeader);
    EXPECT_EQ(3u, Get(header, &IAAFHeader::CountIdentifications));
    Ptr<IAAFMob> mob = Get(header, &IAAFHeader::LookupMob, MobId(1));
    EXPECT_EQ(L"changed", TextOf<IAAFMob>(mob, &IAAFMob::GetNameBufLen, &IAAFMob::GetName));
}

TEST_F(SaveCopy, WarnsOfUnsavedChangesWhenAsked) {
    Ptr<IAAFFile> file =
        NewFile(Path("dirty.aaf"), kAAFFileKind_DontCare, AAF_FILE_MODE_CLOSE_FAIL_DIRTY);
    EXPECT_EQ(AAFRESULT_UNSAVED_CHANGES, file->Close());
    EXPECT_EQ(AAFRESULT_SUCCESS, file->Save());
    EXPECT_EQ(AAFRESULT_SUCCESS, file->Close());
}

TEST_F(SaveCopy, FailsWhereNothingCanBeWritten) {
    Ptr<IAAFFile> target = NewFile(Path("no such folder/x.aaf"));
    EXPECT_LT(file_->SaveCopyAs(target), 0);
}

TEST_F(SaveCopy, ClonesSingleMobsWithThoseTheyReferTo) {
    DescribeClip();
    Ptr<IAAFFile> alone = NewFile(Path("alone.aaf"));
    Ptr<IAAFFile> all = NewFile(Path("all.aaf"));
    Ptr<IAAFMob> clone;
    aafNumSlots_t count = 0;
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, master_->CloneExternal(2, 0, alone, clone.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, master_->CloneExternal(0, 0, nullptr, clone.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              master_->CloneExternal(kAAFNoFollowDepend, kAAFNoIncludeMedia, alone, clone.Out()));
    EXPECT_EQ(Comments(master_), Comments(clone));
    Ptr<IAAFHeader> header = Get(alone, &IAAFFile::GetHeader);
    EXPECT_EQ(AAFRESULT_SUCCESS, header->CountMobs(kAAFAllMob, &count));
    EXPECT_EQ(1u, count);
    EXPECT_EQ(AAFRESULT_DUPLICATE_MOBID,
              master_->CloneExternal(kAAFNoFollowDepend, kAAFNoIncludeMedia, alone, clone.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              master_->CloneExternal(kAAFFollowDepend, kAAFNoIncludeMedia, all, clone.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, all->GetHeader(header.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, header->CountMobs(kAAFAllMob, &count));
    EXPECT_EQ(3u, count);
}

TEST_F(SaveCopy, CarriesEssence) {
    Ptr<IAAFMob> mob = FileMob(1);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    Ptr<IAAFEssenceData> data = Make<IAAFEssenceData>(AUID_AAFEssenceData);
    ASSERT_EQ(AAFRESULT_SUCCESS, data->Initialize(As<IAAFSourceMob>(mob)));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddEssenceData(data));
    std::vector<aafUInt8> bytes(100000, 7);
    aafUInt32 count = 0;
    ASSERT_EQ(AAFRESULT_SUCCESS,
              data->Write(static_cast<aafUInt32>(bytes.size()), bytes.data(), &count));
    const std::wstring path = Path("essence.aaf");
    Copy(path);
    Ptr<IAAFFile> read;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(path.c_str(), 0, read.Out()));
    Ptr<IAAFHeader> header = Get(read, &IAAFFile::GetHeader);
    ASSERT_EQ(AAFRESULT_SUCCESS, header->LookupEssenceData(MobId(1), data.Out()));
    EXPECT_EQ(100000, Get(data, &IAAFEssenceData::GetSize));
}

namespace {

std::vector<std::wstring> Writers(const Ptr<IAAFFile>& file) {
    Ptr<IEnumAAFIdentifications> all =
        Get(Get(file, &IAAFFile::GetHeader), &IAAFHeader::GetIdentifications);
    std::vector<std::wstring> names;
    Ptr<IAAFIdentification> one;
    while (all->NextOne(one.Out()) == AAFRESULT_SUCCESS) {
        names.push_back(TextOf<IAAFIdentification>(one, &IAAFIdentification::GetProductNameBufLen,
                                                   &IAAFIdentification::GetProductName));
    }
    return names;
}

}  // namespace

// Who made the description stands behind who saved it.
TEST_F(SaveCopy, KeepsTheIdentificationsOfItsSource) {
    DescribeClip();
    wchar_t name[] = L"Saver";
    product_.ident.productName = name;
    Copy(Path("one.aaf"));
    Ptr<IAAFFile> one;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(Path("one.aaf").c_str(), 0, one.Out()));
    EXPECT_EQ((std::vector<std::wstring>{L"Saver", L"Tests"}), Writers(one));
    aafUID_t made{};
    aafUID_t kept{};
    Get(Get(file_, &IAAFFile::GetHeader), &IAAFHeader::GetLastIdentification)
        ->GetGenerationID(&made);
    Get(Get(one, &IAAFFile::GetHeader), &IAAFHeader::GetLastIdentification)->GetGenerationID(&kept);
    EXPECT_EQ(made, kept);

    // Through a target that somebody looked at, which takes another way.
    wchar_t again[] = L"Saver again";
    product_.ident.productName = again;
    Ptr<IAAFFile> target = NewFile(Path("two.aaf"));
    EXPECT_EQ((std::vector<std::wstring>{L"Saver again"}), Writers(target));
    ASSERT_EQ(AAFRESULT_SUCCESS, one->SaveCopyAs(target));
    const std::vector<std::wstring> three{L"Saver again", L"Saver", L"Tests"};
    EXPECT_EQ(three, Writers(target));
    ASSERT_EQ(AAFRESULT_SUCCESS, target->Close());
    Ptr<IAAFFile> two;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenExistingRead(Path("two.aaf").c_str(), 0, two.Out()));
    EXPECT_EQ(three, Writers(two));
    EXPECT_EQ((std::vector<std::wstring>{L"Saver", L"Tests"}), Writers(one));
}

}  // namespace aaf_test
