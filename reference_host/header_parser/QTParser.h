// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>

#include "host_interfaces/header_parser/QTParser.h"
#include "reference_host/framework/ComponentFactory.h"
#include "reference_host/header_parser/HeaderScanner.h"
#include "reference_host/header_parser/Movie.h"
#include "reference_host/header_parser/Refusal.h"

namespace header_parser {

// The header parser component: gathers the movie header from what it is fed,
// reads it, and asks for the first sample of the first timecode track. After a
// refusal it keeps answering with the same code.
class QTParser final : public host::Component<IQTParser> {
public:
    explicit QTParser(const ParserLimits& limits = ParserLimits());

    NCFRESULT GetCreationTime(ncfUInt64* seconds) override;
    NCFRESULT GetTimeScale(ncfUInt32* timescale) override;
    NCFRESULT GetMovieDuration(ncfUInt32* duration) override;
    NCFRESULT GetVideoTrackCount(ncfUInt32* count) override;
    NCFRESULT GetAudioTrackCount(ncfUInt32* count) override;
    NCFRESULT GetTimeCodeTrackCount(ncfUInt32* count) override;
    NCFRESULT GetOtherTrackCount(ncfUInt32* count) override;
    NCFRESULT GetVideoTrackInfo(ncfUInt32 index, IVideoTrackInfo** track) override;
    NCFRESULT GetAudioTrackInfo(ncfUInt32 index, IAudioTrackInfo** track) override;
    NCFRESULT GetTimeCodeTrackInfo(ncfUInt32 index, ITrackInfo** track) override;
    NCFRESULT GetOtherTrackInfo(ncfUInt32 index, ITrackInfo** track) override;
    NCFRESULT ParseHeaders(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt64 position) override;
    NCFRESULT GetRecomendedReadPosition(ncfUInt64* position, ncfUInt32* size) override;
    NCFRESULT GetTimeCodeInfo(ncfUInt8* hours, ncfUInt8* minutes, ncfUInt8* seconds,
                              ncfUInt8* frames, ncfUInt32* timeScale, ncfUInt32* frameDuration,
                              ncfUInt32* drop, ncfUInt32* numFrames) override;
    NCFRESULT IsMovieSelfContained(ncfBool* selfContained) override;
    NCFRESULT GetMOOVAtom(ncfUInt64* position, ncfUInt64* size) override;

    // Why the file was given up; nothing before that.
    const Refusal& WhyRefused() const { return refusal_; }
    // What a file that ends at `fileSize` lacks for a parser that waits for bytes
    // which are not there; else why it was given up.
    Refusal WhyUnfinished(ncfUInt64 fileSize) const;
    // The whole header, null before it is read.
    std::shared_ptr<const Movie> ReadMovie() const;

private:
    enum class State { kHeader, kTimecode, kDone, kRefused };

    NCFRESULT Refuse(Refusal refusal);
    NCFRESULT ReadHeader(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt64 position);
    NCFRESULT ReadTimecode(const ncfUInt8* begin, const ncfUInt8* end, ncfUInt64 position);
    // The first timecode track whose sample can be read, or null.
    const Track* TimecodeTrack() const;
    NCFRESULT GiveCount(TrackKind kind, ncfUInt32* count) const;
    template <class Object, class Interface>
    NCFRESULT GiveTrack(TrackKind kind, ncfUInt32 index, Interface** out) const;
    // value(movie) of a movie that is read.
    template <typename Value, typename Out>
    NCFRESULT Give(Value value, Out* out) const;

    ParserLimits limits_;
    HeaderScanner scanner_;
    State state_ = State::kHeader;
    Refusal refusal_;
    bool isWaiting_ = false;
    ncfUInt64 wantedPosition_ = 0;
    ncfUInt32 wantedSize_ = 0;
    std::shared_ptr<Movie> movie_;
};

// For Host::RegisterComponent under NCFCompID_QTParser.
host::Maker QTParserMaker(const ParserLimits& limits = ParserLimits());

// Reads `size` bytes at `position` into `to` and returns how many there were.
using ReadAt = std::function<ncfUInt32(ncfUInt64 position, ncfUInt8* to, ncfUInt32 size)>;

// Feeds a parser the way a clip does: 4096 bytes from the start, then what it
// asks for, short reads padded with zeros, NMA_E_NODATA past the end of the
// file. `passes` may be null.
NCFRESULT ReadHeaders(IQTParser& parser, const ReadAt& readAt, ncfUInt32* passes = nullptr);

// The same over bytes in memory.
NCFRESULT ReadHeaders(IQTParser& parser, const ncfUInt8* bytes, ncfUInt64 size,
                      ncfUInt32* passes = nullptr);

}  // namespace header_parser
