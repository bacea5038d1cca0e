// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FileNumber.h"
#include "reference_host/system/FileSystem.h"
#include "reference_host/system/Paths.h"
#include "reference_host/system/WindowsCalls.h"

#include <functional>
#include <string>

namespace host::system {
namespace {

// By the name that the system has for it, or that it was opened by.
std::uint64_t NumberOfName(HANDLE opened, const std::filesystem::path& file) {
    const std::wstring whole = TextOf([&](wchar_t* text, DWORD size) {
        return GetFinalPathNameByHandleW(opened, text, size, FILE_NAME_NORMALIZED);
    });
    return std::hash<std::wstring>()(
        NameKey(whole.empty() ? AbsolutePath(file).native() : whole).native());
}

}  // namespace

std::optional<FileNumber> NumberOf(const std::filesystem::path& file) {
    const OwnedHandle opened = OpenThere(file, FILE_READ_ATTRIBUTES);
    BY_HANDLE_FILE_INFORMATION facts{};
    if (!opened.IsOpen() || !GetFileInformationByHandle(opened.get(), &facts)) {
        return std::nullopt;
    }
    const std::uint64_t number = std::uint64_t{facts.nFileIndexHigh} << 32 | facts.nFileIndexLow;
    // Disks that don't number their files say so by one of these.
    const bool isNumbered = number != 0 && number != ~std::uint64_t{0};
    return FileNumber(facts.dwVolumeSerialNumber,
                      isNumbered ? number : NumberOfName(opened.get(), file));
}

bool NamesDescriptor(const std::filesystem::path&) {
    return false;  // no path does
}

}  // namespace host::system
