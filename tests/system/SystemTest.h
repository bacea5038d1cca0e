// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <gtest/gtest.h>

#include <filesystem>
#include <memory>
#include <set>
#include <string>

#include "reference_host/cliphost/Session.h"
#include "reference_host/cliphost/TreeNode.h"
#include "reference_host/movie_writer/Movie.h"
#include "tests/support/TestFolder.h"

// A test that drives the built module through the reference host. At its end
// nothing may be left of what it did: no object of the module or of the host,
// no open file.
class SystemTest : public testing::Test {
protected:
    SystemTest();

    void SetUp() override { Start(); }
    void TearDown() override;

    // Options that all sessions of the test begin with; change and Start again.
    cliphost::SessionOptions options;

    // A new session in place of the one before, which must have left nothing.
    void Start();
    void End();
    cliphost::Session& session() { return *session_; }

    // Whether no object of the module is alive.
    bool ModuleIsIdle();

    // The tree of a movie's description; fails the test when there is none.
    cliphost::TreeNode Describe(const std::filesystem::path& movie);
    cliphost::TreeNode Describe(const movies::Movie& movie);
    // Writes a movie into the test's folder.
    std::filesystem::path Write(const movies::Movie& movie, const std::string& name = "built.mov");
    std::filesystem::path Write(const movies::Bytes& bytes, const std::string& name);

    // Makes a file in the test's folder by ffmpeg; fails the test when it can't.
    std::filesystem::path Make(const std::string& arguments, const std::string& name);

    // A folder of the test's own, gone with it.
    std::filesystem::path folder() const { return folder_.path(); }

private:
    const TestFolder folder_;
    std::set<std::string> filesAtStart_;
    std::int64_t hostObjectsAtStart_ = 0;
    std::unique_ptr<cliphost::Session> session_;
};

// Where the build put what is tested, and where its movies are.
std::filesystem::path ProgramFolder();
std::filesystem::path MadeMovie(const std::string& name);
std::filesystem::path MadeMoviesFolder();

// What the process has open, by number and target.
std::set<std::string> OpenFiles();
movies::Bytes ReadFile(const std::filesystem::path& file);
