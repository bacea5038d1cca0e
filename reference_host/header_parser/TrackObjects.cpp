// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#include "reference_host/header_parser/TrackObjects.h"

#include <algorithm>

#include "reference_host/framework/Guard.h"
#include "reference_host/header_parser/DescriptionObjects.h"
#include "reference_host/header_parser/SampleTableObject.h"
#include "reference_host/util/Ref.h"

namespace header_parser {

using host::Give;
using host::Guarded;
using host::Need;

namespace {

// A new object over a part of the track, into an interface output.
template <class Object, class Interface, class Part>
NCFRESULT GiveObject(const Shared<Track>& track, const std::vector<Part>& parts, ncfUInt32 index,
                     Interface** out) {
    return Guarded([&] {
        Need(out);
        *out = nullptr;
        Need(index < parts.size(), NCF_E_NOTFOUND);
        *out = host::MakeRef<Object>(Shared<Part>(track, &parts[index])).Detach();
        return NCF_OK;
    });
}

}  // namespace

template <class Interface>
void* TrackObject<Interface>::FindInterface(const GUID& iid) {
    if (iid == IID_ITrackInfo) {
        return static_cast<ITrackInfo*>(this);
    }
    return host::Component<Interface>::FindInterface(iid);
}

template <class Interface>
NCFRESULT TrackObject<Interface>::GetTrackId(ncfUInt32* trackId) {
    return Give(track_->id, trackId);
}

template <class Interface>
NCFRESULT TrackObject<Interface>::GetTrackDuration(ncfUInt32* duration) {
    return Give(track_->duration, duration);
}

template <class Interface>
NCFRESULT TrackObject<Interface>::IsTrackLinear(ncfBool* linear,
                                                ncfBool* areMediaAndTrackTimesProportional,
                                                ncfSInt64* offset, ncfUInt32* trackTimescale) {
    if (linear == nullptr || areMediaAndTrackTimesProportional == nullptr) {
        return NCF_E_POINTER;
    }
    Give(track_->edits.Offset(), offset);
    Give(scales_.movie, trackTimescale);
    Give(track_->edits.IsLinear(scales_), linear);
    return Give(track_->edits.IsProportional(scales_), areMediaAndTrackTimesProportional);
}

template <class Interface>
NCFRESULT TrackObject<Interface>::TrackTimeToMediaTime(ncfUInt64 trackTime, ncfSInt64* mediaTime) {
    if (mediaTime == nullptr) {
        return NCF_E_POINTER;
    }
    if (trackTime >= track_->duration) {
        return NMA_E_NODATA;
    }
    *mediaTime = track_->edits.MediaTimeAt(trackTime, scales_);
    return NCF_OK;
}

template <class Interface>
NCFRESULT TrackObject<Interface>::GetMediaTS(ncfUInt32* timescale) {
    return Give(track_->mediaTimeScale, timescale);
}

template <class Interface>
NCFRESULT TrackObject<Interface>::GetMediaDuration(ncfUInt32* duration) {
    return Give(track_->mediaDuration, duration);
}

template <class Interface>
NCFRESULT TrackObject<Interface>::GetSampleTable(IQTSampleTable** table) {
    return Guarded([&] {
        Need(table);
        *table = nullptr;
        *table = host::MakeRef<SampleTableObject>(Shared<SampleTable>(track_, &track_->samples))
                     .Detach();
        return NCF_OK;
    });
}

template <class Interface>
NCFRESULT TrackObject<Interface>::GetSampleDescriptionCount(ncfUInt32* count) {
    return Give(track_->descriptionCount, count);
}

template class TrackObject<ITrackInfo>;
template class TrackObject<IVideoTrackInfo>;
template class TrackObject<IAudioTrackInfo>;

NCFRESULT VideoTrackObject::GetTrackMatrix(float* matrix) {
    if (matrix == nullptr) {
        return NCF_E_POINTER;
    }
    std::copy(track_->matrix.begin(), track_->matrix.end(), matrix);
    return NCF_OK;
}

NCFRESULT VideoTrackObject::GetVideoSampleDescription(ncfUInt32 index,
                                                      IVideoSampleDescription** description) {
    return GiveObject<VideoDescriptionObject>(track_, track_->video, index, description);
}

NCFRESULT AudioTrackObject::HasConstantSampleRate(ncfUInt32* answer) {
    const ncfUInt32 varies = track_->HasConstantSamples() ? 0 : 1;
    if (answer != nullptr) {
        *answer = varies;
    }
    return static_cast<NCFRESULT>(varies);
}

NCFRESULT AudioTrackObject::GetAudioSampleDescription(ncfUInt32 index,
                                                      IAudioSampleDescription** description) {
    return GiveObject<AudioDescriptionObject>(track_, track_->sound, index, description);
}

}  // namespace header_parser
