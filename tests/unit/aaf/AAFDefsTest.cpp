// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "host_interfaces/aaf/AAFMetaDefinitions.h"
#include "source/aaf/AAFDefs.h"

#include <functional>

#include "tests/unit/aaf/support/AAFTest.h"

namespace NMA::Impl {
namespace {

using AAFDefsTest = AAFTest;

std::string ThrownText(const std::function<void()>& body) {
    try {
        body();
    } catch (const char* text) {
        return text;
    }
    return "nothing";
}

TEST_F(AAFDefsTest, ThrowsTheTextPDictWithoutADictionary) {
    EXPECT_EQ(ThrownText([] { AAFDefs defs(nullptr); }), "pDict");
}

TEST_F(AAFDefsTest, LooksNothingUpUntilItIsAsked) {
    AAFDefs defs(Dictionary());
    EXPECT_EQ(aaf.callCount(), 0);
}

TEST_F(AAFDefsTest, LooksEachDefinitionUpOnce) {
    AAFDefs defs(Dictionary());
    EXPECT_EQ((IAAFClassDef*)defs.cdMasterMob(), (IAAFClassDef*)defs.cdMasterMob());
    defs.tdInt32();
    defs.tdInt32();
    defs.ddTimecode();
    defs.ddTimecode();
    EXPECT_EQ(aaf.journal().lines(),
              (std::vector<std::string>{
                  "Dictionary.LookupClassDef MasterMob",
                  "Dictionary.LookupTypeDef 01010700-0000-0000-060E-2B3401040101",
                  "Dictionary.LookupDataDef 7F275E81-77E5-11D2-807F-006008143E6F"}));
}

TEST_F(AAFDefsTest, FindsEveryClassUnderItsOwnId) {
    AAFDefs defs(Dictionary());
    defs.cdSourceMob();
    defs.cdMultipleDescriptor();
    defs.cdImportDescriptor();
    defs.cdMPEGVideoDescriptor();
    defs.cdRGBADescriptor();
    defs.cdNetworkLocator();
    defs.cdTaggedValue();
    defs.cdSequence();
    defs.cdTimecode();
    defs.cdFiller();
    const std::string start = "Dictionary.LookupClassDef ";
    EXPECT_EQ(
        aaf.journal().lines(),
        (std::vector<std::string>{
            start + "SourceMob", start + "MultipleDescriptor", start + "ImportDescriptor",
            start + "MPEGVideoDescriptor", start + "RGBADescriptor", start + "NetworkLocator",
            start + "TaggedValue", start + "Sequence", start + "Timecode", start + "Filler"}));
}

TEST_F(AAFDefsTest, ThrowsItsTextWhenALookUpFails) {
    AAFDefs defs(Dictionary());
    aaf.refuse("Dictionary.Lookup", AAFRESULT_NO_MORE_OBJECTS, 1);
    EXPECT_EQ(ThrownText([&] { defs.cdFiller(); }), "AAFRESULT_SUCCEEDED (hr)");
    aaf.refuse("Dictionary.LookupTypeDef", AAFRESULT_NO_MORE_OBJECTS, 1);
    EXPECT_EQ(ThrownText([&] { defs.tdRational(); }), "AAFRESULT_SUCCEEDED (hr)");
    aaf.refuse("Dictionary.LookupDataDef", AAFRESULT_NO_MORE_OBJECTS, 1);
    EXPECT_EQ(ThrownText([&] { defs.ddTimecode(); }), "AAFRESULT_SUCCEEDED (hr)");
}

TEST_F(AAFDefsTest, LooksUpAgainAfterAFailure) {
    AAFDefs defs(Dictionary());
    aaf.refuse("Dictionary.LookupClassDef Filler");
    EXPECT_EQ(ThrownText([&] { defs.cdFiller(); }), "AAFRESULT_SUCCEEDED (hr)");
    EXPECT_NE((IAAFClassDef*)defs.cdFiller(), nullptr);
}

}  // namespace
}  // namespace NMA::Impl
