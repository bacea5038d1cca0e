// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/aaf/AAFDefinitions.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "tests/unit/aaf_library/model/ModelFixture.h"

namespace {

class ArrayTypes : public ModelFixture {
protected:
    Ptr<IAAFTypeDefVariableArray> numbers = TypeAs<IAAFTypeDefVariableArray>(kAAFTypeID_Int32Array);
    Ptr<IAAFTypeDefVariableArray> tagged =
        TypeAs<IAAFTypeDefVariableArray>(kAAFTypeID_TaggedValueStrongReferenceVector);
    Ptr<IAAFTypeDefObjectRef> reference =
        TypeAs<IAAFTypeDefObjectRef>(kAAFTypeID_TaggedValueStrongReference);

    Ptr<IAAFPropertyValue> Empty(const Ptr<IAAFTypeDefVariableArray>& type) {
        return Out(type, &IAAFTypeDefVariableArray::CreateEmptyValue);
    }
    Ptr<IAAFPropertyValue> Reference(const Ptr<IAAFObject>& object) {
        return Out(reference, &IAAFTypeDefObjectRef::CreateValue, object.get());
    }
    aafUInt32 Count(const Ptr<IAAFTypeDefVariableArray>& type,
                    const Ptr<IAAFPropertyValue>& value) {
        aafUInt32 count = 99;
        EXPECT_EQ(type->GetCount(value.get(), &count), AAFRESULT_SUCCESS);
        return count;
    }
};

TEST_F(ArrayTypes, NumbersAreAppendedReplacedAndRemoved) {
    const auto value = Empty(numbers);
    const auto more = As<IAAFTypeDefVariableArrayEx>(numbers);
    ASSERT_EQ(numbers->AppendElement(value.get(), Int32Value(2).get()), AAFRESULT_SUCCESS);
    ASSERT_EQ(more->PrependElement(value.get(), Int32Value(1).get()), AAFRESULT_SUCCESS);
    ASSERT_EQ(more->InsertElement(value.get(), 2, Int32Value(3).get()), AAFRESULT_SUCCESS);
    ASSERT_EQ(numbers->SetElementValue(value.get(), 1, Int32Value(20).get()), AAFRESULT_SUCCESS);
    aafInt32 all[3] = {};
    ASSERT_EQ(numbers->GetCArray(value.get(), reinterpret_cast<aafMemPtr_t>(all), sizeof all),
              AAFRESULT_SUCCESS);
    EXPECT_EQ(all[0], 1);
    EXPECT_EQ(all[1], 20);
    EXPECT_EQ(all[2], 3);
    ASSERT_EQ(more->RemoveElement(value.get(), 0), AAFRESULT_SUCCESS);
    EXPECT_EQ(Count(numbers, value), 2u);
    EXPECT_EQ(more->RemoveElement(value.get(), 2), AAFRESULT_BADINDEX);
    EXPECT_EQ(more->InsertElement(value.get(), 3, Int32Value(0).get()), AAFRESULT_BADINDEX);
    EXPECT_EQ(numbers->SetElementValue(value.get(), 2, Int32Value(0).get()), AAFRESULT_BADINDEX);
}

TEST_F(ArrayTypes, ElementsOfAnotherKindAreRefused) {
    const auto value = Empty(numbers);
    EXPECT_EQ(numbers->AppendElement(value.get(), value.get()), AAFRESULT_BAD_TYPE);
    EXPECT_EQ(numbers->AppendElement(value.get(), Reference(New(AUID_AAFTaggedValue)).get()),
              AAFRESULT_BAD_TYPE);
    EXPECT_EQ(tagged->AppendElement(Empty(tagged).get(), Int32Value(1).get()), AAFRESULT_BAD_TYPE);
}

// Before anything is asked of the other.
TEST_F(ArrayTypes, ListAndElementAreBothNeeded) {
    const auto list = Empty(numbers);
    const auto element = Int32Value(1);
    EXPECT_EQ(numbers->AppendElement(nullptr, element.get()), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->AppendElement(list.get(), nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->AppendElement(nullptr, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->AppendElement(element.get(), nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->SetElementValue(element.get(), 0, nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(Count(numbers, list), 0u);
}

TEST_F(ArrayTypes, WholeArraysHaveToBeMultiplesOfTheElement) {
    aafInt32 three[3] = {1, 2, 3};
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(numbers->CreateValueFromCArray(reinterpret_cast<aafMemPtr_t>(three), 7, &out),
              AAFRESULT_BAD_SIZE);
    ASSERT_EQ(numbers->CreateValueFromCArray(reinterpret_cast<aafMemPtr_t>(three), 12, &out),
              AAFRESULT_SUCCESS);
    const auto value = Ptr<IAAFPropertyValue>::Adopt(out);
    EXPECT_EQ(Count(numbers, value), 3u);
    EXPECT_EQ(numbers->SetCArray(value.get(), reinterpret_cast<aafMemPtr_t>(three), 5),
              AAFRESULT_BAD_SIZE);
    EXPECT_EQ(Count(numbers, value), 3u);
    EXPECT_EQ(numbers->GetCArray(value.get(), reinterpret_cast<aafMemPtr_t>(three), 8),
              AAFRESULT_BAD_SIZE);
    EXPECT_EQ(tagged->CreateValueFromCArray(reinterpret_cast<aafMemPtr_t>(three), 12, &out),
              AAFRESULT_BAD_TYPE);
}

TEST_F(ArrayTypes, ArrayThatStandsInAnObjectIsFilledAfterwards) {
    ASSERT_EQ(
        Class(AUID_AAFMob)
            ->RegisterOptionalPropertyDef(
                kOwnId, L"Own", Type(kAAFTypeID_TaggedValueStrongReferenceVector).get(), nullptr),
        AAFRESULT_SUCCESS);
    const auto property = PropertyOf(AUID_AAFMob, kOwnId);
    const auto mob = New(AUID_AAFMasterMob);
    const auto array = Empty(tagged);
    ASSERT_EQ(mob->SetPropertyValue(property.get(), array.get()), AAFRESULT_SUCCESS);
    const auto element = New(AUID_AAFTaggedValue);
    ASSERT_EQ(tagged->AppendElement(array.get(), Reference(element).get()), AAFRESULT_SUCCESS);
    const auto stored = Out(mob, &IAAFObject::GetPropertyValue, property.get());
    EXPECT_EQ(Count(tagged, stored), 1u);
    EXPECT_EQ(CountOf(element), 2u);
    EXPECT_EQ(aaf::ImplementationAs<aaf::Object>(element.get())->owner(),
              aaf::ImplementationAs<aaf::Object>(mob.get()));
    // The very object comes back.
    const auto first = Out(tagged, &IAAFTypeDefVariableArray::GetElementValue, stored.get(), 0);
    IUnknown* object = nullptr;
    ASSERT_EQ(reference->GetObject(first.get(), IID_IAAFObject, &object), AAFRESULT_SUCCESS);
    EXPECT_EQ(static_cast<void*>(object), static_cast<void*>(element.get()));
    object->Release();
    ASSERT_EQ(mob->RemoveOptionalProperty(property.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(aaf::ImplementationAs<aaf::Object>(element.get())->owner(), nullptr);
}

TEST_F(ArrayTypes, SameObjectTwiceIsRefused) {
    const auto array = Empty(tagged);
    const auto element = New(AUID_AAFTaggedValue);
    ASSERT_EQ(tagged->AppendElement(array.get(), Reference(element).get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(tagged->AppendElement(array.get(), Reference(element).get()),
              AAFRESULT_OBJECT_ALREADY_ATTACHED);
    EXPECT_EQ(Count(tagged, array), 1u);
}

TEST_F(ArrayTypes, ListOfOwnedObjectsCannotBeSetOnASecondObject) {
    const auto property = PropertyOf(AUID_AAFMob, aaf::prop::Mob_UserComments.id);
    const auto one = New(AUID_AAFMasterMob);
    const auto two = New(AUID_AAFMasterMob);
    const auto array = Empty(tagged);
    ASSERT_EQ(tagged->AppendElement(array.get(), Reference(New(AUID_AAFTaggedValue)).get()),
              AAFRESULT_SUCCESS);
    ASSERT_EQ(one->SetPropertyValue(property.get(), array.get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(two->SetPropertyValue(property.get(), array.get()),
              AAFRESULT_OBJECT_ALREADY_ATTACHED);
}

TEST_F(ArrayTypes, ElementsAreEnumeratedLive) {
    const auto value = Empty(numbers);
    const auto list = Out(numbers, &IAAFTypeDefVariableArray::GetElements, value.get());
    ASSERT_EQ(numbers->AppendElement(value.get(), Int32Value(4).get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(NumberOf(Out(list, &IEnumAAFPropertyValues::NextOne)), 4);
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(list->NextOne(&out), AAFRESULT_NO_MORE_OBJECTS);
}

TEST_F(ArrayTypes, FixedArraysKeepTheirCount) {
    const auto type = TypeAs<IAAFTypeDefFixedArray>(kAAFTypeID_UInt8Array8);
    aafUInt8 bytes[9] = {1, 2, 3, 4, 5, 6, 7, 8, 9};
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(type->CreateValueFromCArray(bytes, 9, &out), AAFRESULT_BAD_SIZE);
    ASSERT_EQ(type->CreateValueFromCArray(bytes, 8, &out), AAFRESULT_SUCCESS);
    const auto value = Ptr<IAAFPropertyValue>::Adopt(out);
    const auto element = Out(type, &IAAFTypeDefFixedArray::GetElementValue, value.get(), 7);
    ASSERT_EQ(type->SetElementValue(value.get(), 0, element.get()), AAFRESULT_SUCCESS);
    aafUInt8 read[8] = {};
    ASSERT_EQ(type->GetCArray(value.get(), read, 8), AAFRESULT_SUCCESS);
    EXPECT_EQ(read[0], 8);
    EXPECT_EQ(read[1], 2);
    EXPECT_EQ(type->GetElementValue(value.get(), 8, &out), AAFRESULT_BADINDEX);
    EXPECT_EQ(Get(type, &IAAFTypeDefFixedArray::GetCount), 8u);
}

TEST_F(ArrayTypes, SetsHoldEachElementOnce) {
    const auto type = TypeAs<IAAFTypeDefSet>(kAAFTypeID_UInt32Set);
    const aaf::RefPtr<aaf::PropertyValue> set =
        model->NewValue(*model->FindType(kAAFTypeID_UInt32Set));
    ASSERT_EQ(type->AddElement(set.get(), Int32Value(5).get()), AAFRESULT_SUCCESS);
    EXPECT_EQ(type->AddElement(set.get(), Int32Value(5).get()), AAFRESULT_INVALID_PARAM);
    aafBoolean_t contains = kAAFFalse;
    EXPECT_EQ(type->ContainsElement(set.get(), Int32Value(5).get(), &contains), AAFRESULT_SUCCESS);
    EXPECT_EQ(contains, kAAFTrue);
    EXPECT_EQ(type->RemoveElement(set.get(), Int32Value(6).get()), AAFRESULT_OBJECT_NOT_FOUND);
    EXPECT_EQ(type->RemoveElement(set.get(), Int32Value(5).get()), AAFRESULT_SUCCESS);
    aafUInt32 count = 9;
    EXPECT_EQ(type->GetCount(set.get(), &count), AAFRESULT_SUCCESS);
    EXPECT_EQ(count, 0u);
    EXPECT_EQ(type->AddElement(nullptr, nullptr), AAFRESULT_NULL_PARAM);
}

TEST_F(ArrayTypes, SetsOfObjectsAreFoundByKey) {
    const auto type = TypeAs<IAAFTypeDefSet>(kAAFTypeID_DataDefinitionStrongReferenceSet);
    aaf::PropertyValue* set = model->dictionary().FindValue(aaf::prop::Dictionary_DataDefinitions);
    aafUID_t id = kAAFDataDef_Sound;
    const auto key =
        Out(type, &IAAFTypeDefSet::CreateKey, reinterpret_cast<aafDataBuffer_t>(&id), sizeof id);
    aafBoolean_t contains = kAAFFalse;
    EXPECT_EQ(type->ContainsKey(set, key.get(), &contains), AAFRESULT_SUCCESS);
    EXPECT_EQ(contains, kAAFTrue);
    const auto found = Out(type, &IAAFTypeDefSet::LookupElement, set, key.get());
    IUnknown* object = nullptr;
    ASSERT_EQ(TypeAs<IAAFTypeDefObjectRef>(kAAFTypeID_DataDefinitionStrongReference)
                  ->GetObject(found.get(), IID_IAAFDataDef, &object),
              AAFRESULT_SUCCESS);
    object->Release();
    id = kOwnId;
    IAAFPropertyValue* out = nullptr;
    EXPECT_EQ(type->CreateKey(reinterpret_cast<aafDataBuffer_t>(&id), 5, &out), AAFRESULT_BAD_SIZE);
}

TEST_F(ArrayTypes, NullArgumentsAreRefused) {
    IAAFPropertyValue* out = nullptr;
    aafUInt32 count = 0;
    EXPECT_EQ(numbers->CreateEmptyValue(nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->AppendElement(nullptr, Int32Value(1).get()), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->AppendElement(Empty(numbers).get(), nullptr), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->GetCount(nullptr, &count), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->GetElementValue(nullptr, 0, &out), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->CreateValueFromValues(nullptr, 1, &out), AAFRESULT_NULL_PARAM);
    IAAFPropertyValue* nothing[] = {nullptr};
    EXPECT_EQ(numbers->CreateValueFromValues(nothing, 1, &out), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->CreateValueFromCArray(nullptr, 4, &out), AAFRESULT_NULL_PARAM);
    EXPECT_EQ(numbers->GetElements(Empty(numbers).get(), nullptr), AAFRESULT_NULL_PARAM);
}

}  // namespace
