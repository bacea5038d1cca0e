// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/parameters/model/ParamText.h"

#include <clocale>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <string>

#include "tests/support/Environment.h"
#include "tests/support/Quoted.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/parameters/model/ParamTest.h"

namespace {

using NMA::XMLUtils::NMAParamRational;
namespace ParamText = NMA::XMLUtils::ParamText;

class ParamTexts : public ParamTest {
protected:
    template <class Value>
    static Value read(const char* text) {
        Value value{};
        ParamText::Read(S(text), value);
        return value;
    }
    template <class Value>
    static NCFRESULT failure(const char* text) {
        return Thrown([&] { read<Value>(text); });
    }
    static std::string written(const NMAString& text) { return text.GetUTF8String(); }
    static ncfUInt64 bitsOf(double value) {
        ncfUInt64 bits = 0;
        std::memcpy(&bits, &value, sizeof bits);
        return bits;
    }
};

TEST_F(ParamTexts, NumbersGoThereAndBack) {
    EXPECT_EQ(written(ParamText::Write(std::numeric_limits<ncfSInt32>::min())), "-2147483648");
    EXPECT_EQ(written(ParamText::Write(std::numeric_limits<ncfUInt32>::max())), "4294967295");
    EXPECT_EQ(written(ParamText::Write(std::numeric_limits<ncfSInt64>::min())),
              "-9223372036854775808");
    EXPECT_EQ(written(ParamText::Write(std::numeric_limits<ncfUInt64>::max())),
              "18446744073709551615");
    EXPECT_EQ(read<ncfSInt32>("-2147483648"), std::numeric_limits<ncfSInt32>::min());
    EXPECT_EQ(read<ncfUInt32>("4294967295"), 4294967295u);
    EXPECT_EQ(read<ncfSInt64>("-9223372036854775808"), std::numeric_limits<ncfSInt64>::min());
    EXPECT_EQ(read<ncfUInt64>("18446744073709551615"), std::numeric_limits<ncfUInt64>::max());
}

TEST_F(ParamTexts, NumbersMayHaveSpaceBeforeAndAnythingBehind) {
    EXPECT_EQ(read<ncfSInt32>(" \t\n+12 frames"), 12);
    EXPECT_EQ(read<ncfUInt32>("7/8"), 7u);
    EXPECT_EQ(read<ncfSInt64>("-3.9"), -3);
    EXPECT_EQ(read<ncfUInt64>("0x10"), 0u) << "decimal only";
    EXPECT_EQ(read<ncfUInt32>("-1"), 4294967295u) << "wraps";
}

TEST_F(ParamTexts, LeadingZerosMakeNoOctals) {
    EXPECT_EQ(read<ncfSInt32>("-0010"), -10);
    EXPECT_EQ(read<ncfUInt32>("0010"), 10u);
    EXPECT_EQ(read<ncfSInt64>("-0010"), -10);
    EXPECT_EQ(read<ncfUInt64>("0089"), 89u);
    EXPECT_EQ(read<NMAParamRational>("0030/0010"), (NMAParamRational{30, 10}));
}

TEST_F(ParamTexts, NumbersTooLargeLoseTheirHighBits) {
    EXPECT_EQ(read<ncfSInt32>("4294967297"), 1);
    EXPECT_EQ(read<ncfUInt32>("4294967298"), 2u);
    EXPECT_EQ(read<ncfSInt32>("99999999999999999999999"), -1) << "low bits of the largest";
    EXPECT_EQ(read<ncfUInt64>("99999999999999999999999"), std::numeric_limits<ncfUInt64>::max());
}

TEST_F(ParamTexts, TextWithoutNumberIsUnexpectedAndLeavesTheOutput) {
    for (const char* const text : {"", " ", "abc", "-", "+", ".5x", "\xC3\xA4"}) {
        EXPECT_EQ(failure<ncfSInt32>(text), NCF_E_UNEXPECTED) << text;
        EXPECT_EQ(failure<ncfUInt32>(text), NCF_E_UNEXPECTED) << text;
        EXPECT_EQ(failure<ncfSInt64>(text), NCF_E_UNEXPECTED) << text;
        EXPECT_EQ(failure<ncfUInt64>(text), NCF_E_UNEXPECTED) << text;
    }
    ncfUInt32 kept = 5;
    EXPECT_EQ(Thrown([&] { ParamText::Read(S("x"), kept); }), NCF_E_UNEXPECTED);
    EXPECT_EQ(kept, 5u);
}

TEST_F(ParamTexts, DoublesAreWrittenWithSixPlaces) {
    EXPECT_EQ(written(ParamText::Write(1.5)), "1.500000");
    EXPECT_EQ(written(ParamText::Write(-0.0000004)), "-0.000000");
    EXPECT_EQ(written(ParamText::Write(1e20)), "100000000000000000000.000000");
    const std::string largest = written(ParamText::Write(-std::numeric_limits<double>::max()));
    EXPECT_EQ(largest.size(), 1u + 309u + 7u);
    EXPECT_EQ(written(ParamText::Write(std::numeric_limits<double>::infinity())), "inf");
}

TEST_F(ParamTexts, DoublesReadAsTheBitsOfAFloatInTheLowHalf) {
    EXPECT_EQ(bitsOf(read<double>("1.5")), 0x3FC00000u);
    EXPECT_EQ(bitsOf(read<double>("-1.5")), 0xBFC00000u) << "not even the sign survives";
    EXPECT_EQ(bitsOf(read<double>("0.000000")), 0u);
    EXPECT_EQ(bitsOf(read<double>("1e99")), 0x7F800000u);
    EXPECT_LT(read<double>("1.5"), 1e-300);
    EXPECT_GT(read<double>("1.5"), 0.0);
}

TEST_F(ParamTexts, DoublesMayHaveSpaceBeforeAndAnythingBehind) {
    const ncfUInt64 kOneAndAHalf = 0x3FC00000u;
    for (const char* const text :
         {" \t\r\n\v\f1.5", "+1.5", "15e-1", ".15e+1", "1.5 frames", "1.5e", "1.5.7",
          "001.50000000000000000000000000000000000000000000"}) {
        EXPECT_EQ(bitsOf(read<double>(text)), kOneAndAHalf) << text;
    }
    EXPECT_EQ(bitsOf(read<double>("inf")), 0x7F800000u) << "as it is written";
    EXPECT_EQ(bitsOf(read<double>("-inf")), 0xFF800000u);
    EXPECT_EQ(bitsOf(read<double>("nan")), 0x7FC00000u);
    EXPECT_EQ(bitsOf(read<double>("-0")), 0x80000000u);
}

TEST_F(ParamTexts, DoublesThatNoFloatHoldsAreEndlessOrNothing) {
    const std::string zeros(400, '0');
    for (const std::string& large :
         {std::string("1e39"), std::string("1e400"), std::string("1e99999999999999999999"),
          "1" + zeros, "1" + zeros + ".5", "0." + zeros + "1e500", "1" + zeros + "e-300"}) {
        EXPECT_EQ(bitsOf(read<double>(large.c_str())), 0x7F800000u) << large;
        EXPECT_EQ(bitsOf(read<double>(("-" + large).c_str())), 0xFF800000u) << large;
    }
    for (const std::string& small :
         {std::string("1e-46"), std::string("0.7e-45"), std::string("1e-99999999999999999999"),
          "0." + zeros + "1", zeros + "." + zeros + "1", "0." + zeros + "1e300",
          "1" + zeros + "e-500"}) {
        EXPECT_EQ(bitsOf(read<double>(small.c_str())), 0u) << small;
        EXPECT_EQ(bitsOf(read<double>(("-" + small).c_str())), 0x80000000u) << small;
    }
    EXPECT_EQ(bitsOf(read<double>("1e-45")), 1u) << "the smallest there is";
}

// Sets a locale whose numbers have a comma: one that is installed, or one made
// for the test. False where neither is to be had.
bool SetCommaLocale() {
    for (const char* const name : {"de_DE.UTF-8", "fr_FR.UTF-8", "sv_SE.UTF-8", "German"}) {
        if (std::setlocale(LC_NUMERIC, name)) {
            return true;
        }
    }
    const TestFolder folder;
    const std::string make = "localedef -i de_DE -f UTF-8 " + Quoted(folder / "de_DE.UTF-8");
    if (std::system((make + " >/dev/null 2>&1").c_str()) != 0) {
        return false;
    }
    SetVariable("LOCPATH", folder.path().u8string().c_str());
    const bool isSet = std::setlocale(LC_NUMERIC, "de_DE.UTF-8") != nullptr;
    RemoveVariable("LOCPATH");
    return isSet;
}

TEST_F(ParamTexts, DoublesHaveAPointWhateverTheLocale) {
    const std::string before = std::setlocale(LC_NUMERIC, nullptr);
    ASSERT_TRUE(SetCommaLocale()) << "no locale with a decimal comma, and none could be made";
    const std::string point = std::localeconv()->decimal_point;
    const std::string text = written(ParamText::Write(1.5));
    const ncfUInt64 withPoint = bitsOf(read<double>("1.5"));
    const ncfUInt64 withComma = bitsOf(read<double>("1,5"));
    std::setlocale(LC_NUMERIC, before.c_str());
    EXPECT_EQ(point, ",");
    EXPECT_EQ(text, "1.500000");
    EXPECT_EQ(withPoint, 0x3FC00000u);
    EXPECT_EQ(withComma, 0x3F800000u) << "ends at the comma";
}

TEST_F(ParamTexts, ADoubleDoesNotSurviveTheRoundTrip) {
    const double back = read<double>(written(ParamText::Write(1.5)).c_str());
    EXPECT_NE(back, 1.5);
    EXPECT_EQ(bitsOf(back), 0x3FC00000u);
}

TEST_F(ParamTexts, TextWithoutDoubleIsUnexpected) {
    for (const char* const text : {"", " ", "abc", ".", "-", "e5", "--1", "+-1", "- 1", ",5"}) {
        EXPECT_EQ(failure<double>(text), NCF_E_UNEXPECTED) << text;
    }
}

TEST_F(ParamTexts, RationalsAreTwoNumbersAroundAStroke) {
    EXPECT_EQ(written(ParamText::Write(NMAParamRational{-30000, 1001})), "-30000/1001");
    EXPECT_EQ(read<NMAParamRational>("30000/1001"), (NMAParamRational{30000, 1001}));
    EXPECT_EQ(read<NMAParamRational>(" 1/ -2 and more"), (NMAParamRational{1, -2}));
    EXPECT_EQ(read<NMAParamRational>("0/0"), (NMAParamRational{0, 0}));
    EXPECT_EQ(read<NMAParamRational>("9223372036854775807/-9223372036854775808"),
              (NMAParamRational{std::numeric_limits<ncfSInt64>::max(),
                                std::numeric_limits<ncfSInt64>::min()}));
}

TEST_F(ParamTexts, HalfARationalIsUnexpected) {
    for (const char* const text : {"", "1", "1/", "/2", "1 /2", "1:2", "a/b", "1/x"}) {
        EXPECT_EQ(failure<NMAParamRational>(text), NCF_E_UNEXPECTED) << text;
    }
}

TEST_F(ParamTexts, IdentifiersAreWrittenInCapitalsAndReadInAnyCase) {
    EXPECT_EQ(written(ParamText::Write(kIdA)), ID_A);
    EXPECT_EQ(written(ParamText::Write(ncfGuid("00000001-0002-0003-0405-060708090a0b"))),
              "00000001-0002-0003-0405-060708090A0B");
    EXPECT_EQ(read<GUID>(ID_A), kIdA);
    EXPECT_EQ(read<GUID>(ID_A_LOWER), kIdA);
}

TEST_F(ParamTexts, TextWithoutIdentifierIsUnexpected) {
    for (const char* const text :
         {"", "0E74B673", "{" ID_A "}", "0E74B673-0CA8-403B-A142-986D795086", "no identifier"}) {
        EXPECT_EQ(failure<GUID>(text), NCF_E_UNEXPECTED) << text;
    }
}

TEST_F(ParamTexts, OnlyTheWholeWordIsTrue) {
    EXPECT_TRUE(ParamText::IsTrue(S("true")));
    for (const char* const text : {"", "True", "TRUE", "true ", " true", "1", "yes", "false"}) {
        EXPECT_FALSE(ParamText::IsTrue(S(text))) << text;
    }
    EXPECT_EQ(written(ParamText::WriteFlag(true)), "true");
    EXPECT_EQ(written(ParamText::WriteFlag(false)), "false");
}

}  // namespace
