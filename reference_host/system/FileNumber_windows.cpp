// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/system/FileNumber.h"
#include "reference_host/system/WindowsCalls.h"

namespace host::system {

std::optional<FileNumber> NumberOf(const std::filesystem::path& file) {
    const OwnedHandle opened = OpenThere(file, FILE_READ_ATTRIBUTES);
    BY_HANDLE_FILE_INFORMATION facts{};
    if (!opened.IsOpen() || !GetFileInformationByHandle(opened.get(), &facts)) {
        return std::nullopt;
    }
    return FileNumber(facts.dwVolumeSerialNumber,
                      std::uint64_t{facts.nFileIndexHigh} << 32 | facts.nFileIndexLow);
}

bool NamesDescriptor(const std::filesystem::path&) {
    return false;  // no path does
}

}  // namespace host::system
