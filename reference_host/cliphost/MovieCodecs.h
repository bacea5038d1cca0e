// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <map>
#include <string>
#include <vector>

#include "reference_host/cliphost/Session.h"
#include "reference_host/header_parser/InspectHeaders.h"

namespace cliphost {

// What a track of a file is coded in.
struct TrackCodec {
    std::string code;   // of four characters
    std::string name;   // for people; empty for one that nobody knows
    unsigned bits = 0;  // of a pixel, or of a sample of sound; 0: not known
    bool hasAlpha = false;
    unsigned width = 0;  // of a frame, as the file tells it
    unsigned height = 0;
};

struct MovieCodecs {
    std::vector<TrackCodec> pictures;  // in the order of the file
    std::vector<TrackCodec> sounds;
};

// Tells the codecs of movies, by the route by which they are read.
class CodecReader {
public:
    explicit CodecReader(Session& session) : session_(session) {}
    MovieCodecs Read(const std::filesystem::path& movie, const header_parser::HeaderReport& header);

    // The first picture's, or else the first sound's: for people, or else its code.
    std::string ReadFirst(const std::filesystem::path& movie);

private:
    MovieCodecs FromHeader(const header_parser::Movie& movie);
    MovieCodecs FromLibrary(const std::filesystem::path& movie);
    std::string NameOf(ncfUInt32 code);

    Session& session_;
    std::map<ncfUInt32, std::string> names_;
};

}  // namespace cliphost
