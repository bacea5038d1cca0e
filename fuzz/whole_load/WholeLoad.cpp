// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The input as a movie file: the built module in the reference host opens and
// describes it. Whatever it is, afterwards no object of the module is alive.

#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>

#include "reference_host/cliphost/Describe.h"

namespace {

namespace fs = std::filesystem;

cliphost::Session& TheSession() {
    static cliphost::Session* const session = [] {
        cliphost::SessionOptions options;
        options.programFolder = fs::read_symlink("/proc/self/exe").parent_path().parent_path();
        options.pinTime = "2026-01-31T12:00:00Z";
        return new cliphost::Session(options);
    }();
    return *session;
}

// One file for the process, gone with it.
class MovieFile {
public:
    MovieFile()
        : path_(fs::temp_directory_path() / ("load-" + std::to_string(getpid()) + ".mov")) {}
    ~MovieFile() {
        std::error_code ignored;
        fs::remove(path_, ignored);
    }
    const fs::path& Hold(const std::uint8_t* data, std::size_t size) const {
        std::ofstream stream(path_, std::ios::binary | std::ios::trunc);
        stream.write(reinterpret_cast<const char*>(data), static_cast<std::streamsize>(size));
        return path_;
    }

private:
    fs::path path_;
};

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const MovieFile file;
    cliphost::Session& session = TheSession();
    {
        const auto description = cliphost::DescribeMovie(session, file.Hold(data, size));
        if (!description.file && description.problem.empty()) {
            std::fputs("a movie was refused without a word\n", stderr);
            std::abort();
        }
    }
    if (session.plugin().CanUnload() != NCF_OK) {
        std::fputs("an object of the module is left\n", stderr);
        std::abort();
    }
    return 0;
}
