// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "host_interfaces/quicktime/QuickTimeWrapper.h"
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
    NCFRESULT ReservedVideoReaderOperation() override { return NCF_E_NOTIMPL; }
    NCFRESULT ReleaseQT() override { return NCF_OK; }
};
class FakeAudioReader : public FakeObject<QTWrapper::IQTAudioReader> {
public:
    NCFRESULT ReservedAudioReaderOperation() override { return NCF_E_NOTIMPL; }
    NCFRESULT SetParams(ncfUInt32, ncfUInt32, ncfUInt8, double, ncfUInt32&) override {
        return NCF_OK;
    }
    NCFRESULT ReadSamples(ncfUInt32, ncfUInt64, ncfUInt64*, void*, ncfUInt64, ncfUInt8,
                          ncfUInt8) override {
        return NCF_OK;
    }
};

// A wrapper that opens every path and hands out readers; the rest is not
// there.
class FakeWrapper : public FakeObject<QTWrapper::IQuickTimeWrapper>, public FakeCalls {
public:
    explicit FakeWrapper(Journal* lines) : FakeCalls("wrapper", lines) {}

    std::string openedPath;

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

    NCFRESULT PreparePixelFormat(ncfUInt32) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetSampleTable(QTWrapper::IQTWSampleTable**) override { return NCF_E_NOTIMPL; }
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
    NCFRESULT GetAudioInfoForTrack(ncfUInt32, ncfUInt32*, double*, ncfUInt32*, ncfUInt32*,
                                   ncfUInt32*, ncfUInt32*, ncfUInt32*, ncfUInt8*,
                                   ncfUInt8*) override {
        return NCF_E_NOTIMPL;
    }
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
    template <class Reader, class Make>
    NCFRESULT giveNew(const char* operation, Reader** out, Make make) {
        *out = nullptr;
        const NCFRESULT result = enter(operation);
        if (result >= 0) {
            *out = make();
        }
        return result;
    }
};
