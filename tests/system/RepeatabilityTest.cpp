// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The same movie is described in the same way: ids, bytes of the saved file, and
// what a reader of the saved file finds.

#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Describe.h"
#include "tests/system/Facts.h"
#include "tests/system/SystemTest.h"

namespace {

constexpr const char* kKinds[] = {"prores_with_pcm.mov",    "h264_with_aac.mov",
                                  "three_sounds.mov",       "png_alpha.mov",
                                  "pcm_s24be.mov",          "xdcam_ex_1080i50.mov",
                                  "timecode_2997_drop.mov", "avc_intra100_1080p25.mov"};

class Repeatability : public SystemTest {
protected:
    std::vector<std::string> MobIds(const std::filesystem::path& movie) {
        const cliphost::TreeNode tree = Describe(movie);
        std::vector<std::string> ids;
        for (const MobPlace place : {kMasterMob, kFileMob, kSourceMob}) {
            ids.push_back(Fact(Mob(tree, place), "MobID"));
        }
        return ids;
    }
    std::filesystem::path Save(const std::filesystem::path& movie, const std::string& name) {
        const auto description = cliphost::DescribeMovie(session(), movie);
        EXPECT_TRUE(description.file) << LineOf(description.problem);
        if (description.file) {
            session().aaf().Save(description.file.get(), folder() / name);
        }
        return folder() / name;
    }
    std::filesystem::path CopyTo(const std::string& within, const std::filesystem::path& movie) {
        std::filesystem::create_directories(folder() / within);
        const auto copy = folder() / within / movie.filename();
        std::filesystem::copy_file(movie, copy);
        return copy;
    }
};

TEST_F(Repeatability, EqualMoviesInDifferentFoldersHaveEqualMobIds) {
    for (const char* const kind : kKinds) {
        const auto first = CopyTo("a", MadeMovie(kind));
        const auto second = CopyTo("b/deeper", MadeMovie(kind));
        const auto ids = MobIds(first);
        EXPECT_EQ(ids, MobIds(second)) << kind;
        EXPECT_NE(ids[0], ids[1]);
        EXPECT_NE(ids[1], ids[2]);
    }
}

TEST_F(Repeatability, DifferentMoviesHaveDifferentMobIds) {
    std::set<std::string> ids;
    std::size_t files = 0;
    for (const auto& entry : std::filesystem::directory_iterator(MadeMoviesFolder())) {
        if (entry.path().filename().string()[0] != '.' && ++files <= 40) {
            ids.insert(MobIds(entry.path())[0]);
        }
    }
    EXPECT_EQ(ids.size(), std::min<std::size_t>(files, 40));
    EXPECT_GT(files, 40u);
}

TEST_F(Repeatability, ChangedMediaBytesChangeTheMobIds) {
    const movies::Bytes bytes = ReadFile(MadeMovie("prores_with_pcm.mov"));
    movies::Bytes changed = bytes;
    // The last picture of a header-last movie lies well within its media.
    for (std::size_t i = changed.size() / 4; i < changed.size() / 4 * 3; i += 16) {
        changed[i] ^= 1;
    }
    EXPECT_NE(MobIds(Write(bytes, "same.mov"))[0], MobIds(Write(changed, "other.mov"))[0]);
}

TEST_F(Repeatability, DescribingTwiceWithThePinnedTimeSavesTheSameBytes) {
    for (const char* const kind : kKinds) {
        const auto first = ReadFile(Save(MadeMovie(kind), "first.aaf"));
        const auto second = ReadFile(Save(MadeMovie(kind), "second.aaf"));
        EXPECT_GT(first.size(), 4096u) << kind;
        EXPECT_TRUE(first == second) << kind << ": the two files differ";
    }
}

TEST_F(Repeatability, ANewSessionSavesTheSameBytes) {
    const auto first = ReadFile(Save(MadeMovie("h264_with_aac.mov"), "first.aaf"));
    Start();
    // Another movie before it makes no difference.
    Describe(MadeMovie("prores_hq_1080i.mov"));
    EXPECT_TRUE(first == ReadFile(Save(MadeMovie("h264_with_aac.mov"), "second.aaf")));
}

TEST_F(Repeatability, TheSavedFileReadsBackAsTheDescription) {
    for (const auto& entry : std::filesystem::directory_iterator(MadeMoviesFolder())) {
        if (entry.path().filename().string()[0] == '.') {
            continue;
        }
        const auto description = cliphost::DescribeMovie(session(), entry.path());
        ASSERT_TRUE(description.file) << LineOf(description.problem);
        session().aaf().Save(description.file.get(), folder() / "saved.aaf");
        const auto saved = session().aaf().Open(folder() / "saved.aaf");
        EXPECT_EQ(cliphost::ToText(cliphost::ReadTree(description.file.get())),
                  cliphost::ToText(cliphost::ReadTree(saved.get())))
            << entry.path();
    }
}

// Memory and objects do not grow from movie to movie.
TEST_F(Repeatability, ManyMoviesLeaveNothingBehind) {
    Describe(MadeMovie("prores_with_pcm.mov"));
    const auto objects = session().host().LiveObjects();
    for (int i = 0; i < 50; ++i) {
        Describe(MadeMovie(kKinds[static_cast<std::size_t>(i) % std::size(kKinds)]));
        ASSERT_EQ(session().host().LiveObjects(), objects);
        ASSERT_TRUE(ModuleIsIdle());
    }
}

}  // namespace
