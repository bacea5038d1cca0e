// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <vector>

#include "host_interfaces/framework/ResultCodes.h"
#include "reference_host/quicktime/AvOwners.h"
#include "reference_host/quicktime/OpenInput.h"

namespace host {

// Decodes one sound track by place: 0 is the first sample that the movie
// presents, and what an edit leaves empty is silence. Nothing is resampled.
class SoundDecoder {
public:
    // `hasWholeIndex`: the file is a movie whose own time begins at 0. Other
    // files, and movies in fragments, begin where their first stream does.
    static std::unique_ptr<SoundDecoder> Open(const std::filesystem::path& path, int stream,
                                              bool hasWholeIndex,
                                              InputView view = InputView::AsPresented);

    int Channels() const { return channels_; }
    int SampleRate() const { return input_->streams[stream_]->codecpar->sample_rate; }
    double SecondsOfTimeUnit() const { return av_q2d(input_->streams[stream_]->time_base); }

    // `count` frames from `place`, all channels; `words` holds zeros where there
    // is no sound. Gives how many frames reach to the last that there is.
    ncfUInt64 Read(ncfUInt64 place, ncfUInt64 count, std::vector<ncfSInt32>& words);

private:
    SoundDecoder(std::filesystem::path path, InputOwner input, CodecOwner codec, int stream,
                 bool hasWholeIndex, InputView view);

    // A block whose place is known because all before it were counted.
    struct KnownBlock {
        ncfSInt64 time;
        ncfSInt64 place;
    };

    ncfSInt64 TimeOf(ncfSInt64 place) const;
    ncfSInt64 PlaceOf(ncfSInt64 time) const;
    void Start(ncfSInt64 place);
    bool SeekByTime(ncfSInt64 place);
    bool SeekToKnown(ncfSInt64 place);
    void Rewind();
    bool MayDecodeOnTo(ncfSInt64 place) const;
    ncfSInt64 Preroll() const;
    bool Advance();  // the next decoded block; false at the end
    bool PlaceBlock();
    bool Feed();

    std::filesystem::path path_;
    InputView view_;
    InputOwner input_;
    CodecOwner codec_;
    FrameOwner frame_;
    PacketOwner packet_;
    int stream_;
    int channels_;
    ncfSInt64 zeroTime_ = 0;   // of place 0, in time units of the stream
    ncfSInt64 tolerance_ = 1;  // frames that rounding of times may take
    // Times are coarser than frames: places are counted, not taken from times.
    bool countsPlaces_ = false;
    bool leansOnAll_ = false;        // a block comes out right only after all before it
    std::vector<KnownBlock> known_;  // of those that are counted, in order
    bool isRunning_ = false;

    // The block decoded last.
    std::vector<ncfSInt32> block_;
    ncfSInt64 blockStart_ = 0;
    ncfSInt64 blockCount_ = 0;
    bool isFromStart_ = false;  // decoding began with the first block
    bool isPlaced_ = false;     // the next block follows the last where times agree
};

}  // namespace host
