// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/MovieFile.h"

extern "C" {
#include <libavutil/dict.h>
#include <libavutil/parseutils.h>
}

#include <algorithm>
#include <set>

namespace host {
namespace {

// Ids above this are no numbers to loop to.
constexpr ncfUInt32 kHighestUsefulId = 65535;
// From 1904-01-01 to 1970-01-01.
constexpr ncfSInt64 kSecondsTo1970 = 2082844800;

constexpr unsigned kTimecodeTag = MKTAG('t', 'm', 'c', 'd');

std::string ErrorText(int error) {
    char text[AV_ERROR_MAX_STRING_SIZE] = {};
    av_strerror(error, text, sizeof text);
    return text;
}

// Whether every sound and picture stream tells its form already; most files do
// in their headers, and reading on would cost what decoding costs.
bool AreStreamsKnown(const AVFormatContext& input) {
    for (unsigned i = 0; i < input.nb_streams; ++i) {
        const AVCodecParameters& form = *input.streams[i]->codecpar;
        if (form.codec_type == AVMEDIA_TYPE_AUDIO &&
            (form.sample_rate <= 0 || form.ch_layout.nb_channels <= 0)) {
            return false;
        }
        if (form.codec_type == AVMEDIA_TYPE_VIDEO && (form.width <= 0 || form.height <= 0)) {
            return false;
        }
    }
    return input.nb_streams > 0;
}

}  // namespace

std::unique_ptr<MovieFile> MovieFile::Open(const std::filesystem::path& path, std::string& reason) {
    AVFormatContext* opened = nullptr;
    AVDictionary* options = nullptr;
    // A file that names others, such as a playlist, reaches none of them.
    av_dict_set(&options, "protocol_whitelist", "file", 0);
    const int error =
        avformat_open_input(&opened, ("file:" + path.string()).c_str(), nullptr, &options);
    av_dict_free(&options);
    if (error < 0) {
        reason = ErrorText(error);
        return nullptr;
    }
    InputOwner input(opened);
    if (!AreStreamsKnown(*input)) {
        avformat_find_stream_info(input.get(), nullptr);
    }
    if (input->nb_streams == 0) {
        reason = "the file holds no tracks";
        return nullptr;
    }
    return std::unique_ptr<MovieFile>(new MovieFile(std::move(input)));
}

MovieFile::MovieFile(InputOwner input) : input_(std::move(input)) {
    NumberTracks();
}

void MovieFile::NumberTracks() {
    std::set<int> ids;
    bool useful = true;
    for (unsigned i = 0; i < input_->nb_streams; ++i) {
        const int id = input_->streams[i]->id;
        useful = useful && id > 0 && static_cast<ncfUInt32>(id) <= kHighestUsefulId &&
                 ids.insert(id).second;
    }
    for (unsigned i = 0; i < input_->nb_streams; ++i) {
        numbers_.push_back(useful ? static_cast<ncfUInt32>(input_->streams[i]->id) : i + 1);
    }
}

const AVStream* MovieFile::FindTrack(ncfUInt32 track) const {
    const auto found = std::find(numbers_.begin(), numbers_.end(), track);
    if (track == 0 || found == numbers_.end()) {
        return nullptr;
    }
    return input_->streams[found - numbers_.begin()];
}

ncfUInt32 MovieFile::HighestTrack() const {
    return *std::max_element(numbers_.begin(), numbers_.end());
}

bool MovieFile::IsVideo(ncfUInt32 track) const {
    const AVStream* const stream = FindTrack(track);
    return stream && stream->codecpar->codec_type == AVMEDIA_TYPE_VIDEO &&
           (stream->disposition & AV_DISPOSITION_ATTACHED_PIC) == 0;
}

bool MovieFile::IsAudio(ncfUInt32 track) const {
    const AVStream* const stream = FindTrack(track);
    return stream && stream->codecpar->codec_type == AVMEDIA_TYPE_AUDIO;
}

bool MovieFile::IsTimecode(ncfUInt32 track) const {
    const AVStream* const stream = FindTrack(track);
    return stream && stream->codecpar->codec_type == AVMEDIA_TYPE_DATA &&
           stream->codecpar->codec_tag == kTimecodeTag;
}

ncfUInt64 MovieFile::CreationTime() const {
    const AVDictionaryEntry* const entry =
        av_dict_get(input_->metadata, "creation_time", nullptr, 0);
    int64_t microseconds = 0;
    if (!entry || av_parse_time(&microseconds, entry->value, 0) < 0) {
        return 0;
    }
    const ncfSInt64 seconds = microseconds / 1000000 + kSecondsTo1970;
    return seconds > 0 ? static_cast<ncfUInt64>(seconds) : 0;
}

}  // namespace host
