// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>
#include <string>
#include <vector>

#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/StubClip.h"
#include "tests/support/fakes/parser/FakeCalls.h"

// One track of a fake clip with its samples.
struct EssenceTrack {
    ncfUInt32 qtTrack = 0;
    std::vector<ncfSInt64> displayOffsets;
    ncfSInt64 duration = 1000;
    ncfUInt64 firstOffset = 5000;
    ncfUInt32 size = 100;  // sample n has size + n bytes
    ncfUInt32 flags = 1;
    ncfUInt64 next = 0;  // what the run of any sample ends before
    NCFRESULT nextResult = NCF_OK;
};

// A clip that answers what a test sets: writes "clip.<operation> <arguments>"
// into the journal and fails the operations named in `results`, or single calls
// of them.
class EssenceClip final : public StubClip, public FakeCalls {
public:
    EssenceClip(FakeHost& host, Journal* lines)
        : StubClip(Text("/movies/a.mov"), NCFSmartPtr<INCFConsole>(&host.console()),
                   NCFSmartPtr<INCFComponentFactory>(host.factory())),
          FakeCalls("clip", lines) {
        loaded_ = 1;
        picture_.width = 1920;
        picture_.height = 1080;
        picture_.fields.order = kProgressive;
        picture_.fields.layout = kLayoutMerged;
        picture_.colorSpace = CS_YCbCr_709;
        picture_.ignoreAlpha = 0;
    }

    std::vector<EssenceTrack> video;
    std::vector<EssenceTrack> audio;
    // Calls of an operation that pass before its result is given.
    mutable std::map<std::string, int> spared;
    ncfUInt32 trackCount = 0;
    ncfBool oneFrame = 0;
    ncfBool multiFormat = 0;
    AudioTrackMetadata metadata = {2, 48000.0, kFormatLPCM, 4, 16, 0, 1};

    void setAlpha(bool alpha) { picture_.hasAlpha = alpha; }
    void setIgnoreAlpha(bool ignore) { picture_.ignoreAlpha = ignore; }
    void setSize(ncfUInt32 width, ncfUInt32 height) {
        picture_.width = width;
        picture_.height = height;
    }
    void setColorSpace(ncfUInt32 space) { picture_.colorSpace = space; }
    void setFieldOrder(ncfUInt32 order) { picture_.fields.order = order; }
    void setLayout(ncfUInt32 layout) { picture_.fields.layout = layout; }
    void setOrientation(ncfUInt32 orientation) { picture_.fields.lineOrientation = orientation; }
    void setLevels(ncfUInt32 levels) { clipParams_.levelRemap = levels; }

    NCFRESULT SetFieldLayoutDetails() override { return enter("SetFieldLayoutDetails"); }
    NCFRESULT GetTrackCount(ncfUInt32* out) override {
        return give("GetTrackCount", out, trackCount);
    }
    NCFRESULT GetVideoTrackQTId(ncfUInt32 track, ncfUInt32& out) override {
        return give("GetVideoTrackQTId", &out, video.at(track).qtTrack);
    }
    NCFRESULT GetAudioTrackQTId(ncfUInt32 track, ncfUInt32& out) override {
        return give("GetAudioTrackQTId", &out, audio.at(track).qtTrack);
    }
    NCFRESULT GetTrackType(ncfUInt32 qtTrack, ncfUInt32* out) override {
        ncfUInt32 type = kTrackAudio;
        for (const EssenceTrack& track : video) {
            type = track.qtTrack == qtTrack ? kTrackVideo : type;
        }
        return give("GetTrackType", out, type);
    }
    NCFRESULT GetAudioTrackMetadata(ncfUInt32, AudioTrackMetadata* out) override {
        return give("GetAudioTrackMetadata", out, metadata);
    }
    NCFRESULT HasOneFrame(ncfBool* out) override { return give("HasOneFrame", out, oneFrame); }
    NCFRESULT IsMultiFormatMovie(ncfBool* out) override {
        return give("IsMultiFormatMovie", out, multiFormat);
    }
    NCFRESULT GetVideoTrackCountImpl(ncfUInt32* out) override {
        return give("GetVideoTrackCount", out, video.size());
    }
    NCFRESULT GetAudioTrackCountImpl(ncfUInt32* out) override {
        return give("GetAudioTrackCount", out, audio.size());
    }
    NCFRESULT GetEncodedWidthAndHeight(ncfUInt32* width, ncfUInt32* height) override {
        const NCFRESULT result = give("GetEncodedWidthAndHeight", width, picture_.width);
        if (result >= 0) {
            *height = picture_.height;
        }
        return result;
    }
    NCFRESULT GetColorSpace(ncfUInt32* out) const override {
        const NCFRESULT result = resultOf("GetColorSpace");
        return result < 0 ? result : BaseClip::GetColorSpace(out);
    }
    NCFRESULT GetTemporalFieldOrder(ncfUInt32* out) const override {
        journal->add("clip.GetTemporalFieldOrder");
        const NCFRESULT result = resultOf("GetTemporalFieldOrder");
        return result < 0 ? result : BaseClip::GetTemporalFieldOrder(out);
    }
    NCFRESULT GetBufferLineOrientation(ncfUInt32* out) const override {
        journal->add("clip.GetBufferLineOrientation");
        const NCFRESULT result = resultOf("GetBufferLineOrientation");
        return result < 0 ? result : BaseClip::GetBufferLineOrientation(out);
    }
    NCFRESULT GetFrameBufferLayout(ncfUInt32* out) const override {
        journal->add("clip.GetFrameBufferLayout");
        const NCFRESULT result = resultOf("GetFrameBufferLayout");
        return result < 0 ? result : BaseClip::GetFrameBufferLayout(out);
    }

    // --- samples, counted from one -------------------------------------------------
    NCFRESULT GetNumSamples(ncfUInt32 qtTrack, ncfUInt64* out) override {
        return give("GetNumSamples", out, trackOf(qtTrack).displayOffsets.size());
    }
    NCFRESULT GetDataOffset(ncfUInt32 qtTrack, ncfUInt64 sample, ncfUInt64* out) override {
        return ask("GetDataOffset", qtTrack, sample, out,
                   trackOf(qtTrack).firstOffset + 1000 * sample);
    }
    NCFRESULT GetSampleFlags(ncfUInt32 qtTrack, ncfUInt64 sample, ncfUInt32* out) override {
        return ask("GetSampleFlags", qtTrack, sample, out, trackOf(qtTrack).flags);
    }
    NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt32 qtTrack, ncfUInt64 sample,
                                                      ncfUInt64* out) override {
        const EssenceTrack& track = trackOf(qtTrack);
        note("GetNextDiscontiguousDataAttributeChange", qtTrack, sample);
        *out = track.next;  // also where it fails, as a wrapper may
        return track.nextResult;
    }
    NCFRESULT GetDataSizePerSample(ncfUInt32 qtTrack, ncfUInt64 sample, ncfUInt32* out) override {
        return ask("GetDataSizePerSample", qtTrack, sample, out, trackOf(qtTrack).size + sample);
    }
    NCFRESULT GetDisplayOffset(ncfUInt32 qtTrack, ncfUInt64 sample, ncfSInt64* out) override {
        const std::vector<ncfSInt64>& offsets = trackOf(qtTrack).displayOffsets;
        note("GetDisplayOffset", qtTrack, sample);
        if (sample < 1 || sample > offsets.size()) {
            return NCF_E_INVALIDARG;
        }
        const NCFRESULT result = resultOf("GetDisplayOffset", qtTrack, sample);
        if (result >= 0) {
            *out = offsets[sample - 1];
        }
        return result;
    }
    NCFRESULT GetDecodeDuration(ncfUInt32 qtTrack, ncfUInt64 sample, ncfSInt64* out) override {
        return ask("GetDecodeDuration", qtTrack, sample, out, trackOf(qtTrack).duration);
    }

private:
    static NCFSmartPtr<INCFString> Text(const std::string& text) {
        NCFSmartPtr<INCFString> string;
        string.attach(MakeHostString(text));
        return string;
    }
    const EssenceTrack& trackOf(ncfUInt32 qtTrack) const {
        for (const auto* list : {&video, &audio}) {
            for (const EssenceTrack& track : *list) {
                if (track.qtTrack == qtTrack) {
                    return track;
                }
            }
        }
        static const EssenceTrack none;
        return none;
    }
    NCFRESULT resultOf(const std::string& operation) const {
        const auto left = spared.find(operation);
        if (left != spared.end() && left->second > 0) {
            --left->second;
            return NCF_OK;
        }
        const auto found = results.find(operation);
        return found == results.end() ? NCF_OK : found->second;
    }
    // "GetDataOffset 8 5" fails for that sample alone.
    NCFRESULT resultOf(const std::string& operation, ncfUInt32 qtTrack, ncfUInt64 sample) const {
        const auto found = results.find(Call(operation, qtTrack, sample));
        return found == results.end() ? resultOf(operation) : found->second;
    }
    void note(const std::string& operation, ncfUInt32 qtTrack, ncfUInt64 sample) {
        journal->add("clip." + Call(operation, qtTrack, sample));
    }
    static std::string Call(const std::string& operation, ncfUInt32 qtTrack, ncfUInt64 sample) {
        return operation + " " + std::to_string(qtTrack) + " " +
               std::to_string(static_cast<ncfSInt64>(sample));
    }
    template <class Out, class Value>
    NCFRESULT ask(const std::string& operation, ncfUInt32 qtTrack, ncfUInt64 sample, Out* out,
                  const Value& value) {
        note(operation, qtTrack, sample);
        const NCFRESULT result = resultOf(operation, qtTrack, sample);
        if (result >= 0) {
            *out = static_cast<Out>(value);
        }
        return result;
    }
};
