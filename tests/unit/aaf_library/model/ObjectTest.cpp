// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class Objects : public ModelFixture {
protected:
    // An optional property of a number on every mob.
    void SetUp() override {
        ASSERT_EQ(Class(AUID_AAFMob)
                      ->RegisterOptionalPropertyDef(kOwnId, L"Own", Type(kAAFTypeID_Int32).get(),
                                                    nullptr),
                  AAFRESULT_SUCCESS);
        own = PropertyOf(AUID_AAFMob, kOwnId);
        mob = New(AUID_AAFMasterMob);
    }
    Ptr<IAAFPropertyValue> Get() { return Out(mob, &IAAFObject::GetPropertyValue, own.get()); }

    // Two properties on the mob: `own`, and then one more.
    void SetTwoProperties() {
        constexpr aafUID_t kSecondId = ncfGuid("5B0E7D53-3C41-4E0B-8E2C-91B0B0F4D7A2");
        ASSERT_EQ(Class(AUID_AAFMob)
                      ->RegisterOptionalPropertyDef(kSecondId, L"Second",
                                                    Type(kAAFTypeID_Int32).get(), nullptr),
                  AAFRESULT_SUCCESS);
        const auto second = PropertyOf(AUID_AAFMob, kSecondId);
        ASSERT_EQ(mob->SetPropertyValue(own.get(), Int32Value(4).get()), AAFRESULT_SUCCESS);
        ASSERT_EQ(mob->SetPropertyValue(second.get(), Int32Value(5).get()), AAFRESULT_SUCCESS);
    }

    Ptr<IAAFPropertyDef> own;
    Ptr<IAAFObject> mob;
};

TEST_F(Objects, ValueThatIsSetIsTheVeryOneGivenBack) {
    const auto value = Int32Value(4);
    ASSERT_EQ(mob->SetPropertyValue(own.get(), value.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(Get().get(), value.get());
    EXPECT_EQ(CountOf(value), 2u);
    aafInt32 number = 5;
    ASSERT_EQ(TypeAs<IAAFTypeDefInt>(kAAFTypeID_Int32)
                  ->SetInteger(value.get(), reinterpret_cast<aafMemPtr_t>(&number), 4),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(NumberOf(Get()), 5);
}

TEST_F(Objects, ReplacedValueIsReleased) {
    const auto first = Int32Value(1);
    ASSERT_EQ(mob->SetPropertyValue(own.get(), first.get()), AAFRESULT_SUCCESS);
    ASSERT_EQ(mob->SetPropertyValue(own.get(), first.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(CountOf(first), 2u);
    ASSERT_EQ(mob->SetPropertyValue(own.get(), Int32Value(2).get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(CountOf(first), 1u);
    EXPECT_EQ(NumberOf(Get()), 2);
    EXPECT_EQ(NumberOf(first), 1);
}

TEST_F(Objects, OneValueOnTwoObjectsBecomesACopyOnTheSecond) {
    const auto value = Int32Value(7);
    const auto other = New(AUID_AAFMasterMob);
    ASSERT_EQ(mob->SetPropertyValue(own.get(), value.get()), AAFRESULT_SUCCESS);
    ASSERT_EQ(other->SetPropertyValue(own.get(), value.get()), AAFRESULT_SUCCESS);
    const auto copy = Out(other, &IAAFObject::GetPropertyValue, own.get());
    EXPECT_NE(copy.get(), value.get());
    EXPECT_EQ(NumberOf(copy), 7);
}

TEST_F(Objects, PropertyThatIsKeptStaysWhatItIsWhenTheNextIsGiven) {
    SetTwoProperties();
    const auto list = Out(mob, &IAAFObject::GetProperties);
    const auto first = Out(list, &IEnumAAFProperties::NextOne);
    const auto second = Out(list, &IEnumAAFProperties::NextOne);
    EXPECT_NE(first.get(), second.get());
    EXPECT_EQ(NumberOf(Out(first, &IAAFProperty::GetValue)) +
                  NumberOf(Out(second, &IAAFProperty::GetValue)),
              4 + 5);
    EXPECT_NE(Out(first, &IAAFProperty::GetDefinition).get(),
              Out(second, &IAAFProperty::GetDefinition).get());
}

TEST_F(Objects, PropertyThatIsGivenBackMakesPlaceForTheNext) {
    SetTwoProperties();
    const auto list = Out(mob, &IAAFObject::GetProperties);
    const auto first =
        NumberOf(Out(Out(list, &IEnumAAFProperties::NextOne), &IAAFProperty::GetValue));
    const auto second =
        NumberOf(Out(Out(list, &IEnumAAFProperties::NextOne), &IAAFProperty::GetValue));
    EXPECT_NE(first, second);
    EXPECT_EQ(first + second, 4 + 5);
}

TEST_F(Objects, ClonedListOfPropertiesGoesOnFromTheSamePlaceOnItsOwn) {
    SetTwoProperties();
    const auto list = Out(mob, &IAAFObject::GetProperties);
    const auto first = Out(list, &IEnumAAFProperties::NextOne);
    const auto number = NumberOf(Out(first, &IAAFProperty::GetValue));
    const auto clone = Out(list, &IEnumAAFProperties::Clone);
    const auto second = Out(list, &IEnumAAFProperties::NextOne);
    const auto again = Out(clone, &IEnumAAFProperties::NextOne);
    EXPECT_NE(second.get(), again.get());
    EXPECT_EQ(NumberOf(Out(second, &IAAFProperty::GetValue)), 4 + 5 - number);
    EXPECT_EQ(NumberOf(Out(again, &IAAFProperty::GetValue)), 4 + 5 - number);
    EXPECT_EQ(NumberOf(Out(first, &IAAFProperty::GetValue)), number);
}

TEST_F(Objects, PropertyOfAnotherClassIsRefused) {
    const auto filler = New(AUID_AAFFiller);
    IAAFPropertyValue* out = nullptr;
    aafBoolean_t present = kAAFFalse;
    EXPECT_EQ(filler->SetPropertyValue(own.get(), Int32Value(1).get()), AAFRESULT_BAD_PROP);
    EXPECT_EQ(filler->GetPropertyValue(own.get(), &out), AAFRESULT_BAD_PROP);
    EXPECT_EQ(filler->IsPropertyPresent(own.get(), &present), AAFRESULT_BAD_PROP);
    EXPECT_EQ(filler->RemoveOptionalProperty(own.get()), AAFRESULT_BAD_PROP);
}

TEST_F(Objects, AbsentPropertyIsReportedAsSuch) {
    IAAFPropertyValue* out = nullptr;
    aafBoolean_t present = kAAFTrue;
    EXPECT_EQ(mob->GetPropertyValue(own.get(), &out), AAFRESULT_PROP_NOT_PRESENT);
    EXPECT_EQ(mob->IsPropertyPresent(own.get(), &present), AAFRESULT_SUCCESS);
    EXPECT_EQ(present, kAAFFalse);
    EXPECT_EQ(mob->RemoveOptionalProperty(own.get()), AAFRESULT_PROP_NOT_PRESENT);
}

TEST_F(Objects, RemovalWorksAlsoForRequiredProperties) {
    aaf::Object* object = aaf::ImplementationAs<aaf::Object>(mob.get());
    object->PutStruct(aaf::prop::Mob_MobID, aafMobID_t{});
    const auto required = PropertyOf(AUID_AAFMob, aaf::prop::Mob_MobID.id);
    EXPECT_EQ(mob->RemoveOptionalProperty(required.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(mob->RemoveOptionalProperty(required.get()), AAFRESULT_PROP_NOT_PRESENT);
}

TEST_F(Objects, TypeOfTheValueIsNotCompared) {
    const auto name = PropertyOf(AUID_AAFMob, aaf::prop::Mob_Name.id);
    EXPECT_EQ(mob->SetPropertyValue(name.get(), Int32Value(1).get()), AAFRESULT_SUCCESS);
}

TEST_F(Objects, ValueAndPropertyOfAnotherFileAreRefused) {
    const aaf::RefPtr<aaf::Model> other = aaf::Model::Create(Registry());
    const aaf::RefPtr<aaf::PropertyValue> value =
        other->NewValue(*other->FindType(kAAFTypeID_Int32));
    EXPECT_EQ(mob->SetPropertyValue(own.get(), value.get()), AAFRESULT_INVALID_OBJ);
    const aaf::RefPtr<aaf::Object> stranger = other->NewObject<aaf::Object>(AUID_AAFMasterMob);
    EXPECT_EQ(stranger->SetPropertyValue(own.get(), Int32Value(1).get()), AAFRESULT_BAD_PROP);
}

TEST_F(Objects, TypedSettersAndValuesAreTwoViewsOfOneProperty) {
    aaf::Object* object = aaf::ImplementationAs<aaf::Object>(mob.get());
    const auto name = PropertyOf(AUID_AAFMob, aaf::prop::Mob_Name.id);
    ASSERT_EQ(object->PutString(aaf::prop::Mob_Name, L"abc"), AAFRESULT_SUCCESS);
    aafBoolean_t present = kAAFFalse;
    EXPECT_EQ(mob->IsPropertyPresent(name.get(), &present), AAFRESULT_SUCCESS);
    EXPECT_EQ(present, kAAFTrue);
    const auto value = Out(mob, &IAAFObject::GetPropertyValue, name.get());
    aafUInt32 count = 0;
    EXPECT_EQ(TypeAs<IAAFTypeDefString>(kAAFTypeID_String)->GetCount(value.get(), &count),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 4u);
    ASSERT_EQ(object->PutString(aaf::prop::Mob_Name, L"longer"), AAFRESULT_SUCCESS);
    TypeAs<IAAFTypeDefString>(kAAFTypeID_String)->GetCount(value.get(), &count);
    EXPECT_EQ(count, 7u);
}

TEST_F(Objects, PropertiesAreEnumeratedWithTheirValues) {
    ASSERT_EQ(mob->SetPropertyValue(own.get(), Int32Value(9).get()), AAFRESULT_SUCCESS);
    aafUInt32 count = 0;
    ASSERT_EQ(mob->CountProperties(&count), AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 1u);
    const auto list = Out(mob, &IAAFObject::GetProperties);
    const auto property = Out(list, &IEnumAAFProperties::NextOne);
    EXPECT_EQ(Out(property, &IAAFProperty::GetDefinition).get(), own.get());
    EXPECT_EQ(NumberOf(Out(property, &IAAFProperty::GetValue)), 9);
    EXPECT_EQ(property->GetValue(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(property->GetDefinition(nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(Objects, OptionalValueIsMadeOnce) {
    IAAFPropertyValue* out = nullptr;
    ASSERT_EQ(mob->CreateOptionalPropertyValue(own.get(), &out), AAFRESULT_SUCCESS);
    EXPECT_EQ(Get().get(), out);
    EXPECT_EQ(NumberOf(Ptr<IAAFPropertyValue>::Adopt(out)), 0);
    EXPECT_EQ(mob->CreateOptionalPropertyValue(own.get(), &out), AAFRESULT_PROP_ALREADY_PRESENT);
}

TEST_F(Objects, GenerationIsNotTrackedByDefault) {
    IAAFIdentification* generation = nullptr;
    aafBoolean_t tracked = kAAFTrue;
    EXPECT_EQ(mob->GetGeneration(&generation), AAFRESULT_INVALID_PARAM);
    EXPECT_EQ(mob->IsGenerationTracked(&tracked), AAFRESULT_SUCCESS);
    EXPECT_EQ(tracked, kAAFFalse);
    EXPECT_EQ(mob->EnableGenerationTracking(), AAFRESULT_SUCCESS);
    EXPECT_EQ(mob->IsGenerationTracked(&tracked), AAFRESULT_SUCCESS);
    EXPECT_EQ(tracked, kAAFTrue);
}

TEST_F(Objects, NullArgumentsAreRefused) {
    IAAFPropertyValue* value = nullptr;
    aafBoolean_t flag = kAAFFalse;
    EXPECT_EQ(mob->SetPropertyValue(nullptr, Int32Value(1).get()), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->SetPropertyValue(own.get(), nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetPropertyValue(nullptr, &value), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetPropertyValue(own.get(), nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->IsPropertyPresent(nullptr, &flag), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->IsPropertyPresent(own.get(), nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->RemoveOptionalProperty(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->CreateOptionalPropertyValue(own.get(), nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetDefinition(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetDictionary(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetProperties(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->CountProperties(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetGeneration(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->GetGenerationAUID(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(mob->IsGenerationTracked(nullptr), AAFRESULT_NULL_PARAM);
}

}  // namespace
