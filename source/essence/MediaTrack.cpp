// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/MediaTrack.h"

#include <algorithm>

#include "source/plugin/ResultChecks.h"

MediaTrack::~MediaTrack() = default;

ncfUInt32 MediaTrack::GetNumberOfFormats() const {
    return static_cast<ncfUInt32>(formats_.size());
}

const std::vector<MediaFormatPtr>& MediaTrack::GetFormats() const {
    return formats_;
}

NCFRESULT MediaTrack::GetMediaFormat(ncfUInt32 index, MediaFormatPtr& mediaFormat) const {
    NCF_FUNCTION("MediaTrack::GetMediaFormat");
    if (index >= formats_.size()) {
        return NCF_E_INVALIDARG;
    }
    mediaFormat = formats_[index];
    NCFASSERT(mediaFormat);
    return NCF_OK;
}

template <class Format>
void MediaTrack::AddUnlessEqual(const Format& format) {
    const bool known =
        std::any_of(formats_.begin(), formats_.end(), [&](const MediaFormatPtr& entry) {
            const auto* const other = dynamic_cast<const Format*>(entry.get());
            return other && *other == format;
        });
    if (!known) {
        formats_.push_back(MediaFormatPtr(new Format(format)));
    }
}

void MediaTrack::AddFormat(const QTImageFormat& format) {
    AddUnlessEqual(format);
}

void MediaTrack::AddFormat(const QTAudioFormat& format) {
    AddUnlessEqual(format);
}

NCFRESULT AudioMediaTrack::SetNumberAudioChannels(ncfUInt32 num_channels) {
    NCF_FUNCTION("AudioMediaTrack::SetNumberAudioChannels");
    NCFASSERT(num_channels > 0);
    numAudioChannels = num_channels;
    return NCF_OK;
}
