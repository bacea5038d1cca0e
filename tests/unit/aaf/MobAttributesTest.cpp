// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/aaf/AAFMasterMobs.h"
#include "host_interfaces/aaf/AAFTypeDefinitionsOfMany.h"
#include "source/aaf/MobAttributes.h"

#include <functional>

#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

class MobAttributesTest : public AAFTest {
protected:
    NCFRESULT AddCode() { return AddMasterMobAppCode(Dictionary(), mob, kPrecomputeMasterMob); }
    NCFRESULT AddList() { return AddMasterMobAttributes(Dictionary(), mob); }
    std::vector<std::string> WithoutQueries() const {
        std::vector<std::string> calls;
        for (const std::string& line : aaf.journal().lines()) {
            if (line.find("QueryInterface") == std::string::npos) {
                calls.push_back(line);
            }
        }
        return calls;
    }
    IAAFSmartPointer<IAAFMasterMob> mob = Make<IAAFMasterMob>("MasterMob");
};

TEST_F(MobAttributesTest, AppCodeIsAnIntegerPropertyOfMobs) {
    ASSERT_EQ(AddCode(), NCF_OK);
    EXPECT_EQ(WithoutQueries(),
              (std::vector<std::string>{
                  "Dictionary.LookupTypeDef 01010700-0000-0000-060E-2B3401040101",
                  "TypeDef1.CreateValue [1]", "Dictionary.LookupClassDef Mob",
                  "ClassDefMob1.LookupPropertyDef 96C46992-4F62-11D3-A022-006094EB75CB",
                  "ClassDefMob1.RegisterOptionalPropertyDef 96C46992-4F62-11D3-A022-006094EB75CB "
                  "'AppCode' TypeDef1",
                  "MasterMob1.SetPropertyValue PropertyAppCode1 Value1"}));
}

TEST_F(MobAttributesTest, AttributeListHoldsOneTaggedValue) {
    ASSERT_EQ(AddList(), NCF_OK);
    EXPECT_EQ(WithoutQueries(),
              (std::vector<std::string>{
                  "Dictionary.LookupTypeDef 05060800-0000-0000-060E-2B3401040101",
                  "Dictionary.LookupClassDef Mob",
                  "ClassDefMob1.LookupPropertyDef 60958183-47B1-11D4-A01C-0004AC969F50",
                  "ClassDefMob1.RegisterOptionalPropertyDef 60958183-47B1-11D4-A01C-0004AC969F50 "
                  "'MobAttributeList' TypeDef1",
                  "TypeDef1.CreateEmptyValue",
                  // On the mob first, filled afterwards.
                  "MasterMob1.SetPropertyValue PropertyMobAttributeList1 ArrayValue1",
                  "Dictionary.LookupTypeDef 05021A00-0000-0000-060E-2B3401040101",
                  "Dictionary.LookupClassDef TaggedValue", "ClassDefTaggedValue1.CreateInstance",
                  "Dictionary.LookupTypeDef 01010700-0000-0000-060E-2B3401040101",
                  "TaggedValue1.Initialize '_BOUNDS_REFORMATTING_OPTION' TypeDef3 [0]",
                  "TypeDef2.CreateValue TaggedValue1",
                  "TypeDef1.AppendElement ArrayValue1 ObjectValue1"}));
}

TEST_F(MobAttributesTest, AKnownPropertyIsNotRegisteredAgain) {
    ASSERT_EQ(AddCode(), NCF_OK);
    ASSERT_EQ(AddList(), NCF_OK);
    aaf.clearJournal();
    EXPECT_EQ(AddCode(), NCF_OK);
    EXPECT_EQ(AddList(), NCF_OK);
    EXPECT_EQ(aaf.place("ClassDefMob1.RegisterOptionalPropertyDef"), -1);
}

TEST_F(MobAttributesTest, EveryRefusalComesBackUnchanged) {
    const struct {
        std::function<NCFRESULT()> add;
        std::vector<const char*> calls;
    } cases[] = {
        {[this] { return AddCode(); },
         {"MasterMob1.QueryInterface", "Dictionary.LookupTypeDef", "TypeDef1.QueryInterface",
          "TypeDef1.CreateValue", "Dictionary.LookupClassDef",
          "ClassDefMob1.RegisterOptionalPropertyDef", "MasterMob1.SetPropertyValue"}},
        {[this] { return AddList(); },
         {"Dictionary.LookupTypeDef 05060800", "Dictionary.LookupClassDef Mob",
          "ClassDefMob1.RegisterOptionalPropertyDef", "MasterMob1.QueryInterface",
          "MasterMob1.SetPropertyValue", "Dictionary.LookupTypeDef 05021A00",
          "ClassDefTaggedValue1.CreateInstance", "TaggedValue"}},
    };
    for (const auto& [add, calls] : cases) {
        for (const char* call : calls) {
            aaf.clearRefusals();
            aaf.refuse(call, AAFRESULT_NOMEMORY);
            EXPECT_EQ(add(), AAFRESULT_NOMEMORY) << call;
        }
        aaf.clearRefusals();
    }
}

TEST_F(MobAttributesTest, AFailedLookUpOfADefinitionIsUnexpected) {
    aaf.refuse("Dictionary.LookupClassDef TaggedValue");
    EXPECT_EQ(AddList(), NCF_E_UNEXPECTED);
    EXPECT_EQ(AddMasterMobAppCode(nullptr, mob, 1), NCF_E_UNEXPECTED);
    EXPECT_EQ(AddMasterMobAttributes(Dictionary(), nullptr), NCF_E_UNEXPECTED);
}

TEST_F(MobAttributesTest, TheOptionNeedsAList) {
    EXPECT_EQ(AddReformattingOption(Dictionary(), nullptr, nullptr), NCF_E_INVALIDARG);
    EXPECT_TRUE(log.once("CHK_INARG(pPVArray)NMA::Impl::AddReformattingOption"));
}

TEST_F(MobAttributesTest, TheOptionLogsTheStatementThatFailed) {
    const std::pair<const char*, const char*> statements[] = {
        {"Dictionary.LookupTypeDef 05021A00",
         "pDictionary->LookupTypeDef(kAAFTypeID_TaggedValueStrongReference, &pTypeDefTVSR)"},
        {"TypeDef1.QueryInterface",
         "pTypeDefTVSR->QueryInterface (IID_IAAFTypeDefObjectRef, (void **)&pTDObjRef)"},
        {"ClassDefTaggedValue1.CreateInstance",
         "defs.cdTaggedValue()->CreateInstance(IID_IAAFTaggedValue, (IUnknown **)&pTaggedValue)"},
        {"TaggedValue",
         "pTaggedValue->Initialize(L\"_BOUNDS_REFORMATTING_OPTION\", defs.tdInt32(), "
         "sizeof(aafInt32), value)"},
        {"TypeDef1.CreateValue", "pTDObjRef->CreateValue(pTaggedValue, &pPVObject)"},
        {"Array1.AppendElement", "pTDVarArray->AppendElement(pPVArray,pPVObject)"},
    };
    const auto array = Make<IAAFTypeDefVariableArray>("Array");
    const auto value = Make<IAAFPropertyValue>("List");
    for (const auto& [call, statement] : statements) {
        aaf.clearRefusals();
        aaf.refuse(call, AAFRESULT_NOMEMORY);
        EXPECT_EQ(AddReformattingOption(Dictionary(), array, value), AAFRESULT_NOMEMORY) << call;
        EXPECT_TRUE(log.returned(AAFRESULT_NOMEMORY, statement, "NMA::Impl::AddReformattingOption"))
            << call;
    }
}

}  // namespace
}  // namespace NMA::Impl
