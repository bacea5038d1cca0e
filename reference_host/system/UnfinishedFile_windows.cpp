// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/UnfinishedFile.h"

#include <csignal>
#include <functional>
#include <map>
#include <mutex>
#include <string>

#include "reference_host/system/Paths.h"
#include "reference_host/system/WindowsCalls.h"

namespace host::system {
namespace {

// Interrupts come in a thread of their own.
std::mutex lock;
std::map<int, std::wstring> names;
int nextNumber = 0;

BOOL WINAPI EndByEvent(DWORD event) {
    EndBySignal(event == CTRL_C_EVENT || event == CTRL_BREAK_EVENT ? SIGINT : SIGTERM);
    return TRUE;
}

int Keep(const std::filesystem::path& file) {
    const std::lock_guard<std::mutex> held(lock);
    names[nextNumber] = AbsolutePath(file).native();
    return nextNumber++;
}

// Where a file is to lie: behind a link, which stays.
std::filesystem::path BehindLinks(const std::filesystem::path& path) {
    const DWORD attributes = GetFileAttributesW(path.c_str());
    if (attributes == INVALID_FILE_ATTRIBUTES || (attributes & FILE_ATTRIBUTE_REPARSE_POINT) == 0) {
        return path;
    }
    const OwnedHandle target = OpenThere(path, FILE_READ_ATTRIBUTES);
    if (!target.IsOpen()) {
        return path;
    }
    const std::wstring whole = TextOf([&](wchar_t* text, DWORD size) {
        return GetFinalPathNameByHandleW(target.get(), text, size, FILE_NAME_NORMALIZED);
    });
    return whole.empty() ? path : std::filesystem::path(whole);  // disks without a letter tell none
}

// The place's own name shows whose part it is. One that leaves no room for more is told by a
// number; a writer may put its ending behind this name again.
std::filesystem::path NameBeside(const std::filesystem::path& place) {
    constexpr std::size_t kLongestName = 255;
    constexpr std::size_t kRoom = 32;
    const std::wstring name = place.filename().native();
    const std::wstring stem = name.size() + kRoom <= kLongestName
                                  ? name
                                  : std::to_wstring(std::hash<std::wstring>()(name));
    return place.parent_path() / (stem + L"." + std::to_wstring(GetCurrentProcessId()) + L".part");
}

// False, without an error, where something is in a place that is not to be taken from it.
bool Move(const std::filesystem::path& from, const std::filesystem::path& to, DWORD flags,
          std::error_code& error) {
    error.clear();
    if (MoveFileExW(from.c_str(), to.c_str(), flags)) {
        return true;
    }
    const DWORD reason = GetLastError();
    const bool isTaken = reason == ERROR_ALREADY_EXISTS || reason == ERROR_FILE_EXISTS;
    if (isTaken && (flags & MOVEFILE_REPLACE_EXISTING) == 0) {
        return false;
    }
    error.assign(ErrorNumber(reason), std::generic_category());
    return false;
}

}  // namespace

void EndByEvents() {
    SetConsoleCtrlHandler(EndByEvent, TRUE);
}

extern "C" void EndBySignal(int signal) {
    {
        const std::lock_guard<std::mutex> held(lock);
        for (const auto& name : names) {
            DeleteFileW(name.second.c_str());
            DeleteFileW(
                (std::filesystem::path(name.second) += UnfinishedFile::kWriterEnding).c_str());
        }
    }
    PutConsoleBack();
    TerminateProcess(GetCurrentProcess(), signal == SIGINT
                                              ? static_cast<UINT>(STATUS_CONTROL_C_EXIT)
                                              : 128u + static_cast<UINT>(signal));
}

UnfinishedFile::UnfinishedFile(const std::filesystem::path& place)
    : place_(BehindLinks(place)), path_(NameBeside(place_)), slot_(Keep(path_)) {}

UnfinishedFile::~UnfinishedFile() {
    std::error_code ignored;
    if (!path_.empty()) {
        std::filesystem::remove(path_, ignored);
    }
    const std::lock_guard<std::mutex> held(lock);
    names.erase(slot_);
}

void UnfinishedFile::TakePlace(std::error_code& error) {
    if (Move(path_, place_, MOVEFILE_REPLACE_EXISTING, error)) {
        path_.clear();
    }
}

void UnfinishedFile::TakePlaceIfFree(std::error_code& error) {
    if (Move(path_, place_, 0, error)) {
        path_.clear();
    }
}

}  // namespace host::system
