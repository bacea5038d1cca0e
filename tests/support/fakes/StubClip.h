// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "source/clips/BaseClip.h"

// A clip that answers nothing. A fake overrides what its tests ask of it.
class StubClip : public BaseClip {
public:
    explicit StubClip(NCFSmartPtr<INCFString> fileName = nullptr,
                      NCFSmartPtr<INCFConsole> console = nullptr,
                      NCFSmartPtr<INCFComponentFactory> componentFactory = nullptr)
        : BaseClip(fileName, console, componentFactory) {}

    NCFRESULT SetFieldLayoutDetails() override { return NCF_E_NOTIMPL; }
    NCFRESULT GetNMAFrameLayout(ncfUInt32*) const override { return NCF_E_NOTIMPL; }
    NCFRESULT GetDataFormat(ncfUInt32*) const override { return NCF_E_NOTIMPL; }
    NCFRESULT GetVendor(ncfUInt32*) const override { return NCF_E_NOTIMPL; }
    NCFRESULT GetNivoResolution(ncfUInt32*) const override { return NCF_E_NOTIMPL; }
    NCFRESULT GetTrackCount(ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetVideoTrackQTId(ncfUInt32, ncfUInt32&) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetAudioTrackQTId(ncfUInt32, ncfUInt32&) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetTimecodeTrackQTId(ncfUInt32, ncfUInt32&) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetTrackType(ncfUInt32, ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetTimeCodeTrackMetadata(ncfUInt32, TimeCodeTrackMetadata*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetAudioTrackMetadata(ncfUInt32, AudioTrackMetadata*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT IsAudioLPCM(ncfUInt32, ncfBool*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetEditRate(Rational*) const override { return NCF_E_NOTIMPL; }
    NCFRESULT GetMovieLength(ncfUInt64*) const override { return NCF_E_NOTIMPL; }
    NCFRESULT GetCreationTime(ncfUInt64*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetCodecName(ncfUInt32, NCFSmartPtr<INCFString>&) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetContentForHash(ByteVector&) override { return NCF_E_NOTIMPL; }
    NCFRESULT IsSelfContained() override { return NCF_E_NOTIMPL; }
    NCFRESULT IsVideoSampleProviderMedia(AAFInfo*) override { return NCF_E_NOTIMPL; }
    NCFRESULT HasOneFrame(ncfBool*) override { return NCF_E_NOTIMPL; }
    NCFRESULT IsMultiFormatMovie(ncfBool*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetNumSamples(ncfUInt32, ncfUInt64*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetDataOffset(ncfUInt32, ncfUInt64, ncfUInt64*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetSampleFlags(ncfUInt32, ncfUInt64, ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetDataSizePerSample(ncfUInt32, ncfUInt64, ncfUInt32*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetDisplayOffset(ncfUInt32, ncfUInt64, ncfSInt64*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetDecodeDuration(ncfUInt32, ncfUInt64, ncfSInt64*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetMaxDataSizeInBytes(ncfUInt32, ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetHasOutOfOrderFrameDependencies(ncfUInt32, ncfBool*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT LoadClipImpl() override { return NCF_E_NOTIMPL; }
    NCFRESULT SetColorSpaceImpl() override { return NCF_E_NOTIMPL; }
    NCFRESULT SetGeometryImpl() override { return NCF_E_NOTIMPL; }
    NCFRESULT SetEditRateImpl(const EditorSettings&) override { return NCF_E_NOTIMPL; }
    NCFRESULT SetMovieLengthImpl(const EditorSettings&) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetEncodedWidthAndHeightImpl(ncfUInt32*, ncfUInt32*) override {
        return NCF_E_NOTIMPL;
    }
    NCFRESULT GetImageAspectRatioImpl(ncfUInt32*, ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetTimeCodeTrackCountImpl(ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetVideoTrackCountImpl(ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetAudioTrackCountImpl(ncfUInt32*) override { return NCF_E_NOTIMPL; }
    NCFRESULT CalculateAudioTrackLengthInSamples(ncfUInt32, ncfUInt64*) override {
        return NCF_E_NOTIMPL;
    }
};
