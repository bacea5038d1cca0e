// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FolderWatch.h"

#include <algorithm>
#include <cerrno>
#include <cstddef>
#include <cstring>
#include <map>
#include <string>

#include "reference_host/system/FileNumber.h"
#include "reference_host/system/WindowsCalls.h"

namespace host::system {
namespace {

// Reads of network folders are refused with more.
constexpr DWORD kBytes = 65536;
constexpr DWORD kWhat = FILE_NOTIFY_CHANGE_FILE_NAME | FILE_NOTIFY_CHANGE_DIR_NAME |
                        FILE_NOTIFY_CHANGE_SIZE | FILE_NOTIFY_CHANGE_LAST_WRITE;

bool IsFolder(const std::filesystem::path& path) {
    const DWORD attributes = GetFileAttributesW(path.c_str());
    return attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_DIRECTORY) != 0;
}

}  // namespace

// One folder, of which the system notes changes.
class WatchedFolder {
public:
    WatchedFolder(OwnedHandle folder, HANDLE event) : folder_(std::move(folder)) {
        overlapped_.hEvent = event;
    }
    ~WatchedFolder() {
        if (isUnderWay_) {
            EndCall(folder_.get(), overlapped_);
        }
    }
    WatchedFolder(const WatchedFolder&) = delete;
    WatchedFolder& operator=(const WatchedFolder&) = delete;

    std::filesystem::path path;

    bool Start() {
        isUnderWay_ = ReadDirectoryChangesW(folder_.get(), bytes_.data(), kBytes, FALSE, kWhat,
                                            nullptr, &overlapped_, nullptr);
        return isUnderWay_;
    }
    bool HasChanges() const { return isUnderWay_ && HasOverlappedIoCompleted(&overlapped_); }

    // Takes the changes and waits for more. False once the folder has gone.
    bool Take(std::vector<FolderChange>& changes) {
        DWORD size = 0;
        isUnderWay_ = false;
        if (!GetOverlappedResult(folder_.get(), &overlapped_, &size, FALSE)) {
            return GetLastError() == ERROR_NOTIFY_ENUM_DIR ? Missed(changes) : false;
        }
        return size == 0 ? Missed(changes) : Read(size, changes) && Start();
    }

private:
    bool Missed(std::vector<FolderChange>& changes) {
        changes.push_back({FolderChange::What::Missed, {}});
        return Start();
    }

    bool Read(DWORD size, std::vector<FolderChange>& changes) const {
        const auto* const begin = reinterpret_cast<const char*>(bytes_.data());
        constexpr std::size_t kNameAt = offsetof(FILE_NOTIFY_INFORMATION, FileName);
        for (std::size_t at = 0; at + kNameAt <= size;) {
            FILE_NOTIFY_INFORMATION change{};
            std::memcpy(&change, begin + at, kNameAt);
            std::wstring name(
                std::min<std::size_t>(change.FileNameLength, size - at - kNameAt) / sizeof(wchar_t),
                L'\0');
            std::memcpy(name.data(), begin + at + kNameAt, name.size() * sizeof(wchar_t));
            Add(change.Action, path / name, changes);
            if (change.NextEntryOffset == 0) {
                break;
            }
            at += change.NextEntryOffset;
        }
        return true;
    }

    static void Add(DWORD action, std::filesystem::path changed,
                    std::vector<FolderChange>& changes) {
        if (!IsFolder(changed)) {
            changes.push_back({FolderChange::What::File, std::move(changed)});
        } else if (action == FILE_ACTION_ADDED || action == FILE_ACTION_RENAMED_NEW_NAME) {
            changes.push_back({FolderChange::What::Folder, std::move(changed)});
        }
    }

    OwnedHandle folder_;
    OVERLAPPED overlapped_{};
    std::vector<DWORD> bytes_ = std::vector<DWORD>(kBytes / sizeof(DWORD));
    bool isUnderWay_ = false;
};

struct FolderWatch::Watched {
    OwnedHandle event{CreateEventW(nullptr, TRUE, FALSE, nullptr)};
    std::map<FileNumber, std::unique_ptr<WatchedFolder>> folders;

    // Drops the folders that went away.
    std::vector<FolderChange> Take() {
        std::vector<FolderChange> changes;
        ResetEvent(event.get());
        for (auto folder = folders.begin(); folder != folders.end();) {
            WatchedFolder& watched = *folder->second;
            if (watched.HasChanges() && !watched.Take(changes)) {
                changes.push_back({FolderChange::What::Gone, watched.path});
                folder = folders.erase(folder);
            } else {
                ++folder;
            }
        }
        return changes;
    }
};

FolderWatch::FolderWatch() : watched_(std::make_unique<Watched>()) {}

FolderWatch::~FolderWatch() = default;

int FolderWatch::Add(const std::filesystem::path& folder) {
    const std::optional<FileNumber> number = NumberOf(folder);
    if (!number) {
        return LastErrorNumber();
    }
    if (const auto known = watched_->folders.find(*number); known != watched_->folders.end()) {
        known->second->path = folder;
        return 0;
    }
    if (!IsFolder(folder)) {
        return ENOTDIR;
    }
    OwnedHandle opened(CreateFileW(
        folder.c_str(), FILE_LIST_DIRECTORY, FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE,
        nullptr, OPEN_EXISTING, FILE_FLAG_BACKUP_SEMANTICS | FILE_FLAG_OVERLAPPED, nullptr));
    if (!opened.IsOpen()) {
        return LastErrorNumber();
    }
    auto added = std::make_unique<WatchedFolder>(std::move(opened), watched_->event.get());
    added->path = folder;
    if (!added->Start()) {
        return LastErrorNumber();
    }
    watched_->folders.emplace(*number, std::move(added));
    return 0;
}

std::vector<FolderChange> FolderWatch::Wait(std::chrono::milliseconds time) {
    std::vector<FolderChange> changes = watched_->Take();
    if (changes.empty()) {
        const HANDLE events[] = {SignalEvent(), watched_->event.get()};
        WaitForMultipleObjects(2, events, FALSE, static_cast<DWORD>(time.count()));
        changes = watched_->Take();
    }
    return changes;
}

}  // namespace host::system
