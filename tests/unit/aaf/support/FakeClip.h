// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <map>
#include <string>
#include <vector>

#include "source/clips/ClipPicture.h"
#include "source/descriptor_data/AAFInfo.h"
#include "source/descriptor_data/QuickTimeToAAFInfoRetriever.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/Journal.h"
#include "tests/support/fakes/StubClip.h"

struct FakeSoundTrack {
    ncfUInt32 qtTrack = 2;
    NCFRESULT native = 1;
    ncfUInt64 lengthFromPolicy = 0;  // written by the question above when not 0
    AudioTrackMetadata metadata = {2, 48000.0, kFormatLPCM, 4, 16, 0, 1};
    ncfUInt64 samples = 192000;
};

struct FakeTimecodeTrack {
    ncfUInt32 qtTrack = 3;
    NCFRESULT result = NCF_OK;
    TimeCodeTrackMetadata metadata = {1, 0, 0, 0, 2500, 100, 0, 25};
};

// A clip that answers what a test sets, and fails the operations that it names.
// Rate and length are there from SetEditRate and SetMovieLength on, as in a
// real clip, or after SetTiming.
class FakeClip final : public StubClip {
public:
    FakeClip(const std::string& path, FakeHost& host, Journal* journal)
        : StubClip(Path(path), NCFSmartPtr<INCFConsole>(&host.console()),
                   NCFSmartPtr<INCFComponentFactory>(host.factory())),
          journal_(journal) {}

    // --- what the clip is ----------------------------------------------------
    Rational rate{25, 1};
    ncfUInt64 length = 100;
    ncfUInt32 videoTracks = 1;
    std::vector<FakeSoundTrack> sound;
    std::vector<FakeTimecodeTrack> timecode;
    // 1: the host reads the file, by `record`; 0: the sample provider serves.
    NCFRESULT nativePicture = 0;
    AAFInfo record;
    bool halfReadRecord = false;  // fills the record although the answer is 0
    bool askRetriever = false;    // takes answer and record from the data files
    ncfUInt32 code = 0x61766331;  // 'avc1'
    ncfUInt32 vendor = 0;
    ncfUInt32 pictureWidth = 1920;
    ncfUInt32 pictureHeight = 1080;
    ncfUInt32 aspectNumerator = 16;
    ncfUInt32 aspectDenominator = 9;
    ncfUInt32 layout = 0;
    NCFRESULT layoutResult = NCF_OK;
    std::string codecName = "H.264";
    INCFString* codecString = nullptr;  // given in place of the name when set
    ByteVector content = {1, 2, 3, 4};
    // Operation -> failure.
    std::map<std::string, NCFRESULT> failures;
    // Hears each question before it is answered.
    std::function<void(const std::string& operation)> whenAsked;
    // What SetEditRate was given.
    EditorSettings seenSettings;

    ColorDetails& color() { return picture_.color; }
    GeometryDetails& geometry() { return picture_.geometry; }
    void setAlpha(bool inFile, bool ignored) {
        picture_.hasAlpha = inFile;
        picture_.ignoreAlpha = ignored;
    }
    void setTiming() {
        editRate_ = rate;
        length_ = length;
    }
    void setFileName(INCFString* name) { fileName_ = name; }

    // --- asked by a description --------------------------------------------------
    NCFRESULT GetNMAFrameLayout(ncfUInt32* out) const override {
        const NCFRESULT result = answer("GetNMAFrameLayout", out, layout);
        return result < 0 ? result : layoutResult;
    }
    NCFRESULT GetDataFormat(ncfUInt32* out) const override {
        return answer("GetDataFormat", out, code);
    }
    NCFRESULT GetVendor(ncfUInt32* out) const override { return answer("GetVendor", out, vendor); }
    NCFRESULT GetNivoResolution(ncfUInt32*) const override { return NCF_E_PARAMETERNOTAVAILABLE; }
    NCFRESULT GetTimecodeTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) override {
        return answer("GetTimecodeTrackQTId", &qtTrack, timecode.at(track).qtTrack);
    }
    NCFRESULT GetAudioTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) override {
        return answer("GetAudioTrackQTId", &qtTrack, sound.at(track).qtTrack);
    }
    NCFRESULT GetTimeCodeTrackMetadata(ncfUInt32 qtTrack, TimeCodeTrackMetadata* out) override {
        for (const FakeTimecodeTrack& track : timecode) {
            if (track.qtTrack == qtTrack) {
                const NCFRESULT result = answer("GetTimeCodeTrackMetadata", out, track.metadata);
                return result < 0 ? result : track.result;
            }
        }
        return NCF_E_NOTFOUND;
    }
    NCFRESULT GetAudioTrackMetadata(ncfUInt32 qtTrack, AudioTrackMetadata* out) override {
        return answer("GetAudioTrackMetadata", out, soundTrack(qtTrack).metadata);
    }
    NCFRESULT CalculateAudioTrackLengthInSamples(ncfUInt32 qtTrack, ncfUInt64* out) override {
        return answer("CalculateAudioTrackLengthInSamples", out, soundTrack(qtTrack).samples);
    }
    NCFRESULT GetEditRate(Rational* out) const override {
        const NCFRESULT result = told("GetEditRate");
        return result < 0 ? result : GetEditRateBase(out);
    }
    NCFRESULT GetMovieLength(ncfUInt64* out) const override {
        const NCFRESULT result = told("GetMovieLength");
        return result < 0 ? result : GetMovieLengthBase(out);
    }
    NCFRESULT GetCodecName(ncfUInt32, NCFSmartPtr<INCFString>& out) override {
        const NCFRESULT result = told("GetCodecName");
        if (result >= 0 && codecString) {
            codecString->AddRef();
            out.attach(codecString);
        } else if (result >= 0) {
            out.attach(MakeHostString(codecName));
        }
        return result;
    }
    NCFRESULT GetContentForHash(ByteVector& out) override {
        return answer("GetContentForHash", &out, content);
    }
    NCFRESULT IsVideoSampleProviderMedia(AAFInfo* out) override {
        const NCFRESULT result = told("IsVideoSampleProviderMedia");
        if (result != NCF_OK) {
            return result;
        }
        if (askRetriever) {
            return rule_.IsInDataFiles(ClipPicture(*this), out);
        }
        if (nativePicture == 1 || halfReadRecord) {
            *out = record;
        }
        return nativePicture;
    }
    NCFRESULT IsAudioSampleProviderMedia(ncfUInt32 qtTrack, ncfUInt64* numAudioSamples) override {
        const NCFRESULT result = told("IsAudioSampleProviderMedia");
        if (result < 0) {
            return result;
        }
        if (soundTrack(qtTrack).lengthFromPolicy != 0) {
            *numAudioSamples = soundTrack(qtTrack).lengthFromPolicy;
        }
        return soundTrack(qtTrack).native;
    }
    NCFRESULT GetEncodedWidthAndHeight(ncfUInt32* width, ncfUInt32* height) override {
        answer("GetEncodedWidthAndHeight", width, pictureWidth);
        return assign("GetEncodedWidthAndHeight", height, pictureHeight);
    }
    NCFRESULT GetImageAspectRatio(ncfUInt32* numerator, ncfUInt32* denominator) override {
        answer("GetImageAspectRatio", numerator, aspectNumerator);
        return assign("GetImageAspectRatio", denominator, aspectDenominator);
    }
    NCFRESULT GetColorDetails(ColorDetails* out) const override {
        return answer("GetColorDetails", out, picture_.color);
    }
    NCFRESULT GetGeometryDetails(GeometryDetails* out) const override {
        return answer("GetGeometryDetails", out, picture_.geometry);
    }
    NCFRESULT SetEditRateImpl(const EditorSettings& settings) override {
        seenSettings = settings;
        return answer("SetEditRate", &editRate_, rate);
    }
    NCFRESULT SetMovieLengthImpl(const EditorSettings&) override {
        return answer("SetMovieLength", &length_, length);
    }
    NCFRESULT GetTimeCodeTrackCountImpl(ncfUInt32* out) override {
        return answer("GetTimeCodeTrackCount", out, static_cast<ncfUInt32>(timecode.size()));
    }
    NCFRESULT GetVideoTrackCountImpl(ncfUInt32* out) override {
        return answer("GetVideoTrackCount", out, videoTracks);
    }
    NCFRESULT GetAudioTrackCountImpl(ncfUInt32* out) override {
        return answer("GetAudioTrackCount", out, static_cast<ncfUInt32>(sound.size()));
    }

private:
    static NCFSmartPtr<INCFString> Path(const std::string& path) {
        NCFSmartPtr<INCFString> text;
        text.attach(MakeHostString(path));
        return text;
    }
    const FakeSoundTrack& soundTrack(ncfUInt32 qtTrack) const {
        for (const FakeSoundTrack& track : sound) {
            if (track.qtTrack == qtTrack) {
                return track;
            }
        }
        return sound.at(0);
    }
    NCFRESULT failure(const std::string& operation) const {
        const auto found = failures.find(operation);
        return found == failures.end() ? NCF_OK : found->second;
    }
    NCFRESULT told(const std::string& operation) const {
        if (journal_) {
            journal_->add("clip " + operation);
        }
        if (whenAsked) {
            whenAsked(operation);
        }
        return failure(operation);
    }
    template <class Value>
    NCFRESULT assign(const std::string& operation, Value* out, const Value& value) const {
        const NCFRESULT result = failure(operation);
        if (result >= 0) {
            *out = value;
        }
        return result;
    }
    template <class Value>
    NCFRESULT answer(const std::string& operation, Value* out, const Value& value) const {
        told(operation);
        return assign(operation, out, value);
    }

    Journal* journal_;
};
