// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FileSystem.h"

#include <windows.h>

#include <iterator>

#include "text/Encodings.h"

namespace host::system {

namespace {

// A file time counts tenths of a microsecond from 1601.
constexpr std::uint64_t kTicksPerSecond = 10'000'000;
constexpr std::uint64_t kSecondsFrom1601To1970 = 11'644'473'600;

std::uint32_t VolumeType(const wchar_t* root) {
    switch (GetDriveTypeW(root)) {
        case DRIVE_REMOVABLE:
        case DRIVE_CDROM:
            return 2;
        case DRIVE_FIXED:
        case DRIVE_RAMDISK:
            return 3;
        case DRIVE_REMOTE:
            return 4;
        default:
            return 0;
    }
}

// By the rules of file names, which are those of no language; units stay in their places.
std::wstring Capitals(std::wstring text) {
    const auto size = static_cast<int>(text.size());
    LCMapStringEx(LOCALE_NAME_INVARIANT, LCMAP_UPPERCASE, text.c_str(), size, text.data(), size,
                  nullptr, nullptr, 0);
    return text;
}

}  // namespace

VolumeFacts ReadVolumeFacts(const std::filesystem::path& folder) {
    VolumeFacts volume;
    wchar_t root[MAX_PATH + 1] = {};
    if (!GetVolumePathNameW(folder.c_str(), root, static_cast<DWORD>(std::size(root)))) {
        return volume;
    }
    wchar_t label[MAX_PATH + 1] = {};
    DWORD serial = 0;
    if (GetVolumeInformationW(root, label, static_cast<DWORD>(std::size(label)), &serial, nullptr,
                              nullptr, nullptr, 0)) {
        volume.serialNumber = serial;
        volume.label = encodings::FromWide(label);
    }
    volume.type = VolumeType(root);
    return volume;
}

std::uint64_t LastWrite(const std::filesystem::path& file) {
    WIN32_FILE_ATTRIBUTE_DATA facts{};
    if (!GetFileAttributesExW(file.c_str(), GetFileExInfoStandard, &facts)) {
        return 0;
    }
    const std::uint64_t ticks = static_cast<std::uint64_t>(facts.ftLastWriteTime.dwHighDateTime)
                                    << 32 |
                                facts.ftLastWriteTime.dwLowDateTime;
    const std::uint64_t seconds = ticks / kTicksPerSecond;
    return seconds < kSecondsFrom1601To1970 ? 0 : seconds - kSecondsFrom1601To1970;
}

char32_t NameCharacter(char32_t c) {
    return c <= 0xFFFF ? Capitals({static_cast<wchar_t>(c)}).front() : c;
}

std::filesystem::path NameKey(const std::filesystem::path& path) {
    return Capitals(path.native());
}

}  // namespace host::system
