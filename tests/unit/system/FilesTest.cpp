// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Files by names of every script, on every system.
#include <gtest/gtest.h>

#include <cerrno>
#include <chrono>
#include <cstdio>
#include <iterator>
#include <set>
#include <string>

#include "reference_host/system/Access.h"
#include "reference_host/system/FileNumber.h"
#include "reference_host/system/FileState.h"
#include "reference_host/system/FileSystem.h"
#include "reference_host/system/FolderWatch.h"
#include "reference_host/system/OutputStream.h"
#include "reference_host/system/Paths.h"
#include "reference_host/system/ScratchFolder.h"
#include "reference_host/system/UnfinishedFile.h"

using namespace host::system;

namespace {

class Files : public testing::Test {
protected:
    void SetUp() override { ASSERT_FALSE(error_) << error_.message(); }

    std::filesystem::path Write(const std::string& name, const std::string& content) const {
        const std::filesystem::path file = scratch_.path() / PathOfText(name);
        OutputStream stream;
        EXPECT_EQ(stream.Open(file), 0) << name;
        EXPECT_EQ(stream.Write(content.data(), content.size()), 0);
        EXPECT_EQ(stream.Close(), 0);
        return file;
    }
    static std::string ContentOf(const std::filesystem::path& file) {
        std::string content(100, '\0');
        std::FILE* const stream = OpenToRead(file);
        EXPECT_NE(stream, nullptr);
        if (stream != nullptr) {
            content.resize(std::fread(content.data(), 1, content.size(), stream));
            std::fclose(stream);
        }
        return content;
    }
    std::filesystem::path folder() const { return scratch_.path(); }

private:
    std::error_code error_;
    ScratchFolder scratch_{error_};
};

const char* const kNames[] = {
    "plain.mov",
    "\xC3\xBC\xC3\xA4\xC3\xB6\xC3\x9F.mov",                              // German
    "\xD0\xBA\xD0\xB8\xD0\xBD\xD0\xBE.mov",                              // Cyrillic
    "\xE6\x98\xA0\xE7\x94\xBB.mov",                                      // Chinese characters
    "\xD7\xA1\xD7\xA8\xD7\x98 \xD9\x81.mov",                             // Hebrew, Arabic
    "\xF0\x9F\x8E\xAC\xF0\x9F\x91\xA9\xE2\x80\x8D\xF0\x9F\x9A\x80.mov",  // beyond 16 bits, joined
};

}  // namespace

TEST_F(Files, AreFoundByTheNamesOfEqualKeys) {
    Write("\xC3\xBC\xD0\xBA Clip.mov", "");
    for (const char* const name :
         {"\xC3\xBC\xD0\xBA Clip.mov", "\xC3\xBC\xD0\xBA CLIP.mov", "\xC3\xBC\xD0\x9A Clip.mov",
          "\xC3\x9C\xD0\xBA Clip.mov", "u\xD0\xBA Clip.mov"}) {
        const std::filesystem::path file = folder() / PathOfText(name);
        EXPECT_EQ(std::filesystem::exists(file),
                  NameKey(file) == NameKey(folder() / PathOfText("\xC3\xBC\xD0\xBA Clip.mov")))
            << name;
    }
}

TEST_F(Files, OfEveryScriptAreWrittenAndRead) {
    for (const char* const name : kNames) {
        const std::filesystem::path file = Write(name, "a\nb\r\n\x1A");
        EXPECT_EQ(ContentOf(file), "a\nb\r\n\x1A") << name;
        EXPECT_EQ(StateOf(file)->size, 6u) << name;
        EXPECT_TRUE(ReadFirstByte(file).isThere) << name;
        EXPECT_EQ(AccessError(file, Right::Read), 0) << name;
        EXPECT_EQ(AccessError(file, Right::Write), 0) << name;
    }
}

TEST_F(Files, OfEveryScriptAreListedByTheirNames) {
    std::set<std::string> expected(std::begin(kNames), std::end(kNames));
    for (const char* const name : kNames) {
        Write(name, "x");
    }
    std::set<std::string> listed;
    for (const auto& entry : std::filesystem::directory_iterator(folder())) {
        listed.insert(PathText(entry.path().filename()));
    }
    EXPECT_EQ(listed, expected);
}

TEST_F(Files, HaveOneNumberWhateverTheyAreCalled) {
    const std::filesystem::path file = Write("a.mov", "x");
    const std::filesystem::path other = Write("b.mov", "x");
    EXPECT_EQ(NumberOf(file), NumberOf(folder() / "." / "a.mov"));
    EXPECT_NE(NumberOf(file), NumberOf(other));
    EXPECT_TRUE(NumberOf(folder()));
    EXPECT_FALSE(NumberOf(folder() / "none"));
}

TEST_F(Files, ThatAreNotThereSaySo) {
    EXPECT_EQ(ReadFirstByte(folder() / "none").openError, ENOENT);
    EXPECT_EQ(AccessError(folder() / "none", Right::Read), ENOENT);
    EXPECT_EQ(OutputStream().Open(folder() / "none" / "a"), ENOENT);
    EXPECT_EQ(OpenToRead(folder() / "none"), nullptr);
    EXPECT_FALSE(StateOf(folder() / "none"));
}

TEST_F(Files, ThatAreEmptyHaveNoFirstByte) {
    const FirstByte first = ReadFirstByte(Write("empty", ""));
    EXPECT_EQ(first.openError, 0);
    EXPECT_EQ(first.readError, 0);
    EXPECT_FALSE(first.isThere);
}

TEST_F(Files, HaveAStateAndFoldersHaveNone) {
    EXPECT_FALSE(StateOf(folder()));
    const std::filesystem::path file = Write("a", "x");
    const auto state = StateOf(file);
    ASSERT_TRUE(state);
    const std::int64_t of2020 = std::int64_t{1'577'836'800} * 1'000'000'000;
    EXPECT_GT(state->date, of2020);
    EXPECT_TRUE(*state == *StateOf(file));
    Write("a", "xy");
    EXPECT_FALSE(*state == *StateOf(file));
}

TEST_F(Files, ThatAreFinishedReplaceTheOnesBefore) {
    for (const char* const name : kNames) {
        const std::filesystem::path place = Write(name, "before");
        UnfinishedFile file(place);
        Write(PathText(file.path().filename()), "after");
        std::error_code error;
        file.TakePlace(error);
        EXPECT_FALSE(error) << error.message();
        EXPECT_EQ(ContentOf(place), "after") << name;
    }
}

TEST_F(Files, ThatAreFinishedLeaveWhatIsThereIfTheyAreToldTo) {
    const std::filesystem::path place = Write("a.mov", "before");
    {
        UnfinishedFile file(place);
        Write(PathText(file.path().filename()), "after");
        std::error_code error;
        file.TakePlaceIfFree(error);
        EXPECT_FALSE(error) << error.message();
        EXPECT_EQ(ContentOf(place), "before");
        EXPECT_NE(file.path().filename(), place.filename());
    }
    EXPECT_EQ(std::distance(std::filesystem::directory_iterator(folder()), {}), 1);
}

TEST_F(Files, GoWithTheirScratchFolder) {
    std::error_code error;
    std::filesystem::path path;
    {
        const ScratchFolder inner(folder(), error);
        ASSERT_FALSE(error);
        path = inner.path();
        EXPECT_EQ(path.parent_path(), folder());
        OutputStream stream;
        EXPECT_EQ(stream.Open(path / "a"), 0);
    }
    EXPECT_FALSE(std::filesystem::exists(path));
    const ScratchFolder none(folder() / "none", error);
    EXPECT_TRUE(error);
}

TEST_F(Files, TheSystemTellsOfAreNamedInFull) {
    using namespace std::chrono_literals;
    FolderWatch watch;
    ASSERT_EQ(watch.Add(folder()), 0);
    const std::filesystem::path file = Write(kNames[5], "x");
    bool isTold = false;
    for (int i = 0; i < 100 && !isTold; ++i) {
        for (const FolderChange& change : watch.Wait(100ms)) {
            isTold = isTold || (change.what == FolderChange::What::File && change.path == file);
        }
    }
    EXPECT_TRUE(isTold);
    EXPECT_EQ(watch.Add(folder() / "none"), ENOENT);
    EXPECT_EQ(watch.Add(file), ENOTDIR);
}

TEST_F(Files, HaveUrlsThatNameThem) {
    for (const char* const name : kNames) {
        const std::filesystem::path file = Write(name, "x");
        std::string text;
        ASSERT_TRUE(PathTextOfUrl(UrlOfPath(file), text)) << UrlOfPath(file);
        EXPECT_EQ(PathOfText(text), file);
    }
}

TEST(PathTexts, AreThePathAgain) {
    for (const char* const name : kNames) {
        EXPECT_EQ(PathText(PathOfText(name)), name);
    }
    EXPECT_EQ(PathText(PathOfText("no UTF-8 \xFF.mov")), "no UTF-8 \xFF.mov");
}

TEST(PathTexts, CanHaveSlashesBetweenTheNames) {
    EXPECT_EQ(GenericPathText(std::filesystem::path("a") / "b" / "c"), "a/b/c");
}
