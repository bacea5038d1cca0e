// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include "source/clips/ClipRecords.h"
#include "source/clips/MovieServices.h"
#include "source/clips/PictureFacts.h"
#include "source/clips/SampleProviderRule.h"
#include "source/plugin/ByteVector.h"
#include "source/plugin/Tr1Memory.h"

struct AAFInfo;

// One opened movie file: all that the rest of the module asks about a movie
// goes through here. Two classes fill it, one from the file's headers and one
// through the movie wrapper. Shared by container, sample mapping and
// description through a shared pointer; not guarded against threads.
//
// A clip loads itself in the constructor of its class. IsLoaded tells whether
// that worked; a clip that failed to load answers with failures. Rate and
// length are there only after SetEditRate and SetMovieLength.
//
// `qtTrack` is the track's id in the movie, never 0; `track` counts from zero
// within a kind. Sample numbers count from one. Operations are virtual in the
// order in which they stand here, which tests hold fixed.
class BaseClip {
public:
    virtual ~BaseClip();  // 0

    // --- picture and tracks -------------------------------------------------

    // 1. Takes field order and layout from the movie and lays the user's
    // choice over them. Called again when the user changes it.
    virtual NCFRESULT SetFieldLayoutDetails() = 0;
    // 2. 0 full frame, 1 separate fields. NCF_E_PARAMETERNOTAVAILABLE, with 0
    // stored, when the movie does not say.
    virtual NCFRESULT GetNMAFrameLayout(ncfUInt32* frameLayout) const = 0;
    virtual NCFRESULT GetDataFormat(ncfUInt32* dataFormat) const = 0;                 // 3
    virtual NCFRESULT GetVendor(ncfUInt32* vendor) const = 0;                         // 4
    virtual NCFRESULT GetNivoResolution(ncfUInt32* vcID) const = 0;                   // 5
    virtual NCFRESULT GetTrackCount(ncfUInt32* trackCount) = 0;                       // 6
    virtual NCFRESULT GetVideoTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) = 0;     // 7
    virtual NCFRESULT GetAudioTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) = 0;     // 8
    virtual NCFRESULT GetTimecodeTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) = 0;  // 9
    virtual NCFRESULT GetTrackType(ncfUInt32 qtTrack, ncfUInt32* trackType) = 0;      // 10
    virtual NCFRESULT GetTimeCodeTrackMetadata(ncfUInt32 qtTrack,
                                               TimeCodeTrackMetadata* tcInfo) = 0;  // 11
    virtual NCFRESULT GetAudioTrackMetadata(ncfUInt32 qtTrack,
                                            AudioTrackMetadata* audioInfo) = 0;  // 12
    virtual NCFRESULT IsAudioLPCM(ncfUInt32 qtTrack, ncfBool* isLPCM) = 0;       // 13
    virtual NCFRESULT GetEditRate(Rational* editRate) const = 0;                 // 14
    virtual NCFRESULT GetMovieLength(ncfUInt64* movieLength) const = 0;          // 15
    virtual NCFRESULT GetCreationTime(ncfUInt64* creationTime) = 0;  // 16. seconds from 1904 UTC
    // 17. A person's name for a codec, in a new string.
    virtual NCFRESULT GetCodecName(ncfUInt32 codecType, NCFSmartPtr<INCFString>& codecName) = 0;
    // 18. Bytes of the file that tell this movie from others.
    virtual NCFRESULT GetContentForHash(ByteVector& content) = 0;
    // 19. The flag itself, or a negative failure.
    virtual NCFRESULT IsSelfContained() = 0;
    // 20. 1 native, 0 to be served by the sample provider, negative failure.
    virtual NCFRESULT IsVideoSampleProviderMedia(AAFInfo* aafInfo) = 0;
    virtual NCFRESULT HasOneFrame(ncfBool* isOneFrame) = 0;            // 21
    virtual NCFRESULT IsMultiFormatMovie(ncfBool* isMultiformat) = 0;  // 22
    virtual NCFSmartPtr<INCFString> GetFileName() const;               // 23

    // --- rate, length and the cached picture properties -----------------------

    virtual NCFRESULT SetEditRate(const EditorSettings& editorSettings);  // 24
    // 25. Works the length out once; later calls keep it.
    virtual NCFRESULT SetMovieLength(const EditorSettings& editorSettings);
    virtual NCFRESULT GetEncodedWidthAndHeight(ncfUInt32* width, ncfUInt32* height);      // 26
    virtual NCFRESULT GetImageAspectRatio(ncfUInt32* numerator, ncfUInt32* denominator);  // 27
    // 28 to 31. NMA_E_NOTSET, with the output untouched, until it is known.
    virtual NCFRESULT GetColorSpace(ncfUInt32* colorSpace) const;
    virtual NCFRESULT GetTemporalFieldOrder(ncfUInt32* temporalFieldOrder) const;
    virtual NCFRESULT GetFrameBufferLayout(ncfUInt32* frameBufferLayout) const;
    virtual NCFRESULT GetBufferLineOrientation(ncfUInt32* bufferLineOrientation) const;
    virtual NCFRESULT GetTimeCodeTrackCount(ncfUInt32* trackCount);  // 32
    virtual NCFRESULT GetVideoTrackCount(ncfUInt32* trackCount);     // 33
    virtual NCFRESULT GetAudioTrackCount(ncfUInt32* trackCount);     // 34

    // --- samples --------------------------------------------------------------

    virtual NCFRESULT GetNumSamples(ncfUInt32 qtTrack, ncfUInt64* numSamples) = 0;  // 35
    virtual NCFRESULT GetDataOffset(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                    ncfUInt64* samplePosition) = 0;  // 36
    virtual NCFRESULT GetSampleFlags(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                     ncfUInt32* flags) = 0;  // 37
    virtual NCFRESULT GetNextDiscontiguousDataAttributeChange(ncfUInt32 qtTrack,
                                                              ncfUInt64 sampleNum,
                                                              ncfUInt64* lastSample) = 0;  // 38
    virtual NCFRESULT GetDataSizePerSample(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                           ncfUInt32* dataSizeInBytes) = 0;  // 39
    virtual NCFRESULT GetDisplayOffset(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                       ncfSInt64* outOffset) = 0;  // 40
    virtual NCFRESULT GetDecodeDuration(ncfUInt32 qtTrack, ncfUInt64 sampleNum,
                                        ncfSInt64* decodeDuration) = 0;                      // 41
    virtual NCFRESULT GetMaxDataSizeInBytes(ncfUInt32 qtTrack, ncfUInt32* maxDataSize) = 0;  // 42
    virtual NCFRESULT GetHasOutOfOrderFrameDependencies(ncfUInt32 qtTrack,
                                                        ncfBool* outOfOrder) = 0;  // 43

    // 44. 1 native, 0 to be served by the sample provider, negative failure.
    virtual NCFRESULT IsAudioSampleProviderMedia(ncfUInt32 qtTrack, ncfUInt64* numAudioSamples);
    virtual NCFRESULT GetColorDetails(ColorDetails* colorDetails) const;           // 45
    virtual NCFRESULT GetGeometryDetails(GeometryDetails* geometryDetails) const;  // 46

    // --- what each kind of clip does in its own way -----------------------------

    virtual NCFRESULT LoadClipImpl() = 0;                                            // 47
    virtual NCFRESULT SetColorSpaceImpl() = 0;                                       // 48
    virtual NCFRESULT SetGeometryImpl() = 0;                                         // 49
    virtual NCFRESULT SetEditRateImpl(const EditorSettings& editorSettings) = 0;     // 50
    virtual NCFRESULT SetMovieLengthImpl(const EditorSettings& editorSettings) = 0;  // 51
    // 52, 53. Fill the clip's own fields; the outputs are not written.
    virtual NCFRESULT GetEncodedWidthAndHeightImpl(ncfUInt32* width, ncfUInt32* height) = 0;
    virtual NCFRESULT GetImageAspectRatioImpl(ncfUInt32* numerator, ncfUInt32* denominator) = 0;
    virtual NCFRESULT GetTimeCodeTrackCountImpl(ncfUInt32* trackCount) = 0;  // 54
    virtual NCFRESULT GetVideoTrackCountImpl(ncfUInt32* trackCount) = 0;     // 55
    virtual NCFRESULT GetAudioTrackCountImpl(ncfUInt32* trackCount) = 0;     // 56
    virtual NCFRESULT CalculateAudioTrackLengthInSamples(ncfUInt32 qtTrack,
                                                         ncfUInt64* trackNumSamples) = 0;  // 57

    // --- not virtual --------------------------------------------------------------

    BaseClip(const BaseClip&) = delete;
    BaseClip& operator=(const BaseClip&) = delete;

    bool IsLoaded() const { return loaded_ != 0; }
    // The picture has an alpha channel and the host wants to see it.
    bool ShowsAlpha() const { return picture_.hasAlpha != 0 && picture_.ignoreAlpha == 0; }
    ClipParams* GetClipParams() { return &clipParams_; }

    // Number of samples of an audio track to present with the video: cut to
    // the video's length where the track is longer. `hasEnoughAudio` may be
    // null.
    NCFRESULT ObtainAudioTrackLength(ncfUInt32 qtTrack, ncfUInt64* adjustedNumSamples,
                                     bool* hasEnoughAudio = nullptr);

    // See MovieServices.
    NCFRESULT GetQuickTimeInterface(NCFSmartPtr<QTWrapper::IQuickTimeWrapper>& out) {
        return services_.GetQuickTimeInterface(out);
    }
    NCFRESULT GetQuickTimeVideoReader(NCFSmartPtr<QTWrapper::IQTVideoReader>& out) {
        return services_.GetQuickTimeVideoReader(out);
    }
    NCFRESULT GetQuickTimeAudioReader(NCFSmartPtr<QTWrapper::IQTAudioReader>& out) {
        return services_.GetQuickTimeAudioReader(out);
    }
    NCFRESULT GetQuickTimePropertyComponent(NCFSmartPtr<QuickTime::IQuickTimeProperty>& out) {
        return services_.GetQuickTimePropertyComponent(out);
    }

protected:
    BaseClip(NCFSmartPtr<INCFString> fileName, NCFSmartPtr<INCFConsole> console,
             NCFSmartPtr<INCFComponentFactory> componentFactory);

    // Reads what both kinds of clip take from the picture, once the headers
    // are in, and marks the clip as loaded.
    NCFRESULT LoadClipBase();
    NCFRESULT GetMovieLengthBase(ncfUInt64* movieLength) const;
    NCFRESULT GetEditRateBase(Rational* editRate) const;

    ncfSInt32 loaded_ = 0;
    NCFSmartPtr<INCFString> fileName_;
    NCFSmartPtr<INCFConsole> console_;
    NCFSmartPtr<INCFComponentFactory> componentFactory_;
    Rational editRate_;
    ncfUInt64 length_ = 0;  // in video samples
    PictureFacts picture_;
    ClipParams clipParams_;
    MovieServices services_;
    SampleProviderRule rule_;
};
