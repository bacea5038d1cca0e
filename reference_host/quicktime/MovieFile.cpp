// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/MovieFile.h"

extern "C" {
#include <libavutil/dict.h>
#include <libavutil/parseutils.h>
}

#include <algorithm>
#include <limits>
#include <set>

#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/PacketList.h"

namespace host {
namespace {

// Ids above this are no numbers to loop to.
constexpr ncfUInt32 kHighestUsefulId = 65535;
// From 1904-01-01 to 1970-01-01.
constexpr ncfSInt64 kSecondsTo1970 = 2082844800;

constexpr unsigned kTimecodeTag = MKTAG('t', 'm', 'c', 'd');

// All bits set, in the width of either version of a header, means unknown.
template <class Number>
bool IsKnownDuration(Number duration) {
    return duration > 0 && duration != Number{0xFFFFFFFF} &&
           duration != std::numeric_limits<Number>::max();
}

}  // namespace

std::unique_ptr<MovieFile> MovieFile::Open(const std::filesystem::path& path, std::string& reason) {
    InputOwner input = OpenInput(path, InputView::AsPresented, reason);
    return input ? std::unique_ptr<MovieFile>(new MovieFile(path, std::move(input))) : nullptr;
}

MovieFile::MovieFile(std::filesystem::path path, InputOwner input)
    : path_(std::move(path)), input_(std::move(input)) {
    if (IsMovieFamily(*input_)) {
        atoms_ = ReadMovieAtoms(path_);
    }
    NumberTracks();
    for (unsigned i = 0; i < input_->nb_streams; ++i) {
        told_.push_back(
            {input_->streams[i]->codecpar->field_order, input_->streams[i]->avg_frame_rate});
    }
}

void MovieFile::NumberTracks() {
    std::set<int> ids;
    bool useful = IsMovieFamily(*input_);
    for (unsigned i = 0; i < input_->nb_streams; ++i) {
        const int id = input_->streams[i]->id;
        useful = useful && id > 0 && static_cast<ncfUInt32>(id) <= kHighestUsefulId &&
                 ids.insert(id).second;
    }
    for (unsigned i = 0; i < input_->nb_streams; ++i) {
        numbers_.push_back(useful ? static_cast<ncfUInt32>(input_->streams[i]->id) : i + 1);
    }
}

bool MovieFile::IndexIsWhole() const {
    return IsMovieFamily(*input_) && !atoms_.isFragmented;
}

int MovieFile::StreamOf(ncfUInt32 track) const {
    const auto found = std::find(numbers_.begin(), numbers_.end(), track);
    return track == 0 || found == numbers_.end() ? -1 : static_cast<int>(found - numbers_.begin());
}

const AVStream* MovieFile::FindTrack(ncfUInt32 track) const {
    const int stream = StreamOf(track);
    return stream < 0 ? nullptr : input_->streams[stream];
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

ncfUInt32 MovieFile::FirstWhere(bool (MovieFile::*test)(ncfUInt32) const) const {
    ncfUInt32 first = 0;
    for (const ncfUInt32 number : numbers_) {
        if ((this->*test)(number) && (first == 0 || number < first)) {
            first = number;
        }
    }
    return first;
}

ncfUInt32 MovieFile::FirstVideo() const {
    return FirstWhere(&MovieFile::IsVideo);
}

ncfUInt32 MovieFile::FirstAudio() const {
    return FirstWhere(&MovieFile::IsAudio);
}

std::map<ncfUInt32, int> MovieFile::StreamsByTrack() const {
    std::map<ncfUInt32, int> streams;
    for (std::size_t i = 0; i < numbers_.size(); ++i) {
        streams[numbers_[i]] = static_cast<int>(i);
    }
    return streams;
}

const AVStream* MovieFile::FindDetailedTrack(ncfUInt32 track) {
    if (!hasDetails_) {
        hasDetails_ = true;
        FindStreamDetails(*input_);
    }
    return FindTrack(track);
}

AVFieldOrder MovieFile::ContainerFieldOrder(ncfUInt32 track) const {
    const int stream = StreamOf(track);
    return stream < 0 || stream >= static_cast<int>(told_.size())
               ? AV_FIELD_UNKNOWN
               : told_[static_cast<std::size_t>(stream)].fieldOrder;
}

// Samples by the time that the media takes, without regard to edits. 0.0 where
// the container does not tell both.
double MovieFile::MeanRateOfMedia(int stream) const {
    std::string ignored;
    const InputOwner whole =
        IndexIsWhole() ? OpenInput(path_, InputView::WholeMedia, ignored) : nullptr;
    if (!whole || stream >= static_cast<int>(whole->nb_streams)) {
        return 0.0;
    }
    const AVStream& of = *whole->streams[stream];
    return of.nb_frames > 0 && IsKnownDuration(of.duration)
               ? static_cast<double>(of.nb_frames) /
                     (static_cast<double>(of.duration) * av_q2d(of.time_base))
               : 0.0;
}

double MovieFile::PictureRate() {
    const ncfUInt32 track = FirstVideo();
    const int stream = StreamOf(track);
    if (stream < 0) {
        return 0.0;
    }
    const double mean = MeanRateOfMedia(stream);
    if (mean > 0.0) {
        return mean;
    }
    AVRational rate = told_[static_cast<std::size_t>(stream)].rate;
    if (rate.num <= 0 || rate.den <= 0) {
        const AVStream* const detailed = FindDetailedTrack(track);
        rate = detailed->avg_frame_rate.num > 0 ? detailed->avg_frame_rate : detailed->r_frame_rate;
    }
    return rate.num > 0 && rate.den > 0 ? av_q2d(rate) : 0.0;
}

ncfUInt64 MovieFile::CountPictures(ncfUInt64 enough) {
    const int stream = StreamOf(FirstVideo());
    if (stream < 0) {
        return 0;
    }
    if (!countedAll_ && counted_ < enough) {
        std::string ignored;
        const InputOwner input = OpenInput(path_, InputView::AsPresented, ignored);
        if (!input || stream >= static_cast<int>(input->nb_streams)) {
            return 0;
        }
        counted_ = CountShownPackets(*input, stream, IndexIsWhole(), enough);
        countedAll_ = counted_ < enough;
    }
    return std::min(counted_, enough);
}

// From the first packet's display to the end of the last, where no header tells.
double MovieFile::SecondsOfPackets(int stream) {
    const auto known = secondsOfPackets_.find(stream);
    if (known != secondsOfPackets_.end()) {
        return known->second;
    }
    double seconds = 0.0;
    std::string ignored;
    const InputOwner input = OpenInput(path_, InputView::AsPresented, ignored);
    if (input && stream < static_cast<int>(input->nb_streams)) {
        ncfSInt64 first = std::numeric_limits<ncfSInt64>::max();
        ncfSInt64 end = std::numeric_limits<ncfSInt64>::min();
        for (const PacketEntry& packet : ListPackets(*input, stream, IndexIsWhole())) {
            if (packet.displayTime != AV_NOPTS_VALUE) {
                first = std::min(first, packet.displayTime);
                end = std::max(end, packet.displayTime + packet.duration);
            }
        }
        if (end > first) {
            seconds = (static_cast<double>(end) - static_cast<double>(first)) *
                      av_q2d(input->streams[stream]->time_base);
        }
    }
    return secondsOfPackets_[stream] = seconds;
}

double MovieFile::Seconds(ncfUInt32 track) {
    if (atoms_.isFragmented) {  // its headers speak of the part before the fragments
        double longest = 0.0;
        for (std::size_t i = 0; i < numbers_.size(); ++i) {
            const bool wanted =
                track == 0 ? IsVideo(numbers_[i]) || IsAudio(numbers_[i]) : numbers_[i] == track;
            longest = std::max(longest, wanted ? SecondsOfPackets(static_cast<int>(i)) : 0.0);
        }
        return longest;
    }
    const double movie = atoms_.timeScale > 0 && IsKnownDuration(atoms_.duration)
                             ? static_cast<double>(atoms_.duration) / atoms_.timeScale
                         : input_->duration > 0
                             ? static_cast<double>(input_->duration) / AV_TIME_BASE
                             : 0.0;
    if (track == 0) {
        return movie;
    }
    const MovieAtoms::Track* const atoms = atoms_.Find(track);
    if (atoms && atoms_.timeScale > 0 && IsKnownDuration(atoms->duration)) {
        return static_cast<double>(atoms->duration) / atoms_.timeScale;
    }
    const AVStream* const stream = FindTrack(track);
    return stream && IsKnownDuration(stream->duration)
               ? static_cast<double>(stream->duration) * av_q2d(stream->time_base)
               : movie;
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
