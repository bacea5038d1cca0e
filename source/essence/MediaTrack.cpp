// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#include "source/essence/MediaTrack.h"

#include <algorithm>

#include "source/plugin/ResultChecks.h"

MediaTrack::~MediaTrack() = default;

ncfUInt32 MediaTrack::GetNumberOfFormats() const {
    return static_cast<ncfUInt32>(_formats.size());
}

const std::vector<MediaFormatPtr>& MediaTrack::GetFormats() const {
    return _formats;
}

NCFRESULT MediaTrack::GetMediaFormat(ncfUInt32 index, MediaFormatPtr& mediaFormat) const {
    NCF_FUNCTION("MediaTrack::GetMediaFormat");
    if (index >= _formats.size()) {
        return NCF_E_INVALIDARG;
    }
    mediaFormat = _formats[index];
    NCFASSERT(mediaFormat);
    return NCF_OK;
}

template <class Format>
void MediaTrack::AddUnlessEqual(const Format& format) {
    const bool known =
        std::any_of(_formats.begin(), _formats.end(), [&](const MediaFormatPtr& entry) {
            const auto* const other = dynamic_cast<const Format*>(entry.get());
            return other && *other == format;
        });
    if (!known) {
        _formats.push_back(MediaFormatPtr(new Format(format)));
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
