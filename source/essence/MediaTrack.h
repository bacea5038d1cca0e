// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "host_interfaces/framework/ResultCodes.h"
#include "source/essence/MediaFormat.h"
#include "source/plugin/Tr1Memory.h"

using MediaFormatPtr = std::tr1::shared_ptr<MediaFormat>;

// One track as the host sees it: the formats on offer, in the order in which
// they were added, and the one that is set. Only the sample mapping holds it.
class MediaTrack {
public:
    enum Type : ncfUInt32 {
        kVideo = 0,
        kVideoAlpha = 1,
        kAudio = 2,
    };

    virtual ncfUInt32 GetTrackType() const = 0;
    virtual ncfUInt32 GetNumberOfFormats() const;
    virtual const std::vector<MediaFormatPtr>& GetFormats() const;
    virtual ~MediaTrack();

    // NCF_E_INVALIDARG past the end.
    NCFRESULT GetMediaFormat(ncfUInt32 index, MediaFormatPtr& mediaFormat) const;

    // Appends a copy unless an equal format is there already. Nothing is ever
    // removed, because the host keeps indices.
    void AddFormat(const QTImageFormat& format);
    void AddFormat(const QTAudioFormat& format);

    ncfUInt32 GetSelectedIndex() const { return selectedIndex_; }
    void SetSelectedIndex(ncfUInt32 index) { selectedIndex_ = index; }
    const MediaFormatPtr& GetSelectedFormat() const { return selectedFormat_; }
    void SetSelectedFormat(const MediaFormatPtr& format) { selectedFormat_ = format; }

protected:
    MediaTrack() = default;
    MediaTrack(const MediaTrack&) = delete;
    MediaTrack& operator=(const MediaTrack&) = delete;

    std::vector<MediaFormatPtr> formats_;

private:
    template <class Format>
    void AddUnlessEqual(const Format& format);

    ncfUInt32 selectedIndex_ = 0;
    MediaFormatPtr selectedFormat_;
};

class VideoMediaTrack final : public MediaTrack {
public:
    explicit VideoMediaTrack(ncfUInt32 type) : trackType(type) {}
    ncfUInt32 GetTrackType() const override { return trackType; }

private:
    ncfUInt32 trackType;  // kVideo or kVideoAlpha
};

class AudioMediaTrack final : public MediaTrack {
public:
    ncfUInt32 GetTrackType() const override { return kAudio; }

    ncfUInt32 GetNumberAudioChannels() const { return numAudioChannels; }
    // What the reader interleaves; 0 is refused with NCF_E_FAIL.
    NCFRESULT SetNumberAudioChannels(ncfUInt32 num_channels);

private:
    ncfUInt32 numAudioChannels = 1;
};

inline bool IsPictureTrack(const MediaTrack& track) {
    return track.GetTrackType() == MediaTrack::kVideo ||
           track.GetTrackType() == MediaTrack::kVideoAlpha;
}
inline bool IsAudioTrack(const MediaTrack& track) {
    return track.GetTrackType() == MediaTrack::kAudio;
}
