// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "tests/system/SystemTest.h"

#include <cstdlib>
#include <fstream>
#include <iterator>

#include "reference_host/cliphost/AafTree.h"
#include "reference_host/cliphost/Describe.h"
#include "reference_host/framework/ObjectCount.h"
#include "tests/system/Command.h"

SystemTest::SystemTest() {
    options.programFolder = ProgramFolder();
    options.pinTime = "2026-01-31T12:00:00Z";
}

void SystemTest::Start() {
    End();
    hostObjectsAtStart_ = host::LiveObjectCount();
    session_ = std::make_unique<cliphost::Session>(options);
    filesAtStart_ = OpenFiles();
}

void SystemTest::End() {
    if (!session_) {
        return;
    }
    session_->host().factory().SetRule({});
    EXPECT_EQ(OpenFiles(), filesAtStart_) << "a file is still open";
    EXPECT_TRUE(ModuleIsIdle()) << "objects of the module are left";
    session_.reset();
    // What the module keeps from movie to movie ended with it.
    EXPECT_EQ(host::LiveObjectCount(), hostObjectsAtStart_) << "objects of the host are left";
}

bool SystemTest::ModuleIsIdle() {
    return session_->plugin().CanUnload() == NCF_OK;
}

void SystemTest::TearDown() {
    End();
}

cliphost::TreeNode SystemTest::Describe(const std::filesystem::path& movie) {
    const cliphost::Description description = cliphost::DescribeMovie(*session_, movie);
    EXPECT_GE(description.result, 0) << LineOf(description.problem);
    return description.file ? cliphost::ReadTree(description.file.get()) : cliphost::TreeNode();
}

cliphost::TreeNode SystemTest::Describe(const movies::Movie& movie) {
    return Describe(Write(movie));
}

std::filesystem::path SystemTest::Write(const movies::Movie& movie, const std::string& name) {
    const std::filesystem::path file = folder_ / name;
    EXPECT_TRUE(movies::Build(movie).WriteTo(file.string())) << file;
    return file;
}

std::filesystem::path SystemTest::Write(const movies::Bytes& bytes, const std::string& name) {
    const std::filesystem::path file = folder_ / name;
    std::ofstream stream(file, std::ios::binary);
    stream.write(reinterpret_cast<const char*>(bytes.data()),
                 static_cast<std::streamsize>(bytes.size()));
    EXPECT_TRUE(stream.good()) << file;
    return file;
}

std::filesystem::path SystemTest::Make(const std::string& arguments, const std::string& name) {
    const auto path = folder() / name;
    EXPECT_EQ(RunCommand("ffmpeg -nostdin -v error -y " + arguments + " " + Quoted(path)).status, 0)
        << arguments;
    return path;
}

std::filesystem::path ProgramFolder() {
    return CLIPHOST_PROGRAM_FOLDER;
}

std::filesystem::path MadeMoviesFolder() {
    return CLIPHOST_MADE_MOVIES;
}

std::filesystem::path MadeMovie(const std::string& name) {
    const std::filesystem::path movie = MadeMoviesFolder() / name;
    EXPECT_TRUE(std::filesystem::exists(movie))
        << movie << " is missing: run scripts/make_test_movies.sh " << MadeMoviesFolder();
    return movie;
}

std::set<std::string> OpenFiles() {
    std::set<std::string> files;
    for (const auto& entry : std::filesystem::directory_iterator("/proc/self/fd")) {
        std::error_code error;
        const std::filesystem::path target = std::filesystem::read_symlink(entry.path(), error);
        // The reading of this very list is one of them.
        if (!error && target.string().find("/proc/") != 0) {
            files.insert(entry.path().filename().string() + " " + target.string());
        }
    }
    return files;
}

movies::Bytes ReadFile(const std::filesystem::path& file) {
    std::ifstream stream(file, std::ios::binary);
    EXPECT_TRUE(stream.good()) << file;
    return {std::istreambuf_iterator<char>(stream), std::istreambuf_iterator<char>()};
}
