// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FileAccess.h"

#include <dirent.h>
#include <fcntl.h>
#include <fmt/format.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>

#include "reference_host/framework/HostPath.h"

namespace cliphost {
namespace {

using host::DisplayPath;

std::string SystemText(int error) {
    return std::generic_category().message(error);
}

bool IsLink(const std::filesystem::path& path) {
    std::error_code ignored;
    return std::filesystem::is_symlink(std::filesystem::symlink_status(path, ignored));
}

// The first part of the way, from the root on, that can't be reached.
std::filesystem::path FirstOutOfReach(const std::filesystem::path& path) {
    std::filesystem::path part;
    for (const std::filesystem::path& name : path) {
        part /= name;
        struct stat info {};
        if (stat(part.c_str(), &info) != 0) {
            break;
        }
    }
    return part;
}

Problem OutOfReach(const std::filesystem::path& path, int error) {
    const std::filesystem::path absolute = std::filesystem::absolute(path).lexically_normal();
    const std::filesystem::path part = FirstOutOfReach(absolute);
    const bool isOnTheWay = part != absolute;
    if (error == EACCES) {
        return {path,
                fmt::format("the folder {} can't be entered: {}", DisplayPath(part.parent_path()),
                            SystemText(error)),
                "get permission to search it"};
    }
    if (error == ELOOP) {
        return {path, fmt::format("the link {} leads in a circle", DisplayPath(part)),
                "make it point to a file"};
    }
    if (error == ENOENT && IsLink(part)) {
        std::error_code ignored;
        return {path,
                fmt::format("the link {} leads to {}, which is not there", DisplayPath(part),
                            DisplayPath(std::filesystem::read_symlink(part, ignored))),
                "make it point to a file that is there"};
    }
    if (error == ENOENT && isOnTheWay) {
        return {path, fmt::format("there is no such file or folder, and no folder {}",
                                  DisplayPath(part))};
    }
    if (error == ENOENT) {
        return {path, "there is no such file or folder"};
    }
    if (error == ENOTDIR) {
        return {path, fmt::format("{} is not a folder", DisplayPath(part.parent_path()))};
    }
    return {path, SystemText(error)};
}

const char* KindOf(mode_t mode) {
    return S_ISFIFO(mode)   ? "a pipe"
           : S_ISSOCK(mode) ? "a socket"
           : S_ISBLK(mode)  ? "a block device"
                            : "a character device";
}

}  // namespace

Problem WhyUnreachable(const std::filesystem::path& path) {
    struct stat info {};
    return stat(path.c_str(), &info) == 0 ? Problem() : OutOfReach(path, errno);
}

Problem WhyUnreadable(const std::filesystem::path& file) {
    struct stat info {};
    if (stat(file.c_str(), &info) != 0) {
        return OutOfReach(file, errno);
    }
    if (S_ISDIR(info.st_mode)) {
        return {file, "this is a folder", "give a movie in it"};
    }
    // A pipe would keep us waiting.
    if (!S_ISREG(info.st_mode)) {
        return {file, fmt::format("this is not a file but {}", KindOf(info.st_mode)),
                S_ISSOCK(info.st_mode) ? "" : "copy what it delivers into a file"};
    }
    const int descriptor = open(file.c_str(), O_RDONLY | O_CLOEXEC);
    if (descriptor < 0) {
        const int error = errno;
        return {file, "the file can't be opened: " + SystemText(error),
                error == EACCES ? "get permission to read it" : ""};
    }
    char byte = 0;
    const ssize_t got = read(descriptor, &byte, 1);
    const int error = errno;
    close(descriptor);
    if (got < 0) {
        return {file, "the file can't be read: " + SystemText(error)};
    }
    if (got == 0) {
        return {file, "the file is empty", "copy it again from where it came"};
    }
    return {};
}

Problem WhyUnlistable(const std::filesystem::path& folder) {
    if (Problem problem = WhyUnreachable(folder)) {
        return problem;
    }
    DIR* const list = opendir(folder.c_str());
    if (!list) {
        const int error = errno;
        return {folder, "the folder can't be listed: " + SystemText(error),
                error == EACCES ? "get permission to read it" : ""};
    }
    closedir(list);
    if (access(folder.c_str(), X_OK) != 0) {
        return {folder, "the folder can't be entered: " + SystemText(errno),
                "get permission to search it"};
    }
    return {};
}

}  // namespace cliphost
