// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "reference_host/quicktime/MovieAtoms.h"
#include "reference_host/quicktime/SoundDecoder.h"

namespace host {

// The sound of one track as the movie presents it. The multimedia library
// applies an edit list of one piece exactly where the media counts its time in
// frames of sound. In other units it takes each for a frame, and it cuts several
// pieces at its packets; those are put together here from the whole media.
class EditedSound {
public:
    struct Source {
        int stream = -1;
        std::vector<MovieAtoms::Edit> edits;  // none: as the library presents it
        ncfUInt32 timeScale = 0;              // of the durations of edits
        AVRational mediaUnit{0, 1};           // seconds of their times
        SoundForm form;                       // as it is delivered
    };
    static std::unique_ptr<EditedSound> Open(const std::filesystem::path& path,
                                             const Source& source, bool hasWholeIndex);

    int Channels() const { return decoder_->Channels(); }

    // As SoundDecoder::Read.
    ncfUInt64 Read(ncfUInt64 place, ncfUInt64 count, std::vector<ncfSInt32>& words);

private:
    struct Piece {
        ncfUInt64 start;  // frames of the movie, up to the start of the next
        ncfUInt64 end;
        ncfSInt64 media;  // frame of the media, -1 for silence
    };
    explicit EditedSound(std::unique_ptr<SoundDecoder> decoder) : decoder_(std::move(decoder)) {}
    static bool MustDivide(const Source& source);
    void Divide(const Source& source);

    std::unique_ptr<SoundDecoder> decoder_;
    std::vector<Piece> pieces_;  // none: the decoder has them applied
    std::vector<ncfSInt32> words_;
};

}  // namespace host
