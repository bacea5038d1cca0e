// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

#include "host_interfaces/header_parser/TrackInfo.h"
#include "reference_host/framework/Component.h"
#include "reference_host/header_parser/Movie.h"

namespace header_parser {

// A part of a movie that keeps the whole of it alive.
template <class Part>
using Shared = std::shared_ptr<const Part>;

// The operations that all tracks have.
template <class Interface>
class TrackObject : public host::Component<Interface> {
public:
    TrackObject(Shared<Track> track, ncfUInt32 movieTimeScale)
        : track_(std::move(track)), scales_{movieTimeScale, track_->mediaTimeScale} {}

    NCFRESULT GetTrackId(ncfUInt32* trackId) override;
    NCFRESULT GetTrackDuration(ncfUInt32* duration) override;
    NCFRESULT IsTrackLinear(ncfBool* linear, ncfBool* areMediaAndTrackTimesProportional,
                            ncfSInt64* offset, ncfUInt32* trackTimescale) override;
    NCFRESULT TrackTimeToMediaTime(ncfUInt64 trackTime, ncfSInt64* mediaTime) override;
    NCFRESULT GetMediaTS(ncfUInt32* timescale) override;
    NCFRESULT GetMediaDuration(ncfUInt32* duration) override;
    NCFRESULT GetSampleTable(IQTSampleTable** table) override;
    NCFRESULT GetSampleDescriptionCount(ncfUInt32* count) override;

protected:
    void* FindInterface(const GUID& iid) override;

    Shared<Track> track_;
    EditList::Scales scales_;
};

extern template class TrackObject<ITrackInfo>;
extern template class TrackObject<IVideoTrackInfo>;
extern template class TrackObject<IAudioTrackInfo>;

// Timecode and other tracks.
class PlainTrackObject final : public TrackObject<ITrackInfo> {
public:
    using TrackObject::TrackObject;
};

class VideoTrackObject final : public TrackObject<IVideoTrackInfo> {
public:
    using TrackObject::TrackObject;
    NCFRESULT GetTrackMatrix(float* matrix) override;
    NCFRESULT GetVideoSampleDescription(ncfUInt32 index,
                                        IVideoSampleDescription** description) override;
};

class AudioTrackObject final : public TrackObject<IAudioTrackInfo> {
public:
    using TrackObject::TrackObject;
    NCFRESULT HasConstantSampleRate(ncfUInt32* answer) override;
    NCFRESULT GetAudioSampleDescription(ncfUInt32 index,
                                        IAudioSampleDescription** description) override;
};

}  // namespace header_parser
