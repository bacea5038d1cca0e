// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Places where nothing can be written: every verb with an output tells it by the
// system's own words and what helps, ends alike, and leaves nothing behind.

#include <unistd.h>

#include <algorithm>
#include <nlohmann/json.hpp>

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

class OutputPlaces : public SystemTest {
protected:
    struct Call {
        std::string arguments;  // the name of the output comes behind them
        std::string ending;
    };
    // Every verb with an output, and each kind of file.
    std::vector<Call> Calls() {
        const std::string movie = Quoted(MadeMovie("h264_with_aac.mov"));
        return {{"describe -q " + movie + " --aaf ", ".aaf"},
                {"audio " + movie + " -o ", ".wav"},
                {"frame " + movie + " -o ", ".png"},
                {"frame " + movie + " --range 0:2 -o ", ".raw"},
                {"contact " + movie + " -o ", ".png"}};
    }
    // Runs each verb with this output, which fails with these words.
    void ExpectRefused(const std::string& name, const std::string& words,
                       const std::string& setUp = "") {
        for (const Call& call : Calls()) {
            SCOPED_TRACE(call.arguments);
            const std::filesystem::path output = folder() / (name + call.ending);
            const std::set<std::string> before = FilesLeft();
            const CommandResult ran = RunCommand(setUp + Quoted(ProgramFolder() / "cliphost") +
                                                 " " + call.arguments + Quoted(output) + " 2>&1");
            ExpectSays(ran, 2, "cliphost: " + output.string() + ": not written: " + words + "\n");
            EXPECT_EQ(ran.out.find("AAFRESULT"), std::string::npos) << ran.out;
            EXPECT_EQ(FilesLeft(), before);
        }
    }
    std::set<std::string> FilesLeft() {
        std::set<std::string> names;
        for (const auto& entry : std::filesystem::recursive_directory_iterator(folder())) {
            names.insert(entry.path().string());
        }
        return names;
    }
    // Runs a command of the system as root may; false where that is not allowed.
    static bool CanDo(const std::string& command) {
        return RunCommand(command + " >/dev/null 2>&1").status == 0;
    }
    std::string In(const std::string& name) { return Quoted(folder() / name); }
};

// Undoes what keeps the test's folder from being removed.
class AtEnd {
public:
    explicit AtEnd(std::string command) : command_(std::move(command)) {}
    ~AtEnd() { EXPECT_EQ(RunCommand(command_).status, 0) << command_; }
    AtEnd(const AtEnd&) = delete;
    AtEnd& operator=(const AtEnd&) = delete;

private:
    std::string command_;
};

TEST_F(OutputPlaces, ThatAreMissing) {
    ExpectRefused("no/such/a", "No such file or directory; make the folder " +
                                   (folder() / "no/such").string() + " first");
}

TEST_F(OutputPlaces, BehindAFile) {
    Write(movies::Bytes{'x'}, "file");
    ExpectRefused("file/a", "Not a directory; name another place");
}

// But for frames, which a folder takes one by one.
TEST_F(OutputPlaces, ThatAreFolders) {
    std::filesystem::create_directory(folder() / "folder.aaf");
    std::filesystem::create_directory(folder() / "folder.wav");
    std::filesystem::create_directory(folder() / "folder.png");
    for (const Call& call : Calls()) {
        if (call.arguments.find("frame") != 0) {
            ExpectSays(RunCliphost(call.arguments + In("folder" + call.ending)), 2,
                       ": not written: Is a directory; a folder is there: name another file\n");
        }
    }
}

TEST_F(OutputPlaces, OfTooLongAName) {
    ExpectRefused(std::string(252, 'n'), "File name too long; take a shorter name");
}

// The limit of a shell; it stands for the root as well.
TEST_F(OutputPlaces, ThatHoldNoMoreOfOneFile) {
    for (const Call& call : Calls()) {
        SCOPED_TRACE(call.arguments);
        const std::filesystem::path output = folder() / ("a" + call.ending);
        ExpectSays(RunCommand("bash -c " +
                              Quoted("ulimit -f 1; exec " + Quoted(ProgramFolder() / "cliphost") +
                                     " " + call.arguments + Quoted(output) + " 2>&1")),
                   2,
                   "cliphost: " + output.string() +
                       ": not written: File too large; raise the "
                       "limit of a file's size or write less\n");
        EXPECT_TRUE(FilesLeft().empty());
    }
}

TEST_F(OutputPlaces, OnAFullDisk) {
    std::filesystem::create_directory(folder() / "disk");
    if (!CanDo("mount -t tmpfs -o size=16k tmpfs " + In("disk"))) {
        GTEST_SKIP() << "no file system can be mounted here";
    }
    const AtEnd unmount("umount " + In("disk"));
    Write(movies::Bytes(12 * 1024, 'x'), "disk/other");
    ExpectRefused("disk/a", "No space left on device; make room there or name another place");
    EXPECT_EQ(std::filesystem::file_size(folder() / "disk/other"), 12u * 1024u);
}

TEST_F(OutputPlaces, OnADiskThatIsReadOnly) {
    std::filesystem::create_directory(folder() / "disk");
    if (!CanDo("mount -t tmpfs -o ro tmpfs " + In("disk"))) {
        GTEST_SKIP() << "no file system can be mounted here";
    }
    const AtEnd unmount("umount " + In("disk"));
    ExpectRefused("disk/a", "Read-only file system; name another place");
    for (const std::string& call : {"describe -q " + Quoted(MadeMovie("png.mov")) + " --out-dir ",
                                    "frame " + Quoted(MadeMovie("png.mov")) + " --range 0:2 -o "}) {
        ExpectSays(RunCliphost(call + In("disk/new")), 2,
                   "disk/new: the folder can't be made: Read-only file system; name another place");
    }
}

// Permissions bind everyone but root; what can't be changed binds root too.
TEST_F(OutputPlaces, ThatAreClosed) {
    std::filesystem::create_directory(folder() / "closed");
    if (geteuid() == 0) {
        if (!CanDo("chattr +i " + In("closed"))) {
            GTEST_SKIP() << "root passes permissions, and no folder can be made unchangeable here";
        }
        const AtEnd open("chattr -i " + In("closed"));
        ExpectRefused("closed/a",
                      "Operation not permitted; get permission to write there or name "
                      "another place");
        return;
    }
    const AtEnd open("chmod 700 " + In("closed"));
    std::filesystem::permissions(folder() / "closed", std::filesystem::perms::owner_read |
                                                          std::filesystem::perms::owner_exec);
    ExpectRefused("closed/a",
                  "Permission denied; get permission to write there or name another place");
}

TEST_F(OutputPlaces, ThatHoldAFileWhichIsNotToBeChanged) {
    for (const Call& call : Calls()) {
        const std::string name = "kept" + call.ending;
        Write(movies::Bytes{'k'}, name);
        const bool isRoot = geteuid() == 0;
        if (!CanDo((isRoot ? "chattr +i " : "chmod 400 ") + In(name))) {
            GTEST_SKIP() << "root passes permissions, and no file can be made unchangeable here";
        }
        const AtEnd open((isRoot ? "chattr -i " : "chmod 600 ") + In(name));
        ExpectSays(RunCliphost(call.arguments + In(name)), 2,
                   isRoot ? "not written: Operation not permitted; get permission to write there"
                          : "not written: Permission denied; get permission to write there");
        EXPECT_EQ(ReadFile(folder() / name), movies::Bytes{'k'});
    }
}

// A file may have the longest name there is.
TEST_F(OutputPlaces, TakeFilesOfTheLongestName) {
    for (const Call& call : Calls()) {
        const std::string name = std::string(255 - call.ending.size(), 'n') + call.ending;
        EXPECT_EQ(RunCliphost(call.arguments + In(name)).status, 0) << call.arguments;
        EXPECT_TRUE(std::filesystem::remove(folder() / name));
    }
    EXPECT_TRUE(FilesLeft().empty());
}

TEST_F(OutputPlaces, AreToldInJson) {
    const CommandResult ran =
        RunCommand(Quoted(ProgramFolder() / "cliphost") + " describe --json " +
                   Quoted(MadeMovie("png.mov")) + " --aaf " + In("no/a.aaf") + " 2>/dev/null");
    EXPECT_EQ(ran.status, 2);
    const nlohmann::json list = nlohmann::json::parse(ran.out);
    ASSERT_EQ(list.size(), 1u);
    EXPECT_EQ(list[0]["reason"], "not written: No such file or directory");
    EXPECT_EQ(list[0]["hint"], "make the folder " + (folder() / "no").string() + " first");
}

}  // namespace
