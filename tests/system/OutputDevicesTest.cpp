// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Outputs that are no plain files: every verb's output option writes devices,
// pipes and open descriptors as they are, and fails as they fail.

#include <sys/stat.h>

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

class OutputDevices : public SystemTest {
protected:
    // Every verb with an output; each writes the same bytes whenever it runs.
    std::vector<std::string> Calls() {
        const std::string movie = Quoted(MadeMovie("h264_with_aac.mov"));
        return {"audio " + movie + " -o ", "frame " + movie + " --range 0:2 -o ",
                "contact " + movie + " --width 32 -o ",
                "describe " + movie + " --pin-time 2026-01-31T12:00:00Z --aaf "};
    }
    // An ending that makes a file of what a device is given.
    static std::string EndingFor(const std::string& call) {
        return call.rfind("frame", 0) == 0 ? ".raw" : "";
    }
    std::string Out(const std::string& name) { return Quoted(folder() / name); }
    const std::string program = Quoted(ProgramFolder() / "cliphost") + " ";
};

TEST_F(OutputDevices, FailAsAFullDiskDoes) {
    for (const std::string& call : Calls()) {
        ExpectSays(RunCliphost(call + "/dev/full"), 2,
                   "/dev/full: not written: No space left on device");
    }
    EXPECT_TRUE(std::filesystem::is_character_file("/dev/full"));
}

TEST_F(OutputDevices, TakeWhatAFileWould) {
    for (const std::string& call : Calls()) {
        SCOPED_TRACE(call);
        const std::string file = "file" + EndingFor(call);
        ASSERT_EQ(RunCliphost(call + Out(file)).status, 0);
        const movies::Bytes expected = ReadFile(folder() / file);
        ASSERT_FALSE(expected.empty());
        const auto expectWrites = [&](const std::string& rest) {
            SCOPED_TRACE(rest);
            std::filesystem::remove(folder() / "copy");
            EXPECT_EQ(RunCommand(program + call + rest).status, 0);
            EXPECT_TRUE(ReadFile(folder() / "copy") == expected);
        };
        const std::string copy = Out("copy");
        for (const char* const name : {"-", "/dev/stdout", "/dev/fd/1", "/proc/self/fd/1"}) {
            expectWrites(std::string(name) + " 2>/dev/null >" + copy);
            expectWrites(std::string(name) + " 2>/dev/null | cat >" + copy);
        }
        expectWrites("/dev/fd/7 >/dev/null 2>&1 7>" + copy);
        const std::string pipe = Out("pipe");
        ASSERT_EQ(mkfifo((folder() / "pipe").c_str(), 0600), 0);
        expectWrites(pipe + " >/dev/null 2>&1 & cat " + pipe + " >" + copy + "; wait $!");
        EXPECT_TRUE(std::filesystem::is_fifo(folder() / "pipe"));
        std::filesystem::remove(folder() / "pipe");
    }
    EXPECT_TRUE(std::filesystem::is_symlink("/dev/stdout"));
}

TEST_F(OutputDevices, EndQuietlyWhenTheirReaderGoes) {
    for (const std::string& call : Calls()) {
        const CommandResult ran =
            RunCommand("bash -c " + Quoted(program + call + "- 2>" + Out("err") +
                                           " | head -c 10 >/dev/null; "
                                           "echo ${PIPESTATUS[0]}"));
        EXPECT_EQ(ran.out, "0\n") << call;
        const movies::Bytes told = ReadFile(folder() / "err");
        EXPECT_EQ(std::string(told.begin(), told.end()).find("cliphost: "), std::string::npos);
    }
}

TEST_F(OutputDevices, LeaveLinksAndWriteWhatTheyLeadTo) {
    for (const std::string& call : Calls()) {
        SCOPED_TRACE(call);
        const std::string ending = EndingFor(call);
        for (const std::string& target : {"there" + ending, "absent" + ending}) {
            Write(movies::Bytes{'x'}, "there" + ending);
            std::filesystem::create_symlink(target, folder() / ("link" + ending));
            EXPECT_EQ(RunCliphost(call + Out("link" + ending)).status, 0);
            EXPECT_TRUE(std::filesystem::is_symlink(folder() / ("link" + ending)));
            EXPECT_GT(std::filesystem::file_size(folder() / target), 1u);
            std::filesystem::remove(folder() / ("link" + ending));
            std::filesystem::remove(folder() / target);
        }
    }
}

TEST_F(OutputDevices, FailForADescriptorThatIsNotOpen) {
    for (const std::string& call : Calls()) {
        ExpectSays(RunCliphost(call + "/dev/fd/77"), 2, "/dev/fd/77: not written: ");
    }
}

TEST_F(OutputDevices, FailForLinksInACircle) {
    for (const std::string& call : Calls()) {
        const std::string name = "loop" + EndingFor(call);
        std::filesystem::create_symlink(name, folder() / name);
        ExpectSays(RunCliphost(call + Out(name)), 2, "Too many levels of symbolic links");
        EXPECT_TRUE(std::filesystem::is_symlink(folder() / name));
        std::filesystem::remove(folder() / name);
    }
}

TEST_F(OutputDevices, TakeOneThingAlone) {
    ExpectSays(RunCliphost("describe --json " + Quoted(MadeMovie("png.mov")) + " --aaf -"), 2,
               "standard output takes the JSON");
}

TEST_F(OutputDevices, LeaveNothingInTheTemporaryFolder) {
    std::filesystem::create_directory(folder() / "tmp");
    const std::string call = "TMPDIR=" + Out("tmp") + " " + program + Calls().back();
    EXPECT_EQ(RunCommand(call + "/dev/null").status, 0);
    EXPECT_EQ(RunCommand(call + "/dev/full 2>/dev/null").status, 2);
    EXPECT_TRUE(std::filesystem::is_empty(folder() / "tmp"));
}

}  // namespace
