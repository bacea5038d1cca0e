// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <vector>

#include "source/clips/BaseClip.h"

// A clip that says of its picture what a test wants, and fails where it wants.
class FakeClip final : public BaseClip {
public:
    FakeClip() : BaseClip(nullptr, nullptr, nullptr) {}

    // What the clip says.
    ncfUInt32 code = 0;
    ncfUInt32 vendor = 0;
    ncfUInt32 width = 0;
    ncfUInt32 height = 0;
    ncfUInt32 layout = 0;
    Rational rate{25, 1};
    ncfUInt32 resolution = 0;
    // Results of the questions.
    NCFRESULT codeResult = NCF_OK;
    NCFRESULT vendorResult = NCF_OK;
    NCFRESULT sizeResult = NCF_OK;
    NCFRESULT layoutResult = NCF_OK;
    NCFRESULT rateResult = NCF_OK;
    NCFRESULT resolutionResult = NCF_E_PARAMETERNOTAVAILABLE;
    // The questions in order.
    mutable std::vector<std::string> asked;

    NCFRESULT GetNMAFrameLayout(ncfUInt32* frameLayout) const override {
        return Answer("GetNMAFrameLayout", layoutResult, frameLayout, layout);
    }
    NCFRESULT GetDataFormat(ncfUInt32* dataFormat) const override {
        return Answer("GetDataFormat", codeResult, dataFormat, code);
    }
    NCFRESULT GetVendor(ncfUInt32* out) const override {
        return Answer("GetVendor", vendorResult, out, vendor);
    }
    NCFRESULT GetNivoResolution(ncfUInt32* vcID) const override {
        return Answer("GetNivoResolution", resolutionResult, vcID, resolution);
    }
    NCFRESULT GetEditRate(Rational* editRate) const override {
        return Answer("GetEditRate", rateResult, editRate, rate);
    }
    NCFRESULT GetEncodedWidthAndHeight(ncfUInt32* outWidth, ncfUInt32* outHeight) override {
        Answer("GetEncodedWidthAndHeight", sizeResult, outWidth, width);
        if (sizeResult >= 0) {
            *outHeight = height;
        }
        return sizeResult;
    }

    // Nobody asks these here.
    NCFRESULT SetFieldLayoutDetails() override { return NCF_E_NOTIMPL; }
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
    NCFRESULT GetMovieLength(ncfUInt64*) const override { return NCF_E_NOTIMPL; }
    NCFRESULT GetCreationTime(ncfUInt64*) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetCodecName(ncfUInt32, NCFSmartPtr<INCFString>&) override { return NCF_E_NOTIMPL; }
    NCFRESULT GetContentForHash(std::vector<ncfUInt8>&) override { return NCF_E_NOTIMPL; }
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

private:
    template <class T>
    NCFRESULT Answer(const char* name, NCFRESULT result, T* out, const T& value) const {
        asked.push_back(name);
        if (result >= 0) {
            *out = value;
        }
        return result;
    }
};
