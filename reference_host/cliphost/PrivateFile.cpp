// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/PrivateFile.h"

#include <fstream>
#include <string>
#include <system_error>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/OutputFile.h"

namespace cliphost {
namespace {

// Nothing but a file of its own: a link would lead to somebody else's.
void NeedOwnFile(const std::filesystem::path& file, const std::filesystem::path& place) {
    std::error_code ignored;
    if (std::filesystem::symlink_status(file, ignored).type() !=
            std::filesystem::file_type::regular ||
        std::filesystem::hard_link_count(file, ignored) != 1) {
        throw Failure(kExitFile, place,
                      "not written: the process that read the movie left no file");
    }
}

void CopyInto(OutputFile& output, const std::filesystem::path& file) {
    std::ifstream from(file, std::ios::binary);
    char piece[65536];
    while (from.read(piece, sizeof piece), from.gcount() > 0) {
        output.Write(piece, static_cast<std::size_t>(from.gcount()));
    }
}

}  // namespace

std::filesystem::path PrivateFile(const std::filesystem::path& folder, std::uint64_t number) {
    return folder / std::to_string(number);
}

void PutIntoPlace(const std::filesystem::path& file, const std::filesystem::path& place) {
    NeedOwnFile(file, place);
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
            output.Fail(error.value());
        }
    }
    output.Finish();
}

void AppendTo(OutputFile& output, const std::filesystem::path& file,
              const std::filesystem::path& place) {
    NeedOwnFile(file, place);
    CopyInto(output, file);
    std::error_code ignored;
    std::filesystem::remove(file, ignored);
}

}  // namespace cliphost
