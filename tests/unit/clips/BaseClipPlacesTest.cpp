// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT

// The places of the clip's operations in its table, written down once more and
// called by number: other parts of the system call them by place.

#include <gtest/gtest.h>

#include <cstring>
#include <string>

#include "source/clips/BaseClip.h"
#include "tests/support/fakes/FakeHost.h"
#include "tests/support/fakes/RecordingLogger.h"

namespace {

// Tells which of its operations ran.
class PlaceClip : public BaseClip {
public:
    PlaceClip() : BaseClip(nullptr, nullptr, nullptr) {}

    NCFRESULT Ran(const char* operation) const {
        ran = operation;
        return NCF_OK;
    }
    mutable std::string ran;

    NCFRESULT SetFieldLayoutDetails() override { return Ran("SetFieldLayoutDetails"); }
    NCFRESULT GetNMAFrameLayout(ncfUInt32*) const override { return Ran("GetNMAFrameLayout"); }
    NCFRESULT GetDataFormat(ncfUInt32*) const override { return Ran("GetDataFormat"); }
    NCFRESULT GetVendor(ncfUInt32*) const override { return Ran("GetVendor"); }
    NCFRESULT GetNivoResolution(ncfUInt32*) const override { return Ran("GetNivoResolution"); }
    NCFRESULT GetTrackCount(ncfUInt32*) override { return Ran("GetTrackCount"); }
    NCFRESULT GetVideoTrackQTId(ncfUInt32, ncfUInt32&) override { return Ran("GetVideoTrackQTId"); }
    NCFRESULT GetAudioTrackQTId(ncfUInt32, ncfUInt32&) override { return Ran("GetAudioTrackQTId"); }
    NCFRESULT GetTimecodeTrackQTId(ncfUInt32, ncfUInt32&) override {
        return Ran("GetTimecodeTrackQTId");
    }
    NCFRESULT GetTrackType(ncfUInt32, ncfUInt32*) override { return Ran("GetTrackType"); }
    NCFRESULT GetTimeCodeTrackMetadata(ncfUInt32, TimeCodeTrackMetadata*) override {
        return Ran("GetTimeCodeTrackMetadata");
    }
    NCFRESULT GetAudioTrackMetadata(ncfUInt32, AudioTrackMetadata*) override {
        return Ran("GetAudioTrackMetadata");
    }
    NCFRESULT IsAudioLPCM(ncfUInt32, ncfBool*) override { return Ran("IsAudioLPCM"); }
    NCFRESULT GetEditRate(Rational*) const override { return Ran("GetEditRate"); }
    NCFRESULT GetMovieLength(ncfUInt64*) const override { return Ran("GetMovieLength"); }
    NCFRESULT GetCreationTime(ncfUInt64*) override { return Ran("GetCreationTime"); }
    NCFRESULT GetCodecName(ncfUInt32, NCFSmartPtr<INCFString>&) override {
        return Ran("GetCodecName");
    }
    NCFRESULT GetContentForHash(std::vector<ncfUInt8>&) override {
        return Ran("GetContentForHash");
    }
    NCFRESULT IsSelfContained() override { return Ran("IsSelfContained"); }
    NCFRESULT IsVideoSampleProviderMedia(AAFInfo*) override {
        return Ran("IsVideoSampleProviderMedia");
    }
    NCFRESULT HasOneFrame(ncfBool*) override { return Ran("HasOneFrame"); }
    NCFRESULT IsMultiFormatMovie(ncfBool*) override { return Ran("IsMultiFormatMovie"); }
    NCFSmartPtr<INCFString> GetFileName() const override {
        ran = "GetFileName";
        return nullptr;
    }
    NCFRESULT SetEditRate(const EditorSettings&) override { return Ran("SetEditRate"); }
    NCFRESULT SetMovieLength(const EditorSettings&) override { return Ran("SetMovieLength"); }
    NCFRESULT GetEncodedWidthAndHeight(ncfUInt32*, ncfUInt32*) override {
        return Ran("GetEncodedWidthAndHeight");
    }
    NCFRESULT GetImageAspectRatio(ncfUInt32*, ncfUInt32*) override {
        return Ran("GetImageAspectRatio");
    }
    NCFRESULT GetColorSpace(ncfUInt32*) const override { return Ran("GetColorSpace"); }
    NCFRESULT GetTemporalFieldOrder(ncfUInt32*) const override {
        return Ran("GetTemporalFieldOrder");
    }
    NCFRESULT GetFrameBufferLayout(ncfUInt32*) const override {
        return Ran("GetFrameBufferLayout");
    }
    NCFRESULT GetBufferLineOrientation(ncfUInt32*) const override {
        return Ran("GetBufferLineOrientation");
    }
    NCFRESULT GetTimeCodeTrackCount(ncfUInt32*) override { return Ran("GetTimeCodeTrackCount"); }
    NCFRESULT GetVideoTrackCount(ncfUInt32*) override { return Ran("GetVideoTrackCount"); }
    NCFRESULT GetAudioTrackCount(ncfUInt32*) override { return Ran("GetAudioTrackCount"); }
    NCFRESULT GetNumSamples(ncfUInt32, ncfUInt64*) override { return Ran("GetNumSamples"); }
    NCFRESULT GetDataOffset(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return Ran("GetDataOffset");
    }
    NCFRESULT GetSampleFlags(ncfUInt32, ncfUInt64, ncfUInt32*) override {
        return Ran("GetSampleFlags");
    }
    NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt32, ncfUInt64, ncfUInt64*) override {
        return Ran("GetNextDiscontiguousDataAttributeChange");
    }
    NCFRESULT GetDataSizePerSample(ncfUInt32, ncfUInt64, ncfUInt32*) override {
        return Ran("GetDataSizePerSample");
    }
    NCFRESULT GetDisplayOffset(ncfUInt32, ncfUInt64, ncfSInt64*) override {
        return Ran("GetDisplayOffset");
    }
    NCFRESULT GetDecodeDuration(ncfUInt32, ncfUInt64, ncfSInt64*) override {
        return Ran("GetDecodeDuration");
    }
    NCFRESULT GetMaxDataSizeInBytes(ncfUInt32, ncfUInt32*) override {
        return Ran("GetMaxDataSizeInBytes");
    }
    NCFRESULT GetHasOutOfOrderFrameDependencies(ncfUInt32, ncfBool*) override {
        return Ran("GetHasOutOfOrderFrameDependencies");
    }
    NCFRESULT IsAudioSampleProviderMedia(ncfUInt32, ncfUInt64*) override {
        return Ran("IsAudioSampleProviderMedia");
    }
    NCFRESULT GetColorDetails(ColorDetails*) const override { return Ran("GetColorDetails"); }
    NCFRESULT GetGeometryDetails(GeometryDetails*) const override {
        return Ran("GetGeometryDetails");
    }
    NCFRESULT LoadClipImpl() override { return Ran("LoadClipImpl"); }
    NCFRESULT SetColorSpaceImpl() override { return Ran("SetColorSpaceImpl"); }
    NCFRESULT SetGeometryImpl() override { return Ran("SetGeometryImpl"); }
    NCFRESULT SetEditRateImpl(const EditorSettings&) override { return Ran("SetEditRateImpl"); }
    NCFRESULT SetMovieLengthImpl(const EditorSettings&) override {
        return Ran("SetMovieLengthImpl");
    }
    NCFRESULT GetEncodedWidthAndHeightImpl(ncfUInt32*, ncfUInt32*) override {
        return Ran("GetEncodedWidthAndHeightImpl");
    }
    NCFRESULT GetImageAspectRatioImpl(ncfUInt32*, ncfUInt32*) override {
        return Ran("GetImageAspectRatioImpl");
    }
    NCFRESULT GetTimeCodeTrackCountImpl(ncfUInt32*) override {
        return Ran("GetTimeCodeTrackCountImpl");
    }
    NCFRESULT GetVideoTrackCountImpl(ncfUInt32*) override { return Ran("GetVideoTrackCountImpl"); }
    NCFRESULT GetAudioTrackCountImpl(ncfUInt32*) override { return Ran("GetAudioTrackCountImpl"); }
    NCFRESULT CalculateAudioTrackLengthInSamples(ncfUInt32, ncfUInt64*) override {
        return Ran("CalculateAudioTrackLengthInSamples");
    }
};

struct Place {
    std::size_t slot;
    const char* operation;
};

// The destructor is slot 0.
const Place kPlaces[] = {
    {1, "SetFieldLayoutDetails"},
    {2, "GetNMAFrameLayout"},
    {3, "GetDataFormat"},
    {4, "GetVendor"},
    {5, "GetNivoResolution"},
    {6, "GetTrackCount"},
    {7, "GetVideoTrackQTId"},
    {8, "GetAudioTrackQTId"},
    {9, "GetTimecodeTrackQTId"},
    {10, "GetTrackType"},
    {11, "GetTimeCodeTrackMetadata"},
    {12, "GetAudioTrackMetadata"},
    {13, "IsAudioLPCM"},
    {14, "GetEditRate"},
    {15, "GetMovieLength"},
    {16, "GetCreationTime"},
    {17, "GetCodecName"},
    {18, "GetContentForHash"},
    {19, "IsSelfContained"},
    {20, "IsVideoSampleProviderMedia"},
    {21, "HasOneFrame"},
    {22, "IsMultiFormatMovie"},
    {23, "GetFileName"},
    {24, "SetEditRate"},
    {25, "SetMovieLength"},
    {26, "GetEncodedWidthAndHeight"},
    {27, "GetImageAspectRatio"},
    {28, "GetColorSpace"},
    {29, "GetTemporalFieldOrder"},
    {30, "GetFrameBufferLayout"},
    {31, "GetBufferLineOrientation"},
    {32, "GetTimeCodeTrackCount"},
    {33, "GetVideoTrackCount"},
    {34, "GetAudioTrackCount"},
    {35, "GetNumSamples"},
    {36, "GetDataOffset"},
    {37, "GetSampleFlags"},
    {38, "GetNextDiscontiguousDataAttributeChange"},
    {39, "GetDataSizePerSample"},
    {40, "GetDisplayOffset"},
    {41, "GetDecodeDuration"},
    {42, "GetMaxDataSizeInBytes"},
    {43, "GetHasOutOfOrderFrameDependencies"},
    {44, "IsAudioSampleProviderMedia"},
    {45, "GetColorDetails"},
    {46, "GetGeometryDetails"},
    {47, "LoadClipImpl"},
    {48, "SetColorSpaceImpl"},
    {49, "SetGeometryImpl"},
    {50, "SetEditRateImpl"},
    {51, "SetMovieLengthImpl"},
    {52, "GetEncodedWidthAndHeightImpl"},
    {53, "GetImageAspectRatioImpl"},
    {54, "GetTimeCodeTrackCountImpl"},
    {55, "GetVideoTrackCountImpl"},
    {56, "GetAudioTrackCountImpl"},
    {57, "CalculateAudioTrackLengthInSamples"},
};

// The compilers in use give a virtual destructor two entries, so that slot n
// stands at index n + 1.
std::size_t IndexOf(std::size_t slot) {
    return slot + 1;
}

using Word = std::uintptr_t;

}  // namespace

TEST(BaseClip, KeepsItsOperationsInTheirPlaces) {
    PlaceClip clip;
    BaseClip* const base = &clip;
    void** table = nullptr;
    std::memcpy(&table, static_cast<void*>(base), sizeof table);
    alignas(16) unsigned char scratch[256] = {};
    const Word argument = reinterpret_cast<Word>(scratch);
    ASSERT_EQ(std::size(kPlaces), 57u);
    for (const Place& place : kPlaces) {
        clip.ran.clear();
        void* const entry = table[IndexOf(place.slot)];
        if (std::string(place.operation) == "GetFileName") {
            // Its result is an object: its address goes first.
            NCFSmartPtr<INCFString> name;
            reinterpret_cast<void* (*)(void*, BaseClip*)>(entry)(&name, base);
        } else {
            reinterpret_cast<NCFRESULT (*)(BaseClip*, Word, Word, Word)>(entry)(base, argument,
                                                                                argument, argument);
        }
        EXPECT_EQ(clip.ran, place.operation) << "slot " << place.slot;
    }
}

// A kind of clip that finds neither size nor ratio and doesn't say so.
TEST(BaseClip, TellsAMissingSizeFromAMissingRatio) {
    FakeHost host;
    const RecordingLog log(host);
    PlaceClip clip;
    ncfUInt32 a = 7;
    ncfUInt32 b = 7;
    EXPECT_EQ(clip.BaseClip::GetEncodedWidthAndHeight(&a, &b), NCF_E_FAIL);
    EXPECT_EQ(log.count("NCFASSERT( width_ && height_ )BaseClip::GetEncodedWidthAndHeight"), 1);
    const std::size_t before = log.records().size();
    EXPECT_EQ(clip.BaseClip::GetImageAspectRatio(&a, &b), NMA_E_NOTINITIALIZED);
    EXPECT_EQ(log.records().size(), before + 1) << "no more than the ratio that was found";
    EXPECT_EQ(log.records().back().text, "BaseClip::GetImageAspectRatioimage_aspect_ratio: 0/0");
    EXPECT_EQ(a, 7u);
    EXPECT_EQ(b, 7u);
}
