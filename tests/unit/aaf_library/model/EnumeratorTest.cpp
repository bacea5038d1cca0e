// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class Enumerators : public ModelFixture {
protected:
    Ptr<IEnumAAFDataDefs> list = Out(dictionary, &IAAFDictionary::GetDataDefs);

    Ptr<IAAFDataDef> Next() { return Out(list, &IEnumAAFDataDefs::NextOne); }
};

TEST_F(Enumerators, NextOneWalksToTheEndAndLeavesTheOutputAlone) {
    for (int i = 0; i < 11; ++i) {
        EXPECT_TRUE(Next());
    }
    auto* out = reinterpret_cast<IAAFDataDef*>(this);
    EXPECT_EQ(list->NextOne(&out), AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_EQ(static_cast<void*>(out), this);
    EXPECT_EQ(list->NextOne(nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(Enumerators, NextGivesWhatIsLeftAndSaysHowMany) {
    IAAFDataDef* out[16] = {};
    aafUInt32 fetched = 99;
    ASSERT_EQ(list->Next(8, out, &fetched), AAFRESULT_SUCCESS);
    EXPECT_EQ(fetched, 8u);
    EXPECT_EQ(list->Next(8, out + 8, &fetched), AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_EQ(fetched, 3u);
    for (int i = 0; i < 11; ++i) {
        ASSERT_NE(out[i], nullptr);
        out[i]->Release();
    }
    EXPECT_EQ(out[11], nullptr);
}

TEST_F(Enumerators, NextRefusesCountZeroAndNullPointers) {
    IAAFDataDef* out = nullptr;
    aafUInt32 fetched = 0;
    EXPECT_EQ(list->Next(0, &out, &fetched), AAFRESULT_INVALID_PARAM);
    EXPECT_EQ(list->Next(1, nullptr, &fetched), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(list->Next(1, &out, nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(Enumerators, SkipPastTheEndIsRefused) {
    EXPECT_EQ(list->Skip(11), AAFRESULT_SUCCESS);
    EXPECT_EQ(list->Skip(1), AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_EQ(list->Reset(), AAFRESULT_SUCCESS);
    EXPECT_EQ(list->Skip(12), AAFRESULT_NO_MORE_OBJECTS);
    EXPECT_TRUE(Next());
}

TEST_F(Enumerators, CloneGoesOnFromTheSamePlaceOnItsOwn) {
    Next();
    const auto clone = Out(list, &IEnumAAFDataDefs::Clone);
    const auto second = Next();
    Next();
    EXPECT_EQ(Out(clone, &IEnumAAFDataDefs::NextOne).get(), second.get());
    EXPECT_EQ(list->Clone(nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(Enumerators, ElementsAddedWhileItRunsAreMet) {
    ASSERT_EQ(list->Skip(11), AAFRESULT_SUCCESS);
    const auto own = As<IAAFDataDef>(New(AUID_AAFDataDefinition));
    // The largest id of all, so that it comes last.
    ASSERT_EQ(own->Initialize(ncfGuid("FFFFFFFF-FFFF-FFFF-FFFF-FFFFFFFFFFFF"), L"Own", L""),
              AAFRESULT_SUCCESS);
    ASSERT_EQ(dictionary->RegisterDataDef(own.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(Next().get(), own.get());
}

TEST_F(Enumerators, EmptyListIsGivenAndEndsAtOnce) {
    const auto codecs = Out(dictionary, &IAAFDictionary::GetCodecDefs);
    IAAFCodecDef* out = nullptr;
    EXPECT_EQ(codecs->NextOne(&out), AAFRESULT_NO_MORE_OBJECTS);
}

TEST_F(Enumerators, ClassesTypesAndPropertiesAreWalkedToo) {
    aafUInt32 wanted = 0;
    aafUInt32 met = 0;
    dictionary->CountTypeDefs(&wanted);
    const auto types = Out(dictionary, &IAAFDictionary::GetTypeDefs);
    for (IAAFTypeDef* out = nullptr; types->NextOne(&out) == AAFRESULT_SUCCESS; ++met) {
        out->Release();
    }
    EXPECT_EQ(met, wanted);
    const auto properties = Out(Class(AUID_AAFFiller), &IAAFClassDef::GetPropertyDefs);
    IAAFPropertyDef* none = nullptr;
    EXPECT_EQ(properties->NextOne(&none), AAFRESULT_NO_MORE_OBJECTS);
}

}  // namespace
