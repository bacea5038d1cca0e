// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The program without the library that knows FFmpeg: it is loaded only when something needs it.

#include "tests/system/Command.h"
#include "tests/system/SystemTest.h"

namespace {

namespace fs = std::filesystem;

constexpr char kLibrary[] = "libcliphost-movies.so";

class MovieLibrary : public SystemTest {
protected:
    MovieLibrary() {
        for (const char* name : {"cliphost", "libNMAUtilLib20.so", "libcom-api.so", "plugins"}) {
            fs::copy(ProgramFolder() / name, folder() / name, fs::copy_options::recursive);
        }
    }
    CommandResult Run(const std::string& arguments) {
        return RunCommand(Quoted(folder() / "cliphost") + " " + arguments + " 2>&1");
    }
};

TEST_F(MovieLibrary, IsNotNeededToListAFolder) {
    EXPECT_EQ(Run("types").status, 0);
    ExpectSays(Run("scan " + Quoted(MadeMoviesFolder())), 0, "h264_aspect.mov");
}

TEST_F(MovieLibrary, IsNotNeededWhereTheHeaderTellsAll) {
    for (const char* name :
         {"dv_pal.mov", "imx50_pal.mov", "prores_with_pcm.mov", "v210.mov", "pcm_s24be.mov"}) {
        const CommandResult run = Run("describe -q " + Quoted(MadeMovie(name)));
        EXPECT_EQ(run.status, 0) << run.out;
    }
}

TEST_F(MovieLibrary, ThatIsMissingIsTheInstallationsFaultAndNoMovies) {
    for (const char* verb : {"describe ", "samples ", "formats "}) {
        ExpectSays(Run(verb + Quoted(MadeMovie("h264_aspect.mov"))), 2,
                   "cliphost: " + (folder() / kLibrary).string() + ": ");
    }
}

TEST_F(MovieLibrary, OfAnotherKindIsRefused) {
    fs::copy(ProgramFolder() / "libNMAUtilLib20.so", folder() / kLibrary);
    ExpectSays(Run("describe " + Quoted(MadeMovie("h264_aspect.mov"))), 2,
               (folder() / kLibrary).string() + " is not the library of this program");
}

}  // namespace
