// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMAString.h"

#include <thread>
#include <vector>

#include "tests/unit/util/UtilFixture.h"

class NMAStringTest : public UtilTest {};

TEST_F(NMAStringTest, StartsEmpty) {
    const NMAString string;
    EXPECT_TRUE(string.IsEmpty());
    EXPECT_STREQ("", string.GetUTF8String());
    EXPECT_STREQ(L"", string.GetWCHARString());
    EXPECT_TRUE(NMAString(static_cast<const char*>(nullptr)).IsEmpty());
    EXPECT_TRUE(NMAString(nullptr, kNCFUTF8).IsEmpty());
}

TEST_F(NMAStringTest, ShowsItsTextInThreeEncodings) {
    const NMAString string("caf\xC3\xA9");
    EXPECT_STREQ("caf\xC3\xA9", string.GetUTF8String());
    EXPECT_EQ(std::u16string(u"caf\u00E9"), string.GetUTF16String());
    EXPECT_STREQ(L"caf\u00E9", string.GetWCHARString());
}

TEST_F(NMAStringTest, CopiesTheTextOfAHostString) {
    const auto source = host::MakeString("text", kNCFUTF32);
    const NMAString string(source.get(), kNCFWCHAR);
    source->AssignUTF8(kNCFUTF8, "other", kNCFZeroTerminated);
    EXPECT_STREQ("text", string.GetUTF8String());
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFWCHAR), string.InArg()->GetEncoding());
}

TEST_F(NMAStringTest, ReadingDoesNotConvertWhatIsShown) {
    const NMAString string("text");
    INCFString* shown = string.InArg();
    ASSERT_EQ(static_cast<ncfUInt32>(kNCFUTF8), shown->GetEncoding());
    string.GetWCHARString();
    string.GetUTF16String();
    EXPECT_EQ(shown, string.InArg());
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFUTF8), shown->GetEncoding());
}

TEST_F(NMAStringTest, TakesOverWhatACalleePutInItsPlace) {
    NMAString string("before");
    INCFString** place = string.OutArg();
    ASSERT_EQ(nullptr, *place);
    EXPECT_TRUE(string.IsEmpty());
    *place = host::MakeString("after").Detach();
    EXPECT_STREQ("after", string.GetUTF8String());
    EXPECT_EQ(*place, string.InArg());
}

TEST_F(NMAStringTest, SeesWhatACalleeWroteIntoTheShownString) {
    const NMAString string("before");
    ASSERT_EQ(NCF_OK, string.InArg()->AssignUTF8(kNCFUTF8, "after", kNCFZeroTerminated));
    EXPECT_STREQ("after", string.GetUTF8String());
    EXPECT_TRUE(string == NMAString("after"));
}

TEST_F(NMAStringTest, AChangeLeavesAStringAloneThatAnotherHolds) {
    NMAString string("before");
    INCFString* held = string.InArg();
    held->AddRef();
    string = NMAString("after");
    EXPECT_EQ("before", Taken(held));
    EXPECT_EQ("after", host::text::ReadUtf8(string.InArg()));
}

TEST_F(NMAStringTest, ComparesTextAndNotEncoding) {
    const auto wide = host::MakeString("same", kNCFWCHAR);
    EXPECT_TRUE(NMAString(wide.get(), kNCFUTF16) == NMAString("same"));
    EXPECT_TRUE(NMAString("same") != NMAString("other"));
    const NMAString one("same");
    EXPECT_TRUE(one == one);
}

TEST_F(NMAStringTest, AppendsAlsoItself) {
    NMAString string("ab");
    string += NMAString("c");
    EXPECT_STREQ("abc", string.GetUTF8String());
    string += string;
    EXPECT_STREQ("abcabc", string.GetUTF8String());
    string = *&string;
    EXPECT_STREQ("abcabc", string.GetUTF8String());
}

TEST_F(NMAStringTest, CarriesBytesThatAreNoUtf8) {
    const NMAString string("a\xE9.mov");
    EXPECT_STREQ("a\xE9.mov", string.GetUTF8String());
    EXPECT_EQ(0xDCE9, string.GetUTF16String()[1]);
}

// Joined, they would be one character, but neither was part of one.
TEST_F(NMAStringTest, KeepsBytesApartThatWereNoUtf8EachForItself) {
    NMAString string("\xC3");
    string += NMAString("\xA9");
    EXPECT_STREQ("\xC3\xA9", string.GetUTF8String());
    EXPECT_EQ(std::u16string({0xDCC3, 0xDCA9}), string.GetUTF16String());
    EXPECT_TRUE(string != NMAString("\xC3\xA9"));
    const NMAString copy(string);
    EXPECT_EQ(std::u16string({0xDCC3, 0xDCA9}), copy.GetUTF16String());
}

// Its UTF-8 is for reading only: a copy has what it stands for.
TEST_F(NMAStringTest, KeepsWhatHasNoFormInUtf8AfterThatWasShown) {
    const auto source = host::MakeString(std::u32string_view(U"a\xD800"), kNCFUTF16);
    const NMAString string(source.get(), kNCFUTF16);
    EXPECT_STREQ("a\xEF\xBF\xBD", string.GetUTF8String());
    EXPECT_TRUE(string != NMAString("a\xEF\xBF\xBD"));
    NMAString copy;
    copy = string;
    EXPECT_EQ(std::u16string({u'a', 0xD800}), copy.GetUTF16String());
    EXPECT_TRUE(copy == string);
}

TEST_F(NMAStringTest, ShowsTextThatItsEncodingCannotHoldInUtf16) {
    const auto source = host::MakeString("caf\xC3\xA9");
    const NMAString string(source.get(), kNCFASCII);
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFUTF16), string.InArg()->GetEncoding());
    EXPECT_EQ("caf\xC3\xA9", host::text::ReadUtf8(string.InArg()));
}

TEST_F(NMAStringTest, CreateStringGivesAnEmptyStringOfTheHost) {
    INCFString* made = nullptr;
    ASSERT_EQ(NCF_OK, NMAString::CreateString(&made));
    EXPECT_EQ(0u, made->GetLength());
    made->Release();
    EXPECT_EQ(NCF_E_POINTER, NMAString::CreateString(nullptr));
}

TEST_F(NMAStringTest, AFactoryThatRefusesGivesAStringThatRefuses) {
    host_.factory().SetRule([](const host::CreationCall& call) {
        return call.component == NCFCompID_NCFString ? NCF_E_OUTOFMEMORY : NCF_OK;
    });
    INCFString* made = reinterpret_cast<INCFString*>(1);
    EXPECT_EQ(NCF_E_OUTOFMEMORY, NMAString::CreateString(&made));
    EXPECT_EQ(nullptr, made);
    const NMAString string("text");
    INCFString* shown = string.InArg();
    ASSERT_NE(nullptr, shown);
    EXPECT_EQ(NMA_E_NOTINITIALIZED, shown->ConvertTo(kNCFUTF8));
    EXPECT_EQ(1, shown->IsEmpty());
    wchar_t* raw = reinterpret_cast<wchar_t*>(1);
    EXPECT_LT(shown->GetRawWCHAR(&raw), 0);
    EXPECT_EQ(nullptr, raw);
    EXPECT_STREQ("text", string.GetUTF8String()) << "its own text stays";
    host_.factory().SetRule({});
    EXPECT_EQ("text", host::text::ReadUtf8(string.InArg())) << "asked again, it gets one";
}

TEST_F(NMAStringTest, ManyThreadsMayReadOne) {
    const NMAString string("shared \xC3\xA9");
    string.InArg();
    std::vector<std::thread> readers;
    for (int i = 0; i < 4; ++i) {
        readers.emplace_back([&] {
            for (int turn = 0; turn < 200; ++turn) {
                EXPECT_STREQ("shared \xC3\xA9", string.GetUTF8String());
                EXPECT_STREQ(L"shared \u00E9", string.GetWCHARString());
                const NMAString copy(string);
                EXPECT_TRUE(copy == string);
            }
        });
    }
    for (std::thread& reader : readers) {
        reader.join();
    }
}

TEST(NMAStringAlone, WorksWithoutAFactory) {
    NMATerminate();
    NMAString string("text");
    string += NMAString(" more");
    EXPECT_STREQ(L"text more", string.GetWCHARString());
    INCFString* made = nullptr;
    EXPECT_EQ(NMA_E_NOTINITIALIZED, NMAString::CreateString(&made));
    ASSERT_NE(nullptr, string.InArg());
    EXPECT_EQ(NMA_E_NOTINITIALIZED, string.InArg()->AssignUTF8(kNCFUTF8, "x", 1));
}
