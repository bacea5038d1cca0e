// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <cstring>
#include <memory>
#include <vector>

#include "host_interfaces/header_parser/QTParser.h"
#include "tests/support/fakes/parser/FakeTracks.h"

// The optional colour interface, as an object of its own.
class FakeParserColor : public FakeObject<IQTParserColor>, public FakeCalls {
public:
    explicit FakeParserColor(Journal* lines) : FakeCalls("parser color", lines) {}
    ncfUInt32 flagA = 1;
    ncfUInt32 flagB = 1;
    ncfUInt32 ColorFlagA() override {
        enter("ColorFlagA");
        return flagA;
    }
    ncfUInt32 ColorFlagB() override {
        enter("ColorFlagB");
        return flagB;
    }
};

// A header parser whose movie is made by the test. Until told otherwise it is
// content with the first bytes it gets; `script` makes it ask for more.
//
//     FakeParser* parser = new FakeParser(&journal);
//     parser->AddVideoTrack(1)->description->width = 720;
//     host.maker(NCFCompID_QTParser, GiveParser(parser));
class FakeParser : public FakeObject<IQTParser>, public FakeCalls {
public:
    explicit FakeParser(Journal* lines = nullptr) : FakeCalls("parser", lines) {}
    ~FakeParser() override {
        for (auto* track : videoTracks) {
            track->Release();
        }
        for (auto* track : audioTracks) {
            track->Release();
        }
        for (auto* track : timecodeTracks) {
            track->Release();
        }
        for (auto* track : otherTracks) {
            track->Release();
        }
        if (color) {
            color->Release();
        }
    }

    struct Step {
        NCFRESULT result;
        ncfUInt64 nextPosition;
        ncfUInt32 nextSize;
    };
    struct Feed {
        ncfUInt64 position;
        std::vector<ncfUInt8> bytes;
        const ncfUInt8* place;  // where they stood in memory
    };

    std::vector<Step> script;  // answers of ParseHeaders in turn, then NCF_OK
    std::vector<Feed> fed;     // what ParseHeaders was given
    ncfUInt64 creationTime = 3786825600u;
    ncfUInt32 timeScale = 1000;
    ncfUInt32 duration = 12000;
    ncfBool selfContained = 1;
    ncfUInt64 headerPosition = 0;
    ncfUInt64 headerSize = 0;
    ncfUInt8 hours = 1, minutes = 2, seconds = 3, frames = 4;
    ncfUInt32 tcTimeScale = 25, tcFrameDuration = 1, tcDrop = 0, tcNumFrames = 25;
    std::vector<FakeVideoTrack*> videoTracks;
    std::vector<FakeAudioTrack*> audioTracks;
    std::vector<FakeTrack*> timecodeTracks;
    std::vector<FakeTrack*> otherTracks;
    FakeParserColor* color = nullptr;

    FakeVideoTrack* AddVideoTrack(ncfUInt32 id) {
        videoTracks.push_back(new FakeVideoTrack("video " + std::to_string(id), journal, id));
        return videoTracks.back();
    }
    FakeAudioTrack* AddAudioTrack(ncfUInt32 id) {
        audioTracks.push_back(new FakeAudioTrack("audio " + std::to_string(id), journal, id));
        return audioTracks.back();
    }
    FakeTrack* AddTimecodeTrack(ncfUInt32 id) {
        timecodeTracks.push_back(new FakeTrack("timecode " + std::to_string(id), journal, id));
        return timecodeTracks.back();
    }
    FakeTrack* AddOtherTrack(ncfUInt32 id) {
        otherTracks.push_back(new FakeTrack("other " + std::to_string(id), journal, id));
        return otherTracks.back();
    }

    NCFRESULT QueryInterface(const GUID& iid, void** out) override {
        if (iid == IID_IQTParserColor && color) {
            color->AddRef();
            *out = static_cast<IQTParserColor*>(color);
            return NCF_OK;
        }
        return FakeObject::QueryInterface(iid, out);
    }
    NCFRESULT GetCreationTime(ncfUInt64* out) override {
        return give("GetCreationTime", out, creationTime);
    }
    NCFRESULT GetTimeScale(ncfUInt32* out) override { return give("GetTimeScale", out, timeScale); }
    NCFRESULT GetMovieDuration(ncfUInt32* out) override {
        return give("GetMovieDuration", out, duration);
    }
    NCFRESULT GetVideoTrackCount(ncfUInt32* out) override {
        return give("GetVideoTrackCount", out, videoTracks.size());
    }
    NCFRESULT GetAudioTrackCount(ncfUInt32* out) override {
        return give("GetAudioTrackCount", out, audioTracks.size());
    }
    NCFRESULT GetTimeCodeTrackCount(ncfUInt32* out) override {
        return give("GetTimeCodeTrackCount", out, timecodeTracks.size());
    }
    NCFRESULT GetOtherTrackCount(ncfUInt32* out) override {
        return give("GetOtherTrackCount", out, otherTracks.size());
    }
    NCFRESULT GetVideoTrackInfo(ncfUInt32 index, IVideoTrackInfo** out) override {
        return giveObject("GetVideoTrackInfo", out, videoTracks.at(index));
    }
    NCFRESULT GetAudioTrackInfo(ncfUInt32 index, IAudioTrackInfo** out) override {
        return giveObject("GetAudioTrackInfo", out, audioTracks.at(index));
    }
    NCFRESULT GetTimeCodeTrackInfo(ncfUInt32 index, ITrackInfo** out) override {
        return giveObject("GetTimeCodeTrackInfo", out, timecodeTracks.at(index));
    }
    NCFRESULT GetOtherTrackInfo(ncfUInt32 index, ITrackInfo** out) override {
        return giveObject("GetOtherTrackInfo", out, otherTracks.at(index));
    }
    NCFRESULT ParseHeaders(const ncfUInt8* begin, const ncfUInt8* end,
                           ncfUInt64 position) override {
        enter("ParseHeaders");
        fed.push_back({position, std::vector<ncfUInt8>(begin, end), begin});
        const std::size_t pass = fed.size() - 1;
        return pass < script.size() ? script[pass].result : NCF_OK;
    }
    NCFRESULT GetRecomendedReadPosition(ncfUInt64* position, ncfUInt32* size) override {
        const Step& step = script.at(fed.size() - 1);
        const NCFRESULT result = give("GetRecomendedReadPosition", position, step.nextPosition);
        if (result >= 0) {
            *size = step.nextSize;
        }
        return result;
    }
    NCFRESULT GetTimeCodeInfo(ncfUInt8* h, ncfUInt8* m, ncfUInt8* s, ncfUInt8* f, ncfUInt32* scale,
                              ncfUInt32* frameDuration, ncfUInt32* drop,
                              ncfUInt32* numFrames) override {
        const NCFRESULT result = give("GetTimeCodeInfo", h, hours);
        if (result >= 0) {
            *m = minutes;
            *s = seconds;
            *f = frames;
            *scale = tcTimeScale;
            *frameDuration = tcFrameDuration;
            *drop = tcDrop;
            *numFrames = tcNumFrames;
        }
        return result;
    }
    NCFRESULT IsMovieSelfContained(ncfBool* out) override {
        return give("IsMovieSelfContained", out, selfContained);
    }
    NCFRESULT GetMOOVAtom(ncfUInt64* position, ncfUInt64* size) override {
        const NCFRESULT result = give("GetMOOVAtom", position, headerPosition);
        if (result >= 0) {
            *size = headerSize;
        }
        return result;
    }
};

// Maker that hands out `parser`, whose first reference stays with the test.
inline FakeHost::Maker GiveParser(FakeParser* parser) {
    return [parser](const GUID& iid, void** out) { return parser->QueryInterface(iid, out); };
}
