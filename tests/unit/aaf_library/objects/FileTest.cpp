// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFDictionary.h"
#include "host_interfaces/aaf/AAFMobSlots.h"
#include "host_interfaces/aaf/AAFMobs.h"
#include "tests/unit/aaf_library/objects/TransientFile.h"

namespace aaf_test {

using File = TransientFile;

TEST_F(File, RefusesToOpenWithoutIdentificationOrPlaceForTheResult) {
    IAAFFile* out = file_;
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFFileOpenTransient(nullptr, &out));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFFileOpenTransient(&product_.ident, nullptr));
    EXPECT_EQ(file_.get(), out);
}

TEST_F(File, RefusesAnIdentificationWithoutCompanyOrProduct) {
    Product product;
    Ptr<IAAFFile> made;
    product.ident.companyName = nullptr;
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFFileOpenTransient(&product.ident, made.Out()));
    product.ident.companyName = product.company.data();
    product.ident.productName = nullptr;
    EXPECT_EQ(AAFRESULT_NULL_PARAM, AAFFileOpenTransient(&product.ident, made.Out()));
}

TEST_F(File, StartsWithOneReference) {
    Ptr<IAAFFile> made;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, made.Out()));
    EXPECT_EQ(1u, ReferencesOf(made.get()));
}

TEST_F(File, IsOpenFromTheStartAndCanNotBeOpenedAgain) {
    EXPECT_EQ(AAFRESULT_ALREADY_OPEN, file_->Open());
}

TEST_F(File, SavesIntoMemoryWhileItIsOpen) {
    EXPECT_EQ(AAFRESULT_SUCCESS, file_->Save());
}

TEST_F(File, CanBeClosedOnceAndStaysClosed) {
    EXPECT_EQ(AAFRESULT_SUCCESS, file_->Close());
    EXPECT_EQ(AAFRESULT_NOT_OPEN, file_->Close());
    EXPECT_EQ(AAFRESULT_NOT_OPEN, file_->Save());
    EXPECT_EQ(AAFRESULT_ALREADY_OPEN, file_->Open());
    Ptr<IAAFHeader> header;
    Ptr<IAAFDictionary> dictionary;
    aafFileRev_t revision = 0;
    EXPECT_EQ(AAFRESULT_NOT_OPEN, file_->GetHeader(header.Out()));
    EXPECT_EQ(AAFRESULT_NOT_OPEN, file_->GetDictionary(dictionary.Out()));
    EXPECT_EQ(AAFRESULT_NOT_OPEN, file_->GetRevision(&revision));
    EXPECT_EQ(AAFRESULT_NOT_OPEN, file_->SaveCopyAs(file_));
}

TEST_F(File, HasTheSecondRevision) {
    EXPECT_EQ(kAAFRev2, Get(file_, &IAAFFile::GetRevision));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, file_->GetRevision(nullptr));
}

TEST_F(File, GivesTheSameHeaderAndDictionaryEachTime) {
    Ptr<IAAFDictionary> ofObject;
    Ptr<IAAFHeader> header = Get(file_, &IAAFFile::GetHeader);
    Ptr<IAAFDictionary> ofFile = Get(file_, &IAAFFile::GetDictionary);
    EXPECT_EQ(AAFRESULT_SUCCESS, Make<IAAFObject>(AUID_AAFFiller)->GetDictionary(ofObject.Out()));
    EXPECT_EQ(header_.get(), header.get());
    EXPECT_EQ(dictionary_.get(), ofFile.get());
    EXPECT_EQ(dictionary_.get(), ofObject.get());
    EXPECT_EQ(AAFRESULT_NULL_PARAM, file_->GetHeader(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, file_->GetDictionary(nullptr));
}

TEST_F(File, LeavesItsObjectsUsableWhenItGoes) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    file_.Reset();

    aafNumSlots_t count = 0;
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->CountMobs(kAAFAllMob, &count));
    EXPECT_EQ(1u, count);
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetName(L"left behind"));
    EXPECT_NE(nullptr, DataDef(kAAFDataDef_Sound).get());
}

TEST_F(File, LeavesAMobUsableThatOutlivesEverythingElse) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    header_.Reset();
    dictionary_.Reset();
    file_.Reset();

    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetName(L"alone"));
    EXPECT_EQ(0u, Get(mob, &IAAFMob::CountSlots));
    Ptr<IAAFDictionary> dictionary = Get(As<IAAFObject>(mob), &IAAFObject::GetDictionary);
    Ptr<IAAFDataDef> picture = Get(dictionary, &IAAFDictionary::LookupDataDef, kAAFDataDef_Picture);
}

TEST_F(File, LeavesMobsUsableThatAreHeldWhenItIsClosed) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    EXPECT_EQ(AAFRESULT_SUCCESS, file_->Close());
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetName(L"still here"));
}

TEST_F(File, KeepsAMobThatItsMakerLetGo) {
    {
        Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
        mob->SetMobID(MobId(1));
        mob->SetName(L"kept");
        ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    }
    Ptr<IAAFMob> found = Get(header_, &IAAFHeader::LookupMob, MobId(1));
    EXPECT_EQ(L"kept", TextOf<IAAFMob>(found, &IAAFMob::GetNameBufLen, &IAAFMob::GetName));
}

TEST_F(File, RefusesToSaveASourceMobWithoutDescriptor) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFSourceMob);
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    EXPECT_EQ(AAFRESULT_INVALID_OBJ, file_->Save());
}

TEST_F(File, RefusesToSaveASlotWithoutSegment) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFMasterMob);
    ASSERT_EQ(AAFRESULT_SUCCESS, mob->AppendSlot(Make<IAAFMobSlot>(AUID_AAFTimelineMobSlot)));
    ASSERT_EQ(AAFRESULT_SUCCESS, header_->AddMob(mob));
    EXPECT_EQ(AAFRESULT_INVALID_OBJ, file_->Save());
}

}  // namespace aaf_test
