// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "reference_host/cliphost/Essence.h"
#include "reference_host/cliphost/ImageFormats.h"
#include "reference_host/cliphost/Picture.h"
#include "reference_host/framework/SampleRequest.h"

namespace cliphost {

// A clip of this track has no frame at or behind this number.
std::uint64_t MostFrames(Essence& essence, const ClipTrack& track);

// Delivers frames of one picture or alpha track in one of its formats. Owns the
// request, whose buffer is used for all frames; the essence must outlive it.
class FrameReader {
public:
    // Chooses and sets the format; see ChooseFormat for how it is named. Throws
    // a Failure.
    FrameReader(Essence& essence, const ClipTrack& track, const std::string& formatName);
    ~FrameReader();
    FrameReader(const FrameReader&) = delete;
    FrameReader& operator=(const FrameReader&) = delete;

    const ImageFormat& format() const { return format_; }
    const ImageLayout& layout() const { return *LayoutOf(format_); }
    int width() const { return width_; }
    int height() const { return height_; }  // of a whole frame
    std::uint64_t frameBytes() const { return frameBytes_; }

    // Frames of the clip, counted from zero: its length, or the pictures that its
    // edits show where those are fewer. Decodes the last one to know.
    std::uint64_t Count();
    std::uint64_t MostFrames() const { return cliphost::MostFrames(essence_, track_); }

    // Forgets what was decoded: what is read next does not lean on it.
    void StartAnew();
    // NMA_E_NODATA past the last picture, another failure for one that does not
    // decode.
    NCFRESULT Read(std::uint64_t frame);
    // Of the frame read last.
    const unsigned char* bytes() const { return request_->buffer().bytes(); }
    Picture ToPicture() const;

private:
    void Choose(const std::string& formatName);
    void Start();

    Essence& essence_;
    const ClipTrack track_;
    ImageFormat format_;
    int width_ = 0;
    int height_ = 0;
    std::uint64_t frameBytes_ = 0;
    std::optional<std::uint64_t> count_;
    host::Ref<host::SampleRequest> request_;
};

}  // namespace cliphost
