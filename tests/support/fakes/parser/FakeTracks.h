// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "tests/support/fakes/parser/FakeDescriptions.h"

// A track of a fake movie. Owns its sample table and description.
template <class Interface, class... Answers>
class FakeTrackBase : public FakeObject<Interface, Answers...>, public FakeCalls {
public:
    FakeTrackBase(const std::string& name, Journal* lines, ncfUInt32 trackId)
        : FakeCalls(name, lines), id(trackId), table(new FakeSampleTable(name + " table", lines)) {}
    ~FakeTrackBase() override { table->Release(); }

    ncfUInt32 id;
    ncfUInt32 trackDuration = 12000;
    ncfBool linear = 1;
    ncfBool proportional = 1;
    ncfUInt32 trackTimescale = 1000;
    ncfSInt64 mediaOffset = 0;
    ncfUInt32 mediaTimescale = 25000;
    ncfUInt32 mediaDuration = 300000;
    ncfUInt32 descriptionCount = 1;
    FakeSampleTable* table;

    // Silent: only a refusal is looked up.
    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        const auto refusal = results.find("QueryInterface");
        if (refusal == results.end()) {
            return FakeObject<Interface, Answers...>::QueryInterface(iid, out);
        }
        *out = nullptr;
        return refusal->second;
    }
    NCFRESULT GetTrackId(ncfUInt32* out) override { return give("GetTrackId", out, id); }
    NCFRESULT GetTrackDuration(ncfUInt32* out) override {
        return give("GetTrackDuration", out, trackDuration);
    }
    NCFRESULT IsTrackLinear(ncfBool* isLinear, ncfBool* isProportional, ncfSInt64* offset,
                            ncfUInt32* timescale) override {
        const NCFRESULT result = give("IsTrackLinear", isLinear, linear);
        if (result >= 0) {
            *isProportional = proportional;
            if (offset) {
                *offset = mediaOffset;
            }
            if (timescale) {
                *timescale = trackTimescale;
            }
        }
        return result;
    }
    NCFRESULT TrackTimeToMediaTime(ncfUInt64, ncfSInt64* out) override {
        return give("TrackTimeToMediaTime", out, mediaOffset);
    }
    NCFRESULT GetMediaTS(ncfUInt32* out) override {
        return give("GetMediaTS", out, mediaTimescale);
    }
    NCFRESULT GetMediaDuration(ncfUInt32* out) override {
        return give("GetMediaDuration", out, mediaDuration);
    }
    NCFRESULT GetSampleTable(IQTSampleTable** out) override {
        return giveObject("GetSampleTable", out, table);
    }
    NCFRESULT GetSampleDescriptionCount(ncfUInt32* out) override {
        return give("GetSampleDescriptionCount", out, descriptionCount);
    }
};

class FakeTrack : public FakeTrackBase<ITrackInfo> {
public:
    using FakeTrackBase::FakeTrackBase;
};

class FakeVideoTrack : public FakeTrackBase<IVideoTrackInfo, ITrackInfo> {
public:
    FakeVideoTrack(const std::string& name, Journal* lines, ncfUInt32 trackId)
        : FakeTrackBase(name, lines, trackId), description(new FakeVideoDescription(lines)) {}
    ~FakeVideoTrack() override { description->Release(); }

    float matrix[9] = {1, 0, 0, 0, 1, 0, 0, 0, 1};
    FakeVideoDescription* description;

    NCFRESULT GetTrackMatrix(float* out) override {
        const NCFRESULT result = enter("GetTrackMatrix");
        for (int i = 0; result >= 0 && i < 9; ++i) {
            out[i] = matrix[i];
        }
        return result;
    }
    NCFRESULT GetVideoSampleDescription(ncfUInt32, IVideoSampleDescription** out) override {
        return giveObject("GetVideoSampleDescription", out, description);
    }
};

// Its durations say 10 seconds on both clocks: 480000 samples.
class FakeAudioTrack : public FakeTrackBase<IAudioTrackInfo, ITrackInfo> {
public:
    FakeAudioTrack(const std::string& name, Journal* lines, ncfUInt32 trackId)
        : FakeTrackBase(name, lines, trackId), description(new FakeAudioDescription(lines)) {
        trackDuration = 10000;
        mediaTimescale = 48000;
        mediaDuration = 480000;
    }
    ~FakeAudioTrack() override { description->Release(); }

    FakeAudioDescription* description;

    // The result is the answer: set results["HasConstantSampleRate"].
    NCFRESULT HasConstantSampleRate(ncfUInt32*) override { return enter("HasConstantSampleRate"); }
    NCFRESULT GetAudioSampleDescription(ncfUInt32, IAudioSampleDescription** out) override {
        return giveObject("GetAudioSampleDescription", out, description);
    }
};
