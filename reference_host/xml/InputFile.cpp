// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/xml/InputFile.h"

#include <cerrno>
#include <fstream>
#include <system_error>
#include <vector>

#include "reference_host/xml/XmlLimits.h"

namespace host {

namespace {

constexpr std::size_t kPiece =
    std::size_t{1} << 16;  // a larger one costs more in page faults than it saves in calls

NCFRESULT Inspect(const std::filesystem::path& file, std::string& problem) {
    std::error_code failure;
    const auto status = std::filesystem::status(file, failure);
    if (status.type() == std::filesystem::file_type::not_found) {
        problem = "there is no such file";
        return NCF_E_NOTFOUND;
    }
    if (status.type() != std::filesystem::file_type::regular) {
        problem = failure ? failure.default_error_condition().message()
                  : status.type() == std::filesystem::file_type::directory ? "this is a folder"
                                                                           : "this is no file";
        return NCF_E_HANDLE;
    }
    if (std::filesystem::file_size(file, failure) > XmlLimits::kLargestDocument && !failure) {
        problem = "the file is too large for a document";
        return NCF_E_NOTSUPPORTED;
    }
    return NCF_OK;
}

}  // namespace

NCFRESULT ReadInputFile(const std::filesystem::path& file, const PieceTaker& take,
                        std::string& problem) {
    const NCFRESULT usable = Inspect(file, problem);
    if (usable < 0) {
        return usable;
    }
    errno = 0;
    std::ifstream stream(file, std::ios::binary);
    if (!stream) {
        problem = "the file can't be opened: " +
                  std::generic_category().message(errno != 0 ? errno : EIO);
        return NCF_E_HANDLE;
    }
    std::vector<char> piece(kPiece);
    bool last = false;
    while (!last) {
        stream.read(piece.data(), static_cast<std::streamsize>(piece.size()));
        if (stream.bad()) {
            problem = "the file can't be read to its end";
            return NCF_E_HANDLE;
        }
        last = stream.eof();
        const NCFRESULT taken = take(piece.data(), static_cast<std::size_t>(stream.gcount()), last);
        if (taken < 0) {
            return taken;
        }
    }
    return NCF_OK;
}

}  // namespace host
