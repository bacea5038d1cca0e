// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/DelayedSignals.h"

#include <gtest/gtest.h>

#include <sys/wait.h>
#include <unistd.h>
#include <csignal>

#include <chrono>
#include <functional>
#include <thread>

#include "reference_host/system/FileState.h"
#include "reference_host/system/UnfinishedFile.h"
#include "tests/support/TestFolder.h"

using host::system::DelayedSignals;

namespace {

// How a process ends that does this.
int EndOf(const std::function<void()>& work) {
    const pid_t process = fork();
    if (process == 0) {
        work();
        _exit(0);
    }
    int status = 0;
    waitpid(process, &status, 0);
    return WIFSIGNALED(status) ? -WTERMSIG(status) : WEXITSTATUS(status);
}

TEST(DelayedSignals, TakeEffectAtTheEnd) {
    for (const int signal : {SIGINT, SIGTERM, SIGHUP}) {
        EXPECT_EQ(EndOf([=] {
                      const DelayedSignals signals;
                      std::raise(signal);
                      std::raise(signal);
                      if (DelayedSignals::Which() != signal) {
                          _exit(7);
                      }
                  }),
                  -signal);
    }
    EXPECT_EQ(EndOf([] { const DelayedSignals signals; }), 0);
}

TEST(DelayedSignals, AreThoseOfTheFirstObject) {
    EXPECT_EQ(EndOf([] {
                  const DelayedSignals first;
                  std::raise(SIGINT);
                  {
                      const DelayedSignals second;
                      if (DelayedSignals::Which() != SIGINT) {
                          _exit(7);
                      }
                  }
                  _exit(DelayedSignals::HaveCome() ? 3 : 8);
              }),
              3);
    EXPECT_EQ(EndOf([] {
                  const DelayedSignals first;
                  {
                      const DelayedSignals second;
                      std::raise(SIGTERM);
                  }
                  if (!DelayedSignals::HaveCome()) {
                      _exit(7);
                  }
              }),
              -SIGTERM);
}

TEST(DelayedSignals, StayIgnored) {
    EXPECT_EQ(EndOf([] {
                  std::signal(SIGHUP, SIG_IGN);
                  const DelayedSignals signals;
                  std::raise(SIGHUP);
                  _exit(DelayedSignals::HaveCome() ? 7 : 3);
              }),
              3);
}

TEST(DelayedSignals, EndTheProgramAtTheSecondWhereWorkMayTakeLong) {
    const TestFolder folder;
    int lines[2];
    ASSERT_EQ(pipe(lines), 0);
    EXPECT_EQ(EndOf([&] {
                  dup2(lines[1], STDERR_FILENO);
                  const DelayedSignals signals("soon\n");
                  const host::system::UnfinishedFile file(folder / "out");
                  folder.Write(file.path().filename(), "half");
                  std::raise(SIGINT);
                  std::raise(SIGINT);  // the same, sent twice
                  std::this_thread::sleep_for(std::chrono::milliseconds(1200));
                  std::raise(SIGTERM);
                  _exit(7);
              }),
              -SIGTERM);
    EXPECT_EQ(folder.CountFiles(), 0u) << "the unfinished file";
    char told[64];
    EXPECT_EQ(std::string(told, read(lines[0], told, sizeof told)), "soon\n");
    close(lines[0]);
    close(lines[1]);
}

TEST(FileState, IsThatOfFilesAlone) {
    const TestFolder folder;
    const auto file = folder.Write("a", "12345");
    const auto state = host::system::StateOf(file);
    ASSERT_TRUE(state);
    EXPECT_EQ(state->size, 5u);
    const auto now = std::chrono::system_clock::now().time_since_epoch();
    EXPECT_NEAR(static_cast<double>(state->date),
                static_cast<double>(std::chrono::nanoseconds(now).count()), 60e9);
    std::filesystem::create_symlink(file, folder / "link");
    EXPECT_EQ(host::system::StateOf(folder / "link"), state);
    EXPECT_FALSE(host::system::StateOf(folder.path()));
    EXPECT_FALSE(host::system::StateOf(folder / "absent"));
    EXPECT_FALSE(host::system::StateOf("/dev/null"));
    std::filesystem::last_write_time(
        file, std::filesystem::last_write_time(file) + std::chrono::nanoseconds(1));
    EXPECT_EQ(host::system::StateOf(file)->date, state->date + 1);
}

}  // namespace
