// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// check_media FILE: one file of a user's media, see MediaCheck.h. Exit status 1
// when the description and ffprobe differ.

#include <fmt/format.h>

#include <cstdlib>
#include <exception>

#include "reference_host/framework/ObjectCount.h"
#include "tests/system/SystemTest.h"
#include "tests/system/media/MediaCheck.h"

namespace {

int Check(const std::filesystem::path& file) {
    cliphost::SessionOptions options;
    options.programFolder = ProgramFolder();
    const TestFolder folder;
    MediaVerdict verdict;
    bool isClean = true;
    {
        cliphost::Session session(options);
        const auto files = OpenFiles();
        verdict = CheckMedia(session, file, folder / "saved.aaf");
        isClean = OpenFiles() == files && session.plugin().CanUnload() == NCF_OK;
    }
    isClean = isClean && host::LiveObjectCount() == 0;
    fmt::print("{}: {}\n", file.string(), verdict.summary);
    for (const std::string& difference : verdict.differences) {
        fmt::print("  {}\n", difference);
    }
    if (!isClean) {
        fmt::print("  objects or files are left\n");
    }
    return verdict.isRight && isClean ? 0 : 1;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 2) {
        fmt::print(stderr, "check_media FILE\n");
        return 2;
    }
    try {
        return Check(argv[1]);
    } catch (const std::exception& error) {
        fmt::print("{}: {}\n", argv[1], error.what());
        return 1;
    }
}
