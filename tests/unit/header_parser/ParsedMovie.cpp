// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "tests/unit/header_parser/ParsedMovie.h"

using header_parser::ParserLimits;
using header_parser::QTParser;

namespace {

template <typename Interface, typename Get>
host::Ref<Interface> Fetch(Get get) {
    Interface* out = nullptr;
    return get(&out) == NCF_OK ? host::Ref<Interface>::Adopt(out) : nullptr;
}

}  // namespace

ParsedMovie::ParsedMovie(const movies::Movie& movie, const ParserLimits& limits)
    : ParsedMovie(movies::Build(movie), limits) {}

ParsedMovie::ParsedMovie(const movies::MadeMovie& made, const ParserLimits& limits)
    : parser_(host::MakeRef<QTParser>(limits)) {
    const header_parser::ReadAt readAt = [&](ncfUInt64 position, ncfUInt8* to, ncfUInt32 wanted) {
        if (position >= made.size) {
            return ncfUInt32{0};
        }
        const auto size = static_cast<ncfUInt32>(std::min<ncfUInt64>(wanted, made.size - position));
        const movies::Bytes bytes = made.Range(position, size);
        std::copy(bytes.begin(), bytes.end(), to);
        return size;
    };
    result_ = header_parser::ReadHeaders(*parser_, readAt, &passes_);
}

ParsedMovie::ParsedMovie(const movies::Bytes& bytes, const ParserLimits& limits)
    : parser_(host::MakeRef<QTParser>(limits)) {
    result_ = header_parser::ReadHeaders(*parser_, bytes.data(), bytes.size(), &passes_);
}

host::Ref<IVideoTrackInfo> ParsedMovie::Video(ncfUInt32 index) const {
    return Fetch<IVideoTrackInfo>(
        [&](IVideoTrackInfo** out) { return parser_->GetVideoTrackInfo(index, out); });
}

host::Ref<IAudioTrackInfo> ParsedMovie::Sound(ncfUInt32 index) const {
    return Fetch<IAudioTrackInfo>(
        [&](IAudioTrackInfo** out) { return parser_->GetAudioTrackInfo(index, out); });
}

host::Ref<ITrackInfo> ParsedMovie::Timecode(ncfUInt32 index) const {
    return Fetch<ITrackInfo>(
        [&](ITrackInfo** out) { return parser_->GetTimeCodeTrackInfo(index, out); });
}

host::Ref<ITrackInfo> ParsedMovie::Other(ncfUInt32 index) const {
    return Fetch<ITrackInfo>(
        [&](ITrackInfo** out) { return parser_->GetOtherTrackInfo(index, out); });
}

host::Ref<IVideoSampleDescription> ParsedMovie::VideoDescription(ncfUInt32 index) const {
    const auto track = Video();
    return Fetch<IVideoSampleDescription>([&](IVideoSampleDescription** out) {
        return track ? track->GetVideoSampleDescription(index, out) : NCF_E_NOTFOUND;
    });
}

host::Ref<IAudioSampleDescription> ParsedMovie::SoundDescription(ncfUInt32 index) const {
    const auto track = Sound();
    return Fetch<IAudioSampleDescription>([&](IAudioSampleDescription** out) {
        return track ? track->GetAudioSampleDescription(index, out) : NCF_E_NOTFOUND;
    });
}

host::Ref<IQTSampleTable> ParsedMovie::Samples() const {
    const auto video = Video();
    const auto sound = Sound();
    return Fetch<IQTSampleTable>([&](IQTSampleTable** out) {
        return video   ? video->GetSampleTable(out)
               : sound ? sound->GetSampleTable(out)
                       : NCF_E_NOTFOUND;
    });
}

movies::Movie PlainMovie() {
    movies::Movie movie;
    movie.tracks.push_back(movies::VideoTrack(movies::VideoFormat(), 30, 30, 1, 100));
    return movie;
}
