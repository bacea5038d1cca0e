// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/cliphost/Progress.h"

#include <fmt/format.h>

#include <cstdio>

#include "reference_host/system/Process.h"

namespace cliphost {
namespace {

constexpr std::size_t kWidth = 24;

void Show(const std::string& text) {
    std::fwrite(text.data(), 1, text.size(), stderr);
    std::fflush(stderr);
}

}  // namespace

Progress::Progress(std::string what, std::size_t count)
    : what_(std::move(what)), count_(count), shown_(count > 1 && host::system::IsWatched()) {}

Progress::~Progress() {
    if (shown_) {
        Show("\r\033[K");
    }
}

void Progress::Step(const std::string& name) {
    if (!shown_) {
        return;
    }
    const std::size_t filled = kWidth * done_ / count_;
    ++done_;
    Show(fmt::format("\r\033[K{} [{}{}] {}/{} {}", what_, std::string(filled, '#'),
                     std::string(kWidth - filled, '.'), done_, count_, name));
}

}  // namespace cliphost
