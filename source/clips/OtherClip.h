// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/clips/BaseClip.h"

// A movie that the header parser refuses: everything is asked of the movie
// wrapper and its sample table, which are opened at once and live as long as
// the clip. The answers mean the same as those of a clip that was read from
// its headers.
//
// Loading happens in the constructor. Track numbers are the wrapper's: the
// movie's own ids, up to the highest one.
class OtherClip final : public BaseClip {
public:
    OtherClip(NCFSmartPtr<INCFString> fileName, NCFSmartPtr<INCFConsole> console,
              NCFSmartPtr<INCFComponentFactory> componentFactory);
    ~OtherClip() override;

    NCFRESULT SetFieldLayoutDetails() override;
    // A movie that doesn't say counts as a full frame, with NCF_OK.
    NCFRESULT GetNMAFrameLayout(ncfUInt32* frameLayout) const override;
    NCFRESULT GetDataFormat(ncfUInt32* dataFormat) const override;
    NCFRESULT GetVendor(ncfUInt32* vendor) const override;
    NCFRESULT GetNivoResolution(ncfUInt32* vcID) const override;
    // The highest track number, which movies with gaps in their ids have fewer
    // tracks than.
    NCFRESULT GetTrackCount(ncfUInt32* trackCount) override;
    NCFRESULT GetVideoTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) override;
    NCFRESULT GetAudioTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) override;
    NCFRESULT GetTimecodeTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) override;
    NCFRESULT GetTrackType(ncfUInt32 qtTrack, ncfUInt32* trackType) override;
    NCFRESULT GetTimeCodeTrackMetadata(ncfUInt32 qtTrack, TimeCodeTrackMetadata* tcInfo) override;
    NCFRESULT GetAudioTrackMetadata(ncfUInt32 qtTrack, AudioTrackMetadata* audioInfo) override;
    NCFRESULT IsAudioLPCM(ncfUInt32 qtTrack, ncfBool* isLPCM) override;
    NCFRESULT GetEditRate(Rational* editRate) const override { return GetEditRateBase(editRate); }
    NCFRESULT GetMovieLength(ncfUInt64* movieLength) const override {
        return GetMovieLengthBase(movieLength);
    }
    NCFRESULT GetCreationTime(ncfUInt64* creationTime) override;
    NCFRESULT GetCodecName(ncfUInt32 codecType, NCFSmartPtr<INCFString>& codecName) override;
    NCFRESULT GetContentForHash(ByteVector& pContent) override;
    NCFRESULT IsSelfContained() override;
    NCFRESULT IsVideoSampleProviderMedia(AAFInfo* outAAFInfo) override;
    NCFRESULT HasOneFrame(ncfBool* isOneFrame) override;
    NCFRESULT IsMultiFormatMovie(ncfBool* isMultiformat) override;

    NCFRESULT GetNumSamples(ncfUInt32 qtTrack, ncfUInt64* numSamples) override;
    NCFRESULT GetDataOffset(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                            ncfUInt64* samplePosition) override;
    NCFRESULT GetSampleFlags(ncfUInt32 qtTrack, ncfUInt64 sampleNum, ncfUInt32* flags) override;
    NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                                      ncfUInt64* lastSample) override;
    NCFRESULT GetDataSizePerSample(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                   ncfUInt32* dataSizeInBytes) override;
    NCFRESULT GetDisplayOffset(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                               ncfSInt64* outOffset) override;
    NCFRESULT GetDecodeDuration(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                ncfSInt64* decodeDuration) override;
    NCFRESULT GetMaxDataSizeInBytes(ncfUInt32 qtTrack, ncfUInt32* maxDataSize) override;
    NCFRESULT GetHasOutOfOrderFrameDependencies(ncfUInt32 qtTrack, ncfBool* outOfOrder) override;

    NCFRESULT IsAudioSampleProviderMedia(ncfUInt32 qtTrack, ncfUInt64* numAudioSamples) override;

    NCFRESULT LoadClipImpl() override;
    NCFRESULT SetColorSpaceImpl() override;
    NCFRESULT SetGeometryImpl() override;
    // Rate and length are settled together by whichever comes first, once.
    NCFRESULT SetEditRateImpl(const EditorSettings& editorSettings) override {
        return SettleOnce("OtherClip::SetEditRateImpl", editorSettings);
    }
    NCFRESULT SetMovieLengthImpl(const EditorSettings& editorSettings) override {
        return SettleOnce("OtherClip::SetMovieLengthImpl", editorSettings);
    }
    NCFRESULT GetEncodedWidthAndHeightImpl(ncfUInt32* width, ncfUInt32* height) override;
    NCFRESULT GetImageAspectRatioImpl(ncfUInt32* numerator, ncfUInt32* denominator) override;
    NCFRESULT GetTimeCodeTrackCountImpl(ncfUInt32* trackCount) override;
    NCFRESULT GetVideoTrackCountImpl(ncfUInt32* trackCount) override;
    NCFRESULT GetAudioTrackCountImpl(ncfUInt32* trackCount) override;
    NCFRESULT CalculateAudioTrackLengthInSamples(ncfUInt32 qtTrack,
                                                 ncfUInt64* trackLength) override;

private:
    // The wrapper's question about the kind of a track.
    using TrackTest = ncfBool (QTWrapper::IQuickTimeWrapper::*)(ncfUInt32);

    // The highest track number that a walk asks about. It costs a question for each
    // number, so one over more is cut off here. The wrapper is given room for as
    // many lengths. GetTrackType takes any number up to the count that the wrapper
    // tells.
    static constexpr ncfUInt32 kMostTracks = 65535;

    ncfUInt32 HighestTrack() const;
    NCFRESULT CountTracks(const char* ncfFunction, TrackTest test, ncfUInt32* trackCount) const;
    // Number of the `index`th track that passes the test; false past the end,
    // with `qtTrack` untouched.
    bool FindTrack(TrackTest test, ncfUInt32 index, ncfUInt32& qtTrack) const;
    // NCF_E_NOTFOUND when the movie has no picture.
    NCFRESULT GetFirstVideoTrack(ncfUInt32& track) const;

    // Both size and ratio, in one answer of the wrapper; nothing without a
    // picture, which `hasPicture` tells.
    NCFRESULT ReadMovieBox(const char* function, bool& hasPicture);
    // For the operation that logs.
    NCFRESULT SettleOnce(const char* ncfFunction, const EditorSettings& editorSettings);
    NCFRESULT SetEditRateAndLengthImpl(const EditorSettings& editorSettings);
    // Whether tracks of either kind disagree with the movie's length.
    NCFRESULT FindDurationIssues(const char* function, ncfBool& sound, ncfBool& picture);

    // Null before loading made it.
    const NCFSmartPtr<QTWrapper::IQuickTimeWrapper>& qtWrapper_ = services_.Wrapper();
    NCFSmartPtr<QTWrapper::IQTWSampleTable> sampleTable_;
};
