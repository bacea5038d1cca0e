// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

#include <map>

#include "host_interfaces/header_parser/QTParser.h"
#include "source/clips/BaseClip.h"
#include "source/plugin/ResultChecks.h"

// A movie that is described by its headers: the file's bytes are fed to the
// header parser until it is content, and everything else is asked of the
// parser's tracks. The movie wrapper is made only when something needs it.
//
// Loading happens in the constructor; a file that can't be opened throws
// NCF_E_HANDLE out of it.
class QuickTimeClip final : public BaseClip {
public:
    QuickTimeClip(NCFSmartPtr<INCFString> fileName, NCFSmartPtr<INCFConsole> console,
                  NCFSmartPtr<INCFComponentFactory> componentFactory);
    ~QuickTimeClip() override;

    NCFRESULT SetFieldLayoutDetails() override;
    NCFRESULT GetNMAFrameLayout(ncfUInt32* frameLayout) const override;
    NCFRESULT GetDataFormat(ncfUInt32* dataFormat) const override;
    NCFRESULT GetVendor(ncfUInt32* vendor) const override;
    NCFRESULT GetNivoResolution(ncfUInt32* vcID) const override;
    NCFRESULT GetTrackCount(ncfUInt32* trackCount) override;
    NCFRESULT GetVideoTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) override {
        return FindTrack(track, kTrackVideo, qtTrack);
    }
    NCFRESULT GetAudioTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) override {
        return FindTrack(track, kTrackAudio, qtTrack);
    }
    NCFRESULT GetTimecodeTrackQTId(ncfUInt32 track, ncfUInt32& qtTrack) override {
        return FindTrack(track, kTrackTimecode, qtTrack);
    }
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
    NCFRESULT GetContentForHash(ByteVector& content) override;
    NCFRESULT IsSelfContained() override;
    NCFRESULT IsVideoSampleProviderMedia(AAFInfo* aafInfo) override;
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
    // The sample shown at a display time in media time units.
    NCFRESULT DisplayTimeToFrameNum(ncfUInt32 qtTrack, ncfUInt64 displayTime, ncfUInt64* sampleNum);

    NCFRESULT IsAudioSampleProviderMedia(ncfUInt32 qtTrack, ncfUInt64* numAudioSamples) override;

    NCFRESULT LoadClipImpl() override;
    NCFRESULT SetColorSpaceImpl() override;
    NCFRESULT SetGeometryImpl() override;
    NCFRESULT SetEditRateImpl(const EditorSettings& editorSettings) override;
    NCFRESULT SetMovieLengthImpl(const EditorSettings& editorSettings) override;
    NCFRESULT GetEncodedWidthAndHeightImpl(ncfUInt32* width, ncfUInt32* height) override;
    NCFRESULT GetImageAspectRatioImpl(ncfUInt32* numerator, ncfUInt32* denominator) override;
    NCFRESULT GetTimeCodeTrackCountImpl(ncfUInt32* trackCount) override;
    NCFRESULT GetVideoTrackCountImpl(ncfUInt32* trackCount) override;
    NCFRESULT GetAudioTrackCountImpl(ncfUInt32* trackCount) override;
    NCFRESULT CalculateAudioTrackLengthInSamples(ncfUInt32 qtTrack,
                                                 ncfUInt64* trackNumSamples) override;
    // The same for all of the media, of which an edit list may play a part.
    NCFRESULT CalculateMediaOnTrackLengthInSamples(ncfUInt32 qtTrack, ncfUInt64* mediaNumSamples);

    // Objects of one track, with a new reference. NCF_E_NOTFOUND for an id
    // that the movie doesn't have.
    NCFRESULT GetTrackInfo(ncfUInt32 qtTrack, ITrackInfo** trackInfo);
    NCFRESULT GetAudioTrack(ncfUInt32 qtTrack, IAudioTrackInfo** audioTrackInfo);
    NCFRESULT GetVideoTrack(ncfUInt32 qtTrack, IVideoTrackInfo** videoTrackInfo);
    NCFRESULT GetSampleTable(ncfUInt32 qtTrack, IQTSampleTable** sampleTable);
    // Null when the movie has none.
    NCFSmartPtr<IVideoTrackInfo>& GetFirstVideoTrackInfo() const;
    NCFSmartPtr<IAudioTrackInfo>& GetFirstAudioTrackInfo() const;

private:
    struct TrackMapEntry {
        NCFSmartPtr<ITrackInfo> info_;
        ncfUInt32 type;  // one of TrackType
    };

    NCFRESULT ParseMediaHeaders();
    NCFRESULT CollectMediaInfo();
    template <class Info>
    NCFRESULT CollectTracks(const char* statement,
                            NCFRESULT (IQTParser::*getTrackInfo)(ncfUInt32, Info**),
                            ncfUInt32 count, ncfUInt32 type);
    NCFRESULT ConfirmNivoAlpha(IVideoSampleDescription* vdscr);
    void FindRotation(IVideoTrackInfo* vti);
    NCFRESULT FindTrack(ncfUInt32 index, ncfUInt32 type, ncfUInt32& qtTrack) const;
    // The one sample description of a sound track, for `function`.
    NCFRESULT GetOnlyAudioDescription(const char* function, ncfUInt32 qtTrack,
                                      NCFSmartPtr<IAudioSampleDescription>& adscr);

    // Asks the first description of the first video track, for the function that logs; the
    // text is what is logged when there is no such track.
    using FirstPicture = NCFSmartPtr<IVideoSampleDescription>;
    template <class Question>
    NCFRESULT AskFirstPicture(const char* ncfFunction, Question question,
                              const char* checkedText = "vti.inArg()") const {
        NCFSmartPtr<IVideoTrackInfo> vti = GetFirstVideoTrackInfo();
        CHK_PTR_TEXT(checkedText, vti.inArg());
        FirstPicture vdscr;
        NCF_RETURN(vti->GetVideoSampleDescription(0, vdscr.outArg()));
        return question(vdscr);
    }
    // Asks the sample table of a track for `out`, whose name is logged when it is null.
    template <class Question>
    NCFRESULT AskSampleTable(const char* ncfFunction, ncfUInt32 qtTrack, const void* out,
                             const char* name, Question question) {
        CHK_PTR_TEXT(name, out);
        NCFSmartPtr<IQTSampleTable> sampleTable;
        NCF_RETURN(GetSampleTable(qtTrack, sampleTable.outArg()));
        return question(sampleTable);
    }

    NCFRESULT SetAverageFrameRate(Rational& rate);
    NCFRESULT SetAVMovieLength();
    NCFRESULT SetOnlyAudioMovieLength();

    NCFRESULT SetColorSpaceImplFromSpecificMedia();
    NCFRESULT ReadColorSpaceDescriptor();
    NCFRESULT SetGeometryImplFromSpecificMedia();
    NCFRESULT ReadBounds();

    NCFRESULT GatherTracks(std::vector<NCFSmartPtr<ITrackInfo>>& tracks);

    NCFSmartPtr<IQTParser> qtParser_;
    mutable NCFSmartPtr<IVideoTrackInfo> firstVideoTrackInfo_;  // filled on first use
    mutable NCFSmartPtr<IAudioTrackInfo> firstAudioTrackInfo_;
    std::map<ncfUInt32, TrackMapEntry> tracks_;  // by the movie's track id
    // The ids by type and place within the kind.
    std::map<std::pair<ncfUInt32, ncfUInt32>, ncfUInt32> trackIds_;
};
