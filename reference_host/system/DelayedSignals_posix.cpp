// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/DelayedSignals.h"

#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <ctime>

#include "reference_host/system/UnfinishedFile.h"

namespace host::system {
namespace {

volatile std::sig_atomic_t noted = 0;
std::atomic<long long> notedAt = 0;
static_assert(std::atomic<long long>::is_always_lock_free, "a handler may use it");
const char* volatile lineToWrite = nullptr;
int objects = 0;

// In milliseconds; may be asked for in a handler.
long long Now() {
    timespec now{};
    clock_gettime(CLOCK_MONOTONIC, &now);
    return now.tv_sec * 1000LL + now.tv_nsec / 1'000'000;
}

// Some senders send a signal twice at once, to the program and to its group.
bool IsSecond() {
    return noted != 0 && Now() >= notedAt + 1000;
}

extern "C" void NoteSignal(int signal) {
    const int error = errno;
    const char* const line = lineToWrite;
    if (line != nullptr && IsSecond()) {
        EndBySignal(signal);
    } else if (noted == 0) {
        notedAt = Now();
        noted = signal;
        // Who closed a pipe has had enough.
        if (line != nullptr && signal != SIGPIPE &&
            write(STDERR_FILENO, line, std::strlen(line)) < 0) {
            // Nobody is there to read it.
        }
    }
    errno = error;
}

}  // namespace

struct DelayedSignals::Before {
    int signal;
    struct sigaction action;
};

DelayedSignals::DelayedSignals(const char* line) {
    if (objects++ > 0) {
        return;
    }
    noted = 0;
    lineToWrite = line;
    for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGQUIT, SIGPIPE}) {
        Before before{signal, {}};
        if (sigaction(signal, nullptr, &before.action) != 0 ||
            before.action.sa_handler == SIG_IGN) {
            continue;
        }
        struct sigaction action {};
        action.sa_handler = NoteSignal;
        // Reading a movie goes on; otherwise waits are cut short.
        action.sa_flags = line != nullptr ? SA_RESTART : 0;
        if (sigaction(signal, &action, nullptr) == 0) {
            before_.push_back(before);
        }
    }
}

DelayedSignals::~DelayedSignals() {
    if (--objects > 0) {
        return;
    }
    for (const Before& before : before_) {
        struct sigaction present {};
        // What somebody has settled since then stays.
        if (sigaction(before.signal, nullptr, &present) == 0 && present.sa_handler == NoteSignal) {
            sigaction(before.signal, &before.action, nullptr);
        }
    }
    if (noted != 0) {
        std::raise(noted);
    }
}

int DelayedSignals::Which() {
    return noted;
}

bool DelayedSignals::ReaderHasGone() {
    return noted == SIGPIPE;
}

}  // namespace host::system
