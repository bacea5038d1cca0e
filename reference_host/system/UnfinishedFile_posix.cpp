// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/UnfinishedFile.h"

#include <fmt/format.h>
#include <unistd.h>

#include <atomic>
#include <climits>
#include <csignal>
#include <cstring>
#include <functional>
#include <string>

namespace host::system {
namespace {

// A signal handler may use neither the heap nor a lock, so the names are in static
// memory. One file is written at a time; the other entries are spare.
struct Slot {
    std::atomic<bool> isTaken{false};
    std::atomic<bool> isNamed{false};
    char name[PATH_MAX] = {};
    char writersName[PATH_MAX] = {};
};
Slot slots[4];

// Signals that the caller had ignored, as nohup does, stay ignored.
void WatchSignals() {
    for (const int signal : {SIGINT, SIGTERM, SIGHUP, SIGPIPE}) {
        struct sigaction present {};
        if (sigaction(signal, nullptr, &present) == 0 && present.sa_handler == SIG_DFL) {
            std::signal(signal, EndBySignal);
        }
    }
}

int TakeSlot(const std::string& name) {
    const std::string writersName = name + UnfinishedFile::kWriterEnding;
    for (std::size_t i = 0; i < std::size(slots) && writersName.size() < PATH_MAX; ++i) {
        if (!slots[i].isTaken.exchange(true)) {
            std::memcpy(slots[i].name, name.c_str(), name.size() + 1);
            std::memcpy(slots[i].writersName, writersName.c_str(), writersName.size() + 1);
            slots[i].isNamed = true;
            return static_cast<int>(i);
        }
    }
    return -1;
}

// A longer chain of links must be a loop.
constexpr int kMostLinks = 40;

// Where a file is to lie: behind links, which stay.
std::filesystem::path BehindLinks(std::filesystem::path path) {
    std::error_code error;
    for (int i = 0; i < kMostLinks && std::filesystem::is_symlink(path, error); ++i) {
        const std::filesystem::path target = std::filesystem::read_symlink(path, error);
        path = target.is_absolute() ? target : path.parent_path() / target;
    }
    return path;
}

// The place's own name shows whose part it is. One that leaves no room for more
// is told by a number; a writer may put its ending behind this name again.
std::filesystem::path NameBeside(const std::filesystem::path& place) {
    constexpr std::size_t kRoom = 32;
    const std::string name = place.filename().native();
    const std::string stem = name.size() + kRoom <= NAME_MAX
                                 ? name
                                 : fmt::format("{:x}", std::hash<std::string>()(name));
    return place.parent_path() / fmt::format("{}.{}.part", stem, getpid());
}

}  // namespace

extern "C" void EndBySignal(int signal) {
    for (Slot& slot : slots) {
        if (slot.isNamed) {
            unlink(slot.name);
            unlink(slot.writersName);
        }
    }
    // The signal comes again once this returns, and then ends the program.
    std::signal(signal, SIG_DFL);
    std::raise(signal);
}

UnfinishedFile::UnfinishedFile(const std::filesystem::path& place)
    : place_(BehindLinks(place)), path_(NameBeside(place_)) {
    // Absolute, should the working folder change.
    std::error_code error;
    const std::filesystem::path absolute = std::filesystem::absolute(path_, error);
    slot_ = TakeSlot(error ? path_.native() : absolute.native());
    WatchSignals();
}

UnfinishedFile::~UnfinishedFile() {
    std::error_code ignored;
    if (!path_.empty()) {
        std::filesystem::remove(path_, ignored);
    }
    if (slot_ >= 0) {
        slots[slot_].isNamed = false;
        slots[slot_].isTaken = false;
    }
}

void UnfinishedFile::TakePlace(std::error_code& error) {
    std::filesystem::rename(path_, place_, error);
    if (!error) {
        path_.clear();
    }
}

void UnfinishedFile::TakePlaceIfFree(std::error_code& error) {
    std::filesystem::create_hard_link(path_, place_, error);
    if (!error || error == std::errc::file_exists) {
        error.clear();
    } else if (!std::filesystem::exists(place_, error) && !error) {
        TakePlace(error);  // not every file system has such links
    }
}

}  // namespace host::system
