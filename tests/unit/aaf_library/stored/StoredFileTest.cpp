// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "aaf_library/stored/StoredFile.h"

#include "aaf_library/stored/TreeWriter.h"
#include "tests/support/TestFolder.h"
#include "tests/unit/aaf_library/stored/SampleTree.h"

#include <gtest/gtest.h>
#include <unistd.h>
#include <fstream>
#include <iterator>

using namespace aaf::stored;
namespace fs = std::filesystem;

namespace {

class StoredFile : public testing::Test {
protected:
    static void Put(const fs::path& path, const std::string& content) {
        std::ofstream(path, std::ios::binary) << content;
    }
    std::size_t FileCount() const { return folder_.CountFiles(); }

    const TestFolder folder_;
};

}  // namespace

TEST_F(StoredFile, SavesAndLoadsATreeUnderAnyName) {
    const fs::path path = folder_ / fs::u8path("cl\xC3\xAFp \xF0\x9F\x8E\xAC.aaf");
    const StoredObject tree = sample::RootWith(sample::text(0x4402, u"name"));
    ASSERT_TRUE(SaveTree(tree, path, SectorSize::Bytes512));
    StoredObject loaded;
    const FileResult result = LoadTree(path, loaded);
    ASSERT_TRUE(result) << result.message;
    EXPECT_EQ(loaded, tree);
    EXPECT_EQ(FileCount(), 1u);
}

TEST_F(StoredFile, HoldsTheTreeAsItIsLaidOut) {
    // One stream is long, so that no part of the file is empty.
    const StoredObject tree = sample::EveryForm();
    for (const SectorSize size : {SectorSize::Bytes512, SectorSize::Bytes4096}) {
        ASSERT_TRUE(SaveTree(tree, folder_ / "tree.aaf", size));
        std::ifstream in(folder_ / "tree.aaf", std::ios::binary);
        const Bytes content{std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
        EXPECT_EQ(content, WriteTree(tree, size));
    }
}

TEST_F(StoredFile, TellsTheKindOfAnAafFile) {
    SectorSize kind = SectorSize::Bytes512;
    ASSERT_TRUE(SaveTree(sample::EveryForm(), folder_ / "large.aaf", SectorSize::Bytes4096));
    EXPECT_TRUE(IsAafFile(folder_ / "large.aaf", &kind));
    EXPECT_EQ(kind, SectorSize::Bytes4096);
    ASSERT_TRUE(SaveTree(sample::EveryForm(), folder_ / "small.aaf", SectorSize::Bytes512));
    EXPECT_TRUE(IsAafFile(folder_ / "small.aaf", &kind));
    EXPECT_EQ(kind, SectorSize::Bytes512);
    EXPECT_TRUE(IsAafFile(folder_ / "small.aaf", nullptr));
}

TEST_F(StoredFile, TakesNoOtherFileForAnAafFile) {
    Put(folder_ / "text", "hello");
    Put(folder_ / "compound", "\xD0\xCF\x11\xE0\xA1\xB1\x1A\xE1" + std::string(600, '\0'));
    Put(folder_ / "empty", "");
    for (const char* name : {"text", "compound", "empty", "absent", ""}) {
        EXPECT_FALSE(IsAafFile(folder_ / name, nullptr)) << name;
    }
    StoredObject tree;
    EXPECT_EQ(LoadTree(folder_ / "text", tree).failure, FileFailure::NotAaf);
    EXPECT_EQ(LoadTree(folder_ / "compound", tree).failure, FileFailure::NotAaf);
    const FileResult empty = LoadTree(folder_ / "empty", tree);
    EXPECT_EQ(empty.failure, FileFailure::NotAaf);
    EXPECT_EQ(empty.message, (folder_ / "empty").u8string() + ": is no AAF file");
}

TEST_F(StoredFile, SavingReplacesTheWholeFile) {
    const fs::path path = folder_ / "clip.aaf";
    ASSERT_TRUE(SaveTree(sample::EveryForm(), path, SectorSize::Bytes4096));
    const StoredObject small = sample::RootWith(sample::data(1, {1}));
    ASSERT_TRUE(SaveTree(small, path, SectorSize::Bytes512));
    StoredObject loaded;
    ASSERT_TRUE(LoadTree(path, loaded));
    EXPECT_EQ(loaded, small);
    EXPECT_EQ(FileCount(), 1u);
}

TEST_F(StoredFile, AFailedSaveLeavesTheOldFileAndNothingElse) {
    const fs::path path = folder_ / "clip.aaf";
    Put(path, "old");
    const FileResult result =
        SaveTree(sample::RootWith(sample::data(0x4402, Bytes(70000))), path, SectorSize::Bytes512);
    EXPECT_EQ(result.failure, FileFailure::NotStorable);
    EXPECT_EQ(result.message,
              path.u8string() + ": property 4402: 70000 bytes, a value may take 65535");
    EXPECT_EQ(fs::file_size(path), 3u);
    EXPECT_EQ(FileCount(), 1u);
}

TEST_F(StoredFile, AFolderInThePlaceOfTheTargetIsNamed) {
    const fs::path path = folder_ / "clip.aaf";
    fs::create_directories(path / "something");
    const FileResult result =
        SaveTree(sample::RootWith(sample::data(1, {1})), path, SectorSize::Bytes512);
    EXPECT_EQ(result.failure, FileFailure::NoAccess);
    EXPECT_EQ(result.message.find(path.u8string() + ": cannot be replaced: "), 0u)
        << result.message;
    EXPECT_EQ(FileCount(), 1u);
    StoredObject tree;
    EXPECT_EQ(LoadTree(path, tree).message, path.u8string() + ": is a folder");
}

TEST_F(StoredFile, AMissingFolderIsNamedWithTheReason) {
    const fs::path path = folder_ / "absent" / "clip.aaf";
    const FileResult result =
        SaveTree(sample::RootWith(sample::data(1, {1})), path, SectorSize::Bytes512);
    EXPECT_EQ(result.failure, FileFailure::NotThere);
    EXPECT_EQ(result.message, path.u8string() + ": cannot be written: No such file or directory");
}

TEST_F(StoredFile, AMissingFileIsNamedWithTheReason) {
    StoredObject tree = sample::EveryForm();
    const FileResult result = LoadTree(folder_ / "absent.aaf", tree);
    EXPECT_EQ(result.failure, FileFailure::NotThere);
    EXPECT_EQ(result.message, (folder_ / "absent.aaf").u8string() +
                                  ": cannot be opened: No such file or directory");
    EXPECT_EQ(tree, sample::EveryForm());
}

TEST_F(StoredFile, AForeignFileWithTheTemporaryNameIsNotTouched) {
    Put(folder_ / "clip.aaf.part", "mine");
    ASSERT_TRUE(SaveTree(sample::EveryForm(), folder_ / "clip.aaf", SectorSize::Bytes512));
    EXPECT_EQ(fs::file_size(folder_ / "clip.aaf.part"), 4u);
    EXPECT_EQ(FileCount(), 2u);
}

TEST_F(StoredFile, ADamagedFileIsNamedWithItsDefect) {
    const fs::path path = folder_ / "clip.aaf";
    ASSERT_TRUE(SaveTree(sample::EveryForm(), path, SectorSize::Bytes512));
    fs::resize_file(path, 1024);
    StoredObject tree;
    const FileResult result = LoadTree(path, tree);
    EXPECT_EQ(result.failure, FileFailure::Damaged);
    EXPECT_EQ(result.message.find(path.u8string() + ": sector "), 0u) << result.message;
    EXPECT_TRUE(tree.properties.empty());
}
