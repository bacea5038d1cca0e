// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FileAccess.h"

#include <fmt/format.h>

#include <cerrno>

#include "reference_host/cliphost/MachinePath.h"
#include "reference_host/framework/HostPath.h"
#include "reference_host/system/Access.h"
#include "reference_host/system/Paths.h"

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

// What keeps the system from telling of a path, links followed; 0: nothing.
int ReachError(const std::filesystem::path& path) {
    std::error_code error;
    static_cast<void>(std::filesystem::status(path, error));
    return error.default_error_condition().value();
}

// The first part of the way, from the root on, that can't be reached.
std::filesystem::path FirstOutOfReach(const std::filesystem::path& path) {
    std::filesystem::path part = path;
    while (part.has_relative_path() && ReachError(part.parent_path()) != 0) {
        part = part.parent_path();
    }
    return part;
}

Problem OutOfReach(const std::filesystem::path& path, int error) {
    const std::filesystem::path absolute = AbsolutePath(path);
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

const char* KindOf(std::filesystem::file_type type) {
    switch (type) {
        case std::filesystem::file_type::fifo:
            return "a pipe";
        case std::filesystem::file_type::socket:
            return "a socket";
        case std::filesystem::file_type::block:
            return "a block device";
        default:
            return "a character device";
    }
}

}  // namespace

Problem WhyNoPath(const std::filesystem::path& path, const char* hint) {
    if (const std::string reason = host::system::NameProblem(path); !reason.empty()) {
        return {path, reason, hint};
    }
    if (const std::string reason = host::system::LengthProblem(path); !reason.empty()) {
        return {path, reason, "turn its setting LongPathsEnabled on, or take a shorter path"};
    }
    return {};
}

Problem WhyUnreachable(const std::filesystem::path& path) {
    if (Problem problem = WhyNoPath(path, "give the name that the file has")) {
        return problem;
    }
    const int error = ReachError(path);
    return error == 0 ? Problem() : OutOfReach(path, error);
}

Problem WhyUnreadable(const std::filesystem::path& file) {
    if (Problem problem = WhyUnreachable(file)) {
        return problem;
    }
    std::error_code ignored;
    const std::filesystem::file_type type = std::filesystem::status(file, ignored).type();
    if (type == std::filesystem::file_type::directory) {
        return {file, "this is a folder", "give a movie in it"};
    }
    // A pipe would keep us waiting.
    if (type != std::filesystem::file_type::regular) {
        return {
            file, fmt::format("this is not a file but {}", KindOf(type)),
            type == std::filesystem::file_type::socket ? "" : "copy what it delivers into a file"};
    }
    const host::system::FirstByte first = host::system::ReadFirstByte(file);
    if (first.openError != 0) {
        return {file, "the file can't be opened: " + SystemText(first.openError),
                first.openError == EACCES ? "get permission to read it" : ""};
    }
    if (first.readError != 0) {
        return {file, "the file can't be read: " + SystemText(first.readError)};
    }
    if (!first.isThere) {
        return {file, "the file is empty", "copy it again from where it came"};
    }
    return {};
}

Problem WhyUnlistable(const std::filesystem::path& folder) {
    if (Problem problem = WhyUnreachable(folder)) {
        return problem;
    }
    if (const std::string reason = host::system::ListingProblem(folder); !reason.empty()) {
        return {folder, "the folder can't be listed: " + reason, "give the files in it"};
    }
    std::error_code error;
    std::filesystem::directory_iterator(folder, error);
    if (error) {
        return {
            folder, "the folder can't be listed: " + error.default_error_condition().message(),
            error.default_error_condition().value() == EACCES ? "get permission to read it" : ""};
    }
    if (const int closed = host::system::AccessError(folder, host::system::Right::Search)) {
        return {folder, "the folder can't be entered: " + SystemText(closed),
                "get permission to search it"};
    }
    return {};
}

}  // namespace cliphost
