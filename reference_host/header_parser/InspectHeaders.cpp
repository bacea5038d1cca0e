// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/InspectHeaders.h"

#include <fmt/format.h>

#include <fstream>

#include "reference_host/header_parser/QTParser.h"

namespace header_parser {

std::string HeaderReport::WhyOfNoUse() const {
    if (!movie) {
        return refusal.Sentence();
    }
    const std::vector<ncfUInt32>& pictures = movie->Of(TrackKind::kVideo);
    if (pictures.empty()) {
        return !movie->Of(TrackKind::kSound).empty()
                   ? std::string()
                   : fmt::format("the movie holds no picture and no sound in its {}",
                                 Counted(movie->tracks.size(), "track"));
    }
    const Track& first = movie->tracks[pictures.front()];
    if (first.video.empty()) {
        return fmt::format("track {} of the file: 'stsd' describes none of its samples",
                           pictures.front() + 1);
    }
    const VideoDescription& picture = first.video.front();
    return picture.width != 0 && picture.height != 0
               ? std::string()
               : fmt::format("track {} of the file: {} gives a size of {} x {}",
                             pictures.front() + 1, NameOf(picture.codec), picture.width,
                             picture.height);
}

std::optional<ncfUInt32> HeaderReport::ShownTrack() const {
    return !WhyOfNoUse().empty() || movie->Of(TrackKind::kVideo).empty()
               ? std::nullopt
               : std::optional(movie->Of(TrackKind::kVideo).front());
}

HeaderReport InspectHeaders(const std::filesystem::path& file) {
    HeaderReport report;
    std::ifstream stream;
    stream.rdbuf()->pubsetbuf(nullptr, 0);  // each read has a place of its own, and few bytes
    stream.open(file, std::ios::binary);
    std::error_code error;
    report.fileSize = std::filesystem::file_size(file, error);
    if (!stream || error) {
        report.fileSize = 0;
        report.refusal = {NCF_E_HANDLE, "the file can't be read"};
        return report;
    }
    const auto parser = host::MakeRef<QTParser>();
    const ReadAt readAt = [&stream](ncfUInt64 position, ncfUInt8* to, ncfUInt32 wanted) {
        stream.clear();
        stream.seekg(static_cast<std::streamoff>(position));
        stream.read(reinterpret_cast<char*>(to), wanted);
        return static_cast<ncfUInt32>(stream.gcount());
    };
    if (ReadHeaders(*parser, readAt) != NCF_OK) {
        report.refusal = parser->WhyUnfinished(report.fileSize);
    }
    report.movie = parser->ReadMovie();
    return report;
}

}  // namespace header_parser
