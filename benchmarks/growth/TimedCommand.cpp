// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "benchmarks/growth/TimedCommand.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

double SecondsIn(const timeval& time) {
    return static_cast<double>(time.tv_sec) + static_cast<double>(time.tv_usec) * 1e-6;
}

}  // namespace

double SecondsOf(const std::vector<std::string>& command, int expectedStatus) {
    std::vector<char*> arguments;
    for (const std::string& argument : command) {
        arguments.push_back(const_cast<char*>(argument.c_str()));
    }
    arguments.push_back(nullptr);
    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    for (const int stream : {STDOUT_FILENO, STDERR_FILENO}) {
        posix_spawn_file_actions_addopen(&actions, stream, "/dev/null", O_WRONLY, 0);
    }
    pid_t process = 0;
    const int error =
        posix_spawn(&process, arguments[0], &actions, nullptr, arguments.data(), environ);
    posix_spawn_file_actions_destroy(&actions);
    int status = 0;
    rusage usage{};
    const bool isDone = error == 0 && wait4(process, &status, 0, &usage) == process &&
                        WIFEXITED(status) && WEXITSTATUS(status) == expectedStatus;
    return isDone ? SecondsIn(usage.ru_utime) + SecondsIn(usage.ru_stime) : -1.0;
}
