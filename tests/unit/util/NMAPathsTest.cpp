// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/util/UtilFixture.h"

class NMAPathsTest : public UtilTest {
protected:
    static std::string Split(const std::string& path) {
        INCFString* out = nullptr;
        EXPECT_EQ(NCF_OK, NMASplitPath(host::MakeString(path).get(), &out));
        return Taken(out);
    }

    static std::string Url(const std::string& path) {
        INCFString* out = nullptr;
        const NCFRESULT result = MakeURLPathFromFilePath(host::MakeString(path).get(), &out);
        EXPECT_EQ(NCF_OK, result);
        return Taken(out);
    }
};

TEST_F(NMAPathsTest, SplitGivesTheNameWithoutFolderAndExtension) {
    EXPECT_EQ("clip", Split("C:\\media\\clip.mov"));
    EXPECT_EQ("clip", Split("/media/clip.mov"));
    EXPECT_EQ("clip", Split("\\media/clip.mov"));
    EXPECT_EQ("clip", Split("clip.mov"));
    EXPECT_EQ("clip", Split("clip"));
}

TEST_F(NMAPathsTest, SplitTakesTheLastExtensionOnly) {
    EXPECT_EQ("a.b", Split("/m/a.b.mov"));
    EXPECT_EQ("clip", Split("/m/clip."));
    EXPECT_EQ("clip", Split("/a.b/clip"));
    EXPECT_EQ(".mov", Split("/m/.mov"));
}

TEST_F(NMAPathsTest, SplitOfAFolderIsEmpty) {
    EXPECT_EQ("", Split("/media/"));
    EXPECT_EQ("", Split(""));
}

TEST_F(NMAPathsTest, SplitLeavesThePathAlone) {
    const auto path = host::MakeString("/m/a.mov", kNCFUTF32);
    INCFString* out = nullptr;
    ASSERT_EQ(NCF_OK, NMASplitPath(path.get(), &out));
    out->Release();
    EXPECT_EQ(U"/m/a.mov", path->Text());
    EXPECT_EQ(static_cast<ncfUInt32>(kNCFUTF32), path->GetEncoding());
}

TEST_F(NMAPathsTest, UrlOfARootedPath) {
    EXPECT_EQ("file:///home/me/clip.mov", Url("/home/me/clip.mov"));
    EXPECT_EQ("file:///", Url("/"));
}

TEST_F(NMAPathsTest, UrlOfADrivePathKeepsTheColonOfTheDrive) {
    EXPECT_EQ("file:///C:/media/clip.mov", Url("C:\\media\\clip.mov"));
    EXPECT_EQ("file:///C:/a%3Ab", Url("C:\\a:b"));
}

TEST_F(NMAPathsTest, UrlOfAServerPathNamesTheServer) {
    EXPECT_EQ("file://server/share/clip.mov", Url("\\\\server\\share\\clip.mov"));
}

TEST_F(NMAPathsTest, BothFormsOfOnePathGiveOneUrl) {
    EXPECT_EQ(Url("/home/me/a b.mov"), Url("\\home\\me\\a b.mov"));
}

TEST_F(NMAPathsTest, UrlEscapesAllButUnreservedCharacters) {
    EXPECT_EQ("file:///AZaz09-._~", Url("/AZaz09-._~"));
    EXPECT_EQ("file:///%20%21%23%24%25%26%27%28%29%2A%2B%2C%3A%3B%3D%3F%40%5B%5D",
              Url("/ !#$%&'()*+,:;=?@[]"));
}

TEST_F(NMAPathsTest, UrlEscapesTheBytesOfUtf8AndStrayBytes) {
    EXPECT_EQ("file:///caf%C3%A9%F0%9F%8E%AC", Url("/caf\xC3\xA9\xF0\x9F\x8E\xAC"));
    EXPECT_EQ("file:///a%E9", Url("/a\xE9"));
}

TEST_F(NMAPathsTest, UrlOfARelativePathStartsAtTheWorkingFolder) {
    const std::string folder = Url(std::filesystem::current_path().u8string());
    EXPECT_EQ(folder + "/clip.mov", Url("clip.mov"));
    EXPECT_EQ(folder + "/C%3Aclip.mov", Url("C:clip.mov"));
}

TEST_F(NMAPathsTest, RefusesAPathThatNamesNothing) {
    INCFString* out = reinterpret_cast<INCFString*>(1);
    EXPECT_EQ(NCF_E_INVALIDARG, MakeURLPathFromFilePath(host::MakeString("").get(), &out));
    EXPECT_EQ(nullptr, out);
    const auto zero = host::MakeString(std::u32string_view(U"/a\0b", 4));
    EXPECT_EQ(NCF_E_INVALIDARG, MakeURLPathFromFilePath(zero.get(), &out));
}

TEST_F(NMAPathsTest, NullsItsOutputAndRefusesNullArguments) {
    INCFString* out = reinterpret_cast<INCFString*>(1);
    EXPECT_EQ(NCF_E_POINTER, NMASplitPath(nullptr, &out));
    EXPECT_EQ(nullptr, out);
    out = reinterpret_cast<INCFString*>(1);
    EXPECT_EQ(NCF_E_POINTER, MakeURLPathFromFilePath(nullptr, &out));
    EXPECT_EQ(nullptr, out);
    const auto path = host::MakeString("/a");
    EXPECT_EQ(NCF_E_POINTER, NMASplitPath(path.get(), nullptr));
    EXPECT_EQ(NCF_E_POINTER, MakeURLPathFromFilePath(path.get(), nullptr));
}

TEST_F(NMAPathsTest, HandsOnTheRefusalOfTheFactory) {
    const auto path = host::MakeString("/m/a.mov");
    host_.factory().SetRule([](const host::CreationCall&) { return NCF_E_ACCESSDENIED; });
    INCFString* out = nullptr;
    EXPECT_EQ(NCF_E_ACCESSDENIED, NMASplitPath(path.get(), &out));
    EXPECT_EQ(NCF_E_ACCESSDENIED, MakeURLPathFromFilePath(path.get(), &out));
    EXPECT_EQ(nullptr, out);
}
