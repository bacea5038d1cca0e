// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FileSystem.h"

#include <sys/stat.h>
#include <sys/statfs.h>
#include <sys/statvfs.h>
#include <sys/sysmacros.h>

#include <algorithm>
#include <array>
#include <fstream>

#include "text/Encodings.h"

namespace host::system {

namespace {

constexpr std::uint32_t kUnknown = 0;
constexpr std::uint32_t kRemovable = 2;
constexpr std::uint32_t kFixed = 3;
constexpr std::uint32_t kNetwork = 4;

// File systems that another machine serves, by the number that statfs gives.
constexpr std::array<std::uint32_t, 8> kNetworkFileSystems = {
    0x00006969,  // NFS
    0x0000517B,  // SMB
    0xFF534D42,  // CIFS
    0xFE534D42,  // SMB 2
    0x5346414F,  // AFS
    0x73757245,  // Coda
    0x00C36400,  // Ceph
    0x01021997,  // 9P
};
// A file system in user space may be anything.
constexpr std::uint32_t kUserSpace = 0x65735546;

bool IsRemovable(dev_t device) {
    const std::string block =
        "/sys/dev/block/" + std::to_string(major(device)) + ":" + std::to_string(minor(device));
    // A partition has no answer of its own; its disk, one folder up, has.
    for (const char* place : {"/removable", "/../removable"}) {
        std::ifstream answer(block + place);
        int removable = 0;
        if (answer >> removable) {
            return removable != 0;
        }
    }
    return false;
}

std::uint32_t VolumeType(const std::filesystem::path& folder, dev_t device) {
    struct statfs facts {};
    if (statfs(folder.c_str(), &facts) != 0) {
        return kUnknown;
    }
    const auto kind = static_cast<std::uint32_t>(facts.f_type);
    if (kind == kUserSpace) {
        return kUnknown;
    }
    if (std::find(kNetworkFileSystems.begin(), kNetworkFileSystems.end(), kind) !=
        kNetworkFileSystems.end()) {
        return kNetwork;
    }
    return IsRemovable(device) ? kRemovable : kFixed;
}

// The topmost folder that lies on the same device.
std::filesystem::path MountPoint(std::filesystem::path folder, dev_t device) {
    while (folder.has_relative_path()) {
        const std::filesystem::path parent = folder.parent_path();
        struct stat facts {};
        if (stat(parent.c_str(), &facts) != 0 || facts.st_dev != device) {
            break;
        }
        folder = parent;
    }
    return folder;
}

}  // namespace

VolumeFacts ReadVolumeFacts(const std::filesystem::path& folder) {
    VolumeFacts volume;
    std::error_code failure;
    const std::filesystem::path real = std::filesystem::canonical(folder, failure);
    struct stat facts {};
    if (failure || stat(real.c_str(), &facts) != 0) {
        return volume;
    }
    struct statvfs system {};
    if (statvfs(real.c_str(), &system) == 0) {
        volume.serialNumber = static_cast<std::uint32_t>(system.f_fsid & 0xFFFFFFFFu);
    }
    volume.label = encodings::FromUtf8(MountPoint(real, facts.st_dev).filename().native());
    volume.type = VolumeType(real, facts.st_dev);
    return volume;
}

std::uint64_t LastWrite(const std::filesystem::path& file) {
    struct stat facts {};
    if (stat(file.c_str(), &facts) != 0 || facts.st_mtime < 0) {
        return 0;
    }
    return static_cast<std::uint64_t>(facts.st_mtime);
}

char32_t NameCharacter(char32_t c) {
    return c;
}

std::filesystem::path NameKey(const std::filesystem::path& path) {
    return path;
}

}  // namespace host::system
