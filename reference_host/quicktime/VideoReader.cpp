// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "reference_host/quicktime/VideoReader.h"

#include "reference_host/framework/Guard.h"
#include "reference_host/quicktime/pixels/PictureWriter.h"

namespace host {

NCFRESULT VideoReader::SetOutputPixelFormat(ncfUInt32 fourCC, ncfUInt32, ncfUInt32) {
    const std::lock_guard<std::mutex> lock(mutex_);
    if (!IsKnownLayout(fourCC)) {
        return NCF_E_NOTSUPPORTED;
    }
    layout_ = fourCC;
    return NCF_OK;
}

NCFRESULT VideoReader::InitQT(ncfUInt32 mode) {
    const std::lock_guard<std::mutex> lock(mutex_);
    if (mode != QTWrapper::kUseDecompressionSession) {
        return NCF_E_INVALIDARG;
    }
    return Guarded([&] {
        if (!pictures_) {
            pictures_ = PictureReader::Open(source_.path, source_.stream, source_.indexIsWhole);
        }
        isStarted_ = pictures_ != nullptr;
        return isStarted_ ? NCF_OK : NCF_E_FAIL;
    });
}

NCFRESULT VideoReader::ReleaseQT() {
    const std::lock_guard<std::mutex> lock(mutex_);
    isStarted_ = false;
    last_.reset();
    return Guarded([&] {
        if (pictures_) {
            pictures_->Release();
        }
        return NCF_OK;
    });
}

ncfUInt32 VideoReader::GetFrameBufferSize(ncfUInt32, ncfUInt64, ncfUInt32) {
    const std::lock_guard<std::mutex> lock(mutex_);
    return layout_ == 0
               ? 0
               : PictureBytes(static_cast<PixelLayout>(layout_), source_.width, source_.height);
}

NCFRESULT VideoReader::ReadFrame(ncfUInt64 sample, void* destination, ncfUInt32, ncfUInt32,
                                 ncfUInt32) {
    const std::lock_guard<std::mutex> lock(mutex_);
    return Guarded([&] {
        Need(destination);
        const auto layout = static_cast<PixelLayout>(layout_);
        Need(isStarted_ && layout_ != 0 && PictureBytes(layout, source_.width, source_.height) != 0,
             NMA_E_NOTINITIALIZED);
        if (!last_ || lastSample_ != sample) {
            std::shared_ptr<const AVFrame> frame;
            Check(pictures_->Read(static_cast<std::size_t>(sample), frame));
            last_ = std::move(frame);
            lastSample_ = sample;
        }
        return WritePicture(*last_, layout, source_.width, source_.height,
                            static_cast<std::uint8_t*>(destination))
                   ? NCF_OK
                   : NCF_E_FAIL;
    });
}

}  // namespace host
