// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Running with another build of the AAF library in place of our own.

#include <algorithm>
#include <cstdlib>
#include <fstream>

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

namespace fs = std::filesystem;

// The library of the build under another file name, and, where wanted, under
// another name inside.
fs::path OtherBuild(const fs::path& folder, bool keepsName) {
    movies::Bytes bytes = ReadFile(ProgramFolder() / "libcom-api.so");
    if (!keepsName) {
        const std::string name("libcom-api.so\0", 14);
        for (auto at = bytes.begin();
             (at = std::search(at, bytes.end(), name.begin(), name.end())) != bytes.end(); ++at) {
            at[9] = 'o';
        }
    }
    const fs::path file = folder / "other-build.so";
    std::ofstream(file, std::ios::binary)
        .write(reinterpret_cast<const char*>(bytes.data()),
               static_cast<std::streamsize>(bytes.size()));
    return file;
}

class AafLibraryOption : public SystemTest {};

TEST_F(AafLibraryOption, TakesAnyFileThatCallsItselfByThePublishedName) {
    const fs::path library = OtherBuild(folder(), true);
    const fs::path saved = folder() / "saved.aaf";
    const fs::path movie = Write(movies::Movie{{movies::VideoTrack({}, 10, 25, 1)}}, "m.mov");
    const CommandResult run = RunCliphost("--aaf-library " + Quoted(library) + " describe " +
                                          Quoted(movie) + " --aaf " + Quoted(saved));
    EXPECT_EQ(run.status, 0) << run.out;
    EXPECT_TRUE(fs::exists(saved));
}

TEST_F(AafLibraryOption, TakesAFileWithoutTheInnerNameByStartingAnew) {
    const fs::path library = OtherBuild(folder(), false);
    const fs::path temporary = folder() / "temporary";
    fs::create_directory(temporary);
    setenv("TMPDIR", temporary.c_str(), 1);
    const fs::path saved = folder() / "saved.aaf";
    const fs::path movie = Write(movies::Movie{{movies::VideoTrack({}, 10, 25, 1)}}, "m.mov");
    const fs::path second = Write(movies::Movie{{movies::VideoTrack({}, 20, 25, 1)}}, "n.mov");
    const std::string pinned = " --pin-time 2026-01-31T12:00:00Z";
    const std::string option = "--aaf-library " + Quoted(library);
    const CommandResult one = RunCliphost(option + " describe " + Quoted(movie) + " --aaf " +
                                          Quoted(saved) + " --json" + pinned);
    EXPECT_EQ(one.status, 0) << one.out;
    EXPECT_TRUE(fs::exists(saved));
    const CommandResult usual =
        RunCliphost("describe " + Quoted(movie) + " --aaf " + Quoted(saved) + " --json" + pinned);
    EXPECT_EQ(one.out, usual.out) << "arguments are passed on whole";
    // Processes that read movies are started in the same way.
    const CommandResult many =
        RunCliphost("describe -q --jobs 2 --out-dir " + Quoted(folder() / "out") + ' ' + option +
                    ' ' + Quoted(movie) + ' ' + Quoted(second));
    EXPECT_EQ(many.status, 0) << many.out;
    EXPECT_TRUE(fs::is_empty(temporary));
    unsetenv("TMPDIR");
}

TEST_F(AafLibraryOption, RefusesAFileThatTheModuleWouldNotFind) {
    const fs::path library = OtherBuild(folder(), false);
    setenv("TMPDIR", (folder() / "absent").c_str(), 1);
    const CommandResult run = RunCliphost("--aaf-library " + Quoted(library) + " plugin");
    unsetenv("TMPDIR");
    EXPECT_EQ(run.status, 2);
    EXPECT_NE(run.out.find(library.string() + ": the module would not find this AAF library"),
              std::string::npos)
        << run.out;
    EXPECT_NE(run.out.find("LD_LIBRARY_PATH=" + folder().string()), std::string::npos);
}

TEST_F(AafLibraryOption, TakesALibraryWithoutAnInnerNameFromTheSearchPath) {
    const fs::path library = folder() / "libcom-api.so";
    fs::rename(OtherBuild(folder(), false), library);
    setenv("LD_LIBRARY_PATH", folder().c_str(), 1);
    const CommandResult run = RunCliphost("--aaf-library " + Quoted(library) + " plugin");
    unsetenv("LD_LIBRARY_PATH");
    EXPECT_EQ(run.status, 0) << run.out;
}

TEST_F(AafLibraryOption, RefusesALibraryThatLacksThePublishedFunctions) {
    const fs::path library = ProgramFolder() / "libNMAUtilLib20.so";
    const CommandResult run = RunCliphost("--aaf-library " + Quoted(library) + " plugin");
    EXPECT_EQ(run.status, 2);
    EXPECT_NE(run.out.find("is not an AAF library: it lacks AAFFileOpenTransient"),
              std::string::npos)
        << run.out;
}

}  // namespace
