// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FolderWatch.h"

#include <poll.h>
#include <sys/inotify.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>

namespace host::system {
namespace {

constexpr std::uint32_t kIn = IN_CREATE | IN_CLOSE_WRITE | IN_MOVED_TO;
constexpr std::uint32_t kOut = IN_DELETE | IN_MOVED_FROM;
constexpr std::uint32_t kGone = IN_DELETE_SELF | IN_MOVE_SELF | IN_UNMOUNT;

}  // namespace

FolderWatch::~FolderWatch() {
    if (descriptor_ >= 0) {
        close(descriptor_);
    }
}

int FolderWatch::Add(const std::filesystem::path& folder) {
    if (descriptor_ < 0) {
        descriptor_ = inotify_init1(IN_NONBLOCK | IN_CLOEXEC);
        if (descriptor_ < 0) {
            return errno;
        }
    }
    const int number =
        inotify_add_watch(descriptor_, folder.c_str(), kIn | kOut | kGone | IN_ONLYDIR);
    if (number < 0) {
        return errno;
    }
    folders_[number] = folder;
    return 0;
}

std::vector<FolderChange> FolderWatch::Wait(std::chrono::milliseconds time) {
    std::vector<FolderChange> changes;
    pollfd waiting{descriptor_, POLLIN, 0};
    if (poll(&waiting, descriptor_ < 0 ? 0 : 1, static_cast<int>(time.count())) <= 0) {
        return changes;
    }
    alignas(inotify_event) char events[65536];
    for (ssize_t got; (got = read(descriptor_, events, sizeof events)) > 0;) {
        Take(events, static_cast<std::size_t>(got), changes);
    }
    return changes;
}

void FolderWatch::Take(const char* bytes, std::size_t size, std::vector<FolderChange>& changes) {
    using What = FolderChange::What;
    for (std::size_t at = 0; at + sizeof(inotify_event) <= size;) {
        inotify_event event{};
        std::memcpy(&event, bytes + at, sizeof event);
        const char* const name = bytes + at + sizeof event;
        at += sizeof event + event.len;
        const auto folder = folders_.find(event.wd);
        if ((event.mask & IN_Q_OVERFLOW) != 0) {
            changes.push_back({What::Missed, {}});
        } else if (folder == folders_.end()) {
            continue;  // of one that went away
        } else if ((event.mask & kGone) != 0) {
            changes.push_back({What::Gone, folder->second});
            // One that was moved would still be watched by the path that it had.
            inotify_rm_watch(descriptor_, event.wd);
            folders_.erase(folder);
        } else if ((event.mask & IN_ISDIR) == 0 && event.len > 0) {
            changes.push_back({What::File, folder->second / name});
        } else if ((event.mask & kIn) != 0 && event.len > 0) {
            changes.push_back({What::Folder, folder->second / name});
        }
    }
}

}  // namespace host::system
