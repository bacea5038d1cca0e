// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <map>
#include <set>
#include <stdexcept>
#include <string>
#include <vector>

#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "source/plugin/Rational.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/parser/FakeCalls.h"

// Readers that do nothing but exist.
class FakeVideoReader : public FakeObject<QTWrapper::IQTVideoReader> {
public:
    NCFRESULT SetOutputPixelFormat(ncfUInt32, ncfUInt32, ncfUInt32) override { return NCF_OK; }
    NCFRESULT ReadFrame(ncfUInt64, void*, ncfUInt32, ncfUInt32, ncfUInt32) override {
        return NCF_OK;
    }
    ncfUInt32 GetFrameBufferSize(ncfUInt32, ncfUInt64, ncfUInt32) override { return 0; }
    NCFRESULT InitQT(ncfUInt32) override { return NCF_OK; }
    NCFRESULT ReleaseQT() override { return NCF_OK; }
};
class FakeAudioReader : public FakeObject<QTWrapper::IQTAudioReader> {
public:
    NCFRESULT SetParams(ncfUInt32, ncfUInt32, ncfUInt8, double, ncfUInt32&) override {
        return NCF_OK;
    }
    NCFRESULT ReadSamples(ncfUInt32, ncfUInt64, ncfUInt64*, void*, ncfUInt64, ncfUInt8,
                          ncfUInt8) override {
        return NCF_OK;
    }
};

// A sample table that answers with what it was asked: "operation track/sample"
// stands in the journal, and each answer is a number of its own.
class FakeWrapperTable : public FakeObject<QTWrapper::IQTWSampleTable>, public FakeCalls {
public:
    explicit FakeWrapperTable(Journal* lines) : FakeCalls("table", lines) {}

    std::string asked;  // track and sample of the last question
    QTWrapper::QTWSamplePropertyFlags_t flags = QTWrapper::kQTWSampleDependent;
    ncfUInt32 maxDataSize = 8000;
    ncfBool outOfOrder = 1;

    NCFRESULT GetNumSamples(ncfUInt32 track, ncfUInt64* n) override {
        asked = std::to_string(track);
        return give("GetNumSamples", n, ncfUInt64{1} << 33);
    }
    NCFRESULT GetDataOffset(ncfUInt32 track, ncfUInt64 sample, ncfUInt64* position) override {
        return answer("GetDataOffset", track, sample, position, ncfUInt64{1} << 34);
    }
    NCFRESULT GetSampleFlags(ncfUInt32 track, ncfUInt64 sample,
                             QTWrapper::QTWSamplePropertyFlags_t* out) override {
        return answer("GetSampleFlags", track, sample, out, flags);
    }
    NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt32 track, ncfUInt64 sample,
                                                      ncfUInt64* next) override {
        return answer("GetNextDiscontiguousDataAttributeChange", track, sample, next,
                      ncfUInt64{1} << 35);
    }
    NCFRESULT GetDataSizePerSample(ncfUInt32 track, ncfUInt64 sample, ncfUInt32* bytes) override {
        return answer("GetDataSizePerSample", track, sample, bytes, 700u);
    }
    NCFRESULT GetDisplayOffset(ncfUInt32 track, ncfUInt64 sample, ncfSInt64* offset) override {
        return answer("GetDisplayOffset", track, sample, offset, -(ncfSInt64{1} << 36));
    }
    NCFRESULT GetDecodeDuration(ncfUInt32 track, ncfUInt64 sample, ncfSInt64* duration) override {
        return answer("GetDecodeDuration", track, sample, duration, ncfSInt64{1} << 37);
    }
    ncfUInt32 GetMaxDataSize(ncfUInt32 track) override {
        asked = std::to_string(track);
        return maxDataSize;
    }
    ncfBool HasOutOfOrderFrameDependencies(ncfUInt32 track) override {
        asked = std::to_string(track);
        return outOfOrder;
    }

private:
    template <class Out, class Value>
    NCFRESULT answer(const char* operation, ncfUInt32 track, ncfUInt64 sample, Out* out,
                     Value value) {
        asked = std::to_string(track) + "/" + std::to_string(sample);
        return give(operation, out, value);
    }
};

// A wrapper that opens every path and answers what the test set; what was
// passed in stands in the fields below.
class FakeWrapper : public FakeObject<QTWrapper::IQuickTimeWrapper>, public FakeCalls {
public:
    explicit FakeWrapper(Journal* lines)
        : FakeCalls("wrapper", lines), table(new FakeWrapperTable(lines)) {}
    ~FakeWrapper() override { table->Release(); }

    FakeWrapperTable* const table;

    // --- the movie ----------------------------------------------------------
    std::set<ncfUInt32> videoTracks, audioTracks, timecodeTracks;
    ncfUInt32 highestTrack = 0;
    ncfBool hasAudio = 0;
    ncfBool alphaByContainer = 0, alphaByPicture = 0;
    ncfUInt32 interlaced = 0, fieldBits = 0;
    ncfUInt32 fieldCount = 0;  // 0: the movie doesn't say
    ncfBool found709 = 0, found601 = 0;
    ncfBool oneFrame = 0;
    ncfUInt32 resolution = 0;
    std::string codecName = "A Codec";
    ncfBool soundIssue = 0, pictureIssue = 0;
    ncfBool multipleVideo = 0;
    std::map<ncfUInt32, std::string> codes;  // by track; another track fails
    ncfUInt32 descriptionCount = 1;
    ncfUInt32 formatID = 0x6C70636D;  // 'lpcm'
    ncfUInt32 soundBits = 16;
    double sampleRate = 48000.0;
    ncfUInt32 width = 1920, height = 1080, aspectNum = 16, aspectDen = 9;
    ncfUInt64 creationTime = 0;
    ncfUInt32 describedTracks = 0;
    ncfUInt32 selfContained = 1;
    Rational rate{25, 1};
    ncfUInt64 length = 250;
    ncfUInt32 vendor = 0;
    ncfUInt64 trackDuration = 0;
    ncfUInt32 movieTimeScale = 600;

    // --- what was passed in -------------------------------------------------
    std::string openedPath;
    std::vector<ncfUInt32> testedTracks;  // by the three questions about kinds
    std::string issueArguments, boxArguments, rateArguments;
    std::vector<ncfUInt64> trackLengths;
    ncfUInt32 lastTrack = 0;

    void AddPicture(ncfUInt32 track) {
        videoTracks.insert(track);
        highestTrack = std::max(highestTrack, track);
        codes[track] = "xyz1";
    }
    void AddSound(ncfUInt32 track) {
        audioTracks.insert(track);
        highestTrack = std::max(highestTrack, track);
        hasAudio = 1;
    }
    void AddTimecode(ncfUInt32 track) {
        timecodeTracks.insert(track);
        highestTrack = std::max(highestTrack, track);
    }

    NCFRESULT NewMovieFromFilePath(INCFString* path) override {
        openedPath = TextOf(path);
        return enter("NewMovieFromFilePath");
    }
    NCFRESULT GetQTAudioReader(QTWrapper::IQTAudioReader** reader) override {
        return giveNew("GetQTAudioReader", reader, [] { return new FakeAudioReader; });
    }
    NCFRESULT GetQTVideoReader(QTWrapper::IQTVideoReader** reader) override {
        return giveNew("GetQTVideoReader", reader, [] { return new FakeVideoReader; });
    }
    NCFRESULT PreparePixelFormat(ncfUInt32) override { return enter("PreparePixelFormat"); }
    NCFRESULT GetSampleTable(QTWrapper::IQTWSampleTable** out) override {
        return giveObject("GetSampleTable", out, table);
    }
    NCFRESULT QueryVideoDescBufferDetails(ncfUInt32* flag, ncfUInt32* bits) override {
        *flag = 1;  // not to be believed when the answer is a failure
        *bits = 9;
        give("QueryVideoDescBufferDetails", flag, interlaced);
        return result("QueryVideoDescBufferDetails", bits, fieldBits);
    }
    NCFRESULT GetCodecColorSpaceInfo(ncfBool* is709, ncfBool* is601) override {
        give("GetCodecColorSpaceInfo", is709, found709);
        return result("GetCodecColorSpaceInfo", is601, found601);
    }
    ncfBool MovieHasOneFrame() override { return note("MovieHasOneFrame", oneFrame); }
    ncfUInt32 GetResolutionId(ncfUInt32 track) override {
        lastTrack = track;
        return note("GetResolutionId", resolution);
    }
    NCFRESULT GetCodecTypeName(ncfUInt32 track, INCFString* name) override {
        lastTrack = track;
        const NCFRESULT answered = enter("GetCodecTypeName");
        return answered < 0 ? answered
                            : name->AssignUTF8(kNCFUTF8, codecName.c_str(), kNCFZeroTerminated);
    }
    NCFRESULT MovieTrackDurationIssues(ncfSInt32 num, ncfSInt32 den, ncfUInt64 units,
                                       ncfBool* sound, ncfBool* picture) override {
        issueArguments =
            std::to_string(num) + "/" + std::to_string(den) + " " + std::to_string(units);
        give("MovieTrackDurationIssues", sound, soundIssue);
        return result("MovieTrackDurationIssues", picture, pictureIssue);
    }
    ncfBool MovieHasMultipleVideoTracks(ncfUInt32 a, ncfUInt32 b) override {
        return a == 0 && b == 0 ? note("MovieHasMultipleVideoTracks", multipleVideo) : 0;
    }
    ncfBool GetFirstVideoTrack(ncfUInt32* track) override {
        note("GetFirstVideoTrack", 0);
        if (!videoTracks.empty()) {
            *track = *videoTracks.begin();
        }
        return !videoTracks.empty();
    }
    ncfBool GetFieldLayoutForTrack(ncfUInt32 track, ncfUInt32* count) override {
        lastTrack = track;
        *count = fieldCount != 0 ? fieldCount : 2;  // not to be believed without a true
        return note("GetFieldLayoutForTrack", fieldCount != 0);
    }
    NCFRESULT GetFourCCFromImageDescrptor(ncfUInt32 track, ncfUInt8* fourBytes) override {
        lastTrack = track;
        const NCFRESULT answered = enter("GetFourCCFromImageDescrptor");
        const auto code = codes.find(track);
        if (answered < 0 || code == codes.end()) {
            return answered < 0 ? answered : NCF_E_NOTFOUND;
        }
        std::copy_n(code->second.begin(), 4, fourBytes);
        return NCF_OK;
    }
    ncfUInt32 GetImageDescriptionCount(ncfUInt32 track) override {
        lastTrack = track;
        return note("GetImageDescriptionCount", descriptionCount);
    }
    NCFRESULT MovieContainsAlpha(ncfUInt32 kind, ncfBool* alpha) override {
        return kind == QTWrapper::kAlphaCheckForImport
                   ? give("MovieContainsAlpha import", alpha, alphaByContainer)
                   : give("MovieContainsAlpha picture", alpha, alphaByPicture);
    }
    NCFRESULT GetAudioInfoForTrack(ncfUInt32 track, ncfUInt32* channels, double* samplesPerSecond,
                                   ncfUInt32* format, ncfUInt32* formatFlags,
                                   ncfUInt32* bytesPerPacket, ncfUInt32* framesPerPacket,
                                   ncfUInt32* bits, ncfUInt8* isBigEndian,
                                   ncfUInt8* isConstantBitRate) override {
        lastTrack = track;
        if (audioTracks.count(track) == 0) {
            return NCF_E_NOTFOUND;
        }
        const NCFRESULT answered = give("GetAudioInfoForTrack", channels, 2);
        result("GetAudioInfoForTrack", samplesPerSecond, sampleRate);
        result("GetAudioInfoForTrack", format, formatID);
        result("GetAudioInfoForTrack", formatFlags, 12);
        result("GetAudioInfoForTrack", bytesPerPacket, 4);
        result("GetAudioInfoForTrack", framesPerPacket, 1);
        result("GetAudioInfoForTrack", bits, soundBits);
        result("GetAudioInfoForTrack", isBigEndian, 1);
        result("GetAudioInfoForTrack", isConstantBitRate, 1);
        return answered;
    }
    NCFRESULT GetMovieBox(ncfUInt32* w, ncfUInt32* h, ncfUInt32* num, ncfUInt32* den) override {
        const NCFRESULT answered = give("GetMovieBox", w, width);
        result("GetMovieBox", h, height);
        result("GetMovieBox", num, aspectNum);
        result("GetMovieBox", den, aspectDen);
        return answered;
    }
    ncfUInt64 GetMovieCreationTime() override { return creationTime; }
    ncfUInt32 GetDescribedTrackCount() override {
        return note("GetDescribedTrackCount", describedTracks);
    }
    ncfUInt32 MovieIsSelfContained(ncfUInt32 a, ncfUInt32 b, ncfUInt32 c) override {
        return a == 0 && b == 0 && c == 0 ? note("MovieIsSelfContained", selfContained) : 0;
    }
    NCFRESULT GetTimeCodeInfoForTrack(ncfUInt32 track, ncfUInt8* hours, ncfUInt8* minutes,
                                      ncfUInt8* seconds, ncfUInt8* frames, ncfUInt32* timeScale,
                                      ncfUInt32* frameDuration, ncfUInt32* drop,
                                      ncfUInt32* numFrames) override {
        lastTrack = track;
        const NCFRESULT answered = give("GetTimeCodeInfoForTrack", hours, 1);
        result("GetTimeCodeInfoForTrack", minutes, 2);
        result("GetTimeCodeInfoForTrack", seconds, 3);
        result("GetTimeCodeInfoForTrack", frames, 4);
        result("GetTimeCodeInfoForTrack", timeScale, 30000);
        result("GetTimeCodeInfoForTrack", frameDuration, 1001);
        result("GetTimeCodeInfoForTrack", drop, 1);
        result("GetTimeCodeInfoForTrack", numFrames, 30);
        return answered;
    }
    ncfBool IsVideoTrack(ncfUInt32 track) override { return IsOneOf(videoTracks, track); }
    ncfBool IsAudioTrack(ncfUInt32 track) override { return IsOneOf(audioTracks, track); }
    ncfBool IsTimeCodeTrack(ncfUInt32 track) override { return IsOneOf(timecodeTracks, track); }
    ncfUInt32 GetNumberOfTracks() override { return highestTrack; }
    ncfBool MovieHasAudio() override { return note("MovieHasAudio", hasAudio); }
    NCFRESULT DetermineMovieEditRateAndLength(double forced, double editor, ncfUInt32 single,
                                              ncfSInt32* num, ncfSInt32* den, ncfUInt64* units,
                                              ncfUInt64* lengths, ncfUInt32 lengthCount,
                                              ncfBool useMovieHeader) override {
        rateArguments = std::to_string(forced) + " " + std::to_string(editor) + " " +
                        std::to_string(single) + " " + std::to_string(useMovieHeader);
        trackLengths.assign(lengths, lengths + lengthCount);
        std::fill(lengths, lengths + lengthCount, 7u);
        const NCFRESULT answered = give("DetermineMovieEditRateAndLength", num, rate.numerator);
        result("DetermineMovieEditRateAndLength", den, rate.denominator);
        result("DetermineMovieEditRateAndLength", units, length);
        return answered;
    }
    NCFRESULT QTWSetMovieBox(ncfSInt16 top, ncfSInt16 left, ncfSInt16 bottom,
                             ncfSInt16 right) override {
        boxArguments = std::to_string(top) + " " + std::to_string(left) + " " +
                       std::to_string(bottom) + " " + std::to_string(right);
        return enter("QTWSetMovieBox");
    }
    NCFRESULT GetVendor(ncfUInt32 track, ncfUInt32* out) override {
        lastTrack = track;
        return give("GetVendor", out, vendor);
    }
    ncfUInt64 GetTrackDuration(ncfUInt32 track) override {
        lastTrack = track;
        return trackDuration;
    }
    ncfUInt32 GetMovieTimeScale() override { return movieTimeScale; }

private:
    // A clip that asks without end fails its test instead of hanging.
    ncfBool IsOneOf(const std::set<ncfUInt32>& tracks, ncfUInt32 track) {
        if (testedTracks.size() > 10000000) {
            throw std::length_error("too many questions about tracks");
        }
        testedTracks.push_back(track);
        return tracks.count(track) != 0;
    }
    // A further answer of an operation that is in the journal already.
    template <class Out, class Value>
    NCFRESULT result(const char* operation, Out* out, const Value& value) {
        const auto found = results.find(operation);
        const NCFRESULT answered = found == results.end() ? NCF_OK : found->second;
        if (answered >= 0 && out) {
            *out = static_cast<Out>(value);
        }
        return answered;
    }
    // An operation without a result.
    template <class Value>
    Value note(const char* operation, Value value) {
        enter(operation);
        return value;
    }
    template <class Reader, class Make>
    NCFRESULT giveNew(const char* operation, Reader** out, Make make) {
        *out = nullptr;
        const NCFRESULT answered = enter(operation);
        if (answered >= 0) {
            *out = make();
        }
        return answered;
    }
};
