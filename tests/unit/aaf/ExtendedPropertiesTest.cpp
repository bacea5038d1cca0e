// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/aaf/AAFPictureDescriptors.h"
#include "host_interfaces/aaf/AAFTypeDefinitions.h"
#include "source/aaf/ExtendedProperties.h"

#include "source/aaf/ColorLabels.h"
#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

BoundsBox Box(ncfSInt32 first) {
    return {
        {first, first + 1}, {first + 2, first + 3}, {first + 4, first + 5}, {first + 6, first + 7}};
}

class ExtendedPropertiesTest : public AAFTest {
protected:
    ExtendedPropertiesTest() {
        geometry.framing = Box(10);
        geometry.valid = Box(20);
        geometry.essence = Box(30);
        geometry.source = Box(40);
    }
    NCFRESULT Put() { return PutBoxesToAAF(Dictionary(), image, geometry); }
    NCFRESULT SetCount(ncfUInt32 count) {
        return SetAVCISliceCount(nullptr, Dictionary(), cdci, count);
    }

    GeometryDetails geometry;
    IAAFSmartPointer<IAAFDigitalImageDescriptor> image =
        Make<IAAFDigitalImageDescriptor>("Picture");
    IAAFSmartPointer<IAAFCDCIDescriptor> cdci = Make<IAAFCDCIDescriptor>("Intra");
};

const std::string kClass = "ClassDefDigitalImageDescriptor1.";

TEST_F(ExtendedPropertiesTest, RegisterTheRecordTypeOnce) {
    ASSERT_EQ(Put(), NCF_OK);
    const std::vector<std::string> start(aaf.journal().lines().begin(),
                                         aaf.journal().lines().begin() + 7);
    EXPECT_EQ(start,
              (std::vector<std::string>{
                  "Dictionary.LookupClassDef DigitalImageDescriptor",
                  "Dictionary.LookupTypeDef 0E040301-0200-0000-060E-2B3401040101",
                  "Dictionary.CreateMetaInstance TypeDefRecord",
                  "TypeDefRecord1.QueryInterface " +
                      aaf.journal().lines()[3].substr(
                          std::string("TypeDefRecord1.QueryInterface ").size()),
                  "Dictionary.LookupTypeDef 03010100-0000-0000-060E-2B3401040101",
                  "TypeDefRecord1.Initialize 0E040301-0200-0000-060E-2B3401040101 'BoundsBox' "
                  "TypeDef1:'PositionX' TypeDef1:'PositionY' TypeDef1:'Width' TypeDef1:'Height'",
                  "Dictionary.RegisterTypeDef TypeDefRecord1"}));
    aaf.clearJournal();
    ASSERT_EQ(Put(), NCF_OK);
    EXPECT_EQ(aaf.place("Dictionary.CreateMetaInstance"), -1);
    EXPECT_EQ(aaf.place("Dictionary.RegisterTypeDef"), -1);
    EXPECT_EQ(aaf.place(kClass + "RegisterOptionalPropertyDef"), -1);
    EXPECT_EQ(aaf.linesOf("Picture1.SetPropertyValue").size(), 4u);
}

TEST_F(ExtendedPropertiesTest, WriteTheFourBoxesInTheirOrder) {
    ASSERT_EQ(Put(), NCF_OK);
    EXPECT_EQ(aaf.linesOf(kClass + "Register"),
              (std::vector<std::string>{
                  kClass + "RegisterOptionalPropertyDef 0E040101-0101-0107-060E-2B3401010101 "
                           "'EssenceBox' TypeDefRecord1",
                  kClass + "RegisterOptionalPropertyDef 0E040101-0101-0108-060E-2B3401010101 "
                           "'SourceBox' TypeDefRecord1",
                  kClass + "RegisterOptionalPropertyDef 0E040101-0101-0106-060E-2B3401010101 "
                           "'ValidBox' TypeDefRecord1",
                  kClass + "RegisterOptionalPropertyDef 0E040301-0200-0000-060E-2B3401040101 "
                           "'BoundsBox' TypeDefRecord1"}));
    EXPECT_EQ(aaf.linesOf("TypeDefRecord1.CreateValueFromStruct"),
              (std::vector<std::string>{
                  "TypeDefRecord1.CreateValueFromStruct [30 31 32 33 34 35 36 37]",
                  "TypeDefRecord1.CreateValueFromStruct [40 41 42 43 44 45 46 47]",
                  "TypeDefRecord1.CreateValueFromStruct [20 21 22 23 24 25 26 27]",
                  "TypeDefRecord1.CreateValueFromStruct [10 11 12 13 14 15 16 17]"}));
    EXPECT_EQ(aaf.linesOf("Picture1.SetPropertyValue"),
              (std::vector<std::string>{"Picture1.SetPropertyValue PropertyEssenceBox1 Value1",
                                        "Picture1.SetPropertyValue PropertySourceBox1 Value2",
                                        "Picture1.SetPropertyValue PropertyValidBox1 Value3",
                                        "Picture1.SetPropertyValue PropertyBoundsBox1 Value4"}));
}

TEST_F(ExtendedPropertiesTest, GiveTheMembersPlacesForEachProperty) {
    ASSERT_EQ(Put(), NCF_OK);
    EXPECT_EQ(aaf.linesOf("TypeDefRecord1.RegisterMembers"),
              std::vector<std::string>(4, "TypeDefRecord1.RegisterMembers [0 8 16 24] 32"));
    EXPECT_LT(aaf.place("TypeDefRecord1.RegisterMembers"),
              aaf.place("TypeDefRecord1.CreateValueFromStruct"));
}

TEST_F(ExtendedPropertiesTest, BoxesOfZerosAreWrittenAsTheyAre) {
    geometry = {};
    ASSERT_EQ(Put(), NCF_OK);
    EXPECT_EQ(
        aaf.linesOf("TypeDefRecord1.CreateValueFromStruct"),
        std::vector<std::string>(4, "TypeDefRecord1.CreateValueFromStruct [0 0 0 0 0 0 0 0]"));
}

TEST_F(ExtendedPropertiesTest, EveryRefusalComesBackUnchanged) {
    for (const std::string call :
         {"Dictionary.LookupClassDef", "Dictionary.CreateMetaInstance",
          "TypeDefRecord1.QueryInterface", "TypeDefRecord2.Initialize",
          "Dictionary.RegisterTypeDef", "ClassDefDigitalImageDescriptor1.Register",
          "TypeDefRecord4.RegisterMembers", "TypeDefRecord4.CreateValueFromStruct",
          "Picture1.QueryInterface", "Picture1.SetPropertyValue"}) {
        aaf.clearRefusals();
        aaf.refuse(call, AAFRESULT_NOMEMORY);
        EXPECT_EQ(Put(), AAFRESULT_NOMEMORY) << call;
        EXPECT_TRUE(aaf.hasRefused()) << call;
    }
}

TEST_F(ExtendedPropertiesTest, TheRecordTypeLogsTheStatementThatFailed) {
    aaf.refuse("TypeDefRecord1.Initialize", AAFRESULT_BAD_TYPE);
    EXPECT_EQ(Put(), AAFRESULT_BAD_TYPE);
    EXPECT_TRUE(
        log.returned(AAFRESULT_BAD_TYPE,
                     "pTDRec->Initialize(kAAFTypeID_NivoBoundsBox, memberTypes, memberNames, "
                     "aafBoundsBoxNumMembers, L\"BoundsBox\")",
                     "NMA::Impl::InitializeNivoBoundsBoxType"));
    aaf.refuse("TypeDefRecord2.QueryInterface", AAFRESULT_BAD_TYPE);
    EXPECT_EQ(Put(), AAFRESULT_BAD_TYPE);
    EXPECT_TRUE(log.returned(AAFRESULT_BAD_TYPE,
                             "pTypeDef->QueryInterface(IID_IAAFTypeDefRecord, (void**) &pTDRec)",
                             "NMA::Impl::InitializeNivoBoundsBoxType"));
}

TEST_F(ExtendedPropertiesTest, AFailedLookUpOfTheRationalTypeIsUnexpected) {
    aaf.refuse("Dictionary.LookupTypeDef 03010100");
    EXPECT_EQ(Put(), NCF_E_UNEXPECTED);
    EXPECT_EQ(PutBoxesToAAF(nullptr, image, geometry), NCF_E_UNEXPECTED);
}

TEST_F(ExtendedPropertiesTest, SliceCountIsAnIntegerOfThePicture) {
    ASSERT_EQ(SetCount(10), NCF_OK);
    EXPECT_TRUE(aaf.has("TypeDef1.CreateValue [10]"));
    EXPECT_TRUE(
        aaf.has("ClassDefCDCIDescriptor1.RegisterOptionalPropertyDef "
                "0E040101-0101-010E-060E-2B3401010101 'AVCISliceCount' TypeDef1"));
    EXPECT_TRUE(aaf.has("Intra1.SetPropertyValue PropertyAVCISliceCount1 Value1"));
    aaf.clearJournal();
    ASSERT_EQ(SetCount(8), NCF_OK);
    EXPECT_EQ(aaf.place("ClassDefCDCIDescriptor1.Register"), -1);
    EXPECT_TRUE(aaf.has("TypeDef1.CreateValue [8]"));
}

TEST_F(ExtendedPropertiesTest, APropertyFoundWithSomethingToTellIsNotRegisteredAgain) {
    ASSERT_EQ(SetCount(10), NCF_OK);
    ASSERT_EQ(Put(), NCF_OK);
    aaf.clearJournal();
    aaf.refuse("ClassDefCDCIDescriptor1.LookupPropertyDef", 1);
    EXPECT_EQ(SetCount(8), NCF_OK);
    EXPECT_TRUE(aaf.has("Intra1.SetPropertyValue PropertyAVCISliceCount1 Value6"));
    aaf.refuse(kClass + "LookupPropertyDef", 1);
    EXPECT_EQ(Put(), NCF_OK);
    EXPECT_TRUE(aaf.hasRefused());
    for (const std::string& line : aaf.journal().lines()) {
        EXPECT_EQ(line.find("RegisterOptionalPropertyDef"), std::string::npos) << line;
    }
}

TEST_F(ExtendedPropertiesTest, SliceCountLogsTheStatementThatFailed) {
    const std::pair<const char*, const char*> statements[] = {
        {"Dictionary.LookupTypeDef", "pDictionary->LookupTypeDef(kAAFTypeID_Int32, &pTDint32)"},
        {"TypeDef1.QueryInterface",
         "pTDint32->QueryInterface(IID_IAAFTypeDefInt, (void**)&pTDInt)"},
        {"TypeDef1.CreateValue",
         "pTDInt->CreateValue((aafMemPtr_t)&localSliceCount, sizeof(localSliceCount), "
         "&pPVsliceCount)"},
        {"Dictionary.LookupClassDef",
         "pDictionary->LookupClassDef(AUID_AAFCDCIDescriptor,& pClassDef)"},
        {"ClassDefCDCIDescriptor1.Register",
         "pClassDef->RegisterOptionalPropertyDef(kAAFPropID_CDCIAVCISliceCount, "
         "L\"AVCISliceCount\", pTDint32, &pPropDef)"},
        {"Intra1.QueryInterface",
         "pCDCIDescriptor->QueryInterface(IID_IAAFObject,(void**)&pObject)"},
        {"Intra1.SetPropertyValue", "pObject->SetPropertyValue(pPropDef, pPVsliceCount)"},
    };
    for (const auto& [call, statement] : statements) {
        aaf.clearRefusals();
        aaf.refuse(call, AAFRESULT_NOMEMORY);
        EXPECT_EQ(SetCount(10), AAFRESULT_NOMEMORY) << call;
        EXPECT_TRUE(log.returned(AAFRESULT_NOMEMORY, statement, "NMA::Impl::SetAVCISliceCount"))
            << call;
    }
}

class ColorLabelsTest : public AAFTest {
protected:
    void SetCodes(ncfUInt32 primaries, ncfUInt32 transfer) {
        aaf.clearJournal();
        host.console().clear();
        ColorDetails details;
        details.colorPrimaries = primaries;
        details.transferFunction = transfer;
        SetCodedColorLabels(details, image, Console());
    }
    bool ToldTransfer() {
        return host.console().count(
                   2, "Color transfer characteristics information unavailable\n") == 1;
    }
    bool ToldPrimaries() {
        return host.console().count(2, "Color primaries information unavailable\n") == 1;
    }
    IAAFSmartPointer<IAAFDigitalImageDescriptor2> image =
        Make<IAAFDigitalImageDescriptor2>("Picture");
};

TEST_F(ColorLabelsTest, KnownCodesHaveLabels) {
    SetCodes(1, 1);
    EXPECT_EQ(aaf.journal().lines(),
              (std::vector<std::string>{
                  "Picture1.SetTransferCharacteristic 04010101-0102-0000-060E-2B3404010101",
                  "Picture1.SetColorPrimaries 04010101-0303-0000-060E-2B3404010106"}));
    EXPECT_FALSE(ToldTransfer() || ToldPrimaries());
    SetCodes(6, 7);
    EXPECT_EQ(aaf.journal().lines(),
              (std::vector<std::string>{
                  "Picture1.SetTransferCharacteristic 04010101-0103-0000-060E-2B3404010101",
                  "Picture1.SetColorPrimaries 04010101-0301-0000-060E-2B3404010106"}));
}

TEST_F(ColorLabelsTest, UnspecifiedCodesGiveBothMessagesAndNoLabel) {
    SetCodes(2, 2);
    EXPECT_EQ(aaf.callCount(), 0);
    EXPECT_TRUE(ToldTransfer());
    EXPECT_TRUE(ToldPrimaries());
}

TEST_F(ColorLabelsTest, EachCodeIsJudgedByItself) {
    SetCodes(5, 1);
    EXPECT_TRUE(ToldPrimaries());
    EXPECT_FALSE(ToldTransfer());
    SetCodes(1, 6);
    EXPECT_FALSE(ToldPrimaries());
    EXPECT_TRUE(ToldTransfer());
}

TEST_F(ColorLabelsTest, ARefusedLabelDoesNotMatter) {
    aaf.refuse("Picture1.SetTransferCharacteristic");
    SetCodes(1, 1);
    EXPECT_EQ(aaf.linesOf("Picture1.SetColorPrimaries").size(), 1u);
}

TEST_F(ColorLabelsTest, AVendorsLabelStandsAlone) {
    ColorDetails details;
    details.colorPrimaries = 1;
    details.transferCharacteristicUID = ncfGuid("0E170000-0001-0101-060E-2B340401010C");
    SetVendorColorLabel(details, image, Console());
    EXPECT_EQ(aaf.journal().lines(),
              std::vector<std::string>{
                  "Picture1.SetTransferCharacteristic 0E170000-0001-0101-060E-2B340401010C"});
}

}  // namespace
}  // namespace NMA::Impl
