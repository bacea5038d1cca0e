// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/system/Harms.h"

#include <dlfcn.h>
#include <fcntl.h>
#include <sys/mman.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <cstdio>
#include <cstring>
#include <fstream>
#include <stdexcept>
#include <thread>
#include <vector>

namespace {

void* RealModule() {
    static void* const module = [] {
        Dl_info own{};
        dladdr(reinterpret_cast<const void*>(&RealFunction), &own);
        const auto folder = std::filesystem::path(own.dli_fname).parent_path();
        return dlopen((folder / CLIPHOST_REAL_MODULE).c_str(), RTLD_NOW | RTLD_LOCAL);
    }();
    return module;
}

constexpr int kChannel = 3;  // to the parent

void Send(const void* bytes, std::size_t size) {
    if (write(kChannel, bytes, size) < 0) {
        std::perror("channel");
    }
}

// Each line tells whether the system lets it be done.
void Tell(const char* what, bool done) {
    std::fprintf(stderr, "%s: %s\n", what, done ? "done" : "refused");
}

void TryEverything(const std::filesystem::path& movie) {
    Tell("socket", socket(AF_INET, SOCK_STREAM, 0) >= 0);
    char program[] = "/bin/true";
    char* const line[] = {program, nullptr};
    const pid_t child = fork();
    if (child == 0) {
        _exit(0);
    }
    Tell("process", child > 0);
    Tell("signal", kill(getppid(), 0) == 0);
    Tell("new code", mmap(nullptr, 4096, PROT_READ | PROT_EXEC, MAP_PRIVATE | MAP_ANONYMOUS, -1,
                          0) != MAP_FAILED);
    Tell("rights of a file", chmod(movie.c_str(), 0666) == 0);
    Tell("writing the movie", open(movie.c_str(), O_WRONLY) >= 0);
    const std::filesystem::path beside = movie.parent_path() / "beside";
    Tell("a file beside it", open(beside.c_str(), O_WRONLY | O_CREAT, 0666) >= 0);
    Tell("removing the movie", unlink(movie.c_str()) == 0);
    bool ran = false;
    std::thread([&] { ran = true; }).join();
    Tell("thread", ran);
    Tell("reading", open(movie.c_str(), O_RDONLY) >= 0);
    execv(program, line);
    Tell("program", false);
}

}  // namespace

void* RealFunction(const char* name) {
    return dlsym(RealModule(), name);
}

std::filesystem::path OwnFolder() {
    std::ifstream line("/proc/self/cmdline");
    const std::string option = "--folder=";
    for (std::string word; std::getline(line, word, '\0');) {
        if (word.compare(0, option.size(), option) == 0) {
            return word.substr(option.size());
        }
    }
    return {};
}

void DoHarm(const std::string& harm, const std::filesystem::path& movie) {
    if (harm == "crash") {
        std::signal(SIGSEGV, SIG_DFL);  // a sanitizer has its own
        std::raise(SIGSEGV);
    } else if (harm == "interrupt") {
        std::raise(SIGTERM);
    } else if (harm == "leave") {
        _exit(3);
    } else if (harm == "hang") {
        for (;;) {
            pause();
        }
    } else if (harm == "hog") {
        std::vector<char> memory(std::size_t{1} << 30);
        std::memset(memory.data(), 1, memory.size());
        std::fprintf(stderr, "%d\n", memory[std::size_t{1} << 29]);
    } else if (harm == "length") {
        const std::array<unsigned char, 8> length = {0xFF, 0xFF, 0xFF, 0xFF,
                                                     0xFF, 0xFF, 0xFF, 0x7F};
        Send(length.data(), length.size());
        pause();
    } else if (harm == "nonsense") {
        const std::array<unsigned char, 12> answer = {4, 0, 0, 0, 0, 0, 0, 0, 'o', 'd', 'd', '!'};
        Send(answer.data(), answer.size());
        pause();
    } else if (harm == "throw") {
        throw std::runtime_error("thrown by the module");
    } else if (harm == "remove" || harm == "shorten") {
        for (const auto& entry : std::filesystem::directory_iterator(OwnFolder())) {
            if (harm == "remove") {
                std::filesystem::remove(entry.path());
            } else {
                std::filesystem::resize_file(entry.path(), 5);
            }
        }
    } else if (harm == "probe") {
        TryEverything(movie);
    } else if (harm == "controls") {
        std::fputs("\x1B[2Jcleared\n", stderr);
    }
}
