// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include <fcntl.h>
#include <unistd.h>

#include <algorithm>
#include <csignal>
#include <cstdlib>
#include <system_error>

#include "reference_host/system/Process.h"

namespace host::system {

void PrepareProcess() {
    // These signals would end us; what is written fails instead.
    std::signal(SIGXFSZ, SIG_IGN);
    std::signal(SIGPIPE, SIG_IGN);
    // A stream that the caller closed would give its number to the next file that is
    // opened, and what is printed would go into that file.
    for (const int stream : {STDIN_FILENO, STDOUT_FILENO, STDERR_FILENO}) {
        if (fcntl(stream, F_GETFD) < 0) {
            // Only errors may be lost; to write results there has to fail.
            open("/dev/null", stream == STDERR_FILENO ? O_WRONLY : O_RDONLY);
        }
    }
}

std::vector<std::string> CommandLineWords(int argc, char** argv) {
    std::vector<std::string> words(argv, argv + argc);
    words.resize(std::max<std::size_t>(words.size(), 1));
    return words;
}

const char* const kSettingsFolderInWords = "~/.config/";

std::filesystem::path SettingsFolder() {
    const auto folder = [](const char* variable) {
        const char* const value = std::getenv(variable);
        const std::filesystem::path path = value ? value : "";
        return path.is_absolute() ? path : std::filesystem::path();
    };
    if (auto own = folder("XDG_CONFIG_HOME"); !own.empty()) {
        return own;
    }
    const auto home = folder("HOME");
    return home.empty() ? home : home / ".config";
}

std::filesystem::path ProgramFile(const char* name) {
    std::error_code error;
    const std::filesystem::path program = std::filesystem::read_symlink("/proc/self/exe", error);
    return error ? std::filesystem::absolute(name) : program;
}

bool IsWatched() {
    return isatty(STDERR_FILENO) != 0;
}

}  // namespace host::system
