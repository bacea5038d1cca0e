// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/MovieFile.h"

extern "C" {
#include <libavutil/dict.h>
#include <libavutil/parseutils.h>
}

#include <algorithm>
#include <iterator>
#include <limits>
#include <numeric>
#include <set>

#include "reference_host/header_parser/InspectHeaders.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/PacketList.h"

namespace host {
namespace {

// Ids above this are no numbers to loop to.
constexpr ncfUInt32 kHighestUsefulId = 65535;
// From 1904-01-01 to 1970-01-01.
constexpr ncfSInt64 kSecondsTo1970 = 2082844800;

// The id of what the library adds to a movie without a track header.
constexpr int kNoId = -1;

constexpr unsigned kTimecodeTag = MKTAG('t', 'm', 'c', 'd');

// All bits set, in the width of either version of a header, means unknown.
template <class Number>
bool IsKnownDuration(Number duration) {
    return duration > 0 && duration != Number{0xFFFFFFFF} &&
           duration != std::numeric_limits<Number>::max();
}

MovieFile::Raster RasterNow(const AVStream& stream) {
    const AVCodecParameters& form = *stream.codecpar;
    return {
        form.width, form.height,
        stream.sample_aspect_ratio.num > 0 ? stream.sample_aspect_ratio : form.sample_aspect_ratio};
}

// From the first packet's display to the end of the last; where some have no
// times, as long as all of them last.
double SecondsOf(const std::vector<PacketEntry>& packets, const AVStream& stream) {
    ncfSInt64 first = std::numeric_limits<ncfSInt64>::max();
    ncfSInt64 end = std::numeric_limits<ncfSInt64>::min();
    double sum = 0.0;
    bool tellsAll = true;
    for (const PacketEntry& packet : packets) {
        sum += static_cast<double>(packet.duration);
        tellsAll = tellsAll && packet.displayTime != AV_NOPTS_VALUE;
        if (packet.displayTime != AV_NOPTS_VALUE) {
            first = std::min(first, packet.displayTime);
            end = std::max(end, packet.displayTime + packet.duration);
        }
    }
    const double span =
        tellsAll && end > first ? static_cast<double>(end) - static_cast<double>(first) : sum;
    return span > 0.0 ? span * av_q2d(stream.time_base) : 0.0;
}

// 0 for none.
ncfUInt32 Lowest(const std::vector<ncfUInt32>& tracks) {
    return tracks.empty() ? 0 : *std::min_element(tracks.begin(), tracks.end());
}

}  // namespace

std::unique_ptr<MovieFile> MovieFile::Open(const std::filesystem::path& path, std::string& reason) {
    InputOwner input = OpenInput(path, InputView::AsPresented, reason);
    if (!input) {
        return nullptr;
    }
    std::unique_ptr<MovieFile> movie(new MovieFile(path, std::move(input)));
    if (movie->HasTooManyChannels()) {
        reason = TooManyChannels();
        return nullptr;
    }
    return movie;
}

// Those that come out of the decoders, which may be more than the headers tell.
// They are only counted where so many could come.
bool MovieFile::HasTooManyChannels() {
    constexpr int kMostOfADecoder = 64;  // where the container tells less
    int possible = 0;
    for (unsigned i = 0; i < input_->nb_streams; ++i) {
        const AVCodecParameters& form = *input_->streams[i]->codecpar;
        if (form.codec_type == AVMEDIA_TYPE_AUDIO) {
            possible += std::max(form.ch_layout.nb_channels, kMostOfADecoder);
        }
    }
    if (possible <= kMostChannelsOfMovie) {
        return false;
    }
    soundForms_ = ReadSoundForms(path_, *input_, IndexIsWhole());
    const auto channels = std::accumulate(
        soundForms_->begin(), soundForms_->end(), ncfUInt64{0},
        [](ncfUInt64 sum, const auto& sound) { return sum + sound.second.channels; });
    return channels > kMostChannelsOfMovie;
}

MovieFile::MovieFile(std::filesystem::path path, InputOwner input)
    : path_(std::move(path)), input_(std::move(input)) {
    if (IsMovieFamily(*input_)) {
        atoms_ = ReadMovieAtoms(path_);
    }
    NumberTracks();
    firstVideo_ = ChooseFirstVideo();
    const bool isByContainer = !HasStreamDetails(*input_);
    for (unsigned i = 0; i < input_->nb_streams; ++i) {
        const AVStream& stream = *input_->streams[i];
        told_.push_back({isByContainer ? stream.codecpar->field_order : AV_FIELD_UNKNOWN,
                         stream.avg_frame_rate, RasterNow(stream)});
    }
}

ncfUInt32 MovieFile::IdOf(unsigned stream) const {
    const int id = input_->streams[stream]->id;
    return IsMovieFamily(*input_) && id != kNoId ? static_cast<ncfUInt32>(id) : 0;
}

// The file's ids are the numbers while all differ and none is too high. Else
// numbers go from 1 to n, where an id within that range still is the number of
// its track, so looking for ids and for numbers never disagrees. What is no
// track of the file, such as a picture attached to it, has the lowest number
// that is left.
void MovieFile::NumberTracks() {
    numbers_.assign(input_->nb_streams, 0);
    std::set<ncfUInt32> ids;
    bool areUseful = true;
    for (unsigned i = 0; i < input_->nb_streams; ++i) {
        const ncfUInt32 id = IdOf(i);
        areUseful = areUseful && id <= kHighestUsefulId && (id == 0 || ids.insert(id).second);
    }
    const ncfUInt32 highest = areUseful ? kHighestUsefulId : input_->nb_streams;
    std::set<ncfUInt32> taken;
    for (unsigned i = 0; i < input_->nb_streams; ++i) {
        const ncfUInt32 id = IdOf(i);
        if (id != 0 && id <= highest && taken.insert(id).second) {
            numbers_[i] = id;
        }
    }
    ncfUInt32 next = 1;
    for (ncfUInt32& number : numbers_) {
        if (number == 0) {
            while (taken.count(next) > 0) {
                ++next;
            }
            number = next++;
        }
    }
}

bool MovieFile::IndexIsWhole() const {
    return IsMovieFamily(*input_) && !atoms_.isFragmented;
}

int MovieFile::StreamOf(ncfUInt32 track) const {
    for (std::size_t i = 0; track != 0 && i < numbers_.size(); ++i) {
        if (numbers_[i] == track) {
            return static_cast<int>(i);
        }
    }
    for (std::size_t i = 0; track != 0 && i < numbers_.size(); ++i) {
        if (IdOf(static_cast<unsigned>(i)) == track) {
            return static_cast<int>(i);
        }
    }
    return -1;
}

const MovieAtoms::Track* MovieFile::FindAtoms(ncfUInt32 track) const {
    const int stream = StreamOf(track);
    const ncfUInt32 id = stream < 0 ? 0 : IdOf(static_cast<unsigned>(stream));
    return id == 0 ? nullptr : atoms_.Find(id);
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

std::vector<ncfUInt32> MovieFile::TracksWhere(bool (MovieFile::*test)(ncfUInt32) const) const {
    std::vector<ncfUInt32> tracks;
    std::copy_if(numbers_.begin(), numbers_.end(), std::back_inserter(tracks),
                 [this, test](ncfUInt32 number) { return (this->*test)(number); });
    return tracks;
}

// Which of several the header shows is asked of its parser: handlers tell it the
// kinds of tracks, and codes tell the library.
ncfUInt32 MovieFile::ChooseFirstVideo() const {
    const std::vector<ncfUInt32> pictures = TracksWhere(&MovieFile::IsVideo);
    if (pictures.size() > 1 && IndexIsWhole()) {
        const header_parser::HeaderReport header = header_parser::InspectHeaders(path_);
        if (const auto place = header.ShownTrack()) {
            const ncfUInt32 id = header.movie->tracks[*place].id;
            const int stream = *place < input_->nb_streams && IdOf(*place) == id
                                   ? static_cast<int>(*place)
                                   : StreamOf(id);
            if (stream >= 0 && IsVideo(numbers_[static_cast<std::size_t>(stream)])) {
                return numbers_[static_cast<std::size_t>(stream)];
            }
        }
    }
    return Lowest(pictures);
}

ncfUInt32 MovieFile::FirstAudio() const {
    return Lowest(TracksWhere(&MovieFile::IsAudio));
}

std::map<ncfUInt32, int> MovieFile::StreamsByTrack() const {
    std::map<ncfUInt32, int> streams;
    for (std::size_t i = 0; i < numbers_.size(); ++i) {
        streams[numbers_[i]] = static_cast<int>(i);
    }
    for (std::size_t i = 0; i < numbers_.size(); ++i) {
        const ncfUInt32 id = IdOf(static_cast<unsigned>(i));
        if (id != 0) {
            streams.emplace(id, static_cast<int>(i));
        }
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

const SoundForm* MovieFile::SoundFormOf(ncfUInt32 track) {
    if (!soundForms_) {
        soundForms_ = ReadSoundForms(path_, *input_, IndexIsWhole());
    }
    const auto found = soundForms_->find(StreamOf(track));
    return found == soundForms_->end() ? nullptr : &found->second;
}

AVFieldOrder MovieFile::ContainerFieldOrder(ncfUInt32 track) const {
    const int stream = StreamOf(track);
    return stream < 0 || stream >= static_cast<int>(told_.size())
               ? AV_FIELD_UNKNOWN
               : told_[static_cast<std::size_t>(stream)].fieldOrder;
}

MovieFile::Raster MovieFile::RasterOf(ncfUInt32 track) {
    const int stream = StreamOf(track);
    if (stream < 0) {
        return {};
    }
    const Raster& told = told_[static_cast<std::size_t>(stream)].raster;
    return IsMovieFamily(*input_) && told.width > 0 && told.height > 0
               ? told
               : RasterNow(*FindDetailedTrack(track));
}

// Samples by the time that the media takes, without regard to edits, as a header
// that is read has it: what the table of durations sums up to, or what the
// media's header tells where that is within a sample. 0.0 for a table of none,
// nothing where there is no table.
std::optional<double> MovieFile::RateOfTable(int stream) const {
    const MovieAtoms::Track* const atoms = FindAtoms(numbers_[static_cast<std::size_t>(stream)]);
    const auto sum = atoms ? SumDurations(path_, *atoms) : std::nullopt;
    if (!sum || atoms->mediaTimeScale == 0) {
        return std::nullopt;
    }
    if (sum->samples == 0) {
        return 0.0;
    }
    const ncfUInt64 told =
        IsKnownDuration(atoms->mediaDuration) ? atoms->mediaDuration : sum->units;
    const ncfUInt64 difference = told > sum->units ? told - sum->units : sum->units - told;
    const bool isSumUp = sum->units > 0 && difference > sum->units / sum->samples;
    const ncfUInt64 units = isSumUp ? sum->units : told;
    return units == 0 ? std::nullopt
                      : std::optional(static_cast<double>(sum->samples) * atoms->mediaTimeScale /
                                      static_cast<double>(units));
}

// The same of a movie whose atoms can't be read in place. 0.0 where the
// library does not tell both.
double MovieFile::MeanRateOfMedia(int stream) const {
    const InputOwner whole = OpenForStream(path_, InputView::WholeMedia, stream);
    if (!whole) {
        return 0.0;
    }
    const AVStream& of = *whole->streams[stream];
    return of.nb_frames > 0 && IsKnownDuration(of.duration)
               ? static_cast<double>(of.nb_frames) /
                     (static_cast<double>(of.duration) * av_q2d(of.time_base))
               : 0.0;
}

// Pictures by the time from the first to the end of the last. 0.0 for a track
// that tells no times.
double MovieFile::MeanRateOfPackets(int stream) {
    const InputOwner input = OpenForStream(path_, InputView::AsPresented, stream);
    if (!input) {
        return 0.0;
    }
    const std::vector<PacketEntry> packets = ListPackets(*input, stream, IndexIsWhole());
    const double seconds = SecondsOf(packets, *input->streams[stream]);
    return seconds > 0.0 ? static_cast<double>(packets.size()) / seconds : 0.0;
}

// The mean of what some containers name counts each field as a picture.
bool MovieFile::MayHoldFieldsApart(int stream) const {
    const AVCodecParameters& form = *input_->streams[stream]->codecpar;
    return !IsMovieFamily(*input_) && TellsTimesOfAll(*input_) &&
           form.codec_id == AV_CODEC_ID_H264 && form.field_order != AV_FIELD_PROGRESSIVE;
}

// Whether a track of a movie whose tables stand in its header has samples at all.
// Edits may show none of them.
bool MovieFile::HoldsSamples(int stream) const {
    if (avformat_index_get_entries_count(input_->streams[stream]) > 0) {
        return true;
    }
    const InputOwner whole = OpenForStream(path_, InputView::WholeMedia, stream);
    return whole && avformat_index_get_entries_count(whole->streams[stream]) > 0;
}

double MovieFile::PictureRate() {
    const ncfUInt32 track = FirstVideo();
    const int stream = StreamOf(track);
    if (stream < 0 || (IndexIsWhole() && !HoldsSamples(stream))) {
        return 0.0;
    }
    const auto ofTable = IndexIsWhole() ? RateOfTable(stream) : std::nullopt;
    if (ofTable) {
        return *ofTable;
    }
    const double mean = IndexIsWhole() ? MeanRateOfMedia(stream)
                        : atoms_.isFragmented || MayHoldFieldsApart(stream)
                            ? MeanRateOfPackets(stream)
                            : 0.0;
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
        const InputOwner input = OpenForStream(path_, InputView::AsPresented, stream);
        if (!input) {
            return 0;
        }
        counted_ = CountShownPackets(*input, stream, IndexIsWhole(), enough);
        countedAll_ = counted_ < enough;
    }
    return std::min(counted_, enough);
}

double MovieFile::SecondsOfPackets(int stream) {
    const auto known = secondsOfPackets_.find(stream);
    if (known != secondsOfPackets_.end()) {
        return known->second;
    }
    double seconds = 0.0;
    if (const InputOwner input = OpenForStream(path_, InputView::AsPresented, stream)) {
        seconds = SecondsOf(ListPackets(*input, stream, IndexIsWhole()), *input->streams[stream]);
    }
    return secondsOfPackets_[stream] = seconds;
}

// Whether headers leave the length out or guess it: those of fragmented movies
// speak of the part before the fragments, some streams are only measured by
// their bytes, and program streams tell the times of some packets alone.
bool MovieFile::NeedsPacketTimes() const {
    return atoms_.isFragmented || !TellsTimesOfAll(*input_) ||
           input_->duration_estimation_method == AVFMT_DURATION_FROM_BITRATE;
}

double MovieFile::Seconds(ncfUInt32 track) {
    if (NeedsPacketTimes()) {
        double longest = 0.0;
        for (std::size_t i = 0; i < numbers_.size(); ++i) {
            const bool wanted = track == 0 ? IsVideo(numbers_[i]) || IsAudio(numbers_[i])
                                           : StreamOf(track) == static_cast<int>(i);
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
    const MovieAtoms::Track* const atoms = FindAtoms(track);
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
