// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/QTParser.h"

#include <fmt/format.h>

#include <algorithm>

#include "reference_host/framework/Guard.h"
#include "reference_host/header_parser/TrackObjects.h"

namespace header_parser {

using host::Need;

QTParser::QTParser(const ParserLimits& limits) : limits_(limits), scanner_(limits) {}

NCFRESULT QTParser::ParseHeaders(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt64 position) {
    if (begin == nullptr || end == nullptr) {
        return NCF_E_POINTER;
    }
    if (end < begin) {
        return NCF_E_INVALIDARG;
    }
    isWaiting_ = false;
    const NCFRESULT result = host::Guarded([&] {
        switch (state_) {
            case State::kHeader:
                return ReadHeader(begin, end, position);
            case State::kTimecode:
                return ReadTimecode(begin, end, position);
            case State::kDone:
                return NCF_OK;
            case State::kRefused:
                break;
        }
        return refusal_.code;
    });
    if (result == NCF_E_OUTOFMEMORY && state_ != State::kRefused) {
        return Refuse({NCF_E_OUTOFMEMORY, "there is no memory for the movie header"});
    }
    return result;
}

NCFRESULT QTParser::Refuse(Refusal refusal) {
    refusal_ = std::move(refusal);
    state_ = State::kRefused;
    movie_.reset();
    return refusal_.code;
}

Refusal QTParser::WhyUnfinished(ncfUInt64 fileSize) const {
    // Zeros stood for what is behind the end of the file.
    const bool isAtEnd = state_ == State::kRefused && scanner_.WalkedToEnd(fileSize);
    if (!isWaiting_ && !isAtEnd) {
        return refusal_;
    }
    if (state_ == State::kTimecode) {
        return {NMA_E_NODATA,
                fmt::format("the first timecode sample begins at byte {}, the file ends at byte {}",
                            wantedPosition_, fileSize)};
    }
    Refusal missing = Locate(scanner_.Missing(fileSize));
    missing.code = isAtEnd ? refusal_.code : missing.code;
    return missing;
}

std::shared_ptr<const Movie> QTParser::ReadMovie() const {
    return state_ == State::kDone ? movie_ : nullptr;
}

NCFRESULT QTParser::ReadHeader(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt64 position) {
    HeaderScanner::Progress progress{};
    Verdict verdict = scanner_.Feed(begin, end, position, progress);
    if (verdict.Refused()) {
        return Refuse(Locate(verdict));
    }
    if (progress == HeaderScanner::Progress::kMore) {
        isWaiting_ = true;
        wantedPosition_ = scanner_.WantedPosition();
        wantedSize_ = scanner_.WantedSize();
        return QT_E_MOREDATA;
    }
    auto movie = std::make_shared<Movie>();
    verdict = header_parser::ReadMovie(std::move(scanner_.Payload()), limits_, *movie);
    if (verdict.Refused()) {
        const std::optional<ncfUInt64> inFile = scanner_.PayloadPosition();
        Refusal refusal = Locate(verdict, movie->bytes, movie->isUnpacked ? std::nullopt : inFile);
        refusal.offset = refusal.offset.value_or(scanner_.AtomPosition());
        return Refuse(std::move(refusal));
    }
    movie->atomPosition = scanner_.AtomPosition();
    movie->atomSize = scanner_.AtomSize();
    movie_ = std::move(movie);
    if (TimecodeTrack() == nullptr) {
        state_ = State::kDone;
        return NCF_OK;
    }
    state_ = State::kTimecode;
    return ReadTimecode(begin, end, position);
}

const Track* QTParser::TimecodeTrack() const {
    const std::vector<ncfUInt32>& tracks = movie_->Of(TrackKind::kTimecode);
    if (tracks.empty()) {
        return nullptr;
    }
    const Track& track = movie_->tracks[tracks.front()];
    const bool isReadable = track.timecode.IsUsable() && track.samples.Count() > 0 &&
                            track.samples.Sizes().SizeOf(0) >= 4 && track.isInFile.front();
    return isReadable ? &track : nullptr;
}

// The sample may lie in the bytes that were just given. When it is all zeros
// there it may as well be padding behind the end of the file, so it is then
// asked for by itself.
NCFRESULT QTParser::ReadTimecode(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt64 position) {
    constexpr ncfUInt64 kSize = 4;
    const Track& track = *TimecodeTrack();
    const ncfUInt64 place = track.samples.PositionOf(0);
    const auto given = static_cast<ncfUInt64>(end - begin);
    const bool isThere = place >= position && given >= kSize && place - position <= given - kSize;
    const ncfUInt8* sample = isThere ? begin + (place - position) : nullptr;
    const bool wasAskedFor = wantedPosition_ == place && wantedSize_ == kSize;
    if (isThere && (wasAskedFor || LoadU32(sample) != 0)) {
        movie_->startAddress = ReadTimecodeSample(sample, track.timecode);
        state_ = State::kDone;
        return NCF_OK;
    }
    if (wasAskedFor) {
        return Refuse({NCF_E_INVALIDARG, "the bytes given are not those asked for"});
    }
    isWaiting_ = true;
    wantedPosition_ = place;
    wantedSize_ = kSize;
    return QT_E_MOREDATA;
}

NCFRESULT QTParser::GetRecomendedReadPosition(ncfUInt64* position, ncfUInt32* size) {
    if (position == nullptr || size == nullptr) {
        return NCF_E_POINTER;
    }
    if (!isWaiting_) {
        return NMA_E_NOTINITIALIZED;
    }
    *position = wantedPosition_;
    *size = wantedSize_;
    return NCF_OK;
}

template <typename Value, typename Out>
NCFRESULT QTParser::Give(Value value, Out* out) const {
    return state_ == State::kDone ? host::Give(value(*movie_), out) : NMA_E_NOTINITIALIZED;
}

NCFRESULT QTParser::GetCreationTime(ncfUInt64* seconds) {
    return Give([](const Movie& movie) { return movie.creationTime; }, seconds);
}

NCFRESULT QTParser::GetTimeScale(ncfUInt32* timescale) {
    return Give([](const Movie& movie) { return movie.timeScale; }, timescale);
}

NCFRESULT QTParser::GetMovieDuration(ncfUInt32* duration) {
    return Give([](const Movie& movie) { return movie.duration; }, duration);
}

NCFRESULT QTParser::GiveCount(TrackKind kind, ncfUInt32* count) const {
    return Give([kind](const Movie& movie) { return movie.Of(kind).size(); }, count);
}

NCFRESULT QTParser::GetVideoTrackCount(ncfUInt32* count) {
    return GiveCount(TrackKind::kVideo, count);
}

NCFRESULT QTParser::GetAudioTrackCount(ncfUInt32* count) {
    return GiveCount(TrackKind::kSound, count);
}

NCFRESULT QTParser::GetTimeCodeTrackCount(ncfUInt32* count) {
    return GiveCount(TrackKind::kTimecode, count);
}

NCFRESULT QTParser::GetOtherTrackCount(ncfUInt32* count) {
    return GiveCount(TrackKind::kOther, count);
}

template <class Object, class Interface>
NCFRESULT QTParser::GiveTrack(TrackKind kind, ncfUInt32 index, Interface** out) const {
    return host::Guarded([&] {
        Need(out);
        *out = nullptr;
        Need(state_ == State::kDone, NMA_E_NOTINITIALIZED);
        Need(index < movie_->Of(kind).size(), NCF_E_NOTFOUND);
        const Track& track = movie_->tracks[movie_->Of(kind)[index]];
        *out = host::MakeRef<Object>(Shared<Track>(movie_, &track), movie_->timeScale).Detach();
        return NCF_OK;
    });
}

NCFRESULT QTParser::GetVideoTrackInfo(ncfUInt32 index, IVideoTrackInfo** track) {
    return GiveTrack<VideoTrackObject>(TrackKind::kVideo, index, track);
}

NCFRESULT QTParser::GetAudioTrackInfo(ncfUInt32 index, IAudioTrackInfo** track) {
    return GiveTrack<AudioTrackObject>(TrackKind::kSound, index, track);
}

NCFRESULT QTParser::GetTimeCodeTrackInfo(ncfUInt32 index, ITrackInfo** track) {
    return GiveTrack<PlainTrackObject>(TrackKind::kTimecode, index, track);
}

NCFRESULT QTParser::GetOtherTrackInfo(ncfUInt32 index, ITrackInfo** track) {
    return GiveTrack<PlainTrackObject>(TrackKind::kOther, index, track);
}

NCFRESULT QTParser::GetTimeCodeInfo(ncfUInt8* hours, ncfUInt8* minutes, ncfUInt8* seconds,
                                    ncfUInt8* frames, ncfUInt32* timeScale,
                                    ncfUInt32* frameDuration, ncfUInt32* drop,
                                    ncfUInt32* numFrames) {
    return host::Guarded([&] {
        Need(hours && minutes && seconds && frames && timeScale && frameDuration && drop &&
             numFrames);
        Need(state_ == State::kDone, NMA_E_NOTINITIALIZED);
        Need(movie_->startAddress, movie_->Of(TrackKind::kTimecode).empty()
                                       ? NCF_E_NOTFOUND
                                       : NCF_E_PARAMETERNOTAVAILABLE);
        const TimecodeDescription& description = TimecodeTrack()->timecode;
        *hours = movie_->startAddress->hours;
        *minutes = movie_->startAddress->minutes;
        *seconds = movie_->startAddress->seconds;
        *frames = movie_->startAddress->frames;
        *timeScale = description.timeScale;
        *frameDuration = description.frameDuration;
        *drop = description.IsDropFrame() ? 1 : 0;
        *numFrames = description.numFrames;
        return NCF_OK;
    });
}

NCFRESULT QTParser::IsMovieSelfContained(ncfBool* selfContained) {
    return Give([](const Movie& movie) { return movie.isSelfContained; }, selfContained);
}

NCFRESULT QTParser::GetMOOVAtom(ncfUInt64* position, ncfUInt64* size) {
    if (position == nullptr || size == nullptr) {
        return NCF_E_POINTER;
    }
    Give([](const Movie& movie) { return movie.atomPosition; }, position);
    return Give([](const Movie& movie) { return movie.atomSize; }, size);
}

host::Maker QTParserMaker(const ParserLimits& limits) {
    return host::MakerOf([limits](INCFUnknown*) { return host::MakeRef<QTParser>(limits); });
}

}  // namespace header_parser
