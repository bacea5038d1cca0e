// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/model/PropertyKeys.h"
#include "tests/unit/aaf_library/objects/SavedFile.h"

// Effects: their definitions in the dictionary, and their use in a composition.
namespace aaf_test {

namespace {

constexpr aafUID_t kBlend = ncfGuid("0C3BEA40-FC05-11D2-8A29-0050040EF7D2");
constexpr aafUID_t kCut = ncfGuid("0C3BEA41-FC05-11D2-8A29-0050040EF7D2");
constexpr aafUID_t kWipe = ncfGuid("0C3BEA42-FC05-11D2-8A29-0050040EF7D2");
constexpr aafUID_t kLevel = ncfGuid("E4962320-2267-11D3-8A4C-0050040EF7D2");
constexpr aafUID_t kSoftness = ncfGuid("01962320-2267-11D3-8A4C-0050040EF7D2");
constexpr aafUID_t kCategory = ncfGuid("0D010102-0101-0100-060E-2B3404010101");
constexpr aafUID_t kLinear = ncfGuid("5B6C85A4-0EDE-11D3-80A9-006008143E6F");
constexpr aafUID_t kNowhere = ncfGuid("11111111-0000-0000-0000-000000000001");

aafDataBuffer_t BytesOf(aafRational_t& value) {
    return reinterpret_cast<aafDataBuffer_t>(&value);
}

std::pair<aafInt32, aafInt32> NumbersOf(const aafRational_t& rational) {
    return {rational.numerator, rational.denominator};
}

template <class Enum, class Element>
std::vector<aafUID_t> IdsOf(Enum* all, HRESULT (Enum::*next)(Element**)) {
    std::vector<aafUID_t> ids;
    Ptr<Element> one;
    while ((all->*next)(one.Out()) == AAFRESULT_SUCCESS) {
        ids.push_back(Get(As<IAAFDefObject>(one), &IAAFDefObject::GetAUID));
    }
    return ids;
}

using UIDs = std::vector<aafUID_t>;

}  // namespace

class Effect : public SavedFile {
protected:
    Ptr<IAAFOperationDef> Operation(const aafUID_t& id, const wchar_t* name) {
        Ptr<IAAFOperationDef> made = Make<IAAFOperationDef>(AUID_AAFOperationDef);
        EXPECT_EQ(AAFRESULT_SUCCESS, made->Initialize(id, name, L"An effect"));
        return made;
    }
    Ptr<IAAFOperationDef> Registered(const aafUID_t& id, const wchar_t* name) {
        Ptr<IAAFOperationDef> made = Operation(id, name);
        EXPECT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterOperationDef(made));
        return made;
    }
    Ptr<IAAFParameterDef> ParameterOf(const aafUID_t& id,
                                      const aafUID_t& type = kAAFTypeID_Rational) {
        Ptr<IAAFParameterDef> made = Make<IAAFParameterDef>(AUID_AAFParameterDef);
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  made->Initialize(id, L"Level", L"How much",
                                   Get(dictionary_, &IAAFDictionary::LookupTypeDef, type)));
        return made;
    }
    Ptr<IAAFParameterDef> RegisteredParameter(const aafUID_t& id) {
        Ptr<IAAFParameterDef> made = ParameterOf(id);
        EXPECT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterParameterDef(made));
        return made;
    }
    Ptr<IAAFInterpolationDef> FreeLinear() {
        Ptr<IAAFInterpolationDef> made = Make<IAAFInterpolationDef>(AUID_AAFInterpolationDef);
        EXPECT_EQ(AAFRESULT_SUCCESS, made->Initialize(kLinear, L"Linear", L""));
        return made;
    }
    Ptr<IAAFInterpolationDef> Linear() {
        Ptr<IAAFInterpolationDef> made = FreeLinear();
        EXPECT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterInterpolationDef(made));
        return made;
    }
    Ptr<IAAFOperationGroup> Group(IAAFOperationDef* definition) {
        Ptr<IAAFOperationGroup> made = Make<IAAFOperationGroup>(AUID_AAFOperationGroup);
        EXPECT_EQ(AAFRESULT_SUCCESS,
                  made->Initialize(DataDef(kAAFDataDef_LegacyPicture), 10, definition));
        return made;
    }
};

TEST_F(Effect, DefinitionKeepsWhatItSays) {
    Ptr<IAAFOperationDef> blend = Registered(kBlend, L"Blend");
    Ptr<IAAFOperationDef> wipe = Registered(kWipe, L"Wipe");
    Ptr<IAAFOperationDef> cut = Registered(kCut, L"Cut");
    Ptr<IAAFParameterDef> level = RegisteredParameter(kLevel);
    Ptr<IAAFParameterDef> softness = RegisteredParameter(kSoftness);
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->SetDataDef(DataDef(kAAFDataDef_LegacyPicture)));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->SetIsTimeWarp(kAAFTrue));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->SetCategory(kCategory));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->SetNumberInputs(-2));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->SetBypass(1));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->AppendDegradeToOperation(cut));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->PrependDegradeToOperation(wipe));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->InsertDegradeToOperationAt(1, blend));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->AddParameterDef(level));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->AddParameterDef(softness));
    AddComposition(Group(blend));  // only definitions in use are saved

    Ptr<IAAFDictionary> read = Get(Reopen(), &IAAFHeader::GetDictionary);
    Ptr<IAAFOperationDef> found = Get(read, &IAAFDictionary::LookupOperationDef, kBlend);
    EXPECT_EQ(
        kAAFDataDef_LegacyPicture,
        Get(As<IAAFDefObject>(Get(found, &IAAFOperationDef::GetDataDef)), &IAAFDefObject::GetAUID));
    EXPECT_EQ(kAAFTrue, Get(found, &IAAFOperationDef::IsTimeWarp));
    EXPECT_EQ(kCategory, Get(found, &IAAFOperationDef::GetCategory));
    EXPECT_EQ(-2, Get(found, &IAAFOperationDef::GetNumberInputs));
    EXPECT_EQ(1u, Get(found, &IAAFOperationDef::GetBypass));
    EXPECT_EQ(3u, Get(found, &IAAFOperationDef::CountDegradeToOperations));
    EXPECT_EQ((UIDs{kWipe, kBlend, kCut}),
              IdsOf(Get(found, &IAAFOperationDef::GetDegradeToOperations).get(),
                    &IEnumAAFOperationDefs::NextOne));
    EXPECT_EQ(2u, Get(found, &IAAFOperationDef::CountParameterDefs));
    EXPECT_EQ(2u, IdsOf(Get(found, &IAAFOperationDef::GetParameterDefs).get(),
                        &IEnumAAFParameterDefs::NextOne)
                      .size());
    Ptr<IAAFParameterDef> parameter = Get(found, &IAAFOperationDef::LookupParameterDef, kLevel);
    EXPECT_EQ(kLevel, Get(As<IAAFDefObject>(parameter), &IAAFDefObject::GetAUID));
}

TEST_F(Effect, DefinitionChecksItsArguments) {
    Ptr<IAAFOperationDef> blend = Registered(kBlend, L"Blend");
    Ptr<IAAFOperationDef> free = Operation(kWipe, L"Wipe");
    aafBoolean_t warp = kAAFFalse;
    aafInt32 inputs = 0;
    aafUInt32 number = 0;
    aafUID_t id{};
    Ptr<IAAFDataDef> dataDef;
    Ptr<IAAFParameterDef> parameter;
    // Nothing is there at first.
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, blend->GetDataDef(dataDef.Out()));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, blend->IsTimeWarp(&warp));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, blend->GetCategory(&id));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, blend->GetNumberInputs(&inputs));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, blend->GetBypass(&number));
    EXPECT_EQ(0u, Get(blend, &IAAFOperationDef::CountDegradeToOperations));
    EXPECT_EQ(0u, Get(blend, &IAAFOperationDef::CountParameterDefs));
    EXPECT_EQ(UIDs{}, IdsOf(Get(blend, &IAAFOperationDef::GetParameterDefs).get(),
                            &IEnumAAFParameterDefs::NextOne));
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS, blend->LookupParameterDef(kLevel, parameter.Out()));

    EXPECT_EQ(AAFRESULT_INVALID_ENUM_VALUE, blend->SetIsTimeWarp(2));
    EXPECT_EQ(AAFRESULT_BADINDEX, blend->InsertDegradeToOperationAt(1, blend));
    EXPECT_EQ(AAFRESULT_BADINDEX, blend->RemoveDegradeToOperationAt(0));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, blend->AppendDegradeToOperation(free));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, blend->PrependDegradeToOperation(free));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, blend->AddParameterDef(ParameterOf(kLevel)));
    EXPECT_EQ(0u, Get(blend, &IAAFOperationDef::CountDegradeToOperations));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->AppendDegradeToOperation(blend));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->RemoveDegradeToOperationAt(0));
    EXPECT_EQ(0u, Get(blend, &IAAFOperationDef::CountDegradeToOperations));

    Ptr<IAAFParameterDef> level = RegisteredParameter(kLevel);
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->AddParameterDef(level));
    EXPECT_EQ(AAFRESULT_OBJECT_ALREADY_ATTACHED, blend->AddParameterDef(level));
    EXPECT_EQ(1u, Get(blend, &IAAFOperationDef::CountParameterDefs));

    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->GetDataDef(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->SetDataDef(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->IsTimeWarp(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->GetCategory(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->GetNumberInputs(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->GetBypass(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->AppendDegradeToOperation(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->PrependDegradeToOperation(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->InsertDegradeToOperationAt(0, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->GetDegradeToOperations(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->CountDegradeToOperations(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->AddParameterDef(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->GetParameterDefs(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->CountParameterDefs(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, blend->LookupParameterDef(kLevel, nullptr));
}

// In whatever order they come, a set of parameters is stored by id.
TEST_F(Effect, DefinitionOrdersItsParameters) {
    const UIDs ids = {kSoftness, kLevel};
    for (const UIDs& order : {UIDs{kSoftness, kLevel}, UIDs{kLevel, kSoftness}}) {
        Ptr<IAAFOperationDef> made = Operation(kBlend, L"Blend");
        for (const aafUID_t& id : order) {
            Ptr<IAAFParameterDef> parameter;
            if (dictionary_->LookupParameterDef(id, parameter.Out()) != AAFRESULT_SUCCESS) {
                parameter = RegisteredParameter(id);
            }
            EXPECT_EQ(AAFRESULT_SUCCESS, made->AddParameterDef(parameter));
        }
        EXPECT_EQ(ids, IdsOf(Get(made, &IAAFOperationDef::GetParameterDefs).get(),
                             &IEnumAAFParameterDefs::NextOne));
    }
}

// A caller who sets them as a value may have them in any order.
TEST_F(Effect, DefinitionHasEachParameterOnce) {
    Ptr<IAAFOperationDef> blend = Registered(kBlend, L"Blend");
    Ptr<IAAFObject> object = As<IAAFObject>(blend);
    Ptr<IAAFPropertyDef> all =
        Get(Get(object, &IAAFObject::GetDefinition), &IAAFClassDef::LookupPropertyDef,
            aaf::prop::OperationDefinition_ParametersDefined.id);
    Ptr<IAAFTypeDefSet> set = As<IAAFTypeDefSet>(Get(all, &IAAFPropertyDef::GetTypeDef));
    Ptr<IAAFTypeDefObjectRef> reference =
        As<IAAFTypeDefObjectRef>(Get(set, &IAAFTypeDefSet::GetElementType));
    Ptr<IAAFPropertyValue> value;
    ASSERT_EQ(AAFRESULT_SUCCESS, object->CreateOptionalPropertyValue(all, value.Out()));
    for (const aafUID_t& id : {kLevel, kSoftness}) {
        Ptr<IAAFPropertyValue> element;
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  reference->CreateValue(RegisteredParameter(id), element.Out()));
        ASSERT_EQ(AAFRESULT_SUCCESS, set->AddElement(value, element));
    }
    for (const aafUID_t& id : {kLevel, kSoftness}) {
        EXPECT_EQ(
            AAFRESULT_OBJECT_ALREADY_ATTACHED,
            blend->AddParameterDef(Get(dictionary_, &IAAFDictionary::LookupParameterDef, id)));
    }
    EXPECT_EQ(2u, Get(blend, &IAAFOperationDef::CountParameterDefs));
}

TEST_F(Effect, GroupKnowsWhatItsDefinitionSays) {
    Ptr<IAAFOperationDef> blend = Registered(kBlend, L"Blend");
    Ptr<IAAFOperationGroup> group = Group(blend);
    EXPECT_EQ(kAAFFalse, Get(group, &IAAFOperationGroup::IsATimeWarp));
    EXPECT_EQ(kAAFFalse, Get(group, &IAAFOperationGroup::IsValidTranOperation));
    blend->SetIsTimeWarp(kAAFTrue);
    blend->SetNumberInputs(2);
    AddComposition(group);
    Ptr<IAAFOperationGroup> read = ReopenedSegment<IAAFOperationGroup>();
    EXPECT_EQ(kAAFTrue, Get(read, &IAAFOperationGroup::IsATimeWarp));
    EXPECT_EQ(kAAFTrue, Get(read, &IAAFOperationGroup::IsValidTranOperation));

    Ptr<IAAFOperationGroup> bare = Make<IAAFOperationGroup>(AUID_AAFOperationGroup);
    aafBoolean_t answer = kAAFFalse;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, bare->IsATimeWarp(&answer));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, bare->IsValidTranOperation(&answer));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, bare->IsATimeWarp(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, bare->IsValidTranOperation(nullptr));
}

TEST_F(Effect, ConstantValueHasTheTypeOfItsParameter) {
    Ptr<IAAFOperationGroup> group = Group(Registered(kBlend, L"Blend"));
    Ptr<IAAFConstantValue> value = Make<IAAFConstantValue>(AUID_AAFConstantValue);
    aafRational_t half{1, 2};
    aafRational_t third{1, 3};
    ASSERT_EQ(AAFRESULT_SUCCESS,
              value->Initialize(RegisteredParameter(kLevel), sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_SUCCESS, value->SetValue(sizeof third, BytesOf(third)));
    EXPECT_EQ(AAFRESULT_SUCCESS, group->AddParameter(As<IAAFParameter>(value)));
    AddComposition(group);

    Ptr<IAAFOperationGroup> read = ReopenedSegment<IAAFOperationGroup>();
    Ptr<IAAFParameter> parameter = Get(read, &IAAFOperationGroup::LookupParameter, kLevel);
    EXPECT_EQ(kLevel, Get(As<IAAFDefObject>(Get(parameter, &IAAFParameter::GetParameterDefinition)),
                          &IAAFDefObject::GetAUID));
    EXPECT_EQ(kAAFTypeID_Rational,
              Get(As<IAAFMetaDefinition>(Get(parameter, &IAAFParameter::GetTypeDefinition)),
                  &IAAFMetaDefinition::GetAUID));
    Ptr<IAAFConstantValue> constant = As<IAAFConstantValue>(parameter);
    aafRational_t got{};
    aafUInt32 bytes = 0;
    EXPECT_EQ(sizeof got, Get(constant, &IAAFConstantValue::GetValueBufLen));
    EXPECT_EQ(AAFRESULT_SUCCESS, constant->GetValue(sizeof got, BytesOf(got), &bytes));
    EXPECT_EQ(NumbersOf(third), NumbersOf(got));
    EXPECT_EQ(sizeof got, bytes);
}

TEST_F(Effect, ConstantValueChecksItsArguments) {
    Ptr<IAAFConstantValue> value = Make<IAAFConstantValue>(AUID_AAFConstantValue);
    Ptr<IAAFParameterDef> level = RegisteredParameter(kLevel);
    aafRational_t half{1, 2};
    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, value->SetValue(sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value->Initialize(nullptr, sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value->Initialize(level, sizeof half, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value->SetValue(sizeof half, nullptr));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED,
              value->Initialize(ParameterOf(kSoftness), sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE, value->Initialize(level, 3, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_SUCCESS, value->Initialize(level, sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_ALREADY_INITIALIZED, value->Initialize(level, sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE, value->SetValue(3, BytesOf(half)));

    Ptr<IAAFParameter> bare = Make<IAAFParameter>(AUID_AAFVaryingValue);
    Ptr<IAAFParameterDef> definition;
    Ptr<IAAFTypeDef> type;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, bare->GetParameterDefinition(definition.Out()));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, bare->GetTypeDefinition(type.Out()));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, bare->GetParameterDefinition(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, bare->GetTypeDefinition(nullptr));
}

TEST_F(Effect, ParameterOfAnotherFileIsFoundByItsId) {
    Ptr<IAAFFile> other;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, other.Out()));
    Ptr<IAAFDictionary> theirs = Get(other, &IAAFFile::GetDictionary);
    Ptr<IAAFParameterDef> foreign;
    ASSERT_EQ(AAFRESULT_SUCCESS, theirs->CreateInstance(AUID_AAFParameterDef, IID_IAAFParameterDef,
                                                        foreign.OutUnknown()));
    ASSERT_EQ(AAFRESULT_SUCCESS, foreign->Initialize(kLevel, L"Level", L"",
                                                     Get(theirs, &IAAFDictionary::LookupTypeDef,
                                                         kAAFTypeID_Rational)));
    ASSERT_EQ(AAFRESULT_SUCCESS, theirs->RegisterParameterDef(foreign));
    Ptr<IAAFConstantValue> value = Make<IAAFConstantValue>(AUID_AAFConstantValue);
    aafRational_t half{1, 2};
    EXPECT_EQ(AAFRESULT_INVALID_OBJ, value->Initialize(foreign, sizeof half, BytesOf(half)));
    RegisteredParameter(kLevel);
    EXPECT_EQ(AAFRESULT_SUCCESS, value->Initialize(foreign, sizeof half, BytesOf(half)));
}

TEST_F(Effect, VaryingValueKeepsItsPoints) {
    Ptr<IAAFOperationGroup> group = Group(Registered(kBlend, L"Blend"));
    Ptr<IAAFVaryingValue> value = Make<IAAFVaryingValue>(AUID_AAFVaryingValue);
    ASSERT_EQ(AAFRESULT_SUCCESS, value->Initialize(RegisteredParameter(kLevel), Linear()));
    for (aafInt32 at : {0, 1}) {
        Ptr<IAAFControlPoint> point = Make<IAAFControlPoint>(AUID_AAFControlPoint);
        aafRational_t level{at * 50, 100};
        ASSERT_EQ(AAFRESULT_SUCCESS,
                  point->Initialize(value, {at, 1}, sizeof level, BytesOf(level)));
        EXPECT_EQ(AAFRESULT_SUCCESS, point->SetEditHint(kAAFProportional));
        EXPECT_EQ(AAFRESULT_SUCCESS, value->AddControlPoint(point));
    }
    EXPECT_EQ(AAFRESULT_SUCCESS, group->AddParameter(As<IAAFParameter>(value)));
    AddComposition(group);

    Ptr<IAAFOperationGroup> read = ReopenedSegment<IAAFOperationGroup>();
    Ptr<IAAFVaryingValue> varying =
        As<IAAFVaryingValue>(Get(read, &IAAFOperationGroup::LookupParameter, kLevel));
    EXPECT_EQ(kLinear,
              Get(As<IAAFDefObject>(Get(varying, &IAAFVaryingValue::GetInterpolationDefinition)),
                  &IAAFDefObject::GetAUID));
    EXPECT_EQ(aafInt32{sizeof(aafRational_t)}, Get(varying, &IAAFVaryingValue::GetValueBufLen));
    ASSERT_EQ(2u, Get(varying, &IAAFVaryingValue::CountControlPoints));
    Ptr<IAAFControlPoint> last = Get(varying, &IAAFVaryingValue::GetControlPointAt, aafUInt32{1});
    aafRational_t got{};
    aafUInt32 bytes = 0;
    EXPECT_EQ(NumbersOf({1, 1}), NumbersOf(Get(last, &IAAFControlPoint::GetTime)));
    EXPECT_EQ(kAAFProportional, Get(last, &IAAFControlPoint::GetEditHint));
    EXPECT_EQ(AAFRESULT_SUCCESS, last->GetValue(sizeof got, BytesOf(got), &bytes));
    EXPECT_EQ(NumbersOf({50, 100}), NumbersOf(got));
    EXPECT_EQ(kAAFTypeID_Rational,
              Get(As<IAAFMetaDefinition>(Get(last, &IAAFControlPoint::GetTypeDefinition)),
                  &IAAFMetaDefinition::GetAUID));
}

TEST_F(Effect, VaryingValueChecksItsArguments) {
    Ptr<IAAFVaryingValue> value = Make<IAAFVaryingValue>(AUID_AAFVaryingValue);
    Ptr<IAAFControlPoint> point = Make<IAAFControlPoint>(AUID_AAFControlPoint);
    Ptr<IAAFParameterDef> level = RegisteredParameter(kLevel);
    Ptr<IAAFInterpolationDef> linear = Linear();
    Ptr<IAAFInterpolationDef> none;
    aafRational_t half{1, 2};
    aafInt32 size = 0;
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, value->GetInterpolationDefinition(none.Out()));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, value->GetValueBufLen(&size));
    EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT,
              point->Initialize(value, {0, 1}, sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value->Initialize(nullptr, linear));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value->Initialize(level, nullptr));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, value->Initialize(ParameterOf(kSoftness), linear));
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, value->Initialize(level, FreeLinear()));
    EXPECT_EQ(AAFRESULT_SUCCESS, value->Initialize(level, linear));
    EXPECT_EQ(AAFRESULT_ALREADY_INITIALIZED, value->Initialize(level, linear));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value->GetInterpolationDefinition(nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, value->GetValueBufLen(nullptr));

    EXPECT_EQ(AAFRESULT_NOT_INITIALIZED, point->SetValue(sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, point->Initialize(nullptr, {0, 1}, sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, point->Initialize(value, {0, 1}, sizeof half, nullptr));
    EXPECT_EQ(AAFRESULT_NULL_PARAM, point->SetValue(sizeof half, nullptr));
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE, point->Initialize(value, {0, 1}, 1, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_SUCCESS, point->Initialize(value, {0, 1}, sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_ALREADY_INITIALIZED,
              point->Initialize(value, {0, 1}, sizeof half, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE, point->SetValue(1, BytesOf(half)));
    EXPECT_EQ(AAFRESULT_SUCCESS, point->SetValue(sizeof half, BytesOf(half)));
}

TEST_F(Effect, ValueThatIsRefusedStaysAsItWas) {
    Ptr<IAAFParameterDef> level = RegisteredParameter(kLevel);
    aafRational_t half{1, 2};
    Ptr<IAAFConstantValue> constant = Make<IAAFConstantValue>(AUID_AAFConstantValue);
    EXPECT_EQ(AAFRESULT_ILLEGAL_VALUE, constant->Initialize(level, 3, BytesOf(half)));
    Ptr<IAAFVaryingValue> varying = Make<IAAFVaryingValue>(AUID_AAFVaryingValue);
    EXPECT_EQ(AAFRESULT_OBJECT_NOT_ATTACHED, varying->Initialize(level, FreeLinear()));
    for (const Ptr<IAAFParameter>& value :
         {As<IAAFParameter>(constant), As<IAAFParameter>(varying)}) {
        Ptr<IAAFParameterDef> none;
        EXPECT_EQ(AAFRESULT_PROP_NOT_PRESENT, value->GetParameterDefinition(none.Out()));
    }
}

// The list may change while it is gone through, as any other.
TEST_F(Effect, ListOfDefinitionsIsGoneThroughAsItIs) {
    Ptr<IAAFOperationDef> blend = Registered(kBlend, L"Blend");
    for (const aafUID_t& id : {kCut, kWipe}) {
        ASSERT_EQ(AAFRESULT_SUCCESS, blend->AppendDegradeToOperation(Registered(id, L"Other")));
    }
    ASSERT_EQ(AAFRESULT_SUCCESS, blend->AppendDegradeToOperation(blend));
    using I = IEnumAAFOperationDefs;
    Ptr<I> all = Get(blend, &IAAFOperationDef::GetDegradeToOperations);
    const auto next = [](I* from) {
        return Get(As<IAAFDefObject>(Get(from, &I::NextOne)), &IAAFDefObject::GetAUID);
    };
    EXPECT_EQ(kCut, next(all));
    Ptr<I> second = Get(all, &I::Clone);
    EXPECT_EQ(kWipe, next(all));
    EXPECT_EQ(kWipe, next(second));
    EXPECT_EQ(AAFRESULT_SUCCESS, all->Reset());
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS, all->Skip(4));
    EXPECT_EQ(AAFRESULT_SUCCESS, all->Skip(2));
    EXPECT_EQ(kBlend, next(all));
    // Without the first one the second stands at the end.
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->RemoveDegradeToOperationAt(0));
    Ptr<IAAFOperationDef> none;
    EXPECT_EQ(AAFRESULT_NO_MORE_OBJECTS, second->NextOne(none.Out()));
    EXPECT_EQ(AAFRESULT_SUCCESS, blend->AppendDegradeToOperation(blend));
    EXPECT_EQ(kBlend, next(second));
    // The last reference may go; the empty list is stored.
    for (int left = 0; left < 3; ++left) {
        EXPECT_EQ(AAFRESULT_SUCCESS, blend->RemoveDegradeToOperationAt(0));
    }
    EXPECT_EQ(AAFRESULT_BADINDEX, blend->RemoveDegradeToOperationAt(0));
    AddComposition(Group(blend));
    Ptr<IAAFOperationGroup> read = ReopenedSegment<IAAFOperationGroup>();
    EXPECT_EQ(0u, Get(Get(read, &IAAFOperationGroup::GetOperationDefinition),
                      &IAAFOperationDef::CountDegradeToOperations));
}

TEST_F(Effect, VaryingValueOfATypeWithoutSizeHasNoLength) {
    Ptr<IAAFVaryingValue> value = Make<IAAFVaryingValue>(AUID_AAFVaryingValue);
    Ptr<IAAFParameterDef> text = ParameterOf(kNowhere, kAAFTypeID_String);
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterParameterDef(text));
    ASSERT_EQ(AAFRESULT_SUCCESS, value->Initialize(text, Linear()));
    aafInt32 size = 0;
    EXPECT_EQ(AAFRESULT_BAD_TYPE, value->GetValueBufLen(&size));
}

// The type that a parameter has may be one that only its file knows.
TEST_F(Effect, CloneTakesTheTypeOfItsParameterAlong) {
    Ptr<IAAFTypeDefRename> own;
    ASSERT_EQ(AAFRESULT_SUCCESS,
              dictionary_->CreateMetaInstance(AUID_AAFTypeDefRename, IID_IAAFTypeDefRename,
                                              own.OutUnknown()));
    ASSERT_EQ(AAFRESULT_SUCCESS,
              own->Initialize(kNowhere,
                              Get(dictionary_, &IAAFDictionary::LookupTypeDef, kAAFTypeID_Rational),
                              L"Loudness"));
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterTypeDef(As<IAAFTypeDef>(own)));
    Ptr<IAAFOperationDef> blend = Registered(kBlend, L"Blend");
    Ptr<IAAFParameterDef> loudness = ParameterOf(kLevel, kNowhere);
    ASSERT_EQ(AAFRESULT_SUCCESS, dictionary_->RegisterParameterDef(loudness));
    ASSERT_EQ(AAFRESULT_SUCCESS, blend->AddParameterDef(loudness));
    AddComposition(Group(blend));

    Ptr<IAAFFile> target;
    ASSERT_EQ(AAFRESULT_SUCCESS, AAFFileOpenTransient(&product_.ident, target.Out()));
    Ptr<IAAFMob> clone;
    ASSERT_EQ(AAFRESULT_SUCCESS,
              Get(header_, &IAAFHeader::LookupMob, MobId(0xC0))
                  ->CloneExternal(kAAFNoFollowDepend, kAAFNoIncludeMedia, target, clone.Out()));
    Ptr<IAAFDictionary> there = Get(target, &IAAFFile::GetDictionary);
    Ptr<IAAFParameterDef> found = Get(there, &IAAFDictionary::LookupParameterDef, kLevel);
    EXPECT_EQ(Get(there, &IAAFDictionary::LookupTypeDef, kNowhere).get(),
              Get(found, &IAAFParameterDef::GetTypeDefinition).get());
    EXPECT_EQ(AAFRESULT_SUCCESS, target->Save());
}

}  // namespace aaf_test
