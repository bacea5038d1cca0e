// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/cliphost/FrameReader.h"

#include <fmt/format.h>

#include <algorithm>

#include "reference_host/cliphost/Failure.h"
#include "reference_host/cliphost/PixelsToPicture.h"
#include "reference_host/framework/HostPath.h"

namespace cliphost {

// Edits may show pictures twice, so the number of samples only limits the frames of
// a movie with one sample, which is delivered for every frame that is asked for.
std::uint64_t MostFrames(Essence& essence, const ClipTrack& track) {
    ncfUInt64 samples = 0;
    const bool isOne =
        essence.map().GetNumberOfSamples(track.number, &samples) >= 0 && samples <= 1;
    return isOne ? std::min<std::uint64_t>(track.length, samples) : track.length;
}

FrameReader::FrameReader(Essence& essence, const ClipTrack& track, const std::string& formatName)
    : essence_(essence), track_(track), request_(host::MakeRef<host::SampleRequest>()) {
    essence_.NeedDelivery(track_);
    Choose(formatName);
    NMA::IUncompressedImageProvider& pictures = essence_.pictures();
    NCFRESULT result = pictures.SetWorkingImageFormat(track_.number, format_.index);
    essence_.CheckSamples(result, track_,
                          fmt::format("the format {} can't be set", NameOf(format_)));
    ncfUInt32 width = 0, fieldHeight = 0;
    ncfUInt16 alignment = 0;
    ncfUInt64 size = 0;
    result = pictures.GetWorkingImageSize(track_.number, &width, &fieldHeight);
    if (result >= 0) {
        result = pictures.GetWorkingImageBufferRequirements(track_.number, &alignment, &size);
    }
    essence_.Check(result, track_, "no picture size");
    // The size told is that of a field where there are two; the buffer always
    // holds a frame.
    const ncfUInt64 lineBytes = ncfUInt64{width} * static_cast<ncfUInt64>(layout().bytesPerPixel);
    width_ = static_cast<int>(width);
    height_ = lineBytes == 0 ? 0 : static_cast<int>(size / lineBytes);
    frameBytes_ = size;
    Start();
}

void FrameReader::Start() {
    essence_.CheckSamples(essence_.provider().Setup(track_.number), track_,
                          "the reader does not start");
}

void FrameReader::StartAnew() {
    essence_.provider().Cleanup(track_.number);
    Start();
}

FrameReader::~FrameReader() {
    essence_.provider().Cleanup(track_.number);
}

void FrameReader::Choose(const std::string& formatName) {
    const std::vector<ImageFormat> formats = essence_.PictureFormats(track_);
    if (const ImageFormat* const chosen = ChooseFormat(formats, formatName)) {
        format_ = *chosen;
        return;
    }
    std::string offered;
    for (const ImageFormat& one : formats) {
        offered += (offered.empty() ? "" : ", ") + NameOf(one);
    }
    if (offered.empty()) {
        throw Failure(kExitFile, essence_.movie(),
                      fmt::format("track {}: the module offers no format of it", track_.number));
    }
    throw Failure(kExitCaller, essence_.movie(),
                  fmt::format("track {}: there is no format '{}'", track_.number, formatName),
                  "it offers " + offered);
}

std::uint64_t FrameReader::Count() {
    if (count_) {
        return *count_;
    }
    std::uint64_t count = MostFrames();
    // Edits can leave fewer pictures than the length says, which is nothing wrong;
    // a file that is cut has fewer too, and those count. Where edits end is found
    // by asking for a picture in the middle of what is open.
    if (count > 1 && Read(count - 1) == NMA_E_NODATA && !essence_.LacksPictures()) {
        std::uint64_t there = 0;
        while (there + 1 < count) {
            const std::uint64_t middle = there + (count - there) / 2;
            (Read(middle) == NMA_E_NODATA ? count : there) = middle;
        }
    }
    if (count == 1 && Read(0) == NMA_E_NODATA) {
        count = 0;
    }
    count_ = count;
    return count;
}

NCFRESULT FrameReader::Read(std::uint64_t frame) {
    request_->Ask(track_.number, frame, 1);
    const NCFRESULT result = essence_.provider().ProvideSampleRange(request_.get(), 0);
    // A picture that may not be read comes back with a result that is no failure.
    const bool isWhole =
        request_->buffer().isComplete() && request_->buffer().validBytes() == frameBytes_;
    return result == NCF_OK && !isWhole ? NCF_E_FAIL : result;
}

Picture FrameReader::ToPicture() const {
    return PixelsToPicture(format_, width_, height_, bytes(),
                           static_cast<std::size_t>(request_->buffer().validBytes()));
}

}  // namespace cliphost
