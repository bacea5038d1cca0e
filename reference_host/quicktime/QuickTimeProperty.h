// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <mutex>

#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "reference_host/framework/Component.h"
#include "reference_host/quicktime/CodecPixels.h"

namespace host {

// Answers about codecs. What a codec's pixels may be delivered as follows from
// what its decoder gives. The sample maps of a clip share one, so each operation
// on the movie locks.
class QuickTimeProperty final : public Component<QuickTime::IQuickTimeProperty> {
public:
    NCFRESULT CreateMovie(INCFString* path) override;
    NCFRESULT GetCodecPixelFormats(INCFBuffer** codes, ncfUInt32* count) override;
    NCFRESULT GetCodecName(ncfUInt32 codecType, INCFString* name) override;
    NCFRESULT GetCodecStorageType(ncfUInt32* type) override;
    NCFRESULT DoesCodecSupportRGB_CCIR(ncfUInt32* flag) override;

private:
    NCFRESULT GiveOfCodec(ncfUInt32 CodecPixels::*fact, ncfUInt32* out);

    std::mutex mutex_;
    std::unique_ptr<CodecPixels> pixels_;  // null until a movie is open
};

}  // namespace host
