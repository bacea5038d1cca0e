// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class DataDefinitions : public ModelFixture {
protected:
    Ptr<IAAFDataDef3> Find(const aafUID_t& id) {
        return As<IAAFDataDef3>(Out(dictionary, &IAAFDictionary::LookupDataDef, id));
    }
    bool Converts(const aafUID_t& from, const aafUID_t& to) {
        aafBoolean_t result = -1;
        EXPECT_EQ(Find(from)->DoesDataDefConvertTo(As<IAAFDataDef>(Find(to)).get(), &result),
                  AAFRESULT_SUCCESS);
        return result == kAAFTrue;
    }
};

TEST_F(DataDefinitions, LegacyAndNewerIdAreOneKind) {
    aafBoolean_t is = kAAFFalse;
    for (const aafUID_t& id : {kAAFDataDef_Picture, kAAFDataDef_LegacyPicture}) {
        EXPECT_EQ(Find(id)->IsPictureKind(&is), AAFRESULT_SUCCESS);
        EXPECT_EQ(is, kAAFTrue);
        EXPECT_EQ(Find(id)->IsSoundKind(&is), AAFRESULT_SUCCESS);
        EXPECT_EQ(is, kAAFFalse);
    }
    for (const aafUID_t& id : {kAAFDataDef_Timecode, kAAFDataDef_LegacyTimecode}) {
        EXPECT_EQ(Find(id)->IsTimecodeKind(&is), AAFRESULT_SUCCESS);
        EXPECT_EQ(is, kAAFTrue);
    }
    EXPECT_EQ(Find(kAAFDataDef_Sound)->IsSoundKind(nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(DataDefinitions, KindsConvertIntoEachOtherAndMatteIntoPictureOneWay) {
    EXPECT_TRUE(Converts(kAAFDataDef_LegacySound, kAAFDataDef_Sound));
    EXPECT_TRUE(Converts(kAAFDataDef_Sound, kAAFDataDef_LegacySound));
    EXPECT_FALSE(Converts(kAAFDataDef_Sound, kAAFDataDef_Picture));
    EXPECT_TRUE(Converts(kAAFDataDef_PictureWithMatte, kAAFDataDef_Picture));
    EXPECT_TRUE(Converts(kAAFDataDef_PictureWithMatte, kAAFDataDef_LegacyPicture));
    EXPECT_FALSE(Converts(kAAFDataDef_Picture, kAAFDataDef_PictureWithMatte));
}

TEST_F(DataDefinitions, WithoutADescriptionHaveOneOfNoLength) {
    const auto made = New(AUID_AAFParameterDefinition);
    const auto definition = As<IAAFDefObject>(made);
    aafUInt32 size = 9;
    wchar_t text[4] = {};
    EXPECT_EQ(definition->GetDescriptionBufLen(&size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, 0u);
    EXPECT_EQ(definition->GetDescription(text, sizeof text), AAFRESULT_PROP_NOT_PRESENT);
    EXPECT_EQ(definition->GetDescriptionBufLen(nullptr), AAFRESULT_NULL_PARAM);
    ASSERT_EQ(definition->SetDescription(L""), AAFRESULT_SUCCESS);
    EXPECT_EQ(definition->GetDescriptionBufLen(&size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, sizeof(wchar_t));

    const auto meta = As<IAAFMetaDefinition>(Class(AUID_AAFFiller));
    size = 9;
    EXPECT_EQ(meta->GetDescriptionBufLen(&size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, 0u);
    EXPECT_EQ(meta->GetDescription(text, sizeof text), AAFRESULT_PROP_NOT_PRESENT);
    ASSERT_EQ(meta->SetDescription(L"no"), AAFRESULT_SUCCESS);
    EXPECT_EQ(meta->GetDescriptionBufLen(&size), AAFRESULT_SUCCESS);
    EXPECT_EQ(size, 3 * sizeof(wchar_t));
}

TEST_F(DataDefinitions, IsDataDefOfAsksForTheSameId) {
    aafBoolean_t result = kAAFTrue;
    const auto legacy = As<IAAFDataDef>(Find(kAAFDataDef_LegacySound));
    EXPECT_EQ(Find(kAAFDataDef_Sound)->IsDataDefOf(legacy.get(), &result), AAFRESULT_SUCCESS);
    EXPECT_EQ(result, kAAFFalse);
    EXPECT_EQ(Find(kAAFDataDef_LegacySound)->IsDataDefOf(legacy.get(), &result), AAFRESULT_SUCCESS);
    EXPECT_EQ(result, kAAFTrue);
}

}  // namespace
