// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <optional>
#include <string>

#include "reference_host/header_parser/Movie.h"
#include "reference_host/header_parser/Refusal.h"

namespace header_parser {

// What the parser makes of a file: why it refuses it, or else all that it read.
struct HeaderReport {
    Refusal refusal;                     // nothing for a header that is understood
    std::shared_ptr<const Movie> movie;  // null for one that is refused
    ncfUInt64 fileSize = 0;

    // Why no clip is made of the header, empty where one is: it is refused, or
    // the pictures that it tells of first lack a description or a size.
    std::string WhyOfNoUse() const;
    // Place in the file of the picture track that such a clip shows.
    std::optional<ncfUInt32> ShownTrack() const;
};

// Lets a parser of its own read the file as a clip does. A file that can't be
// read is refused with NCF_E_HANDLE.
HeaderReport InspectHeaders(const std::filesystem::path& file);

}  // namespace header_parser
