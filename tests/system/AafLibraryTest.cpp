// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// Running with another build of the AAF library in place of our own.

#include <sys/wait.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fstream>

#include "tests/system/SystemTest.h"

namespace {

namespace fs = std::filesystem;

struct Outcome {
    int status;
    std::string output;
};

Outcome Cliphost(const std::string& arguments) {
    const std::string command =
        "'" + (ProgramFolder() / "cliphost").string() + "' " + arguments + " 2>&1";
    FILE* const pipe = popen(command.c_str(), "r");
    Outcome run{-1, {}};
    char buffer[4096];
    for (std::size_t n = 0; pipe && (n = fread(buffer, 1, sizeof buffer, pipe)) > 0;) {
        run.output.append(buffer, n);
    }
    const int status = pipe ? pclose(pipe) : -1;
    run.status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
    return run;
}

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
    const Outcome run = Cliphost("--aaf-library '" + library.string() + "' describe '" +
                                 movie.string() + "' --aaf '" + saved.string() + "'");
    EXPECT_EQ(run.status, 0) << run.output;
    EXPECT_TRUE(fs::exists(saved));
}

TEST_F(AafLibraryOption, RefusesAFileThatTheModuleWouldNotFind) {
    const fs::path library = OtherBuild(folder(), false);
    const Outcome run = Cliphost("--aaf-library '" + library.string() + "' plugin");
    EXPECT_EQ(run.status, 2);
    EXPECT_NE(run.output.find(library.string() + ": the module would not find this AAF library"),
              std::string::npos)
        << run.output;
    EXPECT_NE(run.output.find("LD_LIBRARY_PATH=" + folder().string()), std::string::npos);
}

TEST_F(AafLibraryOption, TakesALibraryWithoutAnInnerNameFromTheSearchPath) {
    const fs::path library = folder() / "libcom-api.so";
    fs::rename(OtherBuild(folder(), false), library);
    setenv("LD_LIBRARY_PATH", folder().c_str(), 1);
    const Outcome run = Cliphost("--aaf-library '" + library.string() + "' plugin");
    unsetenv("LD_LIBRARY_PATH");
    EXPECT_EQ(run.status, 0) << run.output;
}

TEST_F(AafLibraryOption, RefusesALibraryThatLacksThePublishedFunctions) {
    const fs::path library = ProgramFolder() / "libNMAUtilLib20.so";
    const Outcome run = Cliphost("--aaf-library '" + library.string() + "' plugin");
    EXPECT_EQ(run.status, 2);
    EXPECT_NE(run.output.find("is no AAF library: it lacks AAFFileOpenTransient"),
              std::string::npos)
        << run.output;
}

}  // namespace
