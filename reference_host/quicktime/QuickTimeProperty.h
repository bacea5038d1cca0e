// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/quicktime/QuickTimeProperty.h"
#include "reference_host/framework/Component.h"

namespace host {

// Answers about codecs. Pixel formats and storage come with the frames, which
// this host does not serve yet.
class QuickTimeProperty final : public Component<QuickTime::IQuickTimeProperty> {
public:
    NCFRESULT CreateMovie(INCFString* path) override;
    NCFRESULT GetCodecPixelFormats(INCFBuffer** codes, ncfUInt32* count) override;
    NCFRESULT GetCodecName(ncfUInt32 codecType, INCFString* name) override;
    NCFRESULT GetCodecStorageType(ncfUInt32* type) override;
    NCFRESULT DoesCodecSupportRGB_CCIR(ncfUInt32* flag) override;
};

}  // namespace host
