// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "host_interfaces/util/NMAVolume.h"

#include <set>

#include "tests/support/TestFiles.h"
#include "tests/unit/util/UtilFixture.h"

class NMAVolumeTest : public UtilTest {
protected:
    host::Ref<host::String> FolderPath() const { return host::ModulePath(folder_.path()); }

    std::set<std::string> Names(const char* pattern) const {
        NMAVolume volume(FolderPath().get());
        void* handle = nullptr;
        std::set<std::string> names;
        for (INCFString* file = volume.GetFirstFile(pattern, handle); file != nullptr;
             file = volume.GetNextFile(handle)) {
            names.insert(Taken(file));
        }
        EXPECT_EQ(nullptr, handle) << "a search that is over has no handle";
        return names;
    }

    TestFolder folder_;
};

TEST_F(NMAVolumeTest, FindsFilesThatMatchThePattern) {
    folder_.Write("a.mov");
    folder_.Write("b.mov");
    folder_.Write("c.mp4");
    EXPECT_EQ((std::set<std::string>{"a.mov", "b.mov"}), Names("*.mov"));
    EXPECT_EQ((std::set<std::string>{"c.mp4"}), Names("*.mp4"));
}

TEST_F(NMAVolumeTest, CaseFollowsTheFileSystem) {
    folder_.Write("A.MOV");
    EXPECT_TRUE(Names("*.mov").empty());
    EXPECT_EQ(std::set<std::string>{"A.MOV"}, Names("*.MOV"));
}

TEST_F(NMAVolumeTest, FindsHiddenFiles) {
    folder_.Write(".hidden.mov");
    EXPECT_EQ(std::set<std::string>{".hidden.mov"}, Names("*.mov"));
}

TEST_F(NMAVolumeTest, LeavesOutFoldersPipesAndBrokenLinks) {
    std::filesystem::create_directory(folder_.path() / "folder.mov");
    ASSERT_TRUE(MakePipe(folder_ / "pipe.mov"));
    std::filesystem::create_symlink("nothing", folder_.path() / "broken.mov");
    std::filesystem::create_directory_symlink("folder.mov", folder_.path() / "link.mov");
    EXPECT_TRUE(Names("*.mov").empty());
}

TEST_F(NMAVolumeTest, FindsLinksToFiles) {
    folder_.Write("target.bin");
    std::filesystem::create_symlink("target.bin", folder_.path() / "link.mov");
    EXPECT_EQ(std::set<std::string>{"link.mov"}, Names("*.mov"));
}

TEST_F(NMAVolumeTest, CarriesNamesThatAreNoUtf8) {
    folder_.Write("a\xE9.mov");
    EXPECT_EQ(std::set<std::string>{"a\xE9.mov"}, Names("*.mov"));
}

TEST_F(NMAVolumeTest, AFolderThatIsNotThereHasNoFiles) {
    NMAVolume missing(host::MakeString("/no/such/folder").get());
    void* handle = &missing;
    EXPECT_EQ(nullptr, missing.GetFirstFile("*", handle));
    EXPECT_EQ(nullptr, handle);
    NMAVolume nowhere(nullptr);
    EXPECT_EQ(nullptr, nowhere.GetFirstFile("*", handle));
    EXPECT_EQ(nullptr, nowhere.GetFirstFile(nullptr, handle));
}

TEST_F(NMAVolumeTest, ASearchEndsWithItsVolume) {
    folder_.Write("a.mov");
    folder_.Write("b.mov");
    NMAVolume volume(FolderPath().get());
    void* first = nullptr;
    void* second = nullptr;
    Taken(volume.GetFirstFile("*.mov", first));
    Taken(volume.GetFirstFile("*.mov", second));
    EXPECT_NE(first, second) << "two searches go side by side";
    EXPECT_NE("(null)", Taken(volume.GetNextFile(first)));
    EXPECT_EQ(nullptr, volume.GetNextFile(first));
    EXPECT_EQ(nullptr, first);
    EXPECT_NE("(null)", Taken(volume.GetNextFile(second)));
}

TEST_F(NMAVolumeTest, AStrangeHandleGivesNothing) {
    NMAVolume volume(FolderPath().get());
    void* strange = &volume;
    EXPECT_EQ(nullptr, volume.GetNextFile(strange));
    EXPECT_EQ(nullptr, strange);
}

TEST_F(NMAVolumeTest, GivesTheDateOfAFileInSeconds) {
    const auto file = folder_.Write("a.mov");
    SetDate(file, 1234567890);
    NMAVolume volume(FolderPath().get());
    EXPECT_EQ(1234567890u, volume.GetModificationDate(host::MakeString("a.mov").get()));
    EXPECT_EQ(0u, volume.GetModificationDate(host::MakeString("b.mov").get()));
    EXPECT_EQ(0u, volume.GetModificationDate(host::MakeString("").get()));
    EXPECT_EQ(0u, volume.GetModificationDate(nullptr));
}

TEST_F(NMAVolumeTest, EndsASearchWhenTheHostRefusesAString) {
    folder_.Write("a.mov");
    const auto path = FolderPath();
    NMAVolume volume(path.get());
    host_.factory().SetRule([](const host::CreationCall&) { return NCF_E_OUTOFMEMORY; });
    void* handle = nullptr;
    EXPECT_EQ(nullptr, volume.GetFirstFile("*.mov", handle));
    EXPECT_EQ(nullptr, handle);
    EXPECT_NE(nullptr, volume.GetVolumeLabel());
}
