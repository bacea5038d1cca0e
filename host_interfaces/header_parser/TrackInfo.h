// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/header_parser/SampleDescription.h"
#include "host_interfaces/header_parser/SampleTable.h"

// One track of a parsed movie: the facts of its header.
//
// Implemented by the host's header parser, given out by IQTParser 14 to 17; the
// module asks while it loads, describes and maps a clip. One thread at a time, but
// different tracks may be asked at once. Nothing changes once it is given out. What
// comes out belongs to the caller and outlives the track.
struct ITrackInfo : INCFUnknown {
    virtual NCFRESULT ReservedTrack3() { return NCF_E_NOTIMPL; }  // 3
    virtual NCFRESULT ReservedTrack4() { return NCF_E_NOTIMPL; }  // 4
    virtual NCFRESULT ReservedTrack5() { return NCF_E_NOTIMPL; }  // 5
    virtual NCFRESULT ReservedTrack6() { return NCF_E_NOTIMPL; }  // 6
    virtual NCFRESULT ReservedTrack7() { return NCF_E_NOTIMPL; }  // 7
    // 8. The movie's own track id, never 0.
    virtual NCFRESULT GetTrackId(ncfUInt32* trackId) = 0;
    // 9. In movie time units; in those of IsTrackLinear when it says linear.
    virtual NCFRESULT GetTrackDuration(ncfUInt32* duration) = 0;
    // 10. Whether the edit list plays the media once, straight through, from
    // `offset` in media time units; whether track and media time advance in
    // proportion; and the scale in which GetTrackDuration counts. The last two
    // outputs may be null.
    virtual NCFRESULT IsTrackLinear(ncfBool* linear, ncfBool* areMediaAndTrackTimesProportional,
                                    ncfSInt64* offset, ncfUInt32* trackTimescale) = 0;
    // 11. Media time, in media units, at a track time in movie units; -1 in an
    // empty edit. NMA_E_NODATA behind the end of the track.
    virtual NCFRESULT TrackTimeToMediaTime(ncfUInt64 trackTime, ncfSInt64* mediaTime) = 0;
    virtual NCFRESULT ReservedTrack12() { return NCF_E_NOTIMPL; }  // 12
    virtual NCFRESULT ReservedTrack13() { return NCF_E_NOTIMPL; }  // 13
    // 14. Media time units per second, above 0.
    virtual NCFRESULT GetMediaTS(ncfUInt32* timescale) = 0;
    // 15. In media time units.
    virtual NCFRESULT GetMediaDuration(ncfUInt32* duration) = 0;
    virtual NCFRESULT GetSampleTable(IQTSampleTable** table) = 0;  // 16
    // 17. How many sample descriptions the track has; 0 is possible.
    virtual NCFRESULT GetSampleDescriptionCount(ncfUInt32* count) = 0;
    virtual NCFRESULT ReservedTrack18() { return NCF_E_NOTIMPL; }  // 18
    virtual NCFRESULT ReservedTrack19() { return NCF_E_NOTIMPL; }  // 19
    virtual NCFRESULT ReservedTrack20() { return NCF_E_NOTIMPL; }  // 20
    virtual NCFRESULT ReservedTrack21() { return NCF_E_NOTIMPL; }  // 21

protected:
    ~ITrackInfo() = default;
};

inline constexpr GUID IID_ITrackInfo = ncfGuid("C85E31D0-98A7-4B7C-8E26-0D4F6B92A304");
constexpr const GUID& ncfIdOf(const ITrackInfo*) {
    return IID_ITrackInfo;
}

// A video track; the module queries an ITrackInfo for it too.
struct IVideoTrackInfo : ITrackInfo {
    // 22. Display matrix of the track, nine numbers row by row (a b u, c d v,
    // x y w; ISO/IEC 14496-12, 6.2.2).
    virtual NCFRESULT GetTrackMatrix(float* matrix) = 0;
    virtual NCFRESULT ReservedVideoTrack23() { return NCF_E_NOTIMPL; }  // 23
    // 24. `index` from zero; NCF_E_NOTFOUND beyond the count.
    virtual NCFRESULT GetVideoSampleDescription(ncfUInt32 index,
                                                IVideoSampleDescription** description) = 0;

protected:
    ~IVideoTrackInfo() = default;
};

inline constexpr GUID IID_IVideoTrackInfo = ncfGuid("A16AAEB0-03D3-449C-9A03-98C0E02B6BE2");
constexpr const GUID& ncfIdOf(const IVideoTrackInfo*) {
    return IID_IVideoTrackInfo;
}

// A sound track; the module queries an ITrackInfo for it too.
struct IAudioTrackInfo : ITrackInfo {
    // 22. The result is the answer: 0 constant, 1 not, negative failure. The
    // output may be null.
    virtual NCFRESULT HasConstantSampleRate(ncfUInt32* answer) = 0;
    // 23. As GetVideoSampleDescription.
    virtual NCFRESULT GetAudioSampleDescription(ncfUInt32 index,
                                                IAudioSampleDescription** description) = 0;

protected:
    ~IAudioTrackInfo() = default;
};

inline constexpr GUID IID_IAudioTrackInfo = ncfGuid("A7DB9BCE-1716-4991-96A7-2F90763C618E");
constexpr const GUID& ncfIdOf(const IAudioTrackInfo*) {
    return IID_IAudioTrackInfo;
}
