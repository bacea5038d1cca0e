// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/aaf_library/objects/TransientFile.h"

#include <cstring>

namespace aaf_test {

Product::Product() {
    ident.companyName = company.data();
    ident.productName = name.data();
    ident.productVersionString = versionText.data();
    ident.productID = ncfGuid("11111111-2222-3333-4444-555555555555");
    ident.platform = platform.data();
    ident.productVersion = &version;
}

TransientFile::TransientFile() {
    EXPECT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, file_.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, file_->GetHeader(header_.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, header_->GetDictionary(dictionary_.Out()));
}

TransientFile::~TransientFile() {
    dictionary_.Reset();
    header_.Reset();
    if (file_ != nullptr) {
        EXPECT_EQ(1u, ReferencesOf(file_.get()));
    }
}

Ptr<IAAFDataDef> TransientFile::DataDef(const aafUID_t& id) {
    Ptr<IAAFDataDef> found = Get(dictionary_, &IAAFDictionary::LookupDataDef, id);
    return found;
}

Ptr<IAAFSourceClip> TransientFile::Clip(aafLength_t length, const aafUID_t& dataDef) {
    Ptr<IAAFSourceClip> clip = Make<IAAFSourceClip>(AUID_AAFSourceClip);
    EXPECT_EQ(AAFRESULT_SUCCESS, clip->Initialize(DataDef(dataDef), length, aafSourceRef_t{}));
    return clip;
}

Ptr<IAAFComponent> TransientFile::Filler(aafLength_t length, const aafUID_t& dataDef) {
    Ptr<IAAFFiller> filler = Make<IAAFFiller>(AUID_AAFFiller);
    EXPECT_EQ(AAFRESULT_SUCCESS, filler->Initialize(DataDef(dataDef), length));
    return As<IAAFComponent>(filler);
}

Ptr<IAAFMob> TransientFile::FileMob(aafUInt8 number) {
    Ptr<IAAFMob> mob = Make<IAAFMob>(AUID_AAFSourceMob);
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->SetMobID(MobId(number)));
    Ptr<IAAFSourceMob> source = As<IAAFSourceMob>(mob);
    EXPECT_EQ(AAFRESULT_SUCCESS,
              source->SetEssenceDescriptor(Make<IAAFEssenceDescriptor>(AUID_AAFCDCIDescriptor)));
    EXPECT_EQ(AAFRESULT_SUCCESS,
              source->AddNilReference(1, 10, DataDef(kAAFDataDef_LegacyPicture), {25, 1}));
    return mob;
}

aafMobID_t MobId(aafUInt8 number) {
    aafMobID_t id{};
    std::memset(&id, 0x11, sizeof id);
    id.SMPTELabel[0] = number;
    return id;
}

bool SameMobId(const aafMobID_t& left, const aafMobID_t& right) {
    return std::memcmp(&left, &right, sizeof left) == 0;
}

Texts Comments(IAAFMob* mob) {
    Texts texts;
    Ptr<IEnumAAFTaggedValues> all;
    EXPECT_EQ(AAFRESULT_SUCCESS, mob->GetComments(all.Out()));
    Ptr<IAAFTaggedValue> value;
    while (all->NextOne(value.Out()) == AAFRESULT_SUCCESS) {
        aafUInt32 bytes = 0;
        aafUInt32 read = 0;
        EXPECT_EQ(AAFRESULT_SUCCESS, value->GetValueBufLen(&bytes));
        std::vector<aafCharacter> buffer(bytes / sizeof(aafCharacter) + 1);
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  value->GetValue(bytes, reinterpret_cast<aafUInt8*>(buffer.data()), &read));
        texts.emplace_back(TextOf<IAAFTaggedValue>(value, &IAAFTaggedValue::GetNameBufLen,
                                                   &IAAFTaggedValue::GetName),
                           buffer.data());
    }
    return texts;
}

}  // namespace aaf_test
