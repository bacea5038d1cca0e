// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <filesystem>
#include <memory>
#include <mutex>

#include "host_interfaces/quicktime/Readers.h"
#include "reference_host/framework/Component.h"
#include "reference_host/quicktime/PictureReader.h"
#include "reference_host/quicktime/pixels/PixelLayout.h"

namespace host {

// The wrapper's video reader. Each operation locks, so that the reader's state stays
// consistent. But a frame takes three operations, and nothing prevents another user
// of the reader from setting another pixel format between them.
class VideoReader final : public Component<QTWrapper::IQTVideoReader> {
public:
    // The first picture track, with the size in which pictures are delivered.
    struct Source {
        std::filesystem::path path;
        int stream = -1;
        bool indexIsWhole = false;
        ncfUInt32 width = 0;
        ncfUInt32 height = 0;
    };
    explicit VideoReader(Source source) : source_(std::move(source)) {}

    NCFRESULT SetOutputPixelFormat(ncfUInt32 fourCC, ncfUInt32, ncfUInt32) override;
    NCFRESULT ReadFrame(ncfUInt64 sample, void* destination, ncfUInt32, ncfUInt32,
                        ncfUInt32) override;
    ncfUInt32 GetFrameBufferSize(ncfUInt32 all, ncfUInt64 sample, ncfUInt32) override;
    NCFRESULT InitQT(ncfUInt32 mode) override;
    NCFRESULT ReleaseQT() override;

private:
    std::mutex mutex_;
    Source source_;
    ncfUInt32 layout_ = 0;  // 0: none was set
    bool isStarted_ = false;
    std::unique_ptr<PictureReader> pictures_;  // opened with the first start
    std::shared_ptr<const AVFrame> last_;      // video and alpha ask for it in turn
    ncfUInt64 lastSample_ = 0;
};

}  // namespace host
