// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PrivateFile.h"

#include <fstream>
#include <string>
#include <system_error>
#include <vector>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/OutputFile.h"
#include "reference_host/system/Paths.h"

namespace cliphost {
namespace {

void NeedOwnFile(const std::filesystem::path& file, std::optional<std::uint64_t> bytes,
                 const std::filesystem::path& place) {
    if (!IsOwnFile(file, bytes)) {
        throw Failure(kExitFile, place,
                      "not written: the process that read the movie left no whole file");
    }
}

// Gives the number of bytes.
std::uint64_t CopyInto(OutputFile& output, const std::filesystem::path& file) {
    std::ifstream from(file, std::ios::binary);
    char piece[65536];
    std::uint64_t bytes = 0;
    while (from.read(piece, sizeof piece), from.gcount() > 0) {
        output.Write(piece, static_cast<std::size_t>(from.gcount()));
        bytes += static_cast<std::uint64_t>(from.gcount());
    }
    if (!from.is_open() || from.bad()) {
        throw Failure(kExitFile, file, "it can't be read");
    }
    return bytes;
}

}  // namespace

std::filesystem::path PrivateFile(const std::filesystem::path& folder, std::uint64_t number) {
    return folder / std::to_string(number);
}

bool IsOwnFile(const std::filesystem::path& file, std::optional<std::uint64_t> bytes) {
    std::error_code error;
    return std::filesystem::symlink_status(file, error).type() ==
               std::filesystem::file_type::regular &&
           std::filesystem::hard_link_count(file, error) == 1 &&
           (!bytes || (std::filesystem::file_size(file, error) == *bytes && !error));
}

// Each has the number, and what its maker puts behind it.
void RemovePrivateFiles(const std::filesystem::path& folder, std::uint64_t number) {
    const std::string own = std::to_string(number);
    std::error_code error;
    std::vector<std::filesystem::path> files;
    for (std::filesystem::directory_iterator entry(folder, error), end; !error && entry != end;
         entry.increment(error)) {
        const std::string name = host::system::PathText(entry->path().filename());
        if (name.compare(0, own.size(), own) == 0 &&
            (name.size() == own.size() || name[own.size()] < '0' || name[own.size()] > '9')) {
            files.push_back(entry->path());
        }
    }
    for (const std::filesystem::path& file : files) {
        std::filesystem::remove(file, error);
    }
}

void PutIntoPlace(const std::filesystem::path& file, const std::filesystem::path& place) {
    NeedOwnFile(file, {}, place);
    std::error_code error;
    OutputFile output(place, OutputFile::Writer::Other);
    if (OutputFile::IsDevice(place)) {
        CopyInto(output, file);
    } else {
        std::filesystem::rename(file, output.NameForOther(), error);
        if (error == std::errc::cross_device_link) {
            error.clear();
            std::filesystem::copy_file(file, output.NameForOther(), error);
            std::error_code ignored;
            std::filesystem::remove(file, ignored);
        }
        if (error) {
            output.Fail(error.default_error_condition().value());
        }
    }
    output.Finish();
}

void AppendTo(OutputFile& output, const std::filesystem::path& file, std::uint64_t bytes,
              const std::filesystem::path& place) {
    NeedOwnFile(file, bytes, place);
    if (CopyInto(output, file) != bytes) {
        throw Failure(kExitFile, place,
                      "the process that read the movie changes what it has written");
    }
    std::error_code ignored;
    std::filesystem::remove(file, ignored);
}

}  // namespace cliphost
