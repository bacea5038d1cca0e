// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/header_parser/SampleDescription.h"
#include "reference_host/framework/Component.h"
#include "reference_host/header_parser/SoundDescription.h"
#include "reference_host/header_parser/VideoDescription.h"

namespace header_parser {

class VideoDescriptionObject final : public host::Component<IVideoSampleDescription> {
public:
    explicit VideoDescriptionObject(std::shared_ptr<const VideoDescription> description)
        : description_(std::move(description)) {}

    NCFRESULT GetDataFormat(ncfUInt32* dataFormat) override;
    NCFRESULT GetEncodedWidthAndHeight(ncfUInt16* width, ncfUInt16* height) override;
    NCFRESULT HasAlpha(ncfSInt32* hasAlpha) override;
    NCFRESULT GetFieldInfo(ncfUInt32* fieldCount, ncfUInt32* topFieldFirst,
                           ncfUInt32* split) override;
    NCFRESULT GetVendor(ncfUInt32* vendor) override;
    NCFRESULT GetImageAspectRatio(ncfUInt32* numerator, ncfUInt32* denominator) override;
    NCFRESULT GetVideoColorSpaceDetails(ncfUInt32* codes) override;
    NCFRESULT GetNivoAlphaCodingCount(ncfUInt32* count) override;
    NCFRESULT GetNivoAlphaCoding(ncfUInt32 index, ncfUInt32* coding) override;
    NCFRESULT GetNivoResolution(QTNivoResolution* resolution) override;
    NCFRESULT GetRIAttributes(INCFString** text) override;
    NCFRESULT GetCMAttributes(INCFString** text) override;

private:
    std::shared_ptr<const VideoDescription> description_;
};

class AudioDescriptionObject final : public host::Component<IAudioSampleDescription> {
public:
    explicit AudioDescriptionObject(std::shared_ptr<const SoundDescription> description)
        : description_(std::move(description)) {}

    NCFRESULT GetChannelsPerFrame(ncfUInt32* channels) override;
    NCFRESULT GetBitsPerChannel(ncfUInt32* bits) override;
    NCFRESULT GetSampleRate(double* rate) override;
    NCFRESULT IsConstantBitRate(ncfBool* constant) override;
    NCFRESULT IsLPCM(ncfBool* isLPCM) override;
    NCFRESULT GetBytesPerPacket(ncfUInt32* bytes) override;
    NCFRESULT IsLittleEndian(ncfBool* littleEndian) override;

private:
    std::shared_ptr<const SoundDescription> description_;
};

}  // namespace header_parser
