// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <filesystem>
#include <string>

#include "reference_host/header_parser/InspectHeaders.h"

namespace cliphost {

// The part of a track's sound that is beyond the end of the file.
class MissingSound {
public:
    // `place`: among the sound tracks of the movie. `rate`: samples a second as
    // they are delivered.
    MissingSound(const std::filesystem::path& movie, std::size_t place, unsigned rate);

    // What is missing; empty for nothing.
    const std::string& Reason() const { return reason_; }
    // How many of the delivered samples from `from` up to `to` are of that part.
    // Both lie in one piece of what an edit list puts together.
    std::uint64_t CountIn(std::uint64_t from, std::uint64_t to) const;

private:
    bool Has(std::uint64_t sample) const;

    header_parser::HeaderReport header_;
    const header_parser::Track* track_ = nullptr;
    double rate_;
    std::string reason_;
    double mediaTime_ = 0.0;  // from which on all is missing, in units of the media
};

}  // namespace cliphost
