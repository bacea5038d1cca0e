// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <map>
#include <set>

#include "aaf_library/model/Text.h"
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

using BuiltInModel = ModelFixture;

TEST_F(BuiltInModel, TablesHaveAllClassesPropertiesAndTypes) {
    std::size_t properties = 0;
    for (const aaf::BuiltInClass& entry : aaf::BuiltInClasses()) {
        properties += entry.properties.size();
    }
    EXPECT_EQ(aaf::BuiltInClasses().size(), 102u);
    EXPECT_EQ(properties, 321u);
    EXPECT_EQ(aaf::BuiltInTypes().size(), 154u);
}

TEST_F(BuiltInModel, TablesAreClosed) {
    for (const aaf::BuiltInClass& entry : aaf::BuiltInClasses()) {
        EXPECT_NE(aaf::FindBuiltInClass(entry.parent), nullptr) << entry.name;
        for (const aaf::BuiltInProperty& property : entry.properties) {
            EXPECT_NE(aaf::FindBuiltInType(property.type), nullptr)
                << entry.name << "." << property.name;
        }
    }
}

TEST_F(BuiltInModel, NumbersOfPropertiesAreUniqueAlongEachChain) {
    std::map<aaf::PropertyId, const char*> numbers;
    for (const aaf::BuiltInClass& entry : aaf::BuiltInClasses()) {
        for (const aaf::BuiltInProperty& property : entry.properties) {
            if (property.key.pid != aaf::kNoPropertyId) {
                EXPECT_TRUE(numbers.emplace(property.key.pid, property.name).second)
                    << property.name;
                EXPECT_LT(property.key.pid, 0x8000);
            }
        }
    }
}

TEST_F(BuiltInModel, EveryClassComesIntoBeingAsItsRowTells) {
    for (const aaf::BuiltInClass& entry : aaf::BuiltInClasses()) {
        const auto definition = Class(entry.id);
        aafBoolean_t flag = -1;
        EXPECT_EQ(definition->IsConcrete(&flag), AAFRESULT_SUCCESS);
        EXPECT_EQ(flag == kAAFTrue, entry.concrete) << entry.name;
        aafUInt32 count = 0;
        EXPECT_EQ(definition->CountPropertyDefs(&count), AAFRESULT_SUCCESS);
        EXPECT_EQ(count, entry.properties.size()) << entry.name;
        IAAFClassDef* parent = nullptr;
        if (entry.parent == entry.id) {
            EXPECT_EQ(definition->GetParent(&parent), AAFRESULT_IS_ROOT_CLASS) << entry.name;
        } else {
            ASSERT_EQ(definition->GetParent(&parent), AAFRESULT_SUCCESS) << entry.name;
            EXPECT_EQ(parent, Class(entry.parent).get()) << entry.name;
            parent->Release();
        }
        wchar_t name[64] = {};
        EXPECT_EQ(definition->GetName(name, sizeof name), AAFRESULT_SUCCESS);
        EXPECT_EQ(std::wstring(name), aaf::Widen(entry.name));
    }
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountClassDefs), 102u);
}

TEST_F(BuiltInModel, EveryTypeComesIntoBeingAsItsRowTells) {
    for (const aaf::BuiltInType& entry : aaf::BuiltInTypes()) {
        const auto type = Type(entry.id);
        const auto meta = As<IAAFMetaDefinition>(type);
        wchar_t name[80] = {};
        EXPECT_EQ(meta->GetName(name, sizeof name), AAFRESULT_SUCCESS);
        EXPECT_EQ(std::wstring(name), aaf::Widen(entry.name));
        aafUID_t id{};
        EXPECT_EQ(meta->GetAUID(&id), AAFRESULT_SUCCESS);
        EXPECT_TRUE(id == entry.id) << entry.symbol;
    }
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountTypeDefs), 154u);
}

TEST_F(BuiltInModel, CategoriesOfTypesAreThePublishedNumbers) {
    const std::pair<aafUID_t, eAAFTypeCategory_t> expected[] = {
        {kAAFTypeID_Int32, 1},
        {kAAFTypeID_Character, 2},
        {kAAFTypeID_TaggedValueStrongReference, 3},
        {kAAFTypeID_DataDefinitionWeakReference, 4},
        {kAAFTypeID_LengthType, 5},
        {kAAFTypeID_Boolean, 6},
        {kAAFTypeID_RGBALayout, 7},
        {kAAFTypeID_Int32Array, 8},
        {kAAFTypeID_AUIDSet, 9},
        {kAAFTypeID_Rational, 10},
        {kAAFTypeID_Stream, 11},
        {kAAFTypeID_String, 12},
        {kAAFTypeID_UsageType, 13},
        {kAAFTypeID_Indirect, 14},
        {kAAFTypeID_Opaque, 15},
    };
    for (const auto& entry : expected) {
        eAAFTypeCategory_t category = 0;
        EXPECT_EQ(Type(entry.first)->GetTypeCategory(&category), AAFRESULT_SUCCESS);
        EXPECT_EQ(category, entry.second);
    }
}

TEST_F(BuiltInModel, RecordsHaveTheLayoutOfTheirStructures) {
    const auto sizes = [&](const aafUID_t& id) {
        const aaf::TypeDefinition* type = model->FindType(id);
        return std::make_pair(type->NativeSize(), type->StoredSize());
    };
    EXPECT_EQ(sizes(kAAFTypeID_AUID), std::make_pair(sizeof(aafUID_t), std::size_t{16}));
    EXPECT_EQ(sizes(kAAFTypeID_MobIDType), std::make_pair(sizeof(aafMobID_t), std::size_t{32}));
    EXPECT_EQ(sizes(kAAFTypeID_Rational), std::make_pair(sizeof(aafRational_t), std::size_t{8}));
    EXPECT_EQ(sizes(kAAFTypeID_ProductVersion),
              std::make_pair(sizeof(aafProductVersion_t), std::size_t{9}));
    EXPECT_EQ(sizes(kAAFTypeID_VersionType),
              std::make_pair(sizeof(aafVersionType_t), std::size_t{2}));
    EXPECT_EQ(sizes(kAAFTypeID_RGBAComponent),
              std::make_pair(sizeof(aafRGBAComponent_t), std::size_t{2}));
    EXPECT_EQ(sizes(kAAFTypeID_TimeStamp), std::make_pair(sizeof(aafTimeStamp_t), std::size_t{8}));
    EXPECT_EQ(sizes(kAAFTypeID_RGBALayout),
              std::make_pair(8 * sizeof(aafRGBAComponent_t), std::size_t{16}));
}

TEST_F(BuiltInModel, NewDictionaryListsWhatIsUsedFromTheStart) {
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountClassDefs), 37u);
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountTypeDefs), 72u);
    Class(AUID_AAFMasterMob);
    EXPECT_EQ(Get(dictionary, &IAAFDictionary::CountClassDefs), 38u);
}

}  // namespace
