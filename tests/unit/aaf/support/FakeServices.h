// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "host_interfaces/framework/EditorSettings.h"
#include "host_interfaces/quicktime/QuickTimeWrapper.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/Journal.h"

// What the editor's project says, each answer on its own.
struct EditorAnswers {
    NCFRESULT rateResult = NCF_OK;
    double rate = 25.0;
    ncfUInt32 reservedA = 0;
    ncfUInt32 reservedB = 0;
    NCFRESULT forcedResult = NCF_OK;
    ncfUInt32 forced = 0;
    double forcedRate = 0.0;
    NCFRESULT singleResult = NCF_OK;
    ncfUInt32 single = 60;
    NCFRESULT namedResult = NCF_OK;
    ncfUInt32 named = 0;
};

class FakeEditorSettings : public FakeObject<INCFNMAEditorSettings> {
public:
    FakeEditorSettings(const EditorAnswers& answers, Journal* journal)
        : answers_(answers), journal_(journal) {}

    NCFRESULT GetEditorFrameRate(double* rate, ncfUInt32* a, ncfUInt32* b) override {
        journal_->add("editor GetEditorFrameRate");
        if (answers_.rateResult >= 0) {
            *rate = answers_.rate;
            *a = answers_.reservedA;
            *b = answers_.reservedB;
        }
        return answers_.rateResult;
    }
    NCFRESULT GetSingleFrameDuration(ncfUInt32* duration) override {
        journal_->add("editor GetSingleFrameDuration");
        if (answers_.singleResult >= 0) {
            *duration = answers_.single;
        }
        return answers_.singleResult;
    }
    NCFRESULT GetForcedFrameRate(ncfUInt32* enabled, double* rate) override {
        journal_->add("editor GetForcedFrameRate");
        if (answers_.forcedResult >= 0) {
            *enabled = answers_.forced;
            *rate = answers_.forcedRate;
        }
        return answers_.forcedResult;
    }
    NCFRESULT GetNamedSetting(const ncfUTF8* key, ncfUInt32* value, ncfUInt64* out2,
                              void*) override {
        const bool zeroed = *value == 0 && *out2 == 0 && key[255] == 0;
        journal_->add(std::string("editor GetNamedSetting ") + key + (zeroed ? " zeroed" : ""));
        if (answers_.namedResult >= 0) {
            *value = answers_.named;
        }
        return answers_.namedResult;
    }

private:
    const EditorAnswers& answers_;
    Journal* journal_;
};

// A movie wrapper that knows one thing: the sound of every track.
struct WrapperAnswers {
    NCFRESULT openResult = NCF_OK;
    NCFRESULT soundResult = NCF_OK;
    ncfUInt32 channels = 2;
    double sampleRate = 44100.0;
    ncfUInt32 formatID = 0x61616320;  // 'aac '
    ncfUInt32 bytesPerPacket = 0;
};

class FakeWrapper : public FakeObject<QTWrapper::IQuickTimeWrapper> {
public:
    FakeWrapper(const WrapperAnswers& answers, Journal* journal)
        : answers_(answers), journal_(journal) {}

    NCFRESULT NewMovieFromFilePath(INCFString*) override {
        journal_->add("wrapper NewMovieFromFilePath");
        return answers_.openResult;
    }
    NCFRESULT GetAudioInfoForTrack(ncfUInt32 track, ncfUInt32* channels, double* sampleRate,
                                   ncfUInt32* formatID, ncfUInt32* formatFlags,
                                   ncfUInt32* bytesPerPacket, ncfUInt32* framesPerPacket,
                                   ncfUInt32* bitsPerChannel, ncfUInt8* isBigEndian,
                                   ncfUInt8* isConstantBitRate) override {
        const bool rest =
            formatFlags || framesPerPacket || bitsPerChannel || isBigEndian || isConstantBitRate;
        journal_->add("wrapper GetAudioInfoForTrack " + std::to_string(track) +
                      (rest ? " with more" : ""));
        if (answers_.soundResult >= 0) {
            *channels = answers_.channels;
            *sampleRate = answers_.sampleRate;
            *formatID = answers_.formatID;
            *bytesPerPacket = answers_.bytesPerPacket;
        }
        return answers_.soundResult;
    }

    // No description asks these.
    NCFRESULT PreparePixelFormat(ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetSampleTable(QTWrapper::IQTWSampleTable**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetQTAudioReader(QTWrapper::IQTAudioReader**) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetQTVideoReader(QTWrapper::IQTVideoReader**) override { return NCF_E_NOTIMPL; }
    NCFRESULT QueryVideoDescBufferDetails(ncfUInt32*, ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetCodecColorSpaceInfo(ncfBool*, ncfBool*) override { return NCF_E_NOTIMPL; }
    ncfBool MovieHasOneFrame() override { return 0; }
    ncfUInt32 GetResolutionId(ncfUInt32) override { return 0; }
    NCFRESULT GetCodecTypeName(ncfUInt32, INCFString*) override { return NCF_E_NOTIMPL; }
    NCFRESULT MovieTrackDurationIssues(ncfSInt32, ncfSInt32, ncfUInt64, ncfBool*,
                                       ncfBool*) override {
        return NCF_E_NOTIMPL;
    }
    ncfBool MovieHasMultipleVideoTracks(ncfUInt32, ncfUInt32) override { return 0; }
    ncfBool GetFirstVideoTrack(ncfUInt32*) override { return 0; }
    ncfBool GetFieldLayoutForTrack(ncfUInt32, ncfUInt32*) override { return 0; }
    NCFRESULT GetFourCCFromImageDescrptor(ncfUInt32, ncfUInt8*) override { return NCF_E_NOTIMPL; }
    ncfUInt32 GetImageDescriptionCount(ncfUInt32) override { return 0; }
    NCFRESULT MovieContainsAlpha(ncfUInt32, ncfBool*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetMovieBox(ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt32*) override {
        return NCF_E_NOTIMPL;
    }
    ncfUInt64 GetMovieCreationTime() override { return 0; }
    ncfUInt32 GetDescribedTrackCount() override { return 0; }
    ncfUInt32 MovieIsSelfContained(ncfUInt32, ncfUInt32, ncfUInt32) override { return 0; }
    NCFRESULT GetTimeCodeInfoForTrack(ncfUInt32, ncfUInt8*, ncfUInt8*, ncfUInt8*, ncfUInt8*,
                                      ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt32*) override {
        return NCF_E_NOTIMPL;
    }
    ncfBool IsVideoTrack(ncfUInt32) override { return 0; }
    ncfBool IsAudioTrack(ncfUInt32) override { return 0; }
    ncfBool IsTimeCodeTrack(ncfUInt32) override { return 0; }
    ncfUInt32 GetNumberOfTracks() override { return 0; }
    ncfBool MovieHasAudio() override { return 0; }
    NCFRESULT DetermineMovieEditRateAndLength(double, double, ncfUInt32, ncfSInt32*, ncfSInt32*,
                                              ncfUInt64*, ncfUInt64*, ncfUInt32, ncfBool) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT QTWSetMovieBox(ncfSInt16, ncfSInt16, ncfSInt16, ncfSInt16) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetVendor(ncfUInt32, ncfUInt32*) override { return NCF_E_NOTIMPL; }
    ncfUInt64 GetTrackDuration(ncfUInt32) override { return 0; }
    ncfUInt32 GetMovieTimeScale() override { return 0; }

private:
    const WrapperAnswers& answers_;
    Journal* journal_;
};
