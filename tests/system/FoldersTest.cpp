// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Folders: which ones the module claims, and the list of their movies.

#include <fcntl.h>
#include <sys/stat.h>

#include <map>
#include <vector>

#include "host_interfaces/media/PluginComponents.h"
#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/cliphost/FolderClips.h"
#include "reference_host/framework/HostPath.h"
#include "tests/system/Facts.h"
#include "tests/system/SystemTest.h"

namespace {

class Folders : public SystemTest {
protected:
    bool Claimed(const std::filesystem::path& path) {
        return cliphost::IsClaimed(session(), cliphost::PathForModule(path).get());
    }
    std::filesystem::path Copy(const std::string& movie, const std::filesystem::path& to) {
        std::filesystem::create_directories((folder() / to).parent_path());
        std::filesystem::copy_file(MadeMovie(movie), folder() / to);
        return folder() / to;
    }
};

TEST_F(Folders, WithAMovieAreClaimed) {
    EXPECT_FALSE(Claimed(folder()));
    Write(movies::Bytes{1}, "a.mp4");
    Write(movies::Bytes{1}, "B.MOV");
    Write(movies::Bytes{1}, "mov");
    std::filesystem::create_directory(folder() / "folder.mov");
    EXPECT_FALSE(Claimed(folder()));
    // The name alone counts: the movie is not opened.
    Write(movies::Bytes{}, "empty.mov");
    EXPECT_TRUE(Claimed(folder()));
}

TEST_F(Folders, WithALinkToAMovieAreClaimed) {
    std::filesystem::create_symlink(MadeMovie("png.mov"), folder() / "link.mov");
    EXPECT_TRUE(Claimed(folder()));
}

TEST_F(Folders, AreNotClaimedForMoviesInFoldersWithin) {
    Copy("png.mov", "within/png.mov");
    EXPECT_FALSE(Claimed(folder()));
    EXPECT_TRUE(Claimed(folder() / "within"));
}

TEST_F(Folders, WithAMovieOfAnyNameAreListed) {
    // Accents, other scripts, blanks, and bytes that are no text at all.
    const std::vector<std::string> names = {"a.mov",
                                            "b c (1).mov",
                                            "\xC3\xBC.mov",
                                            "\xE5\x8B\x95\xE7\x94\xBB.mov",
                                            "bad \xFF\xFE.mov",
                                            "\xF0\x9F\x8E\xAC.mov",
                                            "per%cent%s.mov"};
    std::set<std::filesystem::path> expected;
    for (const std::string& name : names) {
        expected.insert(Copy("png.mov", name));
    }
    const cliphost::FolderClips clips(session(), folder());
    std::set<std::filesystem::path> listed;
    for (const cliphost::FolderClip& clip : clips.clips()) {
        listed.insert(clip.path);
        const auto description =
            cliphost::DescribeFromList(session(), clips.list(), clip.index, clip.path);
        EXPECT_TRUE(description.file) << clip.path << LineOf(description.problem);
    }
    EXPECT_EQ(listed, expected);
}

TEST_F(Folders, WithOneBadMovieStillGiveTheOthers) {
    Copy("png.mov", "good.mov");
    Write(movies::Bytes(100, 'x'), "bad.mov");
    Copy("mjpeg.mov", "other.mov");
    const cliphost::FolderClips clips(session(), folder());
    ASSERT_EQ(clips.clips().size(), 3u);
    std::map<std::string, bool> described;
    for (const cliphost::FolderClip& clip : clips.clips()) {
        const auto description =
            cliphost::DescribeFromList(session(), clips.list(), clip.index, clip.path);
        described[std::filesystem::path(clip.path).filename()] =
            static_cast<bool>(description.file);
        EXPECT_EQ(description.result < 0, !description.file);
    }
    EXPECT_EQ(described, (std::map<std::string, bool>{
                             {"bad.mov", false}, {"good.mov", true}, {"other.mov", true}}));
    IAAFFile* none = nullptr;
    EXPECT_EQ(clips.list()->GetMetadata(3, &none), NCF_E_NOTFOUND);
    EXPECT_EQ(clips.list()->GetMetadata(-1, &none), NCF_E_NOTFOUND);
    EXPECT_EQ(none, nullptr);
}

TEST_F(Folders, TellTheirNewestDate) {
    Copy("png.mov", "old.mov");
    const auto newer = Copy("png.mov", "new.mov");
    const timespec dates[2] = {{1800000000, 0}, {1800000000, 0}};  // 2027-01-15 08:00:00 UTC
    ASSERT_EQ(utimensat(AT_FDCWD, newer.c_str(), dates, 0), 0);
    const auto path = cliphost::PathForModule(folder());
    const auto info = cliphost::VolumeInfoOf(session(), path.get());
    ncfUInt32 date = 0;
    ASSERT_EQ(info->GetModificationDate(&date), NCF_OK);
    EXPECT_EQ(date, 1800000000u);
}

// A list describes a movie as a container does.
TEST_F(Folders, DescribeAsContainersDo) {
    const auto movie = Copy("prores_with_pcm.mov", "movie.mov");
    const cliphost::FolderClips clips(session(), folder());
    ASSERT_EQ(clips.clips().size(), 1u);
    const auto fromList = cliphost::DescribeFromList(session(), clips.list(), 0, movie);
    ASSERT_TRUE(fromList.file) << LineOf(fromList.problem);
    EXPECT_EQ(cliphost::ToReadableText(cliphost::ReadTree(fromList.file.get())),
              cliphost::ToReadableText(Describe(movie)));
}

}  // namespace
