// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "fuzz/support/RunLimits.h"

#include <sys/resource.h>
#include <sys/time.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>

#if defined(__has_feature)
#if __has_feature(thread_sanitizer)
#define CLIPHOST_THREAD_SANITIZER
#endif
#elif defined(__SANITIZE_THREAD__)
#define CLIPHOST_THREAD_SANITIZER
#endif

// Freed memory that the address sanitizer holds back would count.
extern "C" const char* __asan_default_options() {
    return "quarantine_size_mb=16";
}

namespace fuzz {
namespace {

void StopForTime(int) {
    constexpr char kText[] = "the input took too long\n";
    if (write(STDERR_FILENO, kText, sizeof kText - 1) < 0) {
        _exit(1);
    }
    std::abort();
}

void SetTimer(int seconds) {
    itimerval timer{};
    timer.it_value.tv_sec = seconds;
    setitimer(ITIMER_PROF, &timer, nullptr);
}

}  // namespace

TimeLimit::TimeLimit() {
    if (LimitsCount()) {
        std::signal(SIGPROF, StopForTime);
        SetTimer(kMostSeconds);
    }
}

TimeLimit::~TimeLimit() {
    SetTimer(0);
}

std::size_t PeakMegabytes() {
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return static_cast<std::size_t>(usage.ru_maxrss) / 1024;
}

bool LimitsCount() {
#ifdef CLIPHOST_THREAD_SANITIZER
    return false;
#else
    return true;
#endif
}

}  // namespace fuzz
