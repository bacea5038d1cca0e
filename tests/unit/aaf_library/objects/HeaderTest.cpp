// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDescriptors.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

using Header = TransientFile;

namespace {

std::vector<aafUInt8> Order(IEnumAAFMobs* mobs) {
    std::vector<aafUInt8> order;
    Ptr<IAAFMob> mob;
    while (mobs->NextOne(mob.Out()) == AAFRESULT_SUCCESS) {
        aafMobID_t id{};
        mob->GetMobID(&id);
        order.push_back(id.SMPTELabel[0]);
    }
    return order;
}

}  // namespace

TEST_F(Header, OfANewFileHasOneIdentificationAndTheVersionsOfTheModel) {
    aafVersionType_t revision{};
    aafProductVersion_t library{};
    EXPECT_EQ(1u, Get(header_, &IAAFHeader::CountIdentifications));
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->GetFileRevision(&revision));
    EXPECT_EQ(1, revision.major);
    EXPECT_EQ(1, revision.minor);
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->GetRefImplVersion(&library));
    EXPECT_EQ(1, library.major);
    EXPECT_EQ(1, library.minor);
    EXPECT_EQ(6, library.tertiary);
    EXPECT_EQ(0, library.patchLevel);
    EXPECT_EQ(kAAFVersionBeta, library.type);
}

TEST_F(Header, TellsTheByteOrder) {
    Ptr<IAAFEndian> endian = As<IAAFEndian>(header_);
    eAAFByteOrder_t stored = 7;
    eAAFByteOrder_t native = 7;
    EXPECT_EQ(AAFRESULT_SUCCESS, endian->GetStoredByteOrder(&stored));
    EXPECT_EQ(AAFRESULT_SUCCESS, endian->GetNativeByteOrder(&native));
    EXPECT_EQ(kAAFByteOrderLittle, stored);
    EXPECT_EQ(kAAFByteOrderLittle, native);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, endian->GetStoredByteOrder(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, endian->GetNativeByteOrder(nullptr));
}

TEST_F(Header, HasItsRequiredProperties) {
    Ptr<IAAFObject> object = As<IAAFObject>(header_);
    Ptr<IAAFClassDef> definition = Get(object, &IAAFObject::GetDefinition);
    const aafUID_t ids[] = {ncfGuid("03010201-0200-0000-060E-2B3401010101"),
                            ncfGuid("07020110-0204-0000-060E-2B3401010102"),
                            ncfGuid("06010104-0201-0000-060E-2B3401010102"),
                            ncfGuid("03010201-0500-0000-060E-2B3401010102"),
                            ncfGuid("06010104-0604-0000-060E-2B3401010102"),
                            ncfGuid("03010201-0400-0000-060E-2B3401010102")};
    for (const aafUID_t& id : ids) {
        aafBoolean_t present = kAAFFalse;
        Ptr<IAAFPropertyDef> property = Get(definition, &IAAFClassDef::LookupPropertyDef, id);
        EXPECT_EQ(AAFRESULT_SUCCESS, object->IsPropertyPresent(property, &present));
        EXPECT_EQ(kAAFTrue, present);
    }
}

TEST_F(Header, AddsAMobOnce) {
    Ptr<IAAFMob> mob = FileMob(1);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header_->AddMob(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    EXPECT_EQ(AAFRESULT_DUPLICATE_MOBID, header_->AddMob(mob));
    EXPECT_EQ(AAFRESULT_DUPLICATE_MOBID, header_->AddMob(FileMob(1)));
}

TEST_F(Header, RefusesAMobOfAnotherFile) {
    Ptr<IAAFFile> other;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, other.Out()));
    Ptr<IAAFHeader> otherHeader = Get(other, &IAAFFile::GetHeader);
    Ptr<IAAFMob> mob = FileMob(1);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, otherHeader->AddMob(mob));
}

TEST_F(Header, TakesARemovedMobBack) {
    Ptr<IAAFMob> mob = FileMob(1);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header_->RemoveMob(nullptr));
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->RemoveMob(mob));
    EXPECT_EQ(AAFRESULT_MOB_NOT_FOUND, header_->RemoveMob(mob));
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
}

TEST_F(Header, FindsMobsByIdOnly) {
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(FileMob(3)));
    Ptr<IAAFMob> found = Get(header_, &IAAFHeader::LookupMob, MobId(3));
    IAAFMob* untouched = found;
    EXPECT_EQ(AAFRESULT_MOB_NOT_FOUND, header_->LookupMob(MobId(4), &untouched));
    EXPECT_EQ(found.get(), untouched);
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header_->LookupMob(MobId(3), nullptr));
}

TEST_F(Header, GivesMobsInTheOrderOfTheirIds) {
    for (aafUInt8 number : {5, 0xF0, 1, 0x80}) {
        ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(FileMob(number)));
    }
    Ptr<IEnumAAFMobs> mobs = Get(header_, &IAAFHeader::GetMobs, nullptr);
    EXPECT_EQ((std::vector<aafUInt8>{1, 5, 0x80, 0xF0}), Order(mobs));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header_->GetMobs(nullptr, nullptr));
}

TEST_F(Header, EntersAMobAnewWhenItsIdChanges) {
    Ptr<IAAFMob> first = FileMob(1);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(first));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(FileMob(5)));
    EXPECT_EQ(AAFRESULT_DUPLICATE_MOBID, first->SetMobID(MobId(5)));
    EXPECT_EQ(AAFRESULT_DUPLICATE_MOBID, first->SetMobID(MobId(1)));
    EXPECT_EQ(AAFRESULT_SUCCESS, first->SetMobID(MobId(9)));

    Ptr<IEnumAAFMobs> mobs = Get(header_, &IAAFHeader::GetMobs, nullptr);
    EXPECT_EQ((std::vector<aafUInt8>{5, 9}), Order(mobs));
    Ptr<IAAFMob> found = Get(header_, &IAAFHeader::LookupMob, MobId(9));
    EXPECT_EQ(first.get(), found.get());
    EXPECT_EQ(AAFRESULT_MOB_NOT_FOUND, header_->LookupMob(MobId(1), found.Out()));
}

TEST_F(Header, CountsMobsByKind) {
    const std::pair<aafUID_t, aafMobKind_t> descriptors[] = {
        {AUID_AAFCDCIDescriptor, kAAFFileMob},
        {AUID_AAFMultipleDescriptor, kAAFFileMob},
        {AUID_AAFPCMDescriptor, kAAFFileMob},
        {AUID_AAFTapeDescriptor, kAAFTapeMob},
        {AUID_AAFFilmDescriptor, kAAFFilmMob},
        {AUID_AAFImportDescriptor, kAAFPhysicalMob},
        {AUID_AAFRecordingDescriptor, kAAFPhysicalMob},
        {AUID_AAFAuxiliaryDescriptor, kAAFPhysicalMob}};
    for (const auto& [descriptor, kind] : descriptors) {
        Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFSourceMob);
        ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFSourceMob>(mob)->SetEssenceDescriptor(
                                         Make<IAAFEssenceDescriptor>(descriptor)));
        aafNumSlots_t before = 0;
        aafNumSlots_t after = 0;
        EXPECT_EQ(AAFRESULT_SUCCESS, header_->CountMobs(kind, &before));
        ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
        EXPECT_EQ(AAFRESULT_SUCCESS, header_->CountMobs(kind, &after));
        EXPECT_EQ(before + 1, after);
    }
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(Make<IAAFMob>(AUID_AAFMasterMob)));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(Make<IAAFMob>(AUID_AAFCompositionMob)));
    const std::pair<aafMobKind_t, aafNumSlots_t> expected[] = {
        {kAAFCompMob, 1}, {kAAFMasterMob, 1}, {kAAFFileMob, 3},    {kAAFTapeMob, 1},
        {kAAFFilmMob, 1}, {kAAFAllMob, 10},   {kAAFPhysicalMob, 3}};
    for (const auto& [kind, number] : expected) {
        aafNumSlots_t count = 99;
        EXPECT_EQ(AAFRESULT_SUCCESS, header_->CountMobs(kind, &count));
        EXPECT_EQ(number, count) << kind;
    }
    aafNumSlots_t count = 99;
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, header_->CountMobs(8, &count));
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, header_->CountMobs(-1, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header_->CountMobs(kAAFAllMob, nullptr));
}

TEST_F(Header, SearchesMobsByCriterion) {
    Ptr<IAAFMob> file = FileMob(2);
    Ptr<IAAFMob> master = Make<IAAFMob>(AUID_AAFMasterMob);
    master->SetMobID(MobId(1));
    master->SetName(L"wanted");
    const aafUID_t usage = ncfGuid("0D010102-0101-0500-060E-2B3404010101");
    ASSERT_EQ(AAFRESULT_SUCCESS, As<IAAFMob2>(master)->SetUsageCode(usage));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(file));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(master));

    const auto found = [this](aafSearchTag_t tag, auto set) {
        aafSearchCrit_t criterion{};
        criterion.searchTag = tag;
        set(criterion.tags);
        Ptr<IEnumAAFMobs> mobs = Get(header_, &IAAFHeader::GetMobs, &criterion);
        return Order(mobs);
    };
    using Numbers = std::vector<aafUInt8>;
    wchar_t name[] = L"wanted";
    EXPECT_EQ((Numbers{1, 2}), found(kAAFNoSearch, [](auto&) {}));
    EXPECT_EQ(Numbers{2}, found(kAAFByMobID, [](auto& tags) { tags.mobID = MobId(2); }));
    EXPECT_EQ(Numbers{2}, found(kAAFByMobKind, [](auto& tags) { tags.mobKind = kAAFFileMob; }));
    EXPECT_EQ(Numbers{1}, found(kAAFByName, [&](auto& tags) { tags.name = name; }));
    EXPECT_EQ(Numbers{1},
              found(kAAFByClass, [](auto& tags) { tags.objClass = AUID_AAFMasterMob; }));
    EXPECT_EQ((Numbers{1, 2}), found(kAAFByClass, [](auto& tags) { tags.objClass = AUID_AAFMob; }));
    EXPECT_EQ(Numbers{2},
              found(kAAFByDataDef, [](auto& tags) { tags.datadef = kAAFDataDef_LegacyPicture; }));
    EXPECT_EQ(Numbers{},
              found(kAAFByDataDef, [](auto& tags) { tags.datadef = kAAFDataDef_LegacySound; }));
    EXPECT_EQ(Numbers{1}, found(kAAFByUsageCode, [&](auto& tags) { tags.usageCode = usage; }));
    EXPECT_EQ(Numbers{1},
              found(kAAFByMasterMobUsageCode, [&](auto& tags) { tags.usageCode = usage; }));
    EXPECT_EQ(Numbers{},
              found(kAAFBySourceMobUsageCode, [&](auto& tags) { tags.usageCode = usage; }));
}

TEST_F(Header, RefusesCriteriaThatItDoesNotKnow) {
    aafSearchCrit_t criterion{};
    Ptr<IEnumAAFMobs> mobs;
    criterion.searchTag = 11;
    EXPECT_EQ(AAFRESULT_INVALID_PARAM, header_->GetMobs(&criterion, mobs.Out()));
    criterion.searchTag = kAAFByName;
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header_->GetMobs(&criterion, mobs.Out()));
    criterion.searchTag = kAAFByMobKind;
    criterion.tags.mobKind = 9;
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, header_->GetMobs(&criterion, mobs.Out()));
    criterion.searchTag = kAAFByMediaCrit;
    EXPECT_EQ(AAFRESULT_NOT_IMPLEMENTED, header_->GetMobs(&criterion, mobs.Out()));
}

TEST_F(Header, FindsEssenceByTheMobThatItIsGiven) {
    Ptr<IAAFEssenceData> data[3];
    for (aafUInt8 number : {1, 2, 3}) {
        ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(FileMob(number)));
    }
    const auto mob = [this](aafUInt8 number) {
        return As<IAAFSourceMob>(Get(header_, &IAAFHeader::LookupMob, MobId(number)));
    };
    for (aafUInt8 number : {1, 2}) {
        data[number] = Make<IAAFEssenceData>(AUID_AAFEssenceData);
        ASSERT_EQ(AAFRESULT_SUCCESS, data[number]->Initialize(mob(number)));
        ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddEssenceData(data[number]));
    }
    EXPECT_EQ(AAFRESULT_DUPLICATE_MOBID, data[1]->SetFileMob(mob(2)));
    EXPECT_EQ(AAFRESULT_SUCCESS, data[1]->SetFileMob(mob(1)));
    EXPECT_EQ(AAFRESULT_SUCCESS, data[1]->SetFileMob(mob(3)));
    EXPECT_EQ(data[1].get(), Get(header_, &IAAFHeader::LookupEssenceData, MobId(3)).get());
    EXPECT_EQ(data[2].get(), Get(header_, &IAAFHeader::LookupEssenceData, MobId(2)).get());
    Ptr<IAAFEssenceData> none;
    EXPECT_EQ(AAFRESULT_ESSENCE_NOT_FOUND, header_->LookupEssenceData(MobId(1), none.Out()));
}

TEST_F(Header, TellsWhoWroteTheFile) {
    Ptr<IAAFIdentification> last = Get(header_, &IAAFHeader::GetLastIdentification);
    EXPECT_EQ(L"Cliphost",
              TextOf<IAAFIdentification>(last, &IAAFIdentification::GetCompanyNameBufLen,
                                         &IAAFIdentification::GetCompanyName));
    EXPECT_EQ(L"Tests", TextOf<IAAFIdentification>(last, &IAAFIdentification::GetProductNameBufLen,
                                                   &IAAFIdentification::GetProductName));
    EXPECT_EQ(L"1.0",
              TextOf<IAAFIdentification>(last, &IAAFIdentification::GetProductVersionStringBufLen,
                                         &IAAFIdentification::GetProductVersionString));
    EXPECT_EQ(L"Test machine",
              TextOf<IAAFIdentification>(last, &IAAFIdentification::GetPlatformBufLen,
                                         &IAAFIdentification::GetPlatform));
    aafProductVersion_t version{};
    aafUID_t product{};
    aafUID_t generation{};
    aafTimeStamp_t date{};
    EXPECT_EQ(AAFRESULT_SUCCESS, last->GetProductVersion(&version));
    EXPECT_EQ(2, version.minor);
    EXPECT_EQ(4, version.patchLevel);
    EXPECT_EQ(kAAFVersionDebug, version.type);
    EXPECT_EQ(AAFRESULT_SUCCESS, last->GetProductID(&product));
    EXPECT_EQ(product_.ident.productID, product);
    EXPECT_EQ(AAFRESULT_SUCCESS, last->GetDate(&date));
    EXPECT_GE(date.date.year, 2026);
    EXPECT_EQ(AAFRESULT_SUCCESS, last->GetRefImplVersion(&version));
    EXPECT_EQ(6, version.tertiary);
    EXPECT_EQ(AAFRESULT_SUCCESS, last->GetGenerationID(&generation));

    Ptr<IAAFIdentification> found = Get(header_, &IAAFHeader::LookupIdentification, generation);
    EXPECT_EQ(last.get(), found.get());
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_FOUND, header_->LookupIdentification(product, found.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->GetIdentificationAt(0, found.Out()));
    EXPECT_EQ(last.get(), found.get());
    EXPECT_EQ(AAFRESULT_BADINDEX, header_->GetIdentificationAt(1, found.Out()));
    Ptr<IEnumAAFIdentifications> all = Get(header_, &IAAFHeader::GetIdentifications);
    EXPECT_EQ(AAFRESULT_SUCCESS, all->NextOne(found.Out()));
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS, all->NextOne(found.Out()));
}

TEST_F(Header, HasIdentificationsThatTellNothingBeforeInitialize) {
    Ptr<IAAFIdentification> fresh = Make<IAAFIdentification>(AUID_AAFIdentification);
    aafCharacter text[20] = {};
    aafUInt32 size = 0;
    aafProductVersion_t version{};
    aafTimeStamp_t date{};
    aafUID_t id{};
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetCompanyName(text, sizeof text));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetCompanyNameBufLen(&size));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetProductName(text, sizeof text));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetProductNameBufLen(&size));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetProductVersionString(text, sizeof text));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetProductVersionStringBufLen(&size));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetProductVersion(&version));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetProductID(&id));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetDate(&date));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetRefImplVersion(&version));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetPlatform(text, sizeof text));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetPlatformBufLen(&size));
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, fresh->GetGenerationID(&id));
    ASSERT_EQ(AAFRESULT_SUCCESS, fresh->Initialize(L"C", L"P", L"V", id));
    EXPECT_EQ(AAFRESULT_SUCCESS, fresh->GetProductName(text, sizeof text));
    EXPECT_EQ(AAFRESULT_SUCCESS, fresh->GetGenerationID(&id));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, fresh->GetProductVersion(&version));
}

TEST_F(Header, DoesWithoutTheOptionalPartsOfAnIdentification) {
    Product product;
    product.ident.productVersion = nullptr;
    product.ident.productVersionString = nullptr;
    product.ident.platform = nullptr;
    Ptr<IAAFFile> file;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product.ident, file.Out()));
    Ptr<IAAFHeader> header = Get(file, &IAAFFile::GetHeader);
    Ptr<IAAFIdentification> last = Get(header, &IAAFHeader::GetLastIdentification);
    aafProductVersion_t version{};
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, last->GetProductVersion(&version));
    EXPECT_EQ(L"Unknown version",
              TextOf<IAAFIdentification>(last, &IAAFIdentification::GetProductVersionStringBufLen,
                                         &IAAFIdentification::GetProductVersionString));
    EXPECT_NE(L"", TextOf<IAAFIdentification>(last, &IAAFIdentification::GetPlatformBufLen,
                                              &IAAFIdentification::GetPlatform));
}

TEST_F(Header, KeepsIdentificationsThatAreAppended) {
    Ptr<IAAFIdentification> next = Make<IAAFIdentification>(AUID_AAFIdentification);
    const aafUID_t id = ncfGuid("99999999-2222-3333-4444-555555555555");
    EXPECT_EQ(AAFRESULT_NULL_PARAM, next->Initialize(nullptr, L"b", L"c", id));
    ASSERT_EQ(AAFRESULT_SUCCESS, next->Initialize(L"a", L"b", L"c", id));
    EXPECT_EQ(AAFRESULT_ALREADY_INITIALIZED, next->Initialize(L"a", L"b", L"c", id));
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->AppendIdentification(next));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, header_->AppendIdentification(next));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, header_->AppendIdentification(nullptr));
    Ptr<IAAFIdentification> last = Get(header_, &IAAFHeader::GetLastIdentification);
    EXPECT_EQ(next.get(), last.get());
}

TEST_F(Header, KeepsEssenceUnderTheIdOfItsFileMob) {
    Ptr<IAAFMob> mob = FileMob(1);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    Ptr<IAAFEssenceData> data = Make<IAAFEssenceData>(AUID_AAFEssenceData);
    ASSERT_EQ(AAFRESULT_SUCCESS, data->Initialize(As<IAAFSourceMob>(mob)));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddEssenceData(data));
    EXPECT_EQ(AAFRESULT_DUPLICATE_MOBID, header_->AddEssenceData(data));
    aafUInt8 bytes[] = {1, 2, 3};
    aafUInt32 count = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, data->Write(3, bytes, &count));
    EXPECT_EQ(AAFRESULT_SUCCESS, data->SetPosition(1));
    aafUInt8 back[4] = {};
    EXPECT_EQ(AAFRESULT_SUCCESS, data->Read(4, back, &count));
    EXPECT_EQ(2u, count);
    EXPECT_EQ(2, back[0]);
    EXPECT_EQ(AAFRESULT_END_OF_DATA, data->Read(4, back, &count));
    EXPECT_EQ(AAFRESULT_BADSAMPLEOFFSET, data->SetPosition(4));
    EXPECT_EQ(3, Get(data, &IAAFEssenceData::GetSize));

    aafBoolean_t present = kAAFFalse;
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->IsEssenceDataPresent(MobId(1), kAAFEssence, &present));
    EXPECT_EQ(kAAFTrue, present);
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->IsEssenceDataPresent(MobId(2), kAAFEssence, &present));
    EXPECT_EQ(kAAFFalse, present);
    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, header_->IsEssenceDataPresent(MobId(1), 2, &present));
    Ptr<IAAFEssenceData> found = Get(header_, &IAAFHeader::LookupEssenceData, MobId(1));
    EXPECT_EQ(data.get(), found.get());
    Ptr<IAAFSourceMob> back2 = Get(data, &IAAFEssenceData::GetFileMob);
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->RemoveEssenceData(data));
    EXPECT_EQ(AAFRESULT_ESSENCE_NOT_FOUND, header_->RemoveEssenceData(data));
    EXPECT_EQ(AAFRESULT_ESSENCE_NOT_FOUND, header_->LookupEssenceData(MobId(1), found.Out()));
}

TEST_F(Header, AnswersWithAFailureWhenItsContentWasRemoved) {
    Ptr<IAAFObject> object = As<IAAFObject>(header_);
    Ptr<IAAFPropertyDef> content;
    Ptr<IAAFClassDef> definition = Get(object, &IAAFObject::GetDefinition);
    ASSERT_EQ(AAFRESULT_SUCCESS,
              definition->LookupPropertyDef(ncfGuid("06010104-0201-0000-060E-2B3401010102"),
                                            content.Out()));
    ASSERT_EQ(AAFRESULT_SUCCESS, object->RemoveOptionalProperty(content));
    aafNumSlots_t count = 0;
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_FOUND, header_->CountMobs(kAAFAllMob, &count));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_FOUND, header_->AddMob(FileMob(1)));
    EXPECT_LT(file_->Save(), 0);
    Ptr<IAAFFile> other;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, other.Out()));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_FOUND, file_->SaveCopyAs(other));
}

TEST_F(Header, SharesItsContentWithTheContentStorage) {
    Ptr<IAAFContentStorage> storage = Get(header_, &IAAFHeader::GetContentStorage);
    ASSERT_EQ(AAFRESULT_SUCCESS, storage->AddMob(FileMob(1)));
    aafNumSlots_t count = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->CountMobs(kAAFFileMob, &count));
    EXPECT_EQ(1u, count);
    EXPECT_EQ(AAFRESULT_SUCCESS, As<IAAFHeader2>(header_)->CountMobs(kAAFFileMob, &count));
    EXPECT_EQ(1u, count);
}

}  // namespace aaf_test
