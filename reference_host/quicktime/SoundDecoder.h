// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <optional>
#include <vector>

#include "host_interfaces/framework/ResultCodes.h"
#include "reference_host/quicktime/AvOwners.h"
#include "reference_host/quicktime/OpenInput.h"
#include "reference_host/quicktime/SoundCodec.h"
#include "reference_host/quicktime/SoundConverter.h"
#include "reference_host/quicktime/SoundForm.h"
#include "reference_host/quicktime/SoundPlaces.h"

namespace host {

// Decodes one sound track from any place: 0 is the first sample that the movie
// presents, and empty edits are silence. Channels and rate are those of its form;
// sound that changes on the way is converted to them.
class SoundDecoder {
public:
    // `hasWholeIndex`: the file is a movie whose own time begins at 0. Other
    // files, and movies in fragments, begin where their first stream does.
    static std::unique_ptr<SoundDecoder> Open(const std::filesystem::path& path, int stream,
                                              const SoundForm& form, bool hasWholeIndex,
                                              InputView view = InputView::AsPresented);

    int Channels() const { return channels_; }
    int SampleRate() const { return rate_; }
    double SecondsOfTimeUnit() const { return av_q2d(input_->streams[stream_]->time_base); }

    // `count` frames from `place`, all channels; `words` holds zeros where there
    // is no sound. Gives how many frames reach to the last that there is.
    ncfUInt64 Read(ncfUInt64 place, ncfUInt64 count, std::vector<ncfSInt32>& words);

private:
    struct Opened {
        std::filesystem::path path;
        InputView view;
        int stream;
        bool hasWholeIndex;
        InputOwner input;
        std::unique_ptr<SoundCodec> codec;
        SoundForm form;
    };
    explicit SoundDecoder(Opened opened);

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
    bool Receive();
    bool PlaceBlock();
    void PlaceRest();
    std::optional<ncfSInt64> PlaceByMap();
    bool IsConverting() const;
    bool Feed();
    void DecodeFromStartAlways();

    std::filesystem::path path_;
    InputView view_;
    InputOwner input_;
    std::unique_ptr<SoundCodec> codec_;
    FrameOwner frame_;
    PacketOwner packet_;
    int stream_;
    int channels_;
    int rate_;
    bool isLinear_;
    SoundConverter converter_;
    ncfSInt64 zeroTime_ = 0;   // of place 0, in time units of the stream
    ncfSInt64 heardFrom_ = 0;  // place; what comes before it primes the decoder
    ncfSInt64 tolerance_ = 1;  // frames that rounding of times may take
    // How places are found where times do not give them to the frame: from the
    // index where all packets hold equally much, else by counting.
    std::optional<SoundPlaces> places_;
    ncfSInt64 framesPerPacket_ = 0;
    bool countsPlaces_ = false;
    bool leansOnAll_ = false;        // a block comes out right only after all before it
    std::vector<KnownBlock> known_;  // of those that are counted, in order
    bool isRunning_ = false;
    bool isFed_ = false;        // the end was given to the decoder
    bool isHeld_ = false;       // the frame waits for the rest before it
    bool mustRestart_ = false;  // what was decoded can't stand

    // The block decoded last.
    std::vector<ncfSInt32> block_;
    ncfSInt64 blockStart_ = 0;
    ncfSInt64 blockCount_ = 0;
    bool isFromStart_ = false;  // decoding began with the first block
    bool isPlaced_ = false;     // the next block follows the last where times agree
    // The last block that had a time, and the frames since its start.
    ncfSInt64 lastTime_ = AV_NOPTS_VALUE;
    ncfSInt64 framesSince_ = 0;
    std::optional<ncfSInt64> lastMapped_;  // place of the last packet in the map
};

}  // namespace host
