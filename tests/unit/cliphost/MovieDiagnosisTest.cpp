// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/MovieDiagnosis.h"

#include <gtest/gtest.h>

#include "tests/support/TestFiles.h"
#include "tests/unit/cliphost/TestFolder.h"

using cliphost::DiagnoseMovie;
using namespace cliphost_tests;

namespace {

std::string Atom(const std::string& type, const std::string& body, std::size_t claimed = 0) {
    const std::size_t size = claimed != 0 ? claimed : body.size() + 8;
    std::string atom;
    for (int shift = 24; shift >= 0; shift -= 8) {
        atom += static_cast<char>(size >> shift);
    }
    return atom + type + body;
}

std::string Diagnosis(const std::string& content) {
    const TestFolder folder;
    WriteFile(folder / "movie.mov", content);
    return LineOf(DiagnoseMovie(folder / "movie.mov"));
}

void ExpectSays(const std::string& content, const char* words) {
    const std::string said = Diagnosis(content);
    EXPECT_NE(said.find(words), std::string::npos) << said;
}

const std::string kType = Atom("ftyp", "qt  \0\0\0\0");

}  // namespace

TEST(MovieDiagnosis, TellsFilesThatHoldNothing) {
    const TestFolder folder;
    EXPECT_NE(DiagnoseMovie(folder / "none.mov").reason.find("there is no such file"),
              std::string::npos);
    EXPECT_NE(DiagnoseMovie(folder.path()).reason.find("this is a folder"), std::string::npos);
    // One that nobody writes to would be waited for without end.
    if (MakePipe(folder / "pipe.mov")) {
        EXPECT_EQ(DiagnoseMovie(folder / "pipe.mov").reason, "this is not a file but a pipe");
        EXPECT_EQ(DiagnoseMovie("/dev/null").reason, "this is not a file but a character device");
    }
    ExpectSays("", "the file is empty");
}

TEST(MovieDiagnosis, TellsFilesOfAnotherFamily) {
    ExpectSays("RIFF1234WAVE", "no movie of the QuickTime family");
    ExpectSays("abc", "the file holds 3 bytes and no atom");
    ExpectSays(Atom("abcd", ""), "no movie of the QuickTime family");
}

// To convert what is none helps nobody.
TEST(MovieDiagnosis, GivesNoAdviceThatCantHelp) {
    EXPECT_EQ(Diagnosis("RIFF1234WAVE").find("convert"), std::string::npos);
    EXPECT_EQ(Diagnosis(Atom("ftyp", "", 7)).find("convert"), std::string::npos);
    EXPECT_EQ(Diagnosis(Atom("ftyp", "", 7)).find("another kind"), std::string::npos);
}

TEST(MovieDiagnosis, TellsWhereAFileWasCut) {
    ExpectSays(kType + Atom("moov", "abcd", 5000),
               "'moov' claims 5000 bytes, the file ends at byte 24");
    ExpectSays(kType + Atom("mdat", "abcd", 5000),
               "'mdat' claims 5000 bytes, the file ends at byte 24, before any movie header");
}

TEST(MovieDiagnosis, TellsThatTheHeaderIsMissing) {
    ExpectSays(kType + Atom("mdat", "abcd"), "the file ends without 'moov', the movie header");
}

TEST(MovieDiagnosis, TellsWhatIsWrongWithTheHeader) {
    ExpectSays(kType + Atom("moov", ""), "'moov' holds no 'mvhd' (at byte 12)");
}

TEST(MovieDiagnosis, IsNotDeceivedBySizesThatLie) {
    // Sizes below a head, and a 64-bit size beyond all: no endless walk.
    ExpectSays(kType + Atom("mdat", "", 4), "'mdat' has the impossible size 4");
    ExpectSays(kType + Atom("mdat", std::string(8, '\xFF'), 1),
               "'mdat' has the impossible size 18446744073709551615");
    std::string many;
    for (int i = 0; i < 1000; ++i) {
        many += Atom("free", "");
    }
    EXPECT_FALSE(Diagnosis(many).empty());
}
