// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/HeaderLook.h"

#include <algorithm>
#include <iterator>

#include "reference_host/header_parser/Atom.h"
#include "reference_host/quicktime/MovieAtoms.h"

namespace host {
namespace {

using header_parser::Code;

constexpr ncfUInt32 kEncrypted[] = {Code("encv"), Code("enca"), Code("drmi"), Code("drms")};

}  // namespace

bool IsEncrypted(std::uint32_t code) {
    return std::find(std::begin(kEncrypted), std::end(kEncrypted), code) != std::end(kEncrypted);
}

bool TellsLargePictures(const std::filesystem::path& movie) {
    const MovieAtoms atoms = ReadMovieAtoms(movie);
    return std::any_of(atoms.tracks.begin(), atoms.tracks.end(), [](const auto& track) {
        return std::int64_t{track.width} * track.height > kBelievedPixels;
    });
}

}  // namespace host
