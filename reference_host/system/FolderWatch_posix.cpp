// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FolderWatch.h"

#include <poll.h>
#include <sys/inotify.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <map>

namespace host::system {
namespace {

constexpr std::uint32_t kIn = IN_CREATE | IN_CLOSE_WRITE | IN_MOVED_TO;
constexpr std::uint32_t kOut = IN_DELETE | IN_MOVED_FROM;
constexpr std::uint32_t kGone = IN_DELETE_SELF | IN_MOVE_SELF | IN_UNMOUNT;

}  // namespace

struct FolderWatch::Watched {
    int descriptor = -1;
    std::map<int, std::filesystem::path> folders;  // by the system's numbers

    ~Watched() {
        if (descriptor >= 0) {
            close(descriptor);
        }
    }
    void Take(const char* bytes, std::size_t size, std::vector<FolderChange>& changes);
};

FolderWatch::FolderWatch() : watched_(std::make_unique<Watched>()) {}

FolderWatch::~FolderWatch() = default;

int FolderWatch::Add(const std::filesystem::path& folder) {
    if (watched_->descriptor < 0) {
        watched_->descriptor = inotify_init1(IN_NONBLOCK | IN_CLOEXEC);
        if (watched_->descriptor < 0) {
            return errno;
        }
    }
    const int number =
        inotify_add_watch(watched_->descriptor, folder.c_str(), kIn | kOut | kGone | IN_ONLYDIR);
    if (number < 0) {
        return errno;
    }
    watched_->folders[number] = folder;
    return 0;
}

std::vector<FolderChange> FolderWatch::Wait(std::chrono::milliseconds time) {
    std::vector<FolderChange> changes;
    const int descriptor = watched_->descriptor;
    pollfd waiting{descriptor, POLLIN, 0};
    if (poll(&waiting, descriptor < 0 ? 0 : 1, static_cast<int>(time.count())) <= 0) {
        return changes;
    }
    alignas(inotify_event) char events[65536];
    for (ssize_t got; (got = read(descriptor, events, sizeof events)) > 0;) {
        watched_->Take(events, static_cast<std::size_t>(got), changes);
    }
    return changes;
}

void FolderWatch::Watched::Take(const char* bytes, std::size_t size,
                                std::vector<FolderChange>& changes) {
    using What = FolderChange::What;
    for (std::size_t at = 0; at + sizeof(inotify_event) <= size;) {
        inotify_event event{};
        std::memcpy(&event, bytes + at, sizeof event);
        const char* const name = bytes + at + sizeof event;
        at += sizeof event + event.len;
        const auto folder = folders.find(event.wd);
        if ((event.mask & IN_Q_OVERFLOW) != 0) {
            changes.push_back({What::Missed, {}});
        } else if (folder == folders.end()) {
            continue;  // of one that went away
        } else if ((event.mask & kGone) != 0) {
            changes.push_back({What::Gone, folder->second});
            // One that was moved would still be watched by the path that it had.
            inotify_rm_watch(descriptor, event.wd);
            folders.erase(folder);
        } else if ((event.mask & IN_ISDIR) == 0 && event.len > 0) {
            changes.push_back({What::File, folder->second / name});
        } else if ((event.mask & kIn) != 0 && event.len > 0) {
            changes.push_back({What::Folder, folder->second / name});
        }
    }
}

}  // namespace host::system
